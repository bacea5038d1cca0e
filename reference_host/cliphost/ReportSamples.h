// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <nlohmann/json_fwd.hpp>
#include <string>
#include <vector>

#include "host_interfaces/media/SampleMapping.h"
#include "reference_host/cliphost/ClipTracks.h"
#include "reference_host/cliphost/SampleMap.h"

namespace cliphost {

// Where the samples of all tracks lie, in a few numbers: sizes over time, how far it is from one
// picture that stands alone to the next, and where tracks lie far apart that are played together.
// Throws the result of the map that failed.
nlohmann::ordered_json ReadReportSamples(NMA::ISampleMapping& map,
                                         const std::vector<ClipTrack>& tracks,
                                         std::uint64_t fileSize);

// The runs of a track that is played with others.
struct PlayedRuns {
    ncfUInt32 track = 0;
    double rate = 0;  // samples a second
    std::uint64_t samples = 0;
    std::vector<SampleRun> runs;
};
// How far apart in time what lies side by side in the file is, and where it is more than a player
// reads ahead.
nlohmann::ordered_json Interleaving(const std::vector<PlayedRuns>& tracks);

}  // namespace cliphost
