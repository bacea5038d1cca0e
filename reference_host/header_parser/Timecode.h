// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "reference_host/header_parser/Atom.h"

namespace header_parser {

// A timecode sample description (the fields behind 32 bytes of it, wherever
// its reserved bytes end).
struct TimecodeDescription {
    bool isPresent = false;
    ncfUInt32 flags = 0;
    ncfUInt32 timeScale = 0;
    ncfUInt32 frameDuration = 0;
    ncfUInt32 numFrames = 0;

    bool IsDropFrame() const { return (flags & 1) != 0; }
    bool IsCounter() const { return (flags & 8) != 0; }
    // Can be counted with: none of the numbers is 0.
    bool IsUsable() const {
        return isPresent && timeScale != 0 && frameDuration != 0 && numFrames != 0;
    }
};

struct TimecodeAddress {
    ncfUInt8 hours = 0;
    ncfUInt8 minutes = 0;
    ncfUInt8 seconds = 0;
    ncfUInt8 frames = 0;
};

TimecodeDescription ReadTimecodeDescription(const Atom& entry);

// The address that a timecode sample of four bytes stands for. The description
// must be usable.
TimecodeAddress ReadTimecodeSample(const ncfUInt8* sample, const TimecodeDescription& description);

}  // namespace header_parser
