// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <utility>

#include "host_interfaces/framework/ResultCodes.h"

namespace NMA::Impl {

// Runs a body that throws its failures. A thrown code is the result; anything else is
// unexpected, such as the texts that AAF's look-ups and counted pointers throw. The body
// of an operation that the host calls stands in here: no exception crosses an interface.
template <class Body>
NCFRESULT ResultOf(Body&& body) {
    try {
        return std::forward<Body>(body)();
    } catch (NCFRESULT failure) {
        return failure;
    } catch (...) {
        return NCF_E_UNEXPECTED;
    }
}

}  // namespace NMA::Impl
