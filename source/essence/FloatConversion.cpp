// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/essence/FloatConversion.h"

#include <algorithm>

#include "source/essence/ColorSpace.h"

namespace {

void ConvertRow(const LumaWeights& weights, const ncfUInt8* source, ncfUInt8* destination,
                std::size_t pixels) {
    const std::size_t done = ConvertRowVector(weights, source, destination, pixels);
    ConvertRowScalar(weights, source + done * kR4flPixelBytes, destination + done * kB64aPixelBytes,
                     pixels - done);
}

}  // namespace

void ConvertR4flToB64a(const ncfUInt8* source, ncfUInt8* destination, std::size_t sourceSize,
                       std::size_t destinationSize, ncfUInt32 width, ncfUInt32 height) {
    if (width == 0) {
        return;
    }
    const LumaWeights& weights = IsHighDefinition(width, height) ? kRec709 : kRec601;
    const std::size_t sourceRow = std::size_t{width} * kR4flPixelBytes;
    const std::size_t destinationRow = std::size_t{width} * kB64aPixelBytes;
    const std::size_t rows =
        std::min<std::size_t>({height, sourceSize / sourceRow, destinationSize / destinationRow});
    for (std::size_t row = 0; row < rows; ++row) {
        ConvertRow(weights, source + row * sourceRow, destination + row * destinationRow, width);
    }
}
