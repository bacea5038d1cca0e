// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <cstdint>

namespace host {

// The inner loops of the conversions, over lines of plain numbers. The compiler
// makes vector code of them for each kind of processor; all kinds give the same
// numbers.

void WidenBytes(const std::uint8_t* from, int count, float* to);
void WidenStridedBytes(const std::uint8_t* from, int step, int count, float* to);
void WidenWords(const std::uint8_t* from, int shift, int depth, int count, float* to);

// to = a + (b - a) * weight
void BlendRows(const float* a, const float* b, float weight, int count, float* to);

// Rows of one matrix: out = m[0] x + m[1] y + m[2] z + m[3].
struct Affine {
    float m[3][4];
};
void ApplyAffine(const Affine& affine, const float* x, const float* y, const float* z, int count,
                 float* r, float* g, float* b);
void ScaleRow(const float* from, float scale, float offset, int count, float* to);

// Chroma of twice the width: each stored number makes two, the first with `before` of the
// number before it, the second with `behind` of the number behind it. `from` has one number
// more at both ends.
void DoubleChroma(const float* from, float before, float behind, int count, float* to);
// Chroma of half the width: the mean around each even pixel.
void HalveChroma(const float* from, int width, float* to);

void StoreBgra(const float* r, const float* g, const float* b, const float* alpha, int count,
               std::uint8_t* to);
// From Y'CbCr at once: the matrix takes luma alike into all three.
void StoreOpaqueBgra(const Affine& affine, const float* y, const float* cb, const float* cr,
                     int count, std::uint8_t* to);
void StoreArgb16(const float* r, const float* g, const float* b, const float* alpha, int count,
                 std::uint8_t* to);
void StoreAyuvFloat(const float* y, const float* cb, const float* cr, const float* alpha, int count,
                    std::uint8_t* to);
// Numbers are held within the range of `least` to `most`.
void StoreUyvy(const float* luma, const float* cb, const float* cr, int count, float least,
               float most, std::uint8_t* to);
void RoundRow(const float* from, float least, float most, int count, std::uint16_t* to);
void StoreV210(const std::uint16_t* luma, const std::uint16_t* cb, const std::uint16_t* cr,
               int count, std::uint8_t* to);

// For the commonest pictures, without the way through larger numbers.
void StoreUyvyFromBytes(const std::uint8_t* luma, const std::uint8_t* cb, const std::uint8_t* cr,
                        int count, std::uint8_t* to);
// (a * (8 - weight) + b * weight + 4) / 8
void BlendBytes(const std::uint8_t* a, const std::uint8_t* b, int weight, int count,
                std::uint8_t* to);

}  // namespace host
