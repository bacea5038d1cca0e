// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/MissingMedia.h"

#include <fmt/format.h>

#include <algorithm>
#include <optional>

namespace cliphost {
namespace {

using header_parser::HeaderReport;
using header_parser::Track;

bool IsInFile(const Track& track) {
    return !track.isInFile.empty() &&
           std::find(track.isInFile.begin(), track.isInFile.end(), false) == track.isInFile.end();
}

// The first sample whose bytes lie behind the end. Samples follow each other in
// the file.
std::optional<ncfUInt32> FirstMissing(const HeaderReport& header, const Track& track) {
    const auto isThere = [&](ncfUInt32 i) {
        return track.samples.PositionOf(i) + track.samples.Sizes().SizeOf(i) <= header.fileSize;
    };
    const ncfUInt32 count = track.samples.Count();
    if (count == 0 || !IsInFile(track) || isThere(count - 1)) {
        return std::nullopt;
    }
    ncfUInt32 first = 0;
    for (ncfUInt32 end = count - 1; first < end;) {
        const ncfUInt32 middle = first + (end - first) / 2;
        isThere(middle) ? first = middle + 1 : end = middle;
    }
    return first;
}

}  // namespace

std::string WhatIsMissing(const HeaderReport& header, std::size_t place, std::uint64_t sample) {
    const Track& track = header.movie->tracks[place];
    const std::optional<ncfUInt32> first = FirstMissing(header, track);
    if (!first || sample < *first) {
        return {};
    }
    const ncfUInt64 begin = track.samples.PositionOf(0);
    if (begin >= header.fileSize) {
        return fmt::format(
            "track {} of the file: its samples begin at byte {}, the file ends at byte {}",
            place + 1, begin, header.fileSize);
    }
    return fmt::format(
        "track {} of the file: the file ends at byte {}, so samples {} to {} of its table are "
        "missing or cut off",
        place + 1, header.fileSize, *first, track.samples.Count() - 1);
}

MissingSound::MissingSound(const std::filesystem::path& movie, std::size_t place, unsigned rate)
    : header_(header_parser::InspectHeaders(movie)), rate_(rate) {
    if (!header_.movie || rate == 0) {
        return;
    }
    const auto& sounds = header_.movie->Of(header_parser::TrackKind::kSound);
    if (place >= sounds.size()) {
        return;
    }
    const Track& track = header_.movie->tracks[sounds[place]];
    if (const auto first = FirstMissing(header_, track); first && track.mediaTimeScale > 0) {
        track_ = &track;
        reason_ = WhatIsMissing(header_, sounds[place], *first);
        mediaTime_ = static_cast<double>(track.samples.Times().DecodeTimeOf(*first));
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
