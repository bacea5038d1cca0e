// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/aaf/AAFPlainTypes.h"
#include "host_interfaces/aaf/AAFResultCodes.h"

namespace aaf {

// Whether an enumerated argument is a member of an enumeration without gaps.
inline bool IsWithin(aafInt32 value, aafInt32 first, aafInt32 last) {
    return value >= first && value <= last;
}

// What an operation answers that needs Initialize before.
template <class Operation>
HRESULT OnceInitialized(bool initialized, Operation operation) {
    return initialized ? operation() : AAFRESULT_NOT_INITIALIZED;
}

}  // namespace aaf
