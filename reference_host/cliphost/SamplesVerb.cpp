// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include <fmt/format.h>

#include <algorithm>

#include "reference_host/cliphost/Essence.h"
#include "reference_host/cliphost/JsonAnswer.h"
#include "reference_host/cliphost/MachinePath.h"
#include "reference_host/cliphost/OptionChecks.h"
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

// Shows the maps of tracks: each sample of a picture track, but only the runs of a
// sound track, whose samples are many and alike.
class SamplesRun {
public:
    SamplesRun(Essence& essence, const SamplesOptions& options)
        : essence_(essence), options_(options) {
        std::error_code ignored;
        fileSize_ = std::filesystem::file_size(options.movie, ignored);
    }

    int Run();

private:
    void ShowTrack(const ClipTrack& track);
    void ShowSamples(const ClipTrack& track, std::uint64_t count, Json& json);
    void ShowRuns(const RunMap& runs, Json& json);
    void ShowSums(const ClipTrack& track, const RunMap& runs, Json& json);

    Essence& essence_;
    const SamplesOptions& options_;
    std::uint64_t fileSize_ = 0;
    Json tracks_ = Json::array();
    Problem wrong_;  // the first thing of all that is
};

std::string OffsetText(const MappedSample& sample) {
    return sample.temporalOffset ? fmt::format("{:+}", *sample.temporalOffset) : "unknown";
}

Json ToJson(const MappedSample& sample) {
    Json json = {{"sample", sample.number}, {"position", sample.position}, {"size", sample.size}};
    if (sample.temporalOffset) {
        json["temporalOffset"] = *sample.temporalOffset;
    } else {
        json["temporalOffset"] = nullptr;
    }
    json["properties"] = sample.properties;
    json["dependencies"] = sample.dependencies;
    json["contiguousSamples"] = sample.contiguousSamples;
    json["contiguousBytes"] = sample.contiguousBytes;
    return json;
}

void SamplesRun::ShowSamples(const ClipTrack& track, std::uint64_t count, Json& json) {
    constexpr std::uint64_t kStep = 1024;  // samples between two looks at the bar
    Progress progress("samples", static_cast<std::size_t>(count / kStep + 1));
    if (!options_.json) {
        fmt::print("  {:>8} {:>14} {:>10} {:>8}  {:<17} {}\n", "sample", "position", "size",
                   "offset", "properties", "contiguous bytes");
    }
    TemporalOffsets offsets(essence_.map(), track.number, [&] {
        return DisplayTimesOf(essence_.movie(), essence_.Which(track));
    });
    for (std::uint64_t i = 0; i < count; ++i) {
        if (i % kStep == 0) {
            progress.Step(fmt::format("{}", i));
        }
        MappedSample sample;
        const NCFRESULT result =
            ReadMappedSample(essence_.map(), track.number, i, sample, &offsets);
        if (result < 0) {
            essence_.Fail(fmt::format("track {}: sample {} can't be mapped", track.number, i),
                          result);
        }
        if (options_.json) {
            json["map"].push_back(ToJson(sample));
        } else {
            fmt::print("  {:>8} {:>14} {:>10} {:>8}  {:<17} {}\n", i, sample.position, sample.size,
                       OffsetText(sample), WordsForProperties(sample.properties),
                       sample.contiguousBytes);
        }
    }
}

void SamplesRun::ShowRuns(const RunMap& runs, Json& json) {
    if (!options_.json) {
        fmt::print("  {:>10} {:>10} {:>14} {:>12}\n", "from", "samples", "position", "bytes");
    }
    for (const SampleRun& run : runs.runs) {
        if (options_.json) {
            json["runs"].push_back({{"first", run.first},
                                    {"count", run.count},
                                    {"position", run.position},
                                    {"bytes", run.bytes}});
        } else {
            fmt::print("  {:>10} {:>10} {:>14} {:>12}\n", run.first, run.count, run.position,
                       run.bytes);
        }
    }
}

