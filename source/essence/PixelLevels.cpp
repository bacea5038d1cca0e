// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/essence/PixelLevels.h"

#include <cstddef>
#include <cstring>

#include "source/essence/FormatEnums.h"
#include "source/essence/LevelTables.h"

namespace {

// B G R A, a byte each.
void MakeOpaque8(ncfUInt8* pixels, std::size_t size) {
    for (std::size_t alpha = 3; alpha < size; alpha += 4) {
        pixels[alpha] = 0xFF;
    }
}

void Remap8(ncfUInt8* pixels, std::size_t size, const std::array<ncfUInt8, 256>& table) {
    const std::size_t whole = size - size % 4;
    for (std::size_t i = 0; i < whole; i += 4) {
        pixels[i] = table[pixels[i]];
        pixels[i + 1] = table[pixels[i + 1]];
        pixels[i + 2] = table[pixels[i + 2]];
        pixels[i + 3] = 0xFF;
    }
    for (std::size_t i = whole; i < size; ++i) {
        pixels[i] = table[pixels[i]];
    }
}

// Words of a frame, in memory order; the buffer need not be aligned.
ncfUInt16 Load16(const ncfUInt8* from, bool bigEndian) {
    return static_cast<ncfUInt16>(bigEndian ? from[0] << 8 | from[1] : from[1] << 8 | from[0]);
}
void Store16(ncfUInt8* to, ncfUInt16 value, bool bigEndian) {
    to[bigEndian ? 0 : 1] = static_cast<ncfUInt8>(value >> 8);
    to[bigEndian ? 1 : 0] = static_cast<ncfUInt8>(value);
}

// Four words a pixel, one of them alpha. A last odd byte is no word.
template <std::size_t AlphaWord, bool BigEndian>
void Remap16(ncfUInt8* pixels, std::size_t size, const std::array<ncfUInt16, 65536>* table) {
    const auto remapWord = [&](std::size_t pixel, std::size_t word) {
        ncfUInt8* const at = pixels + 2 * (pixel + word);
        if (word == AlphaWord) {
            Store16(at, 0xFFFF, BigEndian);
        } else if (table) {
            Store16(at, (*table)[Load16(at, BigEndian)], BigEndian);
        }
    };
    const std::size_t words = size / 2;
    const std::size_t whole = words - words % 4;
    for (std::size_t i = 0; i < whole; i += 4) {
        remapWord(i, 0);
        remapWord(i, 1);
        remapWord(i, 2);
        remapWord(i, 3);
    }
    for (std::size_t word = 0; word < words - whole; ++word) {
        remapWord(whole, word);
    }
}

const std::array<ncfUInt8, 256>* Table8(ncfUInt32 mode) {
    const LevelTables& tables = LevelTables::Get();
    return mode == Expand_Levels     ? &tables.expand8
           : mode == Compress_Levels ? &tables.compress8
                                     : nullptr;
}

const std::array<ncfUInt16, 65536>* Table16(ncfUInt32 mode) {
    const LevelTables& tables = LevelTables::Get();
    return mode == Expand_Levels     ? &tables.expand16
           : mode == Compress_Levels ? &tables.compress16
                                     : nullptr;
}

}  // namespace

void RemapPixelLevels(ncfUInt32 pixelFormat, ncfUInt32 componentType, ncfUInt8* buffer,
                      ncfUInt64 sizeInBytes, const ncfUInt32* levelMode) {
    const auto size = static_cast<std::size_t>(sizeInBytes);
    if (pixelFormat == PF_BGRA &&
        (componentType == CT_UCHAR || componentType == CT_UCHAR_FullRange)) {
        if (const auto* const table = Table8(*levelMode)) {
            Remap8(buffer, size, *table);
        } else {
            MakeOpaque8(buffer, size);
        }
    } else if (pixelFormat == PF_BGRA && componentType == CT_USHORT_10_6) {
        Remap16<3, false>(buffer, size, Table16(*levelMode));
    } else if (pixelFormat == PF_ARGB && (componentType == CT_USHORT_BE_VideoRange ||
                                          componentType == CT_USHORT_BE_FullRange)) {
        Remap16<0, true>(buffer, size, Table16(*levelMode));
    }
}
