// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/framework/Types.h"

// The next multiple of `multiple`; 0 leaves the value alone. A value of 0 goes
// below zero first and so comes out near the top of the range: an empty picture
// asks for a buffer that no host gives.
constexpr ncfUInt32 RoundUp(ncfUInt32 value, ncfUInt32 multiple) {
    if (multiple == 0) {
        return value;
    }
    const ncfUInt32 raised = value > 0 ? value + multiple - 1 : 0u - (multiple - 1);
    return raised - raised % multiple;
}
