// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <cstdint>
#include <filesystem>
#include <functional>
#include <optional>
#include <vector>

#include "host_interfaces/media/SampleMapping.h"
#include "reference_host/cliphost/HeaderTracks.h"

namespace cliphost {

// How long a sample lasts in the order of decoding and how much later than it is
// decoded it is displayed, in units of its track.
struct SampleTime {
    std::int64_t duration = 0;
    std::int64_t displayOffset = 0;
};

// The times of a track's samples as the host's tables tell them; none where they
// don't.
std::vector<SampleTime> DisplayTimesOf(const std::filesystem::path& movie, const WhichTrack& which);

// The module's answer for one sample; nothing where it finds none.
std::optional<std::int64_t> AskOffset(NMA::ISampleMapping& map, ncfUInt32 track,
                                      std::uint64_t sample);

// What ISampleMapping::GetSampleTemporalOffset answers, for all samples at once.
std::vector<std::optional<std::int64_t>> WorkOutOffsets(const std::vector<SampleTime>& times);

// The temporal offsets of a track. The module looks outward from each sample that
// it is asked for, up to both ends of the track where it finds none, which for all
// samples takes a time that grows with the square of the track. So after a few that
// are far or nowhere, such ones are worked out from the host's own tables, as long
// as these say the same as the module.
class TemporalOffsets {
public:
    // `times` is asked once at most, and may give none: then the module answers all.
    TemporalOffsets(NMA::ISampleMapping& map, ncfUInt32 track,
                    std::function<std::vector<SampleTime>()> times);

    // Nothing where no sample is displayed at this place.
    std::optional<std::int64_t> Of(std::uint64_t sample);

private:
    bool AgreesAt(std::uint64_t sample, const std::optional<std::int64_t>& answer) const;

    NMA::ISampleMapping& map_;
    ncfUInt32 track_;
    std::function<std::vector<SampleTime>()> times_;
    std::vector<std::optional<std::int64_t>> known_;
    std::size_t farAnswers_ = 0;
};

}  // namespace cliphost
