// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>

#include "host_interfaces/framework/Types.h"

// Rescales the colour of a finished frame in place as the user's level mode
// asks, and makes it opaque, which it does in every mode: alpha of a picture
// travels on the alpha track. Frames that are not RGB stay as they are. Of a
// pixel that is cut off at the end, what is there is done.
//
// Whoever makes a frame may send it through in parts, in order.
class LevelPass {
public:
    LevelPass(ncfUInt32 pixelFormat, ncfUInt32 componentType, ncfUInt8* buffer, std::size_t size,
              ncfUInt32 levelMode);

    // Does what is not done yet of the bytes before `end`, which is the end of a pixel.
    void UpTo(std::size_t end);
    void Finish() { UpTo(size_); }

private:
    using Remap = void (*)(ncfUInt8* pixels, std::size_t size, ncfUInt32 mode);

    Remap remap_;  // null: such a frame stays as it is
    ncfUInt8* buffer_;
    std::size_t size_;
    std::size_t done_ = 0;
    ncfUInt32 mode_;
};

// The whole frame at once.
void RemapPixelLevels(ncfUInt32 pixelFormat, ncfUInt32 componentType, ncfUInt8* buffer,
                      ncfUInt64 sizeInBytes, const ncfUInt32* levelMode);
