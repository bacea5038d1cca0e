// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "tests/unit/aaf_library/limits/SmallLimits.h"

#include "aaf_library/stored/CompoundFileLimits.h"

namespace {

const SmallLimits* current = nullptr;

}  // namespace

SmallLimits::SmallLimits() {
    current = this;
}

SmallLimits::~SmallLimits() {
    current = nullptr;
}

namespace aaf::stored {

std::uint64_t LargestFile(SectorSize) {
    return current->largestFile;
}

std::uint32_t LockSector(SectorSize) {
    return current->lockSector;
}

}  // namespace aaf::stored
