// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// Four pixels at a time. Compiled for SSE4.1.

#include <smmintrin.h>

#include <cstdint>

#include "source/essence/FloatConversionGroups.h"

namespace {

bool IsAligned(const void* address) {
    return reinterpret_cast<std::uintptr_t>(address) % 16 == 0;
}

template <bool SourceAligned, bool DestinationAligned>
struct Sse41 {
    static constexpr std::size_t kPixels = 4;
    using Floats = __m128;
    using Integers = __m128i;

    static Floats All(float value) { return _mm_set1_ps(value); }
    static Floats Add(Floats x, Floats y) { return _mm_add_ps(x, y); }
    static Floats Subtract(Floats x, Floats y) { return _mm_sub_ps(x, y); }
    static Floats Multiply(Floats x, Floats y) { return _mm_mul_ps(x, y); }
    static Floats Divide(Floats x, Floats y) { return _mm_div_ps(x, y); }
    static Floats Minimum(Floats x, Floats y) { return _mm_min_ps(x, y); }
    static Integers ToIntegers(Floats x) { return _mm_cvtps_epi32(x); }

    static Floats LoadPixel(const ncfUInt8* from) {
        const auto* const floats = reinterpret_cast<const float*>(from);
        return SourceAligned ? _mm_load_ps(floats) : _mm_loadu_ps(floats);
    }
    static void LoadComponents(const ncfUInt8* from, Floats& a, Floats& y, Floats& cb, Floats& cr) {
        a = LoadPixel(from);
        y = LoadPixel(from + 16);
        cb = LoadPixel(from + 32);
        cr = LoadPixel(from + 48);
        _MM_TRANSPOSE4_PS(a, y, cb, cr);
    }

    static void Store(ncfUInt8* to, Integers words) {
        auto* const at = reinterpret_cast<Integers*>(to);
        if (DestinationAligned) {
            _mm_store_si128(at, words);
        } else {
            _mm_storeu_si128(at, words);
        }
    }
    // Words x0 x1 x2 x3 y0 y1 y2 y3 as big-endian pairs x0 y0, x1 y1 and so on.
    static Integers BigEndianPairs(Integers x, Integers y) {
        return _mm_shuffle_epi8(_mm_packus_epi32(x, y), _mm_setr_epi8(1, 0, 9, 8, 3, 2, 11, 10, 5,
                                                                      4, 13, 12, 7, 6, 15, 14));
    }
    static void StoreWords(ncfUInt8* to, Integers a, Integers r, Integers g, Integers b) {
        const Integers ar = BigEndianPairs(a, r);
        const Integers gb = BigEndianPairs(g, b);
        Store(to, _mm_unpacklo_epi32(ar, gb));
        Store(to + 16, _mm_unpackhi_epi32(ar, gb));
    }
};

}  // namespace

std::size_t ConvertRowSse41(const LumaWeights& weights, const ncfUInt8* source,
                            ncfUInt8* destination, std::size_t pixels) {
    const std::size_t groups = pixels / 4;
    constexpr decltype(&ConvertGroups<Sse41<false, false>>) kConvert[2][2] = {
        {&ConvertGroups<Sse41<false, false>>, &ConvertGroups<Sse41<false, true>>},
        {&ConvertGroups<Sse41<true, false>>, &ConvertGroups<Sse41<true, true>>}};
    kConvert[IsAligned(source)][IsAligned(destination)](weights, source, destination, groups);
    return groups * 4;
}
