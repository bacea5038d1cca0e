// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <filesystem>
#include <optional>
#include <vector>

#include "host_interfaces/framework/Types.h"
#include "reference_host/header_parser/StoredAtom.h"

namespace host {

// What a movie file says of itself that the multimedia library keeps to itself.
// All of it is optional: files of other families and damaged ones give what
// could be read.
struct MovieAtoms {
    struct Edit {
        ncfUInt64 duration = 0;   // movie time units
        ncfSInt64 mediaTime = 0;  // below 0: empty
    };
    struct Track {
        ncfUInt32 id = 0;
        ncfUInt64 duration = 0;  // movie time units
        ncfUInt32 descriptionCount = 0;
        // Samples, from 0, that have another description than the one before.
        std::vector<ncfUInt64> descriptionChanges;
        bool needsOtherFiles = false;
        // Of linear sound whose first description has an atom `pcmC`: bits of a
        // number, 0 for none, and whether its low byte comes first.
        ncfUInt32 linearBits = 0;
        bool isLittleEndian = false;
        ncfUInt32 mediaTimeScale = 0;
        ncfUInt64 mediaDuration = 0;  // media time units, as its header tells
        std::optional<header_parser::StoredTable> durations;  // of runs of samples
        // Of pictures, as the first description has it.
        ncfUInt32 width = 0;
        ncfUInt32 height = 0;
        std::vector<Edit> edits;  // none where some do not play as fast as the media
    };
    ncfUInt32 timeScale = 0;  // 0: no movie header was found
    ncfUInt64 duration = 0;
    bool isFragmented = false;
    std::vector<Track> tracks;

    const Track* Find(ncfUInt32 id) const;
};

MovieAtoms ReadMovieAtoms(const std::filesystem::path& path);

// Samples of a track by the table of their durations, and what they last in sum.
struct SampleDurations {
    ncfUInt64 samples = 0;
    ncfUInt64 units = 0;  // media time units
};
// Nothing where there is no such table, or its sum is beyond 63 bits.
std::optional<SampleDurations> SumDurations(const std::filesystem::path& path,
                                            const MovieAtoms::Track& track);

}  // namespace host
