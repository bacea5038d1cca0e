// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// Blocks of 32 bytes. Compiled for AVX2: nothing here may run before the
// processor was asked.

#include <immintrin.h>

#include "source/essence/Avx2Kernels.h"
#include "source/essence/PixelLevelsRules.h"

namespace {

struct Avx2 {
    using Block = __m256i;
    static Block Load(const ncfUInt8* from) {
        return _mm256_loadu_si256(reinterpret_cast<const Block*>(from));
    }
    static void Store(ncfUInt8* to, Block x) {
        _mm256_storeu_si256(reinterpret_cast<Block*>(to), x);
    }
    static Block Bytes(int value) { return _mm256_set1_epi8(static_cast<char>(value)); }
    static Block Words(int value) { return _mm256_set1_epi16(static_cast<short>(value)); }
    static Block Longs(ncfUInt32 value) { return _mm256_set1_epi32(static_cast<int>(value)); }
    static Block LongLongs(ncfUInt64 value) {
        return _mm256_set1_epi64x(static_cast<long long>(value));
    }
    static Block Or(Block x, Block y) { return _mm256_or_si256(x, y); }
    static Block SubtractBytes(Block x, Block y) { return _mm256_sub_epi8(x, y); }
    static Block SubtractSaturatedBytes(Block x, Block y) { return _mm256_subs_epu8(x, y); }
    static Block AddSaturatedBytes(Block x, Block y) { return _mm256_adds_epu8(x, y); }
    static Block AddWords(Block x, Block y) { return _mm256_add_epi16(x, y); }
    static Block SubtractSaturatedWords(Block x, Block y) { return _mm256_subs_epu16(x, y); }
    static Block AddSaturatedWords(Block x, Block y) { return _mm256_adds_epu16(x, y); }
    static Block AverageWords(Block x, Block y) { return _mm256_avg_epu16(x, y); }
    static Block MultiplyLowWords(Block x, Block y) { return _mm256_mullo_epi16(x, y); }
    static Block MultiplyHighWords(Block x, Block y) { return _mm256_mulhi_epu16(x, y); }
    static Block UpperBitOfWords(Block x) { return _mm256_srli_epi16(x, 15); }
    static Block SwappedWords(Block x) {
        return _mm256_shuffle_epi8(x, _mm256_broadcastsi128_si256(_mm_setr_epi8(
                                          1, 0, 3, 2, 5, 4, 7, 6, 9, 8, 11, 10, 13, 12, 15, 14)));
    }
    // Bytes times factor / 2^15 to the nearest.
    static Block ScaledBytes(Block x, int factor) {
        const Block zero = _mm256_setzero_si256();
        return _mm256_packus_epi16(
            _mm256_mulhrs_epi16(_mm256_unpacklo_epi8(x, zero), Words(factor)),
            _mm256_mulhrs_epi16(_mm256_unpackhi_epi8(x, zero), Words(factor)));
    }
};

}  // namespace

const LevelKernels kLevelKernelsAvx2 = kLevelKernelsOf<Avx2>;
