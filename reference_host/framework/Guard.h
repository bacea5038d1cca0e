// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <new>

#include "host_interfaces/framework/ResultCodes.h"

namespace host {

// Within a body: ends it where something that it needs is not there.
template <class There>
void Need(const There& there, NCFRESULT otherwise = NCF_E_POINTER) {
    if (!there) {
        throw otherwise;
    }
}

// Within a body: ends it with the result of a step that failed.
inline void Check(NCFRESULT result) {
    if (result < 0) {
        throw result;
    }
}

// Puts a value into an output.
template <class Value, class Out>
NCFRESULT Give(const Value& value, Out* out) {
    if (out == nullptr) {
        return NCF_E_POINTER;
    }
    *out = static_cast<Out>(value);
    return NCF_OK;
}

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
