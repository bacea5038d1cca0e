// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#pragma once

#include <vector>

#include "host_interfaces/framework/Types.h"

// What the shipped data files are to say of movies: one row for each raster that
// a code comes in, written down from public registers and not from the files.
// A movie of a row, made by a program or by a movie builder, must be described
// so.

enum class KnownKind { kCDCI, kMPEG2 };

struct KnownRecord {
    // Of the sample description.
    char code[5];
    char vendor[5];  // "" for none
    ncfUInt32 width;
    ncfUInt32 height;  // of a frame
    ncfUInt32 fields;  // 1, 2, or 0 where the movie does not tell
    // Of the description.
    ncfUInt32 id;
    KnownKind kind;
    ncfUInt32 frameLayout;
    ncfUInt32 storedWidth;
    ncfUInt32 storedHeight;
    ncfUInt32 displayHeight;
    ncfSInt32 firstLines[2];
    ncfUInt32 aspect[2];
};

// What all movies of a code have in common.
struct KnownCode {
    char code[5];
    char coding[37];     // identifier of the picture coding in an AAF file
    char container[37];  // the same of the container
    ncfUInt32 depth;
    ncfUInt32 horizontalSubsampling;
    ncfUInt32 verticalSubsampling;
    ncfUInt32 siting;
};

const std::vector<KnownRecord>& KnownRecords();
const std::vector<KnownCode>& KnownCodes();
