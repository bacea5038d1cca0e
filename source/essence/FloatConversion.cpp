// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/essence/FloatConversion.h"

#include <algorithm>

#include "source/essence/Avx2Kernels.h"
#include "source/essence/ColorSpace.h"
#include "source/essence/PixelLevels.h"

namespace {

// Pixels of a row that are done at once, whole groups of every kernel. So few
// that the processor reads ahead into the next ones while it sets the levels of
// these, and does not wait for memory after a whole row.
constexpr std::size_t kPart = 256;

// The widest kernel first; each does what the one before it left.
void ConvertPart(const Avx2Kernels* wide, const LumaWeights& weights, const ncfUInt8* source,
                 ncfUInt8* destination, std::size_t pixels) {
    std::size_t done = wide ? wide->convertRow(weights, source, destination, pixels) : 0;
    done += ConvertRowSse41(weights, source + done * kR4flPixelBytes,
                            destination + done * kB64aPixelBytes, pixels - done);
    ConvertRowScalar(weights, source + done * kR4flPixelBytes, destination + done * kB64aPixelBytes,
                     pixels - done);
}

}  // namespace

void ConvertR4flToB64a(const ncfUInt8* source, ncfUInt8* destination, std::size_t sourceSize,
                       std::size_t destinationSize, ncfUInt32 width, ncfUInt32 height,
                       LevelPass& levels) {
    if (width == 0) {
        return;
    }
    const Avx2Kernels* const wide = FindAvx2Kernels();
    const LumaWeights& weights = IsHighDefinition(width, height) ? kRec709 : kRec601;
    const std::size_t sourceRow = std::size_t{width} * kR4flPixelBytes;
    const std::size_t destinationRow = std::size_t{width} * kB64aPixelBytes;
    const std::size_t rows =
        std::min<std::size_t>({height, sourceSize / sourceRow, destinationSize / destinationRow});
    for (std::size_t row = 0; row < rows; ++row) {
        for (std::size_t x = 0; x < width; x += kPart) {
            const std::size_t pixels = std::min<std::size_t>(kPart, width - x);
            const std::size_t first = row * width + x;
            ConvertPart(wide, weights, source + first * kR4flPixelBytes,
                        destination + first * kB64aPixelBytes, pixels);
            levels.UpTo((first + pixels) * kB64aPixelBytes);
        }
    }
}