void SamplesRun::ShowSums(const ClipTrack& track, const RunMap& runs, Json& json) {
    if (!wrong_ && !runs.faults.empty()) {
        wrong_ = essence_.WhyUnread(track, std::max<std::uint64_t>(runs.samples, 1) - 1, NCF_OK);
        const bool isKnown = !wrong_.hint.empty();
        wrong_.reason = isKnown ? wrong_.reason
                                : fmt::format("track {}: {}", track.number, runs.faults.front());
    }
    if (options_.json) {
        json["bytes"] = runs.bytes;
        json["faults"] = runs.faults;
        return;
    }
    if (runs.samples == 0) {
        return;
    }
    fmt::print("  {} in {}; the file has {}\n", Counted(runs.bytes, "byte"),
               Counted(runs.runs.size(), "run"), Counted(fileSize_, "byte"));
    for (const std::string& fault : runs.faults) {
        fmt::print("  wrong: {}\n", fault);
    }
    if (runs.faults.empty()) {
        fmt::print("  all samples lie inside the file, and the totals agree\n");
    }
}

void SamplesRun::ShowTrack(const ClipTrack& track) {
    const RunMap runs = ReadRuns(essence_.map(), track.number, fileSize_);
    if (runs.result < 0) {
        essence_.Fail(fmt::format("track {}: its samples can't be mapped", track.number),
                      runs.result);
    }
    ncfUInt32 channels = 0;
    Json json = {{"track", track.number}, {"kind", NameOf(track.kind)}, {"samples", runs.samples}};
    const bool hasChannels = track.kind == TrackKind::Sound && !essence_.Obstacle(track) &&
                             essence_.map().GetNumberOfChannels(track.number, &channels) >= 0;
    if (hasChannels) {
        json["channels"] = channels;
    }
    if (!options_.json) {
        fmt::print("track {}: {}, {}{}\n", track.number, NameOf(track.kind),
                   Counted(runs.samples, "sample"),
                   hasChannels ? " of " + Counted(channels, "channel") : "");
    }
    if (runs.samples == 0) {
        json[track.kind == TrackKind::Sound && !options_.every ? "runs" : "map"] = Json::array();
    } else if (track.kind == TrackKind::Sound && !options_.every) {
        ShowRuns(runs, json);
    } else {
        ShowSamples(track, runs.samples, json);
    }
    ShowSums(track, runs, json);
    tracks_.push_back(std::move(json));
}

int SamplesRun::Run() {
    if (!options_.json) {
        fmt::print("{}\n", host::DisplayPath(options_.movie));
    }
    for (const ClipTrack& track : essence_.tracks()) {
        if (!options_.track || *options_.track == track.number) {
            ShowTrack(track);
        }
    }
    if (tracks_.empty()) {
        throw Failure(kExitCaller, options_.movie,
                      fmt::format("there is no track {}", options_.track.value_or(0)),
                      essence_.TrackList());
    }
    if (options_.json) {
        Json answer = {{"movie", MachinePath(options_.movie)}, {"fileBytes", fileSize_}};
        if (wrong_ || essence_.undescribed()) {
            AddProblem(wrong_ ? wrong_ : essence_.undescribed(), answer);
        } else {
            AddRoute(options_.movie, answer);
        }
        answer["tracks"] = tracks_;
        PrintJson(answer);
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
        "Example: cliphost samples clip.mov --track 0 --json\n"
        "Samples are listed in decode order. The offset says how many samples later in this "
        "order the one\nis stored that is displayed at this place. Totals that do not agree with "
        "the file give exit status 1.");
    auto options = std::make_shared<SamplesOptions>();
    verb->add_option("movie", options->movie, "The movie")->required();
    verb->add_option("--track", options->track, "Only the track of this number")
        ->check(SmallWholeNumber());
    verb->add_flag("--every", options->every, "List every sample of sound, not only its runs");
    verb->add_flag("--json", options->json, kJsonHelp);
    verb->callback([&session, &status, options] {
        AnswerFailureToo(options->json, {{"movie", MachinePath(options->movie)}}, [&] {
            Session running(session);
            Essence essence = OpenEssence(running, options->movie);
            status = SamplesRun(essence, *options).Run();
        });
    });
}

}  // namespace cliphost
