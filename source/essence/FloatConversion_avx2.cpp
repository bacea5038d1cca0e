// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// Eight pixels at a time. Compiled for AVX2: nothing here may run before the
// processor was asked.

#include <immintrin.h>

#include "source/essence/Avx2Kernels.h"
#include "source/essence/FloatConversionGroups.h"

namespace {

struct Avx2 {
    static constexpr std::size_t kPixels = 8;
    using Floats = __m256;
    using Integers = __m256i;

    static Floats All(float value) { return _mm256_set1_ps(value); }
    static Floats Add(Floats x, Floats y) { return _mm256_add_ps(x, y); }
    static Floats Subtract(Floats x, Floats y) { return _mm256_sub_ps(x, y); }
    static Floats Multiply(Floats x, Floats y) { return _mm256_mul_ps(x, y); }
    static Floats Divide(Floats x, Floats y) { return _mm256_div_ps(x, y); }
    static Floats Minimum(Floats x, Floats y) { return _mm256_min_ps(x, y); }
    static Integers ToIntegers(Floats x) { return _mm256_cvtps_epi32(x); }

    // Pixels 0 2 4 6 in the lower half, 1 3 5 7 in the upper one.
    static void LoadComponents(const ncfUInt8* from, Floats& a, Floats& y, Floats& cb, Floats& cr) {
        const auto pair = [from](std::size_t i) {
            return _mm256_loadu_ps(reinterpret_cast<const float*>(from + 32 * i));
        };
        const Floats ay02 = _mm256_unpacklo_ps(pair(0), pair(1));
        const Floats ay46 = _mm256_unpacklo_ps(pair(2), pair(3));
        const Floats cbcr02 = _mm256_unpackhi_ps(pair(0), pair(1));
        const Floats cbcr46 = _mm256_unpackhi_ps(pair(2), pair(3));
        a = _mm256_shuffle_ps(ay02, ay46, 0x44);
        y = _mm256_shuffle_ps(ay02, ay46, 0xEE);
        cb = _mm256_shuffle_ps(cbcr02, cbcr46, 0x44);
        cr = _mm256_shuffle_ps(cbcr02, cbcr46, 0xEE);
    }

    static Integers BigEndianPairs(Integers x, Integers y) {
        return _mm256_shuffle_epi8(_mm256_packus_epi32(x, y),
                                   _mm256_broadcastsi128_si256(_mm_setr_epi8(
                                       1, 0, 9, 8, 3, 2, 11, 10, 5, 4, 13, 12, 7, 6, 15, 14)));
    }
    // Pixels 0 2 1 3 come in; two halves change places.
    static void Store(ncfUInt8* to, Integers words) {
        _mm256_storeu_si256(reinterpret_cast<Integers*>(to), _mm256_permute4x64_epi64(words, 0xD8));
    }
    static void StoreWords(ncfUInt8* to, Integers a, Integers r, Integers g, Integers b) {
        const Integers ar = BigEndianPairs(a, r);
        const Integers gb = BigEndianPairs(g, b);
        Store(to, _mm256_unpacklo_epi32(ar, gb));
        Store(to + 32, _mm256_unpackhi_epi32(ar, gb));
    }
};

}  // namespace

std::size_t ConvertRowAvx2(const LumaWeights& weights, const ncfUInt8* source,
                           ncfUInt8* destination, std::size_t pixels) {
    const std::size_t groups = pixels / Avx2::kPixels;
    ConvertGroups<Avx2>(weights, source, destination, groups);
    return groups * Avx2::kPixels;
}
