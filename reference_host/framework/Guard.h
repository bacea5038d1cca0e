// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <new>

#include "host_interfaces/framework/ResultCodes.h"

namespace host {

// Runs the body of an interface operation. No exception leaves it: a thrown
// result code is the result, memory that ran out has its code, and anything
// else is NCF_E_UNEXPECTED.
template <class Body>
NCFRESULT Guarded(Body&& body) noexcept {
    try {
        return body();
    } catch (NCFRESULT result) {
        return result;
    } catch (const std::bad_alloc&) {
        return NCF_E_OUTOFMEMORY;
    } catch (...) {
        return NCF_E_UNEXPECTED;
    }
}

}  // namespace host
