// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// Four pixels at a time. The one file that is compiled for SSE4.1, and without
// contraction: a fused multiplication would give other words.

#include <smmintrin.h>

#include <cstdint>

#include "source/essence/FloatConversion.h"

namespace {

// Factors of a matrix, each worked out in single precision from left to right.
struct Factors {
    explicit Factors(const LumaWeights& weights)
        : crToR(kScale * 2.0f * (1.0f - weights.Kr)),
          cbToG(kScale * 2.0f * (weights.Kb - 1.0f) * weights.Kb / weights.Kg),
          crToG(kScale * 2.0f * (weights.Kr - 1.0f) * weights.Kr / weights.Kg),
          cbToB(kScale * 2.0f * (1.0f - weights.Kb)) {}
    float crToR;
    float cbToG;
    float crToG;
    float cbToB;
};

bool IsAligned(const void* address) {
    return reinterpret_cast<std::uintptr_t>(address) % 16 == 0;
}

// What is not a number becomes 0: the comparison then gives its second side.
// Rounds as the processor is set, to the nearest with ties to even.
__m128i Words(__m128 value) {
    const __m128 held = _mm_min_ps(_mm_max_ps(value, _mm_setzero_ps()), _mm_set1_ps(kAlphaScale));
    return _mm_cvtps_epi32(held);
}

template <bool SourceAligned>
__m128 LoadPixel(const ncfUInt8* from) {
    const auto* const floats = reinterpret_cast<const float*>(from);
    return SourceAligned ? _mm_load_ps(floats) : _mm_loadu_ps(floats);
}

template <bool DestinationAligned>
void StoreBigEndian(ncfUInt8* to, __m128i words) {
    const __m128i swapped = _mm_or_si128(_mm_slli_epi16(words, 8), _mm_srli_epi16(words, 8));
    auto* const at = reinterpret_cast<__m128i*>(to);
    if (DestinationAligned) {
        _mm_store_si128(at, swapped);
    } else {
        _mm_storeu_si128(at, swapped);
    }
}

template <bool SourceAligned, bool DestinationAligned>
void ConvertGroups(const Factors& factors, const ncfUInt8* source, ncfUInt8* destination,
                   std::size_t groups) {
    const __m128 scale = _mm_set1_ps(kScale);
    const __m128 offset = _mm_set1_ps(kOffset);
    const __m128 lumaRange = _mm_set1_ps(kLumaRange);
    const __m128 chromaRange = _mm_set1_ps(kChromaRange);
    const __m128 chromaBias = _mm_set1_ps(kChromaBias);
    const __m128 crToR = _mm_set1_ps(factors.crToR);
    const __m128 cbToG = _mm_set1_ps(factors.cbToG);
    const __m128 crToG = _mm_set1_ps(factors.crToG);
    const __m128 cbToB = _mm_set1_ps(factors.cbToB);
    for (std::size_t i = 0; i < groups; ++i) {
        const ncfUInt8* const from = source + i * 4 * kR4flPixelBytes;
        __m128 a = LoadPixel<SourceAligned>(from);
        __m128 y = LoadPixel<SourceAligned>(from + 16);
        __m128 cb = LoadPixel<SourceAligned>(from + 32);
        __m128 cr = LoadPixel<SourceAligned>(from + 48);
        _MM_TRANSPOSE4_PS(a, y, cb, cr);
        y = _mm_mul_ps(_mm_div_ps(y, lumaRange), scale);
        cb = _mm_div_ps(_mm_sub_ps(cb, chromaBias), chromaRange);
        cr = _mm_div_ps(_mm_sub_ps(cr, chromaBias), chromaRange);
        const __m128 r = _mm_add_ps(_mm_add_ps(y, _mm_mul_ps(cr, crToR)), offset);
        const __m128 g = _mm_add_ps(
            _mm_add_ps(_mm_add_ps(y, _mm_mul_ps(cb, cbToG)), _mm_mul_ps(cr, crToG)), offset);
        const __m128 b = _mm_add_ps(_mm_add_ps(y, _mm_mul_ps(cb, cbToB)), offset);
        const __m128i aAndG =
            _mm_packus_epi32(Words(_mm_mul_ps(a, _mm_set1_ps(kAlphaScale))), Words(g));
        const __m128i rAndB = _mm_packus_epi32(Words(r), Words(b));
        const __m128i ar = _mm_unpacklo_epi16(aAndG, rAndB);
        const __m128i gb = _mm_unpackhi_epi16(aAndG, rAndB);
        ncfUInt8* const to = destination + i * 4 * kB64aPixelBytes;
        StoreBigEndian<DestinationAligned>(to, _mm_unpacklo_epi32(ar, gb));
        StoreBigEndian<DestinationAligned>(to + 16, _mm_unpackhi_epi32(ar, gb));
    }
}

}  // namespace

std::size_t ConvertRowVector(const LumaWeights& weights, const ncfUInt8* source,
                             ncfUInt8* destination, std::size_t pixels) {
    const Factors factors(weights);
    const std::size_t groups = pixels / 4;
    if (IsAligned(source)) {
        if (IsAligned(destination)) {
            ConvertGroups<true, true>(factors, source, destination, groups);
        } else {
            ConvertGroups<true, false>(factors, source, destination, groups);
        }
    } else if (IsAligned(destination)) {
        ConvertGroups<false, true>(factors, source, destination, groups);
    } else {
        ConvertGroups<false, false>(factors, source, destination, groups);
    }
    return groups * 4;
}
