// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/framework/ResultCodes.h"

namespace NMA::Impl {

// Runs the steps of an object in their order, up to the first whose result is not 0.
template <class Object, class... Steps>
NCFRESULT RunSteps(Object& object, Steps... steps) {
    NCFRESULT result = NCF_OK;
    (void)(((result = (object.*steps)()) == NCF_OK) && ...);
    return result;
}

}  // namespace NMA::Impl
