// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/ReportSamples.h"

#include <algorithm>
#include <cmath>
#include <nlohmann/json.hpp>

#include "reference_host/framework/Guard.h"

namespace cliphost {
namespace {

using Json = nlohmann::ordered_json;

constexpr std::uint64_t kColumnsOfChart = 120;
constexpr std::uint64_t kMostSamples = 1'000'000;  // that are asked one by one
constexpr std::uint64_t kStandsAlone = 1024;
constexpr double kReadAhead = 2.0;      // seconds
constexpr std::size_t kMostBreaks = 8;  // that are told one by one

// Lengths of groups of pictures, each from one that stands alone to before the next.
class PictureGroups {
public:
    void Add(bool standsAlone) {
        if (standsAlone) {
            Close();
            hasBegun_ = true;
        }
        length_ += hasBegun_ ? 1 : 0;
    }
    Json ToJson() {
        Close();
        if (count_ == 0) {
            return {};
        }
        return {{"count", count_},
                {"shortest", shortest_},
                {"longest", longest_},
                {"mean", static_cast<double>(sum_) / static_cast<double>(count_)}};
    }

private:
    void Close() {
        if (length_ > 0) {
            shortest_ = count_ == 0 ? length_ : std::min(shortest_, length_);
            longest_ = std::max(longest_, length_);
            sum_ += length_;
            ++count_;
        }
        length_ = 0;
    }

