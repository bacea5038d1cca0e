// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/essence/PixelLevels.h"

#include <cstddef>

#include "source/essence/FormatEnums.h"
#include "source/essence/LevelTables.h"
#include "source/essence/PixelLevelsWide.h"

// The wide pass does whole blocks, the tables what is left behind them, down to
// a pixel that is cut off.

namespace {

template <class Table>
const Table* TableOf(ncfUInt32 mode, const Table& expand, const Table& compress) {
    return mode == Expand_Levels ? &expand : mode == Compress_Levels ? &compress : nullptr;
}

// B G R A, a byte each.
void RemapBytes(ncfUInt8* pixels, std::size_t size, ncfUInt32 mode) {
    const LevelTables& tables = LevelTables::Get();
    const auto* const table = TableOf(mode, tables.expand8, tables.compress8);
    for (std::size_t i = RemapBytesWide(pixels, size, mode); i < size; ++i) {
        if (i % 4 == 3) {
            pixels[i] = 0xFF;
        } else if (table) {
            pixels[i] = (*table)[pixels[i]];
        }
    }
}

// Four words a pixel, one of them alpha; the buffer need not be aligned. A last
// odd byte is no word.
void RemapWords(ncfUInt8* pixels, std::size_t size, std::size_t done, ncfUInt32 mode,
                std::size_t alphaWord, bool bigEndian) {
    const LevelTables& tables = LevelTables::Get();
    const auto* const table = TableOf(mode, tables.expand16, tables.compress16);
    const std::size_t upper = bigEndian ? 0 : 1;
    for (std::size_t word = done / 2; word < size / 2; ++word) {
        ncfUInt8* const at = pixels + 2 * word;
        auto value = static_cast<ncfUInt16>(at[upper] << 8 | at[1 - upper]);
        if (word % 4 == alphaWord) {
            value = 0xFFFF;
        } else if (table) {
            value = (*table)[value];
        }
        at[upper] = static_cast<ncfUInt8>(value >> 8);
        at[1 - upper] = static_cast<ncfUInt8>(value);
    }
}

}  // namespace

void RemapPixelLevels(ncfUInt32 pixelFormat, ncfUInt32 componentType, ncfUInt8* buffer,
                      ncfUInt64 sizeInBytes, const ncfUInt32* levelMode) {
    const auto size = static_cast<std::size_t>(sizeInBytes);
    const ncfUInt32 mode = *levelMode;
    if (pixelFormat == PF_BGRA &&
        (componentType == CT_UCHAR || componentType == CT_UCHAR_FullRange)) {
        RemapBytes(buffer, size, mode);
    } else if (pixelFormat == PF_BGRA && componentType == CT_USHORT_10_6) {
        RemapWords(buffer, size, RemapLittleWordsWide(buffer, size, mode), mode, 3, false);
    } else if (pixelFormat == PF_ARGB && (componentType == CT_USHORT_BE_VideoRange ||
                                          componentType == CT_USHORT_BE_FullRange)) {
        RemapWords(buffer, size, RemapBigWordsWide(buffer, size, mode), mode, 0, true);
    }
}
