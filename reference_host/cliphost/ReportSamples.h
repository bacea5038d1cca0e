// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <nlohmann/json_fwd.hpp>
#include <string>
#include <vector>

#include "reference_host/cliphost/Essence.h"
#include "reference_host/cliphost/SampleMap.h"

namespace cliphost {

// When the media of a track is played, in seconds of the movie.
struct MediaTime {
    double begin = 0;
    double length = 0;
};
// As the header tells it; where it isn't understood, as the clip tells it.
MediaTime MediaTimeOf(const header_parser::HeaderReport& header, const WhichTrack& which,
                      const ClipTrack& track);

// Where the samples of all tracks lie, in a few numbers: sizes over time, how far it is from one
// picture that stands alone to the next, and where tracks lie far apart that are played together.
// Throws the result of the map that failed.
nlohmann::ordered_json ReadReportSamples(const Essence& essence);

// The runs of a track that is played with others.
struct PlayedRuns {
    ncfUInt32 track = 0;
    double begin = 0;  // seconds
    double rate = 0;   // samples a second
    std::uint64_t samples = 0;
    std::vector<SampleRun> runs;
};
// How far apart in time what lies side by side in the file is, and where it is more than a player
// reads ahead.
nlohmann::ordered_json Interleaving(const std::vector<PlayedRuns>& tracks);

}  // namespace cliphost
