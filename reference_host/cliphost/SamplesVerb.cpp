// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include <fmt/format.h>

#include <algorithm>

#include "reference_host/cliphost/Essence.h"
#include "reference_host/cliphost/JsonAnswer.h"
#include "reference_host/cliphost/MachinePath.h"
#include "reference_host/cliphost/OptionChecks.h"
#include "reference_host/cliphost/PathOption.h"
#include "reference_host/cliphost/Progress.h"
#include "reference_host/cliphost/RouteTaken.h"
#include "reference_host/cliphost/SampleMap.h"
#include "reference_host/cliphost/Verbs.h"
#include "reference_host/cliphost/Words.h"
#include "reference_host/framework/HostPath.h"

namespace cliphost {
namespace {

using Json = nlohmann::ordered_json;

struct SamplesOptions {
    std::filesystem::path movie;
    std::optional<ncfUInt32> track;
    bool every = false;
    bool json = false;
};

// What is shown of a track but for its samples, which may be more than memory
// holds: they are read while they are shown.
struct TrackMap {
    const ClipTrack& track;
    RunMap runs;
    std::optional<ncfUInt32> channels;  // of sound that can be delivered
};

// Shows the maps of tracks: each sample of a picture, the runs of a sound, whose
// samples are many and alike.
class SamplesRun {
public:
    SamplesRun(Essence& essence, const SamplesOptions& options)
        : essence_(essence), options_(options) {
        std::error_code ignored;
        fileSize_ = std::filesystem::file_size(options.movie, ignored);
    }

    int Run();

private:
    TrackMap Read(const ClipTrack& track);
    bool ShowsRuns(const TrackMap& map) const {
        return map.track.kind == TrackKind::Sound && !options_.every;
    }
    template <class Each>
    void ReadSamples(const TrackMap& map, const Each& each);
    Json ToJson(const TrackMap& map);
    void Print(const TrackMap& map);
    void PrintSums(const RunMap& runs);

