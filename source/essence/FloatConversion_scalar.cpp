// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// One pixel at a time: for the pixels of a row that make no group of four.
// Compiled without contraction, so that every step rounds to single precision.

#include <cmath>
#include <cstring>

#include "source/essence/FloatConversion.h"

namespace {

float Clamped(float value) {
    return value < 0.0f ? 0.0f : value > 65535.0f ? 65535.0f : value;
}

// Half added in double precision and cut off; the low 16 bits. What is no
// 64-bit number gives 0.
ncfUInt16 Word(float value) {
    constexpr double limit = 9223372036854775808.0;
    const double raised = static_cast<double>(value) + 0.5;
    if (!(std::fabs(raised) < limit)) {
        return 0;
    }
    return static_cast<ncfUInt16>(static_cast<ncfUInt64>(static_cast<ncfSInt64>(raised)));
}

void StoreBigEndian(ncfUInt8* to, ncfUInt16 word) {
    to[0] = static_cast<ncfUInt8>(word >> 8);
    to[1] = static_cast<ncfUInt8>(word);
}

}  // namespace

void ConvertRowScalar(const LumaWeights& weights, const ncfUInt8* source, ncfUInt8* destination,
                      std::size_t pixels) {
    const float Kr = weights.Kr;
    const float Kg = weights.Kg;
    const float Kb = weights.Kb;
    for (std::size_t i = 0; i < pixels; ++i) {
        float pixel[4];
        std::memcpy(pixel, source + i * kR4flPixelBytes, sizeof pixel);
        const float y = pixel[1] / kLumaRange;
        const float cb = (pixel[2] - kChromaBias) / kChromaRange;
        const float cr = (pixel[3] - kChromaBias) / kChromaRange;
        const float b = cb / (0.5f / (1.0f - Kb)) + y;
        const float r = cr / (0.5f / (1.0f - Kr)) + y;
        const float g = (y - Kb * b - Kr * r) / Kg;
        ncfUInt8* const to = destination + i * kB64aPixelBytes;
        StoreBigEndian(to, Word(pixel[0] * kAlphaScale));
        StoreBigEndian(to + 2, Word(Clamped(r * kScale + kOffset)));
        StoreBigEndian(to + 4, Word(Clamped(g * kScale + kOffset)));
        StoreBigEndian(to + 6, Word(Clamped(b * kScale + kOffset)));
    }
}
