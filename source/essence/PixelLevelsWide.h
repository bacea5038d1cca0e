// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>

#include "host_interfaces/framework/Types.h"

// The level pass over blocks of many bytes, by arithmetic that gives the entries
// of the level tables exactly. Each kernel does the whole blocks at the start of
// `pixels` and gives their bytes, whole pixels if it began with one.
struct LevelKernels {
    using Kernel = std::size_t (*)(ncfUInt8* pixels, std::size_t size, ncfUInt32 mode);
    Kernel bytes;        // B G R A, a byte each
    Kernel littleWords;  // little-endian words, alpha last
    Kernel bigWords;     // big-endian words, alpha first
};

// Blocks of sixteen bytes, for every processor.
extern const LevelKernels kLevelKernelsSse2;
