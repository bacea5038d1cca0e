// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/essence/PixelLevels.h"

#include "source/essence/Avx2Kernels.h"
#include "source/essence/FormatEnums.h"
#include "source/essence/LevelTables.h"

// Kernels do whole blocks, the widest first; the tables do what is left behind
// them, down to a pixel that is cut off.

namespace {

std::size_t RemapBlocks(LevelKernels::Kernel LevelKernels::*kernel, ncfUInt8* pixels,
                        std::size_t size, ncfUInt32 mode) {
    const Avx2Kernels* const wide = FindAvx2Kernels();
    const std::size_t done = wide ? (wide->levels.*kernel)(pixels, size, mode) : 0;
    return done + (kLevelKernelsSse2.*kernel)(pixels + done, size - done, mode);
}

template <class Table>
const Table* TableOf(ncfUInt32 mode, const Table& expand, const Table& compress) {
    return mode == Expand_Levels ? &expand : mode == Compress_Levels ? &compress : nullptr;
}

// B G R A, a byte each.
void RemapBytes(ncfUInt8* pixels, std::size_t size, ncfUInt32 mode) {
    const LevelTables& tables = LevelTables::Get();
    const auto* const table = TableOf(mode, tables.expand8, tables.compress8);
    for (std::size_t i = RemapBlocks(&LevelKernels::bytes, pixels, size, mode); i < size; ++i) {
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

void RemapLittleWords(ncfUInt8* pixels, std::size_t size, ncfUInt32 mode) {
    RemapWords(pixels, size, RemapBlocks(&LevelKernels::littleWords, pixels, size, mode), mode, 3,
               false);
}

void RemapBigWords(ncfUInt8* pixels, std::size_t size, ncfUInt32 mode) {
    RemapWords(pixels, size, RemapBlocks(&LevelKernels::bigWords, pixels, size, mode), mode, 0,
               true);
}

struct Layout {
    ncfUInt32 pixelFormat;
    ncfUInt32 componentType;
    void (*remap)(ncfUInt8* pixels, std::size_t size, ncfUInt32 mode);
};
const Layout kLayouts[] = {
    {PF_BGRA, CT_UCHAR, &RemapBytes},
    {PF_BGRA, CT_UCHAR_FullRange, &RemapBytes},
    {PF_BGRA, CT_USHORT_10_6, &RemapLittleWords},
    {PF_ARGB, CT_USHORT_BE_VideoRange, &RemapBigWords},
    {PF_ARGB, CT_USHORT_BE_FullRange, &RemapBigWords},
};

}  // namespace

LevelPass::LevelPass(ncfUInt32 pixelFormat, ncfUInt32 componentType, ncfUInt8* buffer,
                     std::size_t size, ncfUInt32 levelMode)
    : remap_(nullptr), buffer_(buffer), size_(size), mode_(levelMode) {
    for (const Layout& layout : kLayouts) {
        if (layout.pixelFormat == pixelFormat && layout.componentType == componentType) {
            remap_ = layout.remap;
        }
    }
}

void LevelPass::UpTo(std::size_t end) {
    if (remap_) {
        remap_(buffer_ + done_, end - done_, mode_);
    }
    done_ = end;
}

void RemapPixelLevels(ncfUInt32 pixelFormat, ncfUInt32 componentType, ncfUInt8* buffer,
                      ncfUInt64 sizeInBytes, const ncfUInt32* levelMode) {
    LevelPass(pixelFormat, componentType, buffer, static_cast<std::size_t>(sizeInBytes), *levelMode)
        .Finish();
}
