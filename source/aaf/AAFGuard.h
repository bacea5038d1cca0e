// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/framework/ResultCodes.h"

namespace NMA::Impl {

// Runs a body that throws its failures. A thrown code is the result; anything
// else, such as the texts of the look-ups and counted pointers, is unexpected.
template <class Body>
NCFRESULT GuardAAF(Body&& body) {
    try {
        return body();
    } catch (NCFRESULT result) {
        return result;
    } catch (...) {
        return NCF_E_UNEXPECTED;
    }
}

}  // namespace NMA::Impl
