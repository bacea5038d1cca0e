// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "reference_host/cliphost/TemporalOffsets.h"

#include <algorithm>
#include <utility>

#include "reference_host/cliphost/RouteTaken.h"
#include "reference_host/framework/HostPath.h"
#include "reference_host/header_parser/InspectHeaders.h"
#include "reference_host/quicktime/MovieComponents.h"

namespace cliphost {
namespace {

// The most steps that the module may take for each sample.
constexpr std::int64_t kNear = 16;
// How many samples may cost more before the tables are read, and how many are compared.
constexpr std::size_t kFarAnswers = 8;

using Offsets = std::vector<std::optional<std::int64_t>>;

// Both are compared by their low 32 bits.
std::int32_t Low32(std::int64_t value) {
    return static_cast<std::int32_t>(static_cast<std::uint32_t>(value));
}

bool IsInPlace(const SampleTime& time) {
    const std::int64_t tolerance = Low32(time.duration / 10);
    const std::int64_t offset = Low32(time.displayOffset);
    return -tolerance <= offset && offset <= tolerance;
}

// Finds the offsets of samples that last equally long. Seen from such a sample, one
// that lies `steps` on is displayed at its place when its own display offset takes
// it as many steps back, and the other way round: so its own offset tells at which
// single sample's place it is displayed, whoever looks for it.
class Search {
public:
    Search(const std::vector<SampleTime>& times, std::int64_t duration, Offsets& out)
        : times_(times),
          count_(static_cast<std::int64_t>(times.size())),
          duration_(duration),
          tolerance_(duration / 10),
          out_(out) {}

    std::int64_t StepsBack(std::int64_t sample) const {
        return (tolerance_ - times_[static_cast<std::size_t>(sample)].displayOffset) / duration_;
    }
    std::int64_t StepsForward(std::int64_t sample) const {
        return (times_[static_cast<std::size_t>(sample)].displayOffset + tolerance_) / duration_;
    }

    // Outward from one sample. No sample is displayed further than `most` away.
    void LookAround(std::int64_t sample, std::int64_t most) {
        for (std::int64_t steps = 1; steps <= most; ++steps) {
            const std::int64_t on = sample + steps, before = sample - steps;
            if (IsReached(sample, steps) && on < count_ && StepsBack(on) == steps) {
                out_[static_cast<std::size_t>(sample)] = steps;
                return;
            }
            if (before >= 0 && StepsForward(before) == steps) {
                out_[static_cast<std::size_t>(sample)] = -steps;
                return;
            }
            if (before < 0 && (on >= count_ || !IsReached(sample, steps))) {
                return;
            }
        }
    }

    // For all samples at once; those that `isWanted` refuses stay as they are.
    template <class IsWanted>
    void LookFromAll(IsWanted isWanted) {
        for (std::int64_t other = 0; other < count_; ++other) {
            const std::int64_t back = StepsBack(other), forward = StepsForward(other);
            if (back >= 1 && back <= other && IsReached(other - back, back) &&
                isWanted(other - back)) {
                Offer(other - back, back);
            }
            if (forward >= 1 && forward < count_ - other && isWanted(other + forward)) {
                Offer(other + forward, -forward);
            }
        }
    }

private:
    // The way forward ends two steps after the way back came to the first sample.
    static bool IsReached(std::int64_t from, std::int64_t steps) { return steps <= from + 2; }

    // The nearest counts; of two equally near the one further on.
    void Offer(std::int64_t sample, std::int64_t offset) {
        auto& place = out_[static_cast<std::size_t>(sample)];
        const std::int64_t far = place ? std::abs(*place) : count_;
        if (std::abs(offset) < far || (std::abs(offset) == far && offset > 0)) {
            place = offset;
        }
    }

