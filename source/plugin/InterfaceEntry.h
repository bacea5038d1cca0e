// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <utility>

#include "host_interfaces/framework/ResultCodes.h"

namespace NMA::Impl {

// Body of an operation that the host calls: what it throws becomes its result,
// so that no exception crosses the interface.
template <class Body>
NCFRESULT InterfaceEntry(Body&& body) {
    try {
        return std::forward<Body>(body)();
    } catch (NCFRESULT failure) {
        return failure;
    } catch (...) {
        return NCF_E_UNEXPECTED;
    }
}

}  // namespace NMA::Impl
