// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>

#include "host_interfaces/framework/Types.h"

class LevelPass;

// Turns a frame of floats in the order A, Y', Cb, Cr into 16-bit big-endian
// words in the order A, R, G, B. Colour comes out in video range, alpha in full
// range. The matrix goes by the size of the picture. Each part of a row has its
// levels set while it is in the processor's cache. Sizes in bytes; rows that one
// side lacks are left out.
void ConvertR4flToB64a(const ncfUInt8* source, ncfUInt8* destination, std::size_t sourceSize,
                       std::size_t destinationSize, ncfUInt32 width, ncfUInt32 height,
                       LevelPass& levels);

// Weights of the three colours in luma, in single precision.
struct LumaWeights {
    float Kr;
    float Kg;
    float Kb;
};
inline constexpr LumaWeights kRec601 = {0.299f, 0.587f, 0.114f};
inline constexpr LumaWeights kRec709 = {0.2126f, 0.7152f, 0.0722f};

// Numbers of both kernels.
inline constexpr float kScale = 56064.0f;
inline constexpr float kOffset = 4096.0f;
inline constexpr float kAlphaScale = 65535.0f;
inline constexpr float kLumaRange = 219.0f / 255.0f;  // the source's luma starts at 0
inline constexpr float kChromaRange = 224.0f / 255.0f;
inline constexpr float kChromaBias = 128.0f / 255.0f;

inline constexpr std::size_t kR4flPixelBytes = 16;
inline constexpr std::size_t kB64aPixelBytes = 8;

// The kernels for a row, of two kinds that round and clamp in ways of their own.
//
// Vector kernels do some pixels a step: to the nearest, ties to even, everything
// held to 0 to 65535. They do the whole groups that `pixels` holds and give their
// count of pixels. All give the same words.
using RowKernel = std::size_t (*)(const LumaWeights& weights, const ncfUInt8* source,
                                  ncfUInt8* destination, std::size_t pixels);
// Groups of four. Needs a processor with SSE4.1.
std::size_t ConvertRowSse41(const LumaWeights& weights, const ncfUInt8* source,
                            ncfUInt8* destination, std::size_t pixels);
// One pixel a step: half added and cut off; colour held to 0 to 65535, alpha
// not, of which the low 16 bits are kept.
void ConvertRowScalar(const LumaWeights& weights, const ncfUInt8* source, ncfUInt8* destination,
                      std::size_t pixels);
