// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "reference_host/quicktime/TimecodeStart.h"

extern "C" {
#include <libavutil/dict.h>
#include <libavutil/intreadwrite.h>
}

#include <cstdio>

namespace host {
namespace {

// The end of the track's sample description: reserved, flags, time scale,
// duration of a frame, frames of a second.
constexpr int kDescriptionBytes = 17;
constexpr ncfUInt32 kDropFrameFlag = 1;

}  // namespace

bool ReadTimecodeStart(const AVStream& stream, TimecodeStart& out) {
    const AVDictionaryEntry* const entry = av_dict_get(stream.metadata, "timecode", nullptr, 0);
    unsigned hours = 0, minutes = 0, seconds = 0, frames = 0;
    char separator = 0;
    if (!entry || std::sscanf(entry->value, "%2u:%2u:%2u%c%3u", &hours, &minutes, &seconds,
                              &separator, &frames) != 5) {
        return false;
    }
    // The library tells no start where the description is shorter.
    const AVCodecParameters& form = *stream.codecpar;
    if (!form.extradata || form.extradata_size < kDescriptionBytes) {
        return false;
    }
    TimecodeStart start;
    start.hours = static_cast<ncfUInt8>(hours);
    start.minutes = static_cast<ncfUInt8>(minutes);
    start.seconds = static_cast<ncfUInt8>(seconds);
    start.frames = static_cast<ncfUInt8>(frames);
    start.isDropFrame = (AV_RB32(form.extradata + 4) & kDropFrameFlag) != 0;
    start.timeScale = AV_RB32(form.extradata + 8);
    start.frameDuration = AV_RB32(form.extradata + 12);
    start.framesPerSecond = form.extradata[16];
    // Nothing can be counted with a zero, of which one byte is looked at.
    if (start.timeScale == 0 || start.frameDuration == 0 || (start.framesPerSecond & 0xFF) == 0 ||
        frames > 0xFF) {
        return false;
    }
    out = start;
    return true;
}

}  // namespace host
