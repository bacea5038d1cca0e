// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/essence/PixelLevelsWide.h"

#include <emmintrin.h>

#include "source/essence/FormatEnums.h"

// Instructions that every 64-bit processor of this family has.

namespace {

__m128i Words(int value) {
    return _mm_set1_epi16(static_cast<short>(value));
}

// Eight components of a byte each, widened to words.
//
// (x - 16) * 255 / 219 to the nearest is (255 d + 109) / 219 cut off, where d
// stops at 0; the division is a multiplication by 1197 / 2^18, which is exact
// for every d that there is. The packing that follows stops at 255.
struct ExpandBytes {
    static __m128i Of(__m128i x) {
        const __m128i d = _mm_subs_epu16(x, Words(16));
        const __m128i scaled = _mm_add_epi16(_mm_mullo_epi16(d, Words(255)), Words(109));
        return _mm_srli_epi16(_mm_mulhi_epu16(scaled, Words(1197)), 2);
    }
};

// x * 219 / 255 to the nearest is (219 x + 127) / 255 cut off, and a division
// of any word by 255 is a multiplication by 0x8081 / 2^23.
struct CompressBytes {
    static __m128i Of(__m128i x) {
        const __m128i scaled = _mm_add_epi16(_mm_mullo_epi16(x, Words(219)), Words(127));
        const __m128i quotient = _mm_srli_epi16(_mm_mulhi_epu16(scaled, Words(0x8081)), 7);
        return _mm_add_epi16(quotient, Words(16));
    }
};

// Words times a fraction of 32 bits, cut off: the upper part of a product of 48
// bits, put together from halves with the carry between them.
template <ncfUInt32 Fraction>
__m128i TimesFraction(__m128i x) {
    const __m128i upper = Words(static_cast<int>(Fraction >> 16));
    const __m128i lower = Words(static_cast<int>(Fraction & 0xFFFF));
    const __m128i middle = _mm_mullo_epi16(x, upper);
    const __m128i fromBelow = _mm_mulhi_epu16(x, lower);
    // Their sum passes 65535 unless this difference stops at 0.
    const __m128i beyond = _mm_subs_epu16(fromBelow, _mm_xor_si128(middle, _mm_set1_epi16(-1)));
    const __m128i noCarry = _mm_cmpeq_epi16(beyond, _mm_setzero_si128());
    return _mm_add_epi16(_mm_add_epi16(_mm_mulhi_epu16(x, upper), Words(1)), noCarry);
}

// (x - 4096) * 1.1688453, cut off and held to a word: d + d * 0.1688453.
struct ExpandWords {
    static __m128i Of(__m128i x) {
        const __m128i d = _mm_subs_epu16(x, Words(4096));
        return _mm_adds_epu16(d, TimesFraction<725185039u>(d));
    }
};

// x * 0.8554818, cut off, plus 4096.
struct CompressWords {
    static __m128i Of(__m128i x) {
        return _mm_add_epi16(TimesFraction<3674266352u>(x), Words(4096));
    }
};

struct Unchanged {
    static __m128i Of(__m128i x) { return x; }
};

__m128i SwappedBytes(__m128i words) {
    return _mm_or_si128(_mm_slli_epi16(words, 8), _mm_srli_epi16(words, 8));
}

template <class Block>
std::size_t ForEachBlock(ncfUInt8* pixels, std::size_t size, Block block) {
    const std::size_t whole = size - size % sizeof(__m128i);
    for (std::size_t i = 0; i < whole; i += sizeof(__m128i)) {
        auto* const at = reinterpret_cast<__m128i*>(pixels + i);
        _mm_storeu_si128(at, block(_mm_loadu_si128(at)));
    }
    return whole;
}

template <class Rule>
std::size_t RemapBytes(ncfUInt8* pixels, std::size_t size) {
    const __m128i opaque = _mm_set1_epi32(static_cast<int>(0xFF000000u));
    return ForEachBlock(pixels, size, [&](__m128i x) {
        const __m128i zero = _mm_setzero_si128();
        const __m128i low = Rule::Of(_mm_unpacklo_epi8(x, zero));
        const __m128i high = Rule::Of(_mm_unpackhi_epi8(x, zero));
        return _mm_or_si128(_mm_packus_epi16(low, high), opaque);
    });
}

template <>
std::size_t RemapBytes<Unchanged>(ncfUInt8* pixels, std::size_t size) {
    const __m128i opaque = _mm_set1_epi32(static_cast<int>(0xFF000000u));
    return ForEachBlock(pixels, size, [&](__m128i x) { return _mm_or_si128(x, opaque); });
}

template <class Rule>
std::size_t RemapLittleWords(ncfUInt8* pixels, std::size_t size) {
    const __m128i opaque = _mm_set_epi16(-1, 0, 0, 0, -1, 0, 0, 0);
    return ForEachBlock(pixels, size, [&](__m128i x) { return _mm_or_si128(Rule::Of(x), opaque); });
}

template <class Rule>
std::size_t RemapBigWords(ncfUInt8* pixels, std::size_t size) {
    const __m128i opaque = _mm_set_epi16(0, 0, 0, -1, 0, 0, 0, -1);
    return ForEachBlock(pixels, size, [&](__m128i x) {
        return _mm_or_si128(SwappedBytes(Rule::Of(SwappedBytes(x))), opaque);
    });
}

}  // namespace

std::size_t RemapBytesWide(ncfUInt8* pixels, std::size_t size, ncfUInt32 mode) {
    return mode == Expand_Levels     ? RemapBytes<ExpandBytes>(pixels, size)
           : mode == Compress_Levels ? RemapBytes<CompressBytes>(pixels, size)
                                     : RemapBytes<Unchanged>(pixels, size);
}

std::size_t RemapLittleWordsWide(ncfUInt8* pixels, std::size_t size, ncfUInt32 mode) {
    return mode == Expand_Levels     ? RemapLittleWords<ExpandWords>(pixels, size)
           : mode == Compress_Levels ? RemapLittleWords<CompressWords>(pixels, size)
                                     : RemapLittleWords<Unchanged>(pixels, size);
}

std::size_t RemapBigWordsWide(ncfUInt8* pixels, std::size_t size, ncfUInt32 mode) {
    return mode == Expand_Levels     ? RemapBigWords<ExpandWords>(pixels, size)
           : mode == Compress_Levels ? RemapBigWords<CompressWords>(pixels, size)
                                     : RemapBigWords<Unchanged>(pixels, size);
}
