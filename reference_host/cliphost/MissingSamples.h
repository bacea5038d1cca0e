// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <cstdint>
#include <optional>
#include <string>
#include <vector>

#include "reference_host/header_parser/InspectHeaders.h"

namespace cliphost {

// The samples of a track that are beyond the end of the file, by the numbers of its
// table. They need not be the last ones: chunks may be stored in any order. Samples
// that the header places in another file are not among them.
class MissingSamples {
public:
    // `place`: of the track in the file.
    MissingSamples(const header_parser::HeaderReport& header, std::size_t place);

    bool IsEmpty() const { return runs_.empty(); }
    // The first of them where they are one run to the end of the table.
    std::optional<ncfUInt32> Rest() const;
    // Whether a picture of that number, as it is shown, needs one of them: it may be
    // coded by others around it.
    bool ConcernPicture(std::uint64_t picture) const;
    // Whether the sound at that place, counted in what is delivered, is of them.
    bool ConcernSound(std::uint64_t sample) const;
    // "track 1 of the file: the file ends at byte 90, so samples 3 to 8 of its table
    // are missing or cut off"
    std::string Sentence() const;

private:
    struct Run {
        ncfUInt32 first;
        ncfUInt32 last;
    };
    bool Hold(ncfUInt32 first, ncfUInt32 last) const;

    const header_parser::Track& track_;
    const std::size_t number_;  // of the track in the file, from 1
    const ncfUInt32 movieTimeScale_;
    const ncfUInt64 fileSize_;
    std::vector<Run> runs_;
};

// The description of a sample, counted from 0; none behind the last sample.
std::optional<std::size_t> DescriptionOf(const header_parser::Track& track, std::uint64_t sample);

}  // namespace cliphost
