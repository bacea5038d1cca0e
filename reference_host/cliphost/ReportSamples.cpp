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
constexpr double kReadAhead = 2.0;  // seconds
constexpr std::size_t kMostBreaks = 8;

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
            all.push_back({run.position, i, static_cast<double>(run.first) / rate,
                           static_cast<double>(run.first + run.count) / rate});
        }
    }
    std::sort(all.begin(), all.end(),
              [](const PlacedRun& a, const PlacedRun& b) { return a.position < b.position; });
    return all;
}

double ToHundredths(double seconds) {
    return std::round(seconds * 100) / 100;
}

}  // namespace

Json Interleaving(const std::vector<PlayedRuns>& tracks) {
    std::vector<double> reached(tracks.size(), 0.0);
    double widest = 0;
    bool isApart = false;
    Json breaks = Json::array();
    for (const PlacedRun& run : InFileOrder(tracks)) {
        double gap = 0;
        std::size_t from = run.track;
        for (std::size_t other = 0; other < tracks.size(); ++other) {
            const double end = static_cast<double>(tracks[other].samples) / tracks[other].rate;
            // What is played behind the end of the other track needs nothing of it.
            const double now = run.begin >= end ? 0 : std::abs(reached[other] - run.begin);
            if (other != run.track && now > gap) {
                gap = now;
                from = other;
            }
        }
        reached[run.track] = run.end;
        widest = std::max(widest, gap);
        const bool wasApart = isApart;
        isApart = gap > kReadAhead;
        if (isApart && !wasApart && breaks.size() < kMostBreaks) {
            breaks.push_back({{"position", run.position},
                              {"track", tracks[run.track].track},
                              {"from", tracks[from].track},
                              {"at", ToHundredths(run.begin)},
                              {"seconds", ToHundredths(gap)}});
        }
    }
    return {{"widest", ToHundredths(widest)}, {"breaks", std::move(breaks)}};
}

Json ReadReportSamples(NMA::ISampleMapping& map, const std::vector<ClipTrack>& tracks,
                       std::uint64_t fileSize) {
    Json list = Json::array();
    std::vector<PlayedRuns> played;
    for (const ClipTrack& track : tracks) {
        if (track.kind == TrackKind::Alpha) {
            continue;  // its samples are those of the picture
        }
        RunMap runs = ReadRuns(map, track.number, fileSize);
        host::Check(runs.result);
        Json json = {{"track", track.number},    {"kind", NameOf(track.kind)},
                     {"samples", runs.samples},  {"bytes", runs.bytes},
                     {"runs", runs.runs.size()}, {"faults", runs.faults}};
        if (track.kind == TrackKind::Picture && runs.samples > 0 && runs.samples <= kMostSamples) {
            AddSizes(map, track, runs.samples, json);
        }
        list.push_back(std::move(json));
        if (track.RateAsNumber() > 0 && track.length > 0 && runs.samples > 0) {
            const double seconds = static_cast<double>(track.length) / track.RateAsNumber();
            played.push_back({track.number, static_cast<double>(runs.samples) / seconds,
                              runs.samples, std::move(runs.runs)});
        }
    }
    Json json = {{"tracks", std::move(list)}};
    if (played.size() > 1) {
        json["interleaving"] = Interleaving(played);
    }
    return json;
}

}  // namespace cliphost
