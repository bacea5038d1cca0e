// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <cstdint>
#include <optional>
#include <string>
#include <vector>

#include "host_interfaces/media/SampleMapping.h"
#include "reference_host/cliphost/TemporalOffsets.h"

namespace cliphost {

// A stored sample as the module's map tells it, in the order of decoding.
struct MappedSample {
    std::uint64_t number = 0;
    std::uint64_t position = 0;
    std::uint64_t size = 0;
    // How many samples on lies the one displayed at this place; none where the
    // module can't find it, as with pictures of uneven durations.
    std::optional<std::int64_t> temporalOffset;
    std::uint64_t properties = 0;
    std::uint32_t dependencies = 0;
    std::int64_t contiguousSamples = 0;  // -1 is an answer too
    std::uint64_t contiguousBytes = 0;
};
// The result is the module's; a missing temporal offset is no failure. A caller that
// reads all samples of a track passes its `offsets`.
NCFRESULT ReadMappedSample(NMA::ISampleMapping& map, ncfUInt32 track, std::uint64_t number,
                           MappedSample& sample, TemporalOffsets* offsets = nullptr);
// "stands alone" and the like, the number itself when it is not known.
std::string WordsForProperties(std::uint64_t properties);

// Samples whose bytes follow each other in the file.
struct SampleRun {
    std::uint64_t first = 0;
    std::uint64_t count = 0;
    std::uint64_t position = 0;
    std::uint64_t bytes = 0;
};

// The runs of a track, with what was found wrong with them: every run must lie
// inside the file, its bytes must be the sum of its samples' sizes, and the runs
// must hold every sample once. Samples at one place are those of one packet, whose
// size each of them has.
struct RunMap {
    std::uint64_t samples = 0;
    std::uint64_t bytes = 0;  // of all samples
    std::vector<SampleRun> runs;
    std::vector<std::string> faults;
    NCFRESULT result = NCF_OK;  // of the query that failed
};
RunMap ReadRuns(NMA::ISampleMapping& map, ncfUInt32 track, std::uint64_t fileSize);

}  // namespace cliphost
