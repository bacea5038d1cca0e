// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/essence/PixelLevelsWide.h"

#include <emmintrin.h>

#include "source/essence/PixelLevelsRules.h"

namespace {

// Instructions that every 64-bit processor of this family has.
struct Sse2 {
    using Block = __m128i;
    static Block Load(const ncfUInt8* from) {
        return _mm_loadu_si128(reinterpret_cast<const Block*>(from));
    }
    static void Store(ncfUInt8* to, Block x) { _mm_storeu_si128(reinterpret_cast<Block*>(to), x); }
    static Block Bytes(int value) { return _mm_set1_epi8(static_cast<char>(value)); }
    static Block Words(int value) { return _mm_set1_epi16(static_cast<short>(value)); }
    static Block Longs(ncfUInt32 value) { return _mm_set1_epi32(static_cast<int>(value)); }
    static Block LongLongs(ncfUInt64 value) {
        return _mm_set1_epi64x(static_cast<long long>(value));
    }
    static Block Or(Block x, Block y) { return _mm_or_si128(x, y); }
    static Block SubtractBytes(Block x, Block y) { return _mm_sub_epi8(x, y); }
    static Block SubtractSaturatedBytes(Block x, Block y) { return _mm_subs_epu8(x, y); }
    static Block AddSaturatedBytes(Block x, Block y) { return _mm_adds_epu8(x, y); }
    static Block AddWords(Block x, Block y) { return _mm_add_epi16(x, y); }
    static Block SubtractSaturatedWords(Block x, Block y) { return _mm_subs_epu16(x, y); }
    static Block AddSaturatedWords(Block x, Block y) { return _mm_adds_epu16(x, y); }
    static Block AverageWords(Block x, Block y) { return _mm_avg_epu16(x, y); }
    static Block MultiplyLowWords(Block x, Block y) { return _mm_mullo_epi16(x, y); }
    static Block MultiplyHighWords(Block x, Block y) { return _mm_mulhi_epu16(x, y); }
    static Block UpperBitOfWords(Block x) { return _mm_srli_epi16(x, 15); }
    static Block SwappedWords(Block x) {
        return _mm_or_si128(_mm_slli_epi16(x, 8), _mm_srli_epi16(x, 8));
    }
    // Bytes times factor / 2^15 to the nearest: the product's upper part, of a
    // byte in the upper half of a word, has seven bits behind the point.
    static Block ScaledBytes(Block x, int factor) {
        const auto scaled = [factor](Block upperHalves) {
            const Block product = _mm_mulhi_epu16(upperHalves, Words(factor));
            return _mm_srli_epi16(_mm_add_epi16(product, Words(64)), 7);
        };
        const Block zero = _mm_setzero_si128();
        return _mm_packus_epi16(scaled(_mm_unpacklo_epi8(zero, x)),
                                scaled(_mm_unpackhi_epi8(zero, x)));
    }
};

}  // namespace

const LevelKernels kLevelKernelsSse2 = kLevelKernelsOf<Sse2>;
