// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/aaf/AAFPlainTypes.h"

namespace aaf {

// Whether an enumerated argument is a member of an enumeration without gaps.
inline bool IsWithin(aafInt32 value, aafInt32 first, aafInt32 last) {
    return value >= first && value <= last;
}

}  // namespace aaf
