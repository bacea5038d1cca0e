// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include <sys/mman.h>

#include <cstdint>

#include "reference_host/system/LargeBlock.h"

namespace host::system {

void ExpectLargeBlock(ncfUInt8* memory, ncfUInt64 bytes) {
    constexpr std::uintptr_t kLargePage = std::uintptr_t{2} << 20;
    const auto begin = reinterpret_cast<std::uintptr_t>(memory);
    const std::uintptr_t first = (begin + kLargePage - 1) / kLargePage * kLargePage;
    const std::uintptr_t end = (begin + bytes) / kLargePage * kLargePage;
    if (first < end) {
        madvise(reinterpret_cast<void*>(first), end - first, MADV_HUGEPAGE);
    }
}

}  // namespace host::system
