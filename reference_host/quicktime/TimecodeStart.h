// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/framework/Types.h"
#include "reference_host/quicktime/AvOwners.h"

namespace host {

// Where a timecode track starts and how it counts.
struct TimecodeStart {
    ncfUInt8 hours = 0;
    ncfUInt8 minutes = 0;
    ncfUInt8 seconds = 0;
    ncfUInt8 frames = 0;
    ncfUInt32 timeScale = 0;
    ncfUInt32 frameDuration = 0;
    ncfUInt32 framesPerSecond = 0;
    bool isDropFrame = false;
};

// False for a stream that holds no timecode or none that can be read.
bool ReadTimecodeStart(const AVStream& stream, TimecodeStart& out);

}  // namespace host
