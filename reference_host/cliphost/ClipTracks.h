// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <cstdint>
#include <string>
#include <vector>

#include "host_interfaces/aaf/AAFFile.h"

namespace cliphost {

enum class TrackKind { Picture, Alpha, Sound };
const char* NameOf(TrackKind kind);

// A track as the description of a clip tells it; the number is the host's.
struct ClipTrack {
    ncfUInt32 number = 0;
    TrackKind kind = TrackKind::Picture;
    std::uint64_t length = 0;      // frames, or samples of sound
    aafRational_t rate = {0, 1};   // of them a second
    aafRational_t shape = {0, 1};  // width to height of the whole picture
    ncfUInt32 channels = 0;        // of sound

    double RateAsNumber() const {
        return rate.denominator == 0 ? 0.0 : static_cast<double>(rate.numerator) / rate.denominator;
    }
};

// "30000/1001", for a track whose rate is known.
std::string RateText(const ClipTrack& track);
// "25 frames a second", "48000 samples a second", or that this is not known.
std::string RateWords(const ClipTrack& track);

// The tracks of a described clip in the host's order: the picture, its alpha
// where the clip shows one, the sounds. The description is where a host learns
// them; the module's own count of tracks is the movie's, which is another.
std::vector<ClipTrack> ReadClipTracks(IAAFFile* file);

}  // namespace cliphost
