// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "source/essence/FloatConversion.h"
#include "source/essence/PixelLevelsWide.h"

// Twins of the kernels that every processor runs, in registers twice as wide.
// They give the same bytes.
extern const LevelKernels kLevelKernelsAvx2;
// Eight pixels a step.
std::size_t ConvertRowAvx2(const LumaWeights& weights, const ncfUInt8* source,
                           ncfUInt8* destination, std::size_t pixels);

struct Avx2Kernels {
    const LevelKernels& levels;
    RowKernel convertRow;
};

// Null where this processor can't run them.
const Avx2Kernels* FindAvx2Kernels();
