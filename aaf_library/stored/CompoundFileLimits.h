// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "aaf_library/stored/StoredTree.h"

// In a file of their own, so that a test can make them small.

namespace aaf::stored {

// How many bytes a compound file with such sectors may take.
std::uint64_t LargestFile(SectorSize sectorSize);

// The sector just below 2 GiB, which holds nothing: programs lock parts of it in place of the
// file. kFreeSector where files end before it.
std::uint32_t LockSector(SectorSize sectorSize);

}  // namespace aaf::stored
