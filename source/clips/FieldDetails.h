// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/framework/Console.h"
#include "source/clips/ClipRecords.h"

// How the fields of the picture lie and follow each other.
struct FieldDetails {
    ncfUInt32 order = kPropertyNotSet;   // a TemporalFieldOrder
    ncfUInt32 layout = kPropertyNotSet;  // a FrameBufferLayout
    ncfUInt32 lineOrientation = 1;

    // By the size of the picture alone.
    void ApplySize(ncfUInt32 width, ncfUInt32 height);
    // What the movie says, and over it the user's choice, which learns what was detected.
    void Apply(bool interlaced, bool topFieldFirst, bool split, ClipParams& params,
               const NCFSmartPtr<INCFConsole>& console);
};
