// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "source/essence/FloatConversion.h"

// The vector kernel in four pixels for each 16 bytes of a register. `V` names
// the registers and the instructions. Files that include this are compiled
// without contraction: a fused multiplication would give other words. They share
// no function, or the linker would keep one of them for all processors.

// Factors of a matrix, each worked out in single precision from left to right.
template <class V>
struct MatrixFactors {
    using Floats = typename V::Floats;
    explicit MatrixFactors(const LumaWeights& weights)
        : crToR(V::All(kScale * 2.0f * (1.0f - weights.Kr))),
          cbToG(V::All(kScale * 2.0f * (weights.Kb - 1.0f) * weights.Kb / weights.Kg)),
          crToG(V::All(kScale * 2.0f * (weights.Kr - 1.0f) * weights.Kr / weights.Kg)),
          cbToB(V::All(kScale * 2.0f * (1.0f - weights.Kb))) {}
    Floats crToR;
    Floats cbToG;
    Floats crToG;
    Floats cbToB;
};

// Rounds as the processor is set, to the nearest with ties to even. Not more
// than a word is held here, since a conversion of more would give the least
// number; not less than 0 when words are packed. Of what is not a number the
// comparison gives its second side, the conversion the least number and the
// packing 0.
template <class V>
typename V::Integers Rounded(typename V::Floats value) {
    return V::ToIntegers(V::Minimum(V::All(kAlphaScale), value));
}

template <class V>
void ConvertGroups(const LumaWeights& weights, const ncfUInt8* source, ncfUInt8* destination,
                   std::size_t groups) {
    using Floats = typename V::Floats;
    const MatrixFactors<V> factors(weights);
    for (std::size_t i = 0; i < groups; ++i) {
        Floats a, y, cb, cr;
        V::LoadComponents(source + i * V::kPixels * kR4flPixelBytes, a, y, cb, cr);
        y = V::Multiply(V::Divide(y, V::All(kLumaRange)), V::All(kScale));
        cb = V::Divide(V::Subtract(cb, V::All(kChromaBias)), V::All(kChromaRange));
        cr = V::Divide(V::Subtract(cr, V::All(kChromaBias)), V::All(kChromaRange));
        const Floats offset = V::All(kOffset);
        const Floats r = V::Add(V::Add(y, V::Multiply(cr, factors.crToR)), offset);
        const Floats g = V::Add(
            V::Add(V::Add(y, V::Multiply(cb, factors.cbToG)), V::Multiply(cr, factors.crToG)),
            offset);
        const Floats b = V::Add(V::Add(y, V::Multiply(cb, factors.cbToB)), offset);
        V::StoreWords(destination + i * V::kPixels * kB64aPixelBytes,
                      Rounded<V>(V::Multiply(a, V::All(kAlphaScale))), Rounded<V>(r), Rounded<V>(g),
                      Rounded<V>(b));
    }
}
