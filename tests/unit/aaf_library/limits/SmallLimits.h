// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "aaf_library/stored/CompoundFileFormat.h"

#include <cstdint>
#include <limits>

// What the limits of compound files are while this lives, in place of gigabytes.
struct SmallLimits {
    SmallLimits();
    ~SmallLimits();
    SmallLimits(const SmallLimits&) = delete;
    SmallLimits& operator=(const SmallLimits&) = delete;

    std::uint64_t largestFile = std::numeric_limits<std::uint64_t>::max();
    std::uint32_t lockSector = aaf::stored::kFreeSector;
};
