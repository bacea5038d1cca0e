// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "host_interfaces/util/NMAUtil.h"

namespace {

constexpr ncfUInt64 kMinutesPerDay = 24 * 60;

// Frame numbers left out at the start of each minute but every tenth.
ncfUInt32 DroppedEachMinute(ncfUInt32 fps, bool dropFrame) {
    if (!dropFrame) {
        return 0;
    }
    switch (fps) {
        case 30:
            return 2;
        case 60:
            return 4;
        case 120:
            return 8;
        default:
            return 0;
    }
}

ncfUInt64 DroppedBefore(ncfUInt64 minutes, ncfUInt32 eachMinute) {
    return eachMinute * (minutes - minutes / 10);
}

}  // namespace

NCFRESULT ConvertTCToFrames(ncfUInt32 hours, ncfUInt32 minutes, ncfUInt32 seconds, ncfUInt32 frames,
                            ncfUInt32 fps, bool dropFrame, ncfUInt32* out) {
    if (fps == 0 || out == nullptr) {
        return NCF_E_INVALIDARG;
    }
    const ncfUInt64 wholeMinutes = ncfUInt64{hours} * 60 + minutes;
    const ncfUInt64 counted = (wholeMinutes * 60 + seconds) * fps + frames;
    const ncfUInt64 dropped = DroppedBefore(wholeMinutes, DroppedEachMinute(fps, dropFrame));
    *out = static_cast<ncfUInt32>(counted - dropped);
    return NCF_OK;
}

ncfUInt32 GetMaxDuration(ncfUInt32 fps, bool dropFrame) {
    const ncfUInt64 counted = ncfUInt64{86400} * fps;
    return static_cast<ncfUInt32>(counted -
                                  DroppedBefore(kMinutesPerDay, DroppedEachMinute(fps, dropFrame)));
}
