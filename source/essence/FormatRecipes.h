// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "source/essence/MediaFormat.h"

// A format as it is added to a track, with the text under which a failure to
// add it is logged and the line that tells the user.
struct FormatRow {
    ncfUInt32 pixelFormat;
    ncfUInt32 chromaSubSampling;
    ncfUInt32 colorSpace;
    ncfUInt32 componentType;
    ncfUInt32 componentRange;
    QTPixelParams qt_params;
    const char* text;
    const char* line;
};

// What a pixel format of a codec gives for picture and alpha track.
struct RGBRecipe {
    FormatRow video;
    const FormatRow* alpha;  // null: none
};

// The recipe behind a codec's pixel format that reaches the host as RGB, or
// null. `videoRange`: the codec makes its 8-bit RGB in video range.
const RGBRecipe* FindRGBRecipe(ncfUInt32 fourCC, bool videoRange);
