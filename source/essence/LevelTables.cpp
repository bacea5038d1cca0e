// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/essence/LevelTables.h"

#include <algorithm>

namespace {

// The rules in whole numbers, where no rounding of the machine can change an
// entry.

// (x - 16) * 255 / 219 to the nearest, within a byte.
ncfUInt8 Expand8(ncfSInt32 x) {
    const ncfSInt32 scaled = (x - 16) * 255;
    return static_cast<ncfUInt8>(scaled <= 0 ? 0 : std::min((2 * scaled + 219) / (2 * 219), 255));
}

// x * 219 / 255 to the nearest, plus 16.
ncfUInt8 Compress8(ncfSInt32 x) {
    return static_cast<ncfUInt8>((2 * x * 219 + 255) / (2 * 255) + 16);
}

constexpr ncfSInt64 kTenMillion = 10000000;

// (x - 4096) * 1.1688453, cut off, within a word.
ncfUInt16 Expand16(ncfSInt64 x) {
    const ncfSInt64 scaled = std::max<ncfSInt64>(x - 4096, 0) * 11688453 / kTenMillion;
    return static_cast<ncfUInt16>(std::min<ncfSInt64>(scaled, 65535));
}

// x * 0.8554818, cut off, plus 4096.
ncfUInt16 Compress16(ncfSInt64 x) {
    return static_cast<ncfUInt16>(x * 8554818 / kTenMillion + 4096);
}

LevelTables Made() {
    LevelTables tables;
    for (ncfSInt32 x = 0; x < 256; ++x) {
        const auto at = static_cast<std::size_t>(x);
        tables.expand8[at] = Expand8(x);
        tables.compress8[at] = Compress8(x);
    }
    for (ncfSInt32 x = 0; x < 65536; ++x) {
        const auto at = static_cast<std::size_t>(x);
        tables.expand16[at] = Expand16(x);
        tables.compress16[at] = Compress16(x);
    }
    return tables;
}

}  // namespace

const LevelTables& LevelTables::Get() {
    static const LevelTables tables = Made();
    return tables;
}
