// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "reference_host/quicktime/AvOwners.h"

extern "C" {
#include <libavutil/pixdesc.h>
}

namespace host {

// Weights of red and blue in luma.
struct LumaWeights {
    double red;
    double blue;
    bool operator==(const LumaWeights& other) const {
        return red == other.red && blue == other.blue;
    }
};
inline constexpr LumaWeights kRec601{0.299, 0.114};
inline constexpr LumaWeights kRec709{0.2126, 0.0722};

// What a picture of this size is taken for when it does not say.
LumaWeights WeightsForSize(int width, int height);

// Whether it names a matrix that is known; for others the size decides.
bool NamesMatrix(AVColorSpace space);

// Formats whose names say that they have full range.
bool IsFullRangeByName(AVPixelFormat format);

// How the numbers of a decoded picture are to be understood.
struct PictureForm {
    explicit PictureForm(const AVFrame& frame);

    const AVPixFmtDescriptor* description;
    int width;
    int height;
    int depth;   // bits of a number
    bool isRgb;  // grey counts as R'G'B'
    bool isGrey;
    bool isPalette;
    bool isFloat;
    bool hasAlpha;
    bool isFullRange;
    bool isInterlaced;
    int chromaShiftX;  // a chroma sample for each 1 << shift pixels
    int chromaShiftY;
    double chromaSiteX;  // place of the first, in pixels
    double chromaSiteY;
    LumaWeights weights;    // of Y'CbCr; those of the size where none are told
    bool isStandardMatrix;  // Rec. 601 or 709, or not told

    // Whether the kernels read it as it is; others go through the library's
    // own conversion first.
    static bool CanRead(AVPixelFormat format);
};

}  // namespace host