    Essence& essence_;
    const SamplesOptions& options_;
    std::uint64_t fileSize_ = 0;
    Problem wrong_;  // the first thing of all that is
};

std::string OffsetText(const MappedSample& sample) {
    return sample.temporalOffset ? fmt::format("{:+}", *sample.temporalOffset) : "unknown";
}

Json ToJson(const MappedSample& sample) {
    return {{"sample", sample.number},
            {"position", sample.position},
            {"size", sample.size},
            {"temporalOffset", sample.temporalOffset ? Json(*sample.temporalOffset) : Json()},
            {"properties", sample.properties},
            {"dependencies", sample.dependencies},
            {"contiguousSamples", sample.contiguousSamples},
            {"contiguousBytes", sample.contiguousBytes}};
}

Json ToJson(const SampleRun& run) {
    return {{"first", run.first},
            {"count", run.count},
            {"position", run.position},
            {"bytes", run.bytes}};
}

TrackMap SamplesRun::Read(const ClipTrack& track) {
    TrackMap map{track, ReadRuns(essence_.map(), track.number, fileSize_), {}};
    const RunMap& runs = map.runs;
    essence_.Check(runs.result, track, "its samples can't be mapped");
    ncfUInt32 channels = 0;
    if (track.kind == TrackKind::Sound && !essence_.Obstacle(track) &&
        essence_.map().GetNumberOfChannels(track.number, &channels) >= 0) {
        map.channels = channels;
    }
    if (!wrong_ && !runs.faults.empty()) {
        wrong_ = essence_.WhyUnread(track, std::max<std::uint64_t>(runs.samples, 1) - 1, NCF_OK);
        const bool isKnown = !wrong_.hint.empty();
        wrong_.reason = isKnown ? wrong_.reason
                                : fmt::format("track {}: {}", track.number, runs.faults.front());
    }
    return map;
}

template <class Each>
void SamplesRun::ReadSamples(const TrackMap& map, const Each& each) {
    constexpr std::uint64_t kStep = 1024;  // samples between two looks at the bar
    const ncfUInt32 track = map.track.number;
    Progress progress("samples", static_cast<std::size_t>(map.runs.samples / kStep + 1));
    TemporalOffsets offsets(essence_.map(), track, [&] {
        return DisplayTimesOf(essence_.movie(), essence_.Which(map.track));
    });
    for (std::uint64_t i = 0; i < map.runs.samples; ++i) {
        if (i % kStep == 0) {
            progress.Step(fmt::format("{}", i));
        }
        MappedSample sample;
        const NCFRESULT result = ReadMappedSample(essence_.map(), track, i, sample, &offsets);
        if (result < 0) {
            essence_.Fail(fmt::format("track {}: sample {} can't be mapped", track, i), result);
        }
        each(sample);
    }
}

Json SamplesRun::ToJson(const TrackMap& map) {
    Json json = {{"track", map.track.number},
                 {"kind", NameOf(map.track.kind)},
                 {"samples", map.runs.samples}};
    if (map.channels) {
        json["channels"] = *map.channels;
    }
    Json list = Json::array();
    if (ShowsRuns(map)) {
        for (const SampleRun& run : map.runs.runs) {
            list.push_back(cliphost::ToJson(run));
        }
    } else {
        ReadSamples(map,
                    [&](const MappedSample& sample) { list.push_back(cliphost::ToJson(sample)); });
    }
    json[ShowsRuns(map) ? "runs" : "map"] = std::move(list);
    json["bytes"] = map.runs.bytes;
    json["faults"] = map.runs.faults;
    return json;
}

void SamplesRun::Print(const TrackMap& map) {
    fmt::print("track {}: {}, {}{}\n", map.track.number, NameOf(map.track.kind),
               Counted(map.runs.samples, "sample"),
               map.channels ? " of " + Counted(*map.channels, "channel") : "");
    if (map.runs.samples == 0) {
        return;
    }
    if (ShowsRuns(map)) {
        fmt::print("  {:>10} {:>10} {:>14} {:>12}\n", "from", "samples", "position", "bytes");
        for (const SampleRun& run : map.runs.runs) {
            fmt::print("  {:>10} {:>10} {:>14} {:>12}\n", run.first, run.count, run.position,
                       run.bytes);
        }
    } else {
        fmt::print("  {:>8} {:>14} {:>10} {:>8}  {:<17} {}\n", "sample", "position", "size",
                   "offset", "properties", "contiguous bytes");
        ReadSamples(map, [](const MappedSample& sample) {
            fmt::print("  {:>8} {:>14} {:>10} {:>8}  {:<17} {}\n", sample.number, sample.position,
                       sample.size, OffsetText(sample), WordsForProperties(sample.properties),
                       sample.contiguousBytes);
        });
    }
    PrintSums(map.runs);
}

void SamplesRun::PrintSums(const RunMap& runs) {
    fmt::print("  {} in {}; the file has {}\n", Counted(runs.bytes, "byte"),
               Counted(runs.runs.size(), "run"), Counted(fileSize_, "byte"));
    for (const std::string& fault : runs.faults) {
        fmt::print("  wrong: {}\n", fault);
    }
    if (runs.faults.empty()) {
        fmt::print("  all samples lie inside the file, and the totals agree\n");
    }
}

int SamplesRun::Run() {
    if (!options_.json) {
        fmt::print("{}\n", host::DisplayPath(options_.movie));
    }
    Json tracks = Json::array();
    bool isThere = false;
    for (const ClipTrack& track : essence_.tracks()) {
        if (options_.track && *options_.track != track.number) {
            continue;
        }
        isThere = true;
        const TrackMap map = Read(track);
        if (options_.json) {
            tracks.push_back(ToJson(map));
        } else {
            Print(map);
        }
    }
    if (!isThere) {
        throw Failure(kExitCaller, options_.movie,
                      fmt::format("there is no track {}", options_.track.value_or(0)),
                      essence_.TrackList());
    }
    if (options_.json) {
        Json answer = {{"movie", MachinePath(options_.movie)}, {"fileBytes", fileSize_}};
        AddProblemOrRoute(wrong_ ? wrong_ : essence_.undescribed(), options_.movie, answer);
        answer["tracks"] = std::move(tracks);
        PrintJson(schema::kSamples, std::move(answer));
    }
    if (wrong_) {
        TellProblem(wrong_, essence_.session().verbosity());
    }
    return wrong_ ? kExitFile : kExitFine;
}

}  // namespace

void AddSamples(CLI::App& app, const SessionOptions& session, int& status) {
    auto* const verb =
        app.add_subcommand("samples", "Show where the samples of a movie are in its file");
    verb->footer(
        "Examples:\n"
        "  cliphost samples clip.mov\n"
        "  cliphost samples clip.mov --track 0 --json\n"
        "  cliphost samples clip.mov --every\n\n"
        "Samples are listed in decode order. The offset leads to the sample that is displayed at "
        "this "
        "place:\nso many samples later in the list. Totals that do not agree with "
        "the file give exit status 1.");
    auto options = std::make_shared<SamplesOptions>();
    AddPath(*verb, "movie", options->movie, "The movie")->required();
    verb->add_option("--track", options->track, "Only the track of this number")
        ->check(SmallWholeNumber());
    verb->add_flag("--every", options->every, "List every sample of sound, not only its runs");
    verb->add_flag("--json", options->json, kJsonHelp);
    verb->callback([&session, &status, options] {
        AnswerFailureToo(options->json, schema::kSamples, {{"movie", MachinePath(options->movie)}},
                         [&] {
                             Session running(session);
                             Essence essence = OpenEssence(running, options->movie);
                             status = SamplesRun(essence, *options).Run();
                         });
    });
}

}  // namespace cliphost
