// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/MissingMedia.h"

#include "reference_host/cliphost/HeaderTracks.h"
#include "reference_host/cliphost/MissingSamples.h"

namespace cliphost {

MissingSound::MissingSound(const std::filesystem::path& movie, std::size_t place, unsigned rate)
    : header_(header_parser::InspectHeaders(movie)), rate_(rate) {
    const FoundTrack found = Find(header_, {TrackKind::Sound, place});
    if (!found.track || rate == 0) {
        return;
    }
    const MissingSamples missing(header_, found.place);
    if (const auto first = missing.Rest(); first && found.track->mediaTimeScale > 0) {
        track_ = found.track;
        reason_ = missing.Sentence();
        mediaTime_ = static_cast<double>(track_->samples.Times().DecodeTimeOf(*first));
    }
}

bool MissingSound::Has(std::uint64_t sample) const {
    const header_parser::EditList::Scales scales{header_.movie->timeScale, track_->mediaTimeScale};
    const double seconds = static_cast<double>(sample) / rate_;
    // Units of the movie are coarse, so they are left out where they can be.
    const double time = track_->edits.IsLinear(scales)
                            ? seconds * scales.media + static_cast<double>(track_->edits.Offset())
                            : static_cast<double>(track_->edits.MediaTimeAt(
                                  static_cast<ncfUInt64>(seconds * scales.movie), scales));
    constexpr double kRounding = 1e-6;
    return time + kRounding >= mediaTime_;
}

std::uint64_t MissingSound::CountIn(std::uint64_t from, std::uint64_t to) const {
    if (!track_ || from >= to) {
        return 0;
    }
    const bool isFirst = Has(from);
    if (isFirst == Has(to - 1)) {
        return isFirst ? to - from : 0;
    }
    std::uint64_t first = from, changed = to - 1;
    while (changed - first > 1) {
        const std::uint64_t middle = first + (changed - first) / 2;
        (Has(middle) == isFirst ? first : changed) = middle;
    }
    return isFirst ? changed - from : to - changed;
}

}  // namespace cliphost
