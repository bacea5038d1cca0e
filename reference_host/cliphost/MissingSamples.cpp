// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/MissingSamples.h"

#include <fmt/format.h>

#include <algorithm>

namespace cliphost {
namespace {

using header_parser::Track;

// Pictures that are decoded in another order than shown are this far apart at most.
constexpr ncfUInt32 kFarthestReordered = 16;
constexpr std::size_t kMostRuns = 3;  // told by their numbers

ncfUInt32 AsNumber(std::uint64_t sample, ncfUInt32 most) {
    return static_cast<ncfUInt32>(std::min<std::uint64_t>(sample, most));
}

}  // namespace

std::optional<std::size_t> DescriptionOf(const Track& track, std::uint64_t sample) {
    if (sample >= track.samples.Count()) {
        return std::nullopt;
    }
    return track.samples.Chunks().PlaceOfSample(static_cast<ncfUInt32>(sample)).description - 1;
}

MissingSamples::MissingSamples(const header_parser::HeaderReport& header, std::size_t place)
    : track_(header.movie->tracks[place]),
      number_(place + 1),
      movieTimeScale_(header.movie->timeScale),
      fileSize_(header.fileSize) {
    const header_parser::SampleTable& samples = track_.samples;
    const auto isThere = [&](ncfUInt32 i) {
        return samples.PositionOf(i) + samples.Sizes().SizeOf(i) <= fileSize_;
    };
    for (ncfUInt32 first = 0; first < samples.Count();) {
        const ncfUInt32 next = samples.NextBreak(first);
        const std::size_t description = *DescriptionOf(track_, first);
        const bool isHere = description < track_.isInFile.size() && track_.isInFile[description];
        // The bytes up to the break follow each other.
        if (isHere && !isThere(next - 1)) {
            ncfUInt32 missing = first;
            for (ncfUInt32 end = next - 1; missing < end;) {
                const ncfUInt32 middle = missing + (end - missing) / 2;
                isThere(middle) ? missing = middle + 1 : end = middle;
            }
            if (!runs_.empty() && runs_.back().last + 1 == missing) {
                runs_.back().last = next - 1;
            } else {
                runs_.push_back({missing, next - 1});
            }
        }
        first = next;
    }
}

std::optional<ncfUInt32> MissingSamples::Rest() const {
    const bool isRest = runs_.size() == 1 && runs_.front().last + 1 == track_.samples.Count();
    return isRest ? std::optional(runs_.front().first) : std::nullopt;
}

bool MissingSamples::Hold(ncfUInt32 first, ncfUInt32 last) const {
    return std::any_of(runs_.begin(), runs_.end(),
                       [&](const Run& run) { return run.first <= last && run.last >= first; });
}

bool MissingSamples::ConcernPicture(std::uint64_t picture) const {
    const header_parser::EditList::Scales scales{movieTimeScale_, track_.mediaTimeScale};
    const ncfUInt32 count = track_.samples.Count();
    const ncfUInt64 step = track_.samples.Times().MeanDuration();
    if (count == 0 || step == 0 || !track_.edits.IsLinear(scales)) {
        return !IsEmpty();
    }
    const ncfUInt32 most = count - 1;
    const auto skipped =
        static_cast<ncfUInt64>(std::max<ncfSInt64>(track_.edits.Offset(), 0)) / step;
    ncfUInt32 first = AsNumber(picture, most), last = AsNumber(picture + skipped, most);
    if (track_.samples.Times().IsReordered()) {
        first -= std::min(first, kFarthestReordered);
        last = AsNumber(std::uint64_t{last} + kFarthestReordered, most);
    }
    while (first > 0 && !track_.samples.IsSync(first)) {
        --first;
    }
    return Hold(first, last);
}

bool MissingSamples::ConcernSound(std::uint64_t sample) const {
    const header_parser::EditList::Scales scales{movieTimeScale_, track_.mediaTimeScale};
    const double rate = track_.sound.empty() ? 0.0 : track_.sound.front().rate;
    if (rate <= 0.0 || !track_.edits.IsLinear(scales)) {
        return !IsEmpty();
    }
    const double time = static_cast<double>(sample) / rate * track_.mediaTimeScale +
                        static_cast<double>(track_.edits.Offset());
    ncfUInt32 packet = 0;
    if (!track_.samples.Times().SampleShownAt(static_cast<ncfUInt64>(std::max(time, 0.0)),
                                              packet)) {
        packet = track_.samples.Count() - 1;
    }
    return Hold(packet, packet);
}

std::string MissingSamples::Sentence() const {
    if (IsEmpty()) {
        return {};
    }
    const std::string track = fmt::format("track {} of the file: ", number_);
    const ncfUInt64 begin = track_.samples.PositionOf(0);
    const ncfUInt32 count = track_.samples.Count();
    if (begin >= fileSize_ && runs_.front().first == 0 && runs_.front().last == count - 1) {
        return track + fmt::format("its samples begin at byte {}, the file ends at byte {}", begin,
                                   fileSize_);
    }
    std::string numbers;
    for (std::size_t i = 0; i < std::min(runs_.size(), kMostRuns); ++i) {
        const bool isLast = i + 1 == runs_.size();
        numbers += i == 0 ? "" : isLast ? " and " : ", ";
        numbers += runs_[i].first == runs_[i].last
                       ? fmt::format("{}", runs_[i].first)
                       : fmt::format("{} to {}", runs_[i].first, runs_[i].last);
    }
    numbers += runs_.size() > kMostRuns ? " and more" : "";
    const bool isOne = runs_.size() == 1 && runs_.front().first == runs_.front().last;
    return track + fmt::format(
                       "the file ends at byte {}, so {} {} of its table {} missing or cut "
                       "off",
                       fileSize_, isOne ? "sample" : "samples", numbers, isOne ? "is" : "are");
}

}  // namespace cliphost
