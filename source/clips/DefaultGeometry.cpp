// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// The rectangles of a picture whose movie tells nothing of them, worked out of
// size and ratio.

#include "source/clips/PictureFacts.h"

namespace {

// Products wrap at 32 bits, as the numbers of the description do.
ncfSInt32 Wrapped(ncfSInt32 a, ncfSInt32 b) {
    return static_cast<ncfSInt32>(static_cast<ncfUInt32>(a) * static_cast<ncfUInt32>(b));
}

ncfSInt32 Negated(ncfSInt32 a) {
    return static_cast<ncfSInt32>(0u - static_cast<ncfUInt32>(a));
}

// Whole numbers lose their denominator; nothing else is reduced.
Rational Simplified(ncfSInt32 numerator, ncfSInt32 denominator) {
    if (denominator != 0 && denominator != -1 && numerator % denominator == 0) {
        return Rational{numerator / denominator, 1};
    }
    return Rational{numerator, denominator};
}

// Within 15 per cent of the area of a standard-definition raster.
bool IsNearStandardRaster(ncfUInt32 w, ncfUInt32 h) {
    const double v = 1.0 * w * h / (h < 487 ? 345600.0 : 414720.0);
    return 0.85 < v && v < 1.15;
}

bool IsHighDefinitionRaster(ncfUInt32 w, ncfUInt32 h) {
    return (w == 1920 && h == 1080) || (w == 1280 && h == 720) ||
           (h == 1080 && (w == 1440 || w == 1280));
}

}  // namespace

// One rectangle for all four, centred on the origin. Standard rasters are
// scaled to the width that their ratio has in square pixels.
void PictureFacts::SetDefaultGeometry() {
    const ncfUInt32 w = isRotated ? height : width;
    const ncfUInt32 h = isRotated ? width : height;
    const auto an = static_cast<ncfSInt32>(aspectNumerator);
    const auto ad = static_cast<ncfSInt32>(aspectDenominator);
    ncfSInt32 scale = 1;
    ncfSInt32 div = 1;
    if (an == 4 && ad == 3) {
        if (IsNearStandardRaster(w, h)) {
            scale = 1440;
            div = static_cast<ncfSInt32>(w);
        }
    } else if (an == 16 && ad == 9) {
        if (IsHighDefinitionRaster(w, h)) {
            scale = 1920;
            div = static_cast<ncfSInt32>(w);
        } else if (IsNearStandardRaster(w, h)) {
            scale = 1920;
            div = 720;
        }
    }
    BoundsBox box;
    box.width = Simplified(Wrapped(Wrapped(static_cast<ncfSInt32>(w), scale), 5), Wrapped(div, 6));
    box.height = Simplified(Wrapped(box.width.numerator, ad), Wrapped(box.width.denominator, an));
    box.positionY = Simplified(Negated(box.height.numerator), Wrapped(box.height.denominator, 2));
    box.positionX = Simplified(Negated(box.width.numerator), Wrapped(box.width.denominator, 2));
    geometry = GeometryDetails{box, box, box, box};
}