    bool hasBegun_ = false;
    std::uint64_t length_ = 0;
    std::uint64_t count_ = 0;
    std::uint64_t sum_ = 0;
    std::uint64_t shortest_ = 0;
    std::uint64_t longest_ = 0;
};

// Sets what each sample tells.
void AddSizes(NMA::ISampleMapping& map, const ClipTrack& track, std::uint64_t samples, Json& json) {
    PictureGroups groups;
    const std::uint64_t columns = std::min(kColumnsOfChart, samples);
    std::vector<std::uint64_t> sums(columns, 0);
    std::uint64_t smallest = ~std::uint64_t{0};
    std::uint64_t largest = 0;
    for (std::uint64_t i = 0; i < samples; ++i) {
        ncfUInt64 size = 0;
        host::Check(map.GetSampleSize(track.number, i, &size));
        sums[static_cast<std::size_t>(i * columns / samples)] += size;
        smallest = std::min<std::uint64_t>(smallest, size);
        largest = std::max<std::uint64_t>(largest, size);
        ncfUInt64 properties = 0;
        ncfUInt32 dependencies = 0;
        host::Check(map.GetSampleProperties(track.number, i, &properties, &dependencies));
        groups.Add((properties & kStandsAlone) != 0);
    }
    json["smallest"] = smallest;
    json["largest"] = largest;
    json["groups"] = groups.ToJson();
    Json means = Json::array();
    for (std::uint64_t column = 0; column < columns; ++column) {
        const std::uint64_t first = (column * samples + columns - 1) / columns;
        const std::uint64_t next = ((column + 1) * samples + columns - 1) / columns;
        means.push_back(sums[static_cast<std::size_t>(column)] /
                        std::max<std::uint64_t>(1, next - first));
    }
    json["sizes"] = std::move(means);
}

// A run of one of the tracks, as the file has them one behind the other.
struct PlacedRun {
    std::uint64_t position;
    std::size_t track;
    double begin;  // seconds
    double end;
};

std::vector<PlacedRun> InFileOrder(const std::vector<PlayedRuns>& tracks) {
    std::vector<PlacedRun> all;
    for (std::size_t i = 0; i < tracks.size(); ++i) {
        const double rate = tracks[i].rate;
        for (const SampleRun& run : tracks[i].runs) {
            const double begin = tracks[i].begin + static_cast<double>(run.first) / rate;
            all.push_back({run.position, i, begin, begin + static_cast<double>(run.count) / rate});
        }
    }
    std::sort(all.begin(), all.end(),
              [](const PlacedRun& a, const PlacedRun& b) { return a.position < b.position; });
    return all;
}

// How far what begins now is from where another track has been read to. Behind the other's end
// nothing is needed of it, and before its first sample only what is played already.
double GapBetween(double begin, double reached, double end, bool hasBegun) {
    const double gap = begin >= end ? 0 : begin - reached;
    return hasBegun ? std::abs(gap) : std::max(0.0, gap);
}

double ToHundredths(double seconds) {
    return std::round(seconds * 100) / 100;
}

}  // namespace

Json Interleaving(const std::vector<PlayedRuns>& tracks) {
    std::vector<double> reached;
    std::vector<double> ends;
    std::vector<bool> hasBegun(tracks.size(), false);
    for (const PlayedRuns& track : tracks) {
        reached.push_back(track.begin);
        ends.push_back(track.begin + static_cast<double>(track.samples) / track.rate);
    }
    double widest = 0;
    bool isApart = false;
    std::uint64_t count = 0;
    Json breaks = Json::array();
    for (const PlacedRun& run : InFileOrder(tracks)) {
        double gap = 0;
        std::size_t from = run.track;
        for (std::size_t other = 0; other < tracks.size(); ++other) {
            const double now = GapBetween(run.begin, reached[other], ends[other], hasBegun[other]);
            if (other != run.track && now > gap) {
                gap = now;
                from = other;
            }
        }
        reached[run.track] = run.end;
        hasBegun[run.track] = true;
        widest = std::max(widest, gap);
        const bool wasApart = isApart;
        isApart = gap > kReadAhead;
        if (!isApart || wasApart) {
            continue;
        }
        ++count;
        if (breaks.size() < kMostBreaks) {
            breaks.push_back({{"position", run.position},
                              {"track", tracks[run.track].track},
                              {"from", tracks[from].track},
                              {"at", ToHundredths(run.begin)},
                              {"seconds", ToHundredths(gap)}});
        }
    }
    return {{"widest", ToHundredths(widest)}, {"count", count}, {"breaks", std::move(breaks)}};
}

MediaTime MediaTimeOf(const header_parser::HeaderReport& header, const WhichTrack& which,
                      const ClipTrack& track) {
    const header_parser::Track* const found = Find(header, which).track;
    if (!found || found->mediaTimeScale == 0 || header.movie->timeScale == 0) {
        return {0, static_cast<double>(track.length) / track.RateAsNumber()};
    }
    const header_parser::EditList& edits = found->edits;
    const header_parser::EditList::Scales scales{header.movie->timeScale, found->mediaTimeScale};
    const double seconds = static_cast<double>(found->samples.Times().TotalDuration()) /
                           static_cast<double>(found->mediaTimeScale);
    if (edits.IsEmpty()) {
        return {0, seconds};
    }
    // Behind the pause that may stand at the beginning.
    ncfUInt64 first = 0;
    for (ncfUInt64 end = edits.Duration(); first < end;) {
        const ncfUInt64 middle = first + (end - first) / 2;
        if (edits.MediaTimeAt(middle, scales) < 0) {
            first = middle + 1;
        } else {
            end = middle;
        }
    }
    const ncfSInt64 mediaTime = std::max<ncfSInt64>(0, edits.MediaTimeAt(first, scales));
    return {static_cast<double>(first) / static_cast<double>(scales.movie) -
                static_cast<double>(mediaTime) / static_cast<double>(scales.media),
            seconds};
}

Json ReadReportSamples(const Essence& essence) {
    std::error_code ignored;
    const std::uint64_t fileSize = std::filesystem::file_size(essence.movie(), ignored);
    const header_parser::HeaderReport header = header_parser::InspectHeaders(essence.movie());
    Json list = Json::array();
    std::vector<PlayedRuns> played;
    for (const ClipTrack& track : essence.tracks()) {
        if (track.kind == TrackKind::Alpha) {
            continue;  // its samples are those of the picture
        }
        RunMap runs = ReadRuns(essence.map(), track.number, fileSize);
        host::Check(runs.result);
        Json json = {{"track", track.number},    {"kind", NameOf(track.kind)},
                     {"samples", runs.samples},  {"bytes", runs.bytes},
                     {"runs", runs.runs.size()}, {"faults", runs.faults}};
        if (track.kind == TrackKind::Picture && runs.samples > 0 && runs.samples <= kMostSamples) {
            AddSizes(essence.map(), track, runs.samples, json);
        }
        list.push_back(std::move(json));
        const MediaTime time = MediaTimeOf(header, essence.Which(track), track);
        if (time.length > 0 && runs.samples > 0) {
            played.push_back({track.number, time.begin,
                              static_cast<double>(runs.samples) / time.length, runs.samples,
                              std::move(runs.runs)});
        }
    }
    Json json = {{"tracks", std::move(list)}};
    if (played.size() > 1) {
        json["interleaving"] = Interleaving(played);
    }
    return json;
}

}  // namespace cliphost
