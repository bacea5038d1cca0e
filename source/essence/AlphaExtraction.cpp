// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/essence/AlphaExtraction.h"

#include <emmintrin.h>

#include <algorithm>
#include <cstring>

// The wide loops use what every 64-bit processor of this family has; the plain
// ones after them do the same for the rest of the pixels.

namespace {

__m128i Load(const ncfUInt8* from) {
    return _mm_loadu_si128(reinterpret_cast<const __m128i*>(from));
}
void Store(ncfUInt8* to, __m128i value) {
    _mm_storeu_si128(reinterpret_cast<__m128i*>(to), value);
}

// Sixteen numbers below 256 as bytes.
__m128i Bytes(const __m128i (&fours)[4]) {
    return _mm_packus_epi16(_mm_packs_epi32(fours[0], fours[1]),
                            _mm_packs_epi32(fours[2], fours[3]));
}

// The first 32 bits of each 64.
__m128i LowHalves(__m128i first, __m128i second) {
    return _mm_castps_si128(
        _mm_shuffle_ps(_mm_castsi128_ps(first), _mm_castsi128_ps(second), 0x88));
}

// Pixels for which there is a source and a place in both planes.
std::size_t PlanarCount(std::size_t sourcePixels, std::size_t destinationSize, ncfUInt32 width,
                        ncfUInt32 height) {
    const std::size_t plane = std::size_t{width} * height;
    const std::size_t behind = destinationSize > plane ? destinationSize - plane : 0;
    return std::min({sourcePixels, destinationSize / 2, plane, behind});
}

ncfSInt32 TenBits(float alpha) {
    const float scaled = alpha * 1023.0f + 0.5f;
    // Not a number fails the comparison too.
    return scaled > -2147483648.0f && scaled < 2147483648.0f ? static_cast<ncfSInt32>(scaled) : 0;
}

// The alphas of four float pixels.
__m128 FourAlphas(const ncfUInt8* from) {
    const auto pixel = [from](int i) { return _mm_castsi128_ps(Load(from + 16 * i)); };
    return _mm_movelh_ps(_mm_unpacklo_ps(pixel(0), pixel(1)), _mm_unpacklo_ps(pixel(2), pixel(3)));
}

}  // namespace

void ExtractAlpha8(const ncfUInt8* source, ncfUInt8* destination, std::size_t sourceSize,
                   std::size_t destinationSize, ncfUInt32, ncfUInt32, LevelPass&) {
    const std::size_t count = std::min(sourceSize / 4, destinationSize);
    std::size_t i = 0;
    for (; i + 16 <= count; i += 16) {
        __m128i alphas[4];
        for (std::size_t j = 0; j < 4; ++j) {
            alphas[j] = _mm_srli_epi32(Load(source + 4 * i + 16 * j), 24);
        }
        Store(destination + i, Bytes(alphas));
    }
    for (; i < count; ++i) {
        destination[i] = source[4 * i + 3];
    }
}

// The first byte of a pixel holds the upper eight of its ten bits, the second
// begins with the lower two.
void ExtractAlpha10FromB64a(const ncfUInt8* source, ncfUInt8* destination, std::size_t sourceSize,
                            std::size_t destinationSize, ncfUInt32 width, ncfUInt32 height,
                            LevelPass&) {
    const std::size_t count = PlanarCount(sourceSize / 8, destinationSize, width, height);
    ncfUInt8* const plane2 = destination + std::size_t{width} * height;
    std::size_t i = 0;
    for (; i + 16 <= count; i += 16) {
        __m128i upper[4];
        __m128i lower[4];
        for (std::size_t j = 0; j < 4; ++j) {
            const ncfUInt8* const at = source + 8 * i + 32 * j;
            const __m128i alphas = LowHalves(Load(at), Load(at + 16));
            upper[j] = _mm_and_si128(alphas, _mm_set1_epi32(0xFF));
            lower[j] = _mm_and_si128(_mm_srli_epi32(alphas, 14), _mm_set1_epi32(3));
        }
        Store(destination + i, Bytes(upper));
        Store(plane2 + i, Bytes(lower));
    }
    for (; i < count; ++i) {
        destination[i] = source[8 * i];
        plane2[i] = static_cast<ncfUInt8>(source[8 * i + 1] >> 6);
    }
}

// A conversion that is out of range gives the least number, of which both
// planes hold zeros: the same as 0.
void ExtractAlpha10FromR4fl(const ncfUInt8* source, ncfUInt8* destination, std::size_t sourceSize,
                            std::size_t destinationSize, ncfUInt32 width, ncfUInt32 height,
                            LevelPass&) {
    const std::size_t count = PlanarCount(sourceSize / 16, destinationSize, width, height);
    ncfUInt8* const plane2 = destination + std::size_t{width} * height;
    std::size_t i = 0;
    for (; i + 16 <= count; i += 16) {
        __m128i upper[4];
        __m128i lower[4];
        for (std::size_t j = 0; j < 4; ++j) {
            const __m128 scaled =
                _mm_add_ps(_mm_mul_ps(FourAlphas(source + 16 * i + 64 * j), _mm_set1_ps(1023.0f)),
                           _mm_set1_ps(0.5f));
            const __m128i values = _mm_cvttps_epi32(scaled);
            upper[j] = _mm_and_si128(_mm_srli_epi32(values, 2), _mm_set1_epi32(0xFF));
            lower[j] = _mm_and_si128(values, _mm_set1_epi32(3));
        }
        Store(destination + i, Bytes(upper));
        Store(plane2 + i, Bytes(lower));
    }
    for (; i < count; ++i) {
        float alpha = 0.0f;
        std::memcpy(&alpha, source + 16 * i, sizeof alpha);
        const auto value = static_cast<ncfUInt32>(TenBits(alpha));
        destination[i] = static_cast<ncfUInt8>(value >> 2);
        plane2[i] = static_cast<ncfUInt8>(value & 3);
    }
}
