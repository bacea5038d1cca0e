// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>

#include "host_interfaces/framework/Types.h"

namespace host {

// The layouts in which pictures are delivered; their values are their codes.
enum class PixelLayout : ncfUInt32 {
    Uyvy8 = 0x32767579,      // '2vuy': Cb Y0 Cr Y1
    Yuv10 = 0x76323130,      // 'v210': six pixels in four words
    Bgra8 = 0x42475241,      // 'BGRA': B G R A, full range
    BgraVideo = 0x4E565A32,  // 'NVZ2': the same in video range
    Argb16 = 0x62363461,     // 'b64a': A R G B, big-endian, video range
    AyuvFloat = 0x7234666C,  // 'r4fl': A Y Cb Cr
};

bool IsKnownLayout(ncfUInt32 fourCC);

// Bytes of one line; lines follow each other tightly.
std::size_t LineBytes(PixelLayout layout, ncfUInt32 width);

// Bytes of a picture; 0 when that does not fit what a caller can ask for.
ncfUInt32 PictureBytes(PixelLayout layout, ncfUInt32 width, ncfUInt32 height);

}  // namespace host
