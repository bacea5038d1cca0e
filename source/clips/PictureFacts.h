// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "source/clips/FieldDetails.h"

// What a clip knows of its picture.
struct PictureFacts {
    ncfUInt32 width = 0;  // encoded size
    ncfUInt32 height = 0;
    ncfUInt32 aspectNumerator = 0;
    ncfUInt32 aspectDenominator = 0;
    ncfSInt32 isRotated = 0;  // the track's matrix turns the picture by 90 degrees
    ncfSInt32 hasAlpha = 0;
    ncfSInt32 ignoreAlpha = 1;  // until the host says otherwise
    ncfUInt32 colorSpace = kPropertyNotSet;
    ColorDetails color;
    GeometryDetails geometry;
    FieldDetails fields;

    // The rectangles of a picture of this size and ratio, for movies that tell
    // nothing of them.
    void SetDefaultGeometry();
};
