// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>

#include "host_interfaces/framework/Types.h"

class LevelPass;

// Conversions that pick the alpha of a decoded frame. Sizes in bytes; as many
// pixels are done as both sides hold. Alpha has no levels: they leave the pass to
// their caller.

// Byte 3 of each 'BGRA' pixel.
void ExtractAlpha8(const ncfUInt8* source, ncfUInt8* destination, std::size_t sourceSize,
                   std::size_t destinationSize, ncfUInt32 width, ncfUInt32 height,
                   LevelPass& levels);

// Ten bits of alpha in two planes of one byte a pixel: the upper eight bits,
// then, width times height bytes on, the lower two.
void ExtractAlpha10FromB64a(const ncfUInt8* source, ncfUInt8* destination, std::size_t sourceSize,
                            std::size_t destinationSize, ncfUInt32 width, ncfUInt32 height,
                            LevelPass& levels);
// The same from floats, where 1.0 is 1023. Nothing is clamped: above 1 the
// upper part is cut to its byte, and what is no number of 32 bits gives 0.
void ExtractAlpha10FromR4fl(const ncfUInt8* source, ncfUInt8* destination, std::size_t sourceSize,
                            std::size_t destinationSize, ncfUInt32 width, ncfUInt32 height,
                            LevelPass& levels);
