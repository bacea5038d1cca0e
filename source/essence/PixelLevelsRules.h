// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "source/essence/FormatEnums.h"
#include "source/essence/PixelLevelsWide.h"

// The rules of the level tables in the arithmetic of vector instructions, for
// blocks of any width. `V` names the block and the instructions, with the names
// that they have in the processor's own terms.

// Bytes. Their rules differ from x by a part of it, rounded to the nearest: the
// factor, which is of 15 bits behind the point, is precise enough for a byte.
//
// (x - 16) * 255 / 219 is d + d * 36 / 219, where d stops at 0 and the sum at
// 255.
template <class V>
struct ExpandBytes {
    static typename V::Block Of(typename V::Block x) {
        const auto d = V::SubtractSaturatedBytes(x, V::Bytes(16));
        return V::Or(V::AddSaturatedBytes(d, V::ScaledBytes(d, 5387)), V::Longs(0xFF000000));
    }
};

// x * 219 / 255 + 16 is x - x * 36 / 255 + 16. Alpha gets 255 in place of 16 and
// so stops there.
template <class V>
struct CompressBytes {
    static typename V::Block Of(typename V::Block x) {
        const auto less = V::SubtractBytes(x, V::ScaledBytes(x, 4626));
        return V::AddSaturatedBytes(less, V::Longs(0xFF101010));
    }
};

template <class V>
struct OpaqueBytes {
    static typename V::Block Of(typename V::Block x) { return V::Or(x, V::Longs(0xFF000000)); }
};

// Words times a fraction of 32 bits, cut off: the upper 16 of 48 bits, put
// together from halves. The average of the two parts below has their carry as
// its upper bit. It also adds 1, which `Lower` makes up for.
template <class V, int Upper, int Lower>
typename V::Block TimesFraction(typename V::Block x) {
    const auto below = V::AverageWords(V::MultiplyLowWords(x, V::Words(Upper)),
                                       V::MultiplyHighWords(x, V::Words(Lower)));
    return V::AddWords(V::MultiplyHighWords(x, V::Words(Upper)), V::UpperBitOfWords(below));
}

// (x - 4096) * 1.1688453, cut off and held to a word: d + d * 0.1688453.
template <class V>
typename V::Block ExpandedWords(typename V::Block x) {
    const auto d = V::SubtractSaturatedWords(x, V::Words(4096));
    return V::AddSaturatedWords(d, TimesFraction<V, 11065, 29190>(d));
}

// x * 0.8554818, cut off, plus `more`, which is 4096 for colour; 65535 fills a
// word.
template <class V>
typename V::Block CompressedWords(typename V::Block x, typename V::Block more) {
    return V::AddSaturatedWords(TimesFraction<V, 56064, 56048>(x), more);
}

template <class V>
struct ExpandLittleWords {
    static typename V::Block Of(typename V::Block x) {
        return V::Or(ExpandedWords<V>(x), V::LongLongs(0xFFFF000000000000));
    }
};
template <class V>
struct CompressLittleWords {
    static typename V::Block Of(typename V::Block x) {
        return CompressedWords<V>(x, V::LongLongs(0xFFFF100010001000));
    }
};
template <class V>
struct OpaqueLittleWords {
    static typename V::Block Of(typename V::Block x) {
        return V::Or(x, V::LongLongs(0xFFFF000000000000));
    }
};

template <class V>
struct ExpandBigWords {
    static typename V::Block Of(typename V::Block x) {
        return V::Or(V::SwappedWords(ExpandedWords<V>(V::SwappedWords(x))), V::LongLongs(0xFFFF));
    }
};
template <class V>
struct CompressBigWords {
    static typename V::Block Of(typename V::Block x) {
        return V::SwappedWords(
            CompressedWords<V>(V::SwappedWords(x), V::LongLongs(0x100010001000FFFF)));
    }
};
template <class V>
struct OpaqueBigWords {
    static typename V::Block Of(typename V::Block x) { return V::Or(x, V::LongLongs(0xFFFF)); }
};

template <class V, class Rule>
std::size_t RemapBlocks(ncfUInt8* pixels, std::size_t size) {
    constexpr std::size_t block = sizeof(typename V::Block);
    const std::size_t whole = size - size % block;
    for (std::size_t i = 0; i < whole; i += block) {
        V::Store(pixels + i, Rule::Of(V::Load(pixels + i)));
    }
    return whole;
}

template <class V, template <class> class Expand, template <class> class Compress,
          template <class> class Opaque>
std::size_t RemapByMode(ncfUInt8* pixels, std::size_t size, ncfUInt32 mode) {
    return mode == Expand_Levels     ? RemapBlocks<V, Expand<V>>(pixels, size)
           : mode == Compress_Levels ? RemapBlocks<V, Compress<V>>(pixels, size)
                                     : RemapBlocks<V, Opaque<V>>(pixels, size);
}

template <class V>
inline constexpr LevelKernels kLevelKernelsOf = {
    &RemapByMode<V, ExpandBytes, CompressBytes, OpaqueBytes>,
    &RemapByMode<V, ExpandLittleWords, CompressLittleWords, OpaqueLittleWords>,
    &RemapByMode<V, ExpandBigWords, CompressBigWords, OpaqueBigWords>};
