// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <array>

#include "host_interfaces/framework/Types.h"

// What a component becomes when video range is widened to full range, and when
// full range is narrowed to video range. The 16-bit tables have slopes of their
// own: they are no scalings of the 8-bit ones, nor each other's inverse.
struct LevelTables {
    std::array<ncfUInt8, 256> expand8;
    std::array<ncfUInt8, 256> compress8;
    std::array<ncfUInt16, 65536> expand16;
    std::array<ncfUInt16, 65536> compress16;

    // Made on first use, then constant.
    static const LevelTables& Get();
};