    const std::vector<SampleTime>& times_;
    std::int64_t count_;
    std::int64_t duration_;
    std::int64_t tolerance_;
    Offsets& out_;
};

// Samples that are displayed elsewhere and last some time, by their durations.
std::vector<std::size_t> SamplesToSearch(const std::vector<SampleTime>& times) {
    std::vector<std::size_t> samples;
    for (std::size_t i = 0; i < times.size(); ++i) {
        if (times[i].duration > 0 && !IsInPlace(times[i])) {
            samples.push_back(i);
        }
    }
    std::stable_sort(samples.begin(), samples.end(), [&](std::size_t a, std::size_t b) {
        return times[a].duration < times[b].duration;
    });
    return samples;
}

std::vector<SampleTime> TimesInHeader(const header_parser::HeaderReport& header,
                                      const WhichTrack& which) {
    const header_parser::Track* const track = Find(header, which).track;
    if (!track) {
        return {};
    }
    const header_parser::SampleTable& samples = track->samples;
    std::vector<SampleTime> times;
    times.reserve(samples.Count());
    for (ncfUInt32 i = 0; i < samples.Count(); ++i) {
        times.push_back({samples.Times().DurationOf(i), samples.Times().DisplayOffsetOf(i)});
    }
    return times;
}

// Of the picture; sound that only the library reads is never displayed elsewhere.
std::vector<SampleTime> TimesInLibrary(const std::filesystem::path& movie) {
    const auto wrapper = host::MakeQuickTimeWrapper();
    const auto path = host::ModulePath(movie);
    host::Ref<QTWrapper::IQTWSampleTable> table;
    ncfUInt32 track = 0;
    ncfUInt64 count = 0;
    if (wrapper->NewMovieFromFilePath(path.get()) < 0 || !wrapper->GetFirstVideoTrack(&track) ||
        wrapper->GetSampleTable(table.Out()) < 0 || table->GetNumSamples(track, &count) < 0) {
        return {};
    }
    std::vector<SampleTime> times;
    times.reserve(static_cast<std::size_t>(count));
    for (ncfUInt64 i = 1; i <= count; ++i) {
        ncfSInt64 duration = 0, offset = 0;
        if (table->GetDecodeDuration(track, i, &duration) < 0 ||
            table->GetDisplayOffset(track, i, &offset) < 0) {
            return {};
        }
        times.push_back({duration, offset});
    }
    return times;
}

}  // namespace

std::vector<SampleTime> DisplayTimesOf(const std::filesystem::path& movie,
                                       const WhichTrack& which) {
    const header_parser::HeaderReport header = header_parser::InspectHeaders(movie);
    if (RouteOf(header).reason.empty()) {
        return TimesInHeader(header, which);
    }
    return which.kind == TrackKind::Sound ? std::vector<SampleTime>() : TimesInLibrary(movie);
}

Offsets WorkOutOffsets(const std::vector<SampleTime>& times) {
    Offsets out(times.size());
    std::int64_t least = 0, most = 0;  // offsets of all samples
    for (std::size_t i = 0; i < times.size(); ++i) {
        least = std::min(least, times[i].displayOffset);
        most = std::max(most, times[i].displayOffset);
        if (times[i].duration >= 0 && IsInPlace(times[i])) {
            out[i] = 0;
        }
    }
    const std::vector<std::size_t> samples = SamplesToSearch(times);
    for (auto first = samples.begin(); first != samples.end();) {
        const std::int64_t duration = times[*first].duration;
        const auto end = std::find_if(first, samples.end(),
                                      [&](std::size_t i) { return times[i].duration != duration; });
        Search search(times, duration, out);
        // Many durations with few samples each, or few with many.
        const std::int64_t farthest = (std::max(most, -least) + duration / 10) / duration;
        const auto alike = static_cast<double>(end - first);
        if (alike * static_cast<double>(farthest) < static_cast<double>(times.size())) {
            std::for_each(first, end, [&](std::size_t i) {
                search.LookAround(static_cast<std::int64_t>(i), farthest);
            });
        } else {
            search.LookFromAll([&](std::int64_t sample) {
                const SampleTime& time = times[static_cast<std::size_t>(sample)];
                return time.duration == duration && !IsInPlace(time);
            });
        }
        first = end;
    }
    return out;
}

std::optional<std::int64_t> AskOffset(NMA::ISampleMapping& map, ncfUInt32 track,
                                      std::uint64_t sample) {
    ncfSInt64 offset = 0;
    return map.GetSampleTemporalOffset(track, sample, &offset) < 0
               ? std::nullopt
               : std::optional<std::int64_t>(offset);
}

TemporalOffsets::TemporalOffsets(NMA::ISampleMapping& map, ncfUInt32 track,
                                 std::function<std::vector<SampleTime>()> times)
    : map_(map), track_(track), times_(std::move(times)) {}

// Compared at the sample that was just asked for and at a few all through the track.
bool TemporalOffsets::AgreesAt(std::uint64_t sample,
                               const std::optional<std::int64_t>& answer) const {
    if (sample >= known_.size() || known_[sample] != answer) {
        return false;
    }
    for (std::size_t i = 1; i <= kFarAnswers; ++i) {
        const std::size_t at = (known_.size() - 1) * i / kFarAnswers;
        if (known_[at] != AskOffset(map_, track_, at)) {
            return false;
        }
    }
    return true;
}

std::optional<std::int64_t> TemporalOffsets::Of(std::uint64_t sample) {
    const auto isNear = [](const std::optional<std::int64_t>& offset) {
        return offset && std::abs(*offset) <= kNear;
    };
    const bool isKnown = sample < known_.size();
    if (isKnown && !isNear(known_[sample])) {
        return known_[sample];
    }
    const auto answer = AskOffset(map_, track_, sample);
    if (isKnown && answer != known_[sample]) {
        known_.clear();
    }
    if (!isNear(answer) && times_ && ++farAnswers_ > kFarAnswers) {
        known_ = WorkOutOffsets(std::exchange(times_, nullptr)());
        if (!AgreesAt(sample, answer)) {
            known_.clear();
        }
    }
    return answer;
}

}  // namespace cliphost
