// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/stored/CompoundFileLimits.h"

#include "aaf_library/stored/CompoundFileFormat.h"

namespace aaf::stored {

namespace {

constexpr std::uint32_t kPlaceOfLocks = 0x7FFFFF00;

}  // namespace

// The format ends at 2 GiB for small sectors, and at 16 TiB for large ones; but a file is laid out
// in memory.
std::uint64_t LargestFile(SectorSize sectorSize) {
    return sectorSize == SectorSize::Bytes512 ? kPlaceOfLocks / 512 * 512 : std::uint64_t{4} << 30;
}

std::uint32_t LockSector(SectorSize sectorSize) {
    return sectorSize == SectorSize::Bytes512 ? kFreeSector : kPlaceOfLocks / 4096 - 1;
}

}  // namespace aaf::stored
