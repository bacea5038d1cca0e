// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "reference_host/quicktime/pixels/PixelLayout.h"

namespace host {

bool IsKnownLayout(ncfUInt32 fourCC) {
    switch (static_cast<PixelLayout>(fourCC)) {
        case PixelLayout::Uyvy8:
        case PixelLayout::Yuv10:
        case PixelLayout::Bgra8:
        case PixelLayout::BgraVideo:
        case PixelLayout::Argb16:
        case PixelLayout::AyuvFloat:
            return true;
    }
    return false;
}

std::size_t LineBytes(PixelLayout layout, ncfUInt32 width) {
    const std::size_t pixels = width;
    switch (layout) {
        case PixelLayout::Uyvy8:
            return pixels * 2;
        case PixelLayout::Yuv10:
            return (pixels + 47) / 48 * 128;
        case PixelLayout::Bgra8:
        case PixelLayout::BgraVideo:
            return pixels * 4;
        case PixelLayout::Argb16:
            return pixels * 8;
        case PixelLayout::AyuvFloat:
            return pixels * 16;
    }
    return 0;
}

ncfUInt32 PictureBytes(PixelLayout layout, ncfUInt32 width, ncfUInt32 height) {
    constexpr ncfUInt64 kMost = ncfUInt64{1} << 31;
    const ncfUInt64 line = LineBytes(layout, width);
    if (line == 0 || height == 0 || line > kMost / height) {
        return 0;
    }
    return static_cast<ncfUInt32>(line * height);
}

}  // namespace host
