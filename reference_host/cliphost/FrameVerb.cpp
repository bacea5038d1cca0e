// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include <fmt/format.h>

#include "reference_host/cliphost/Failure.h"
#include "reference_host/cliphost/FrameRange.h"
#include "reference_host/cliphost/FrameSink.h"
#include "reference_host/cliphost/Notice.h"
#include "reference_host/cliphost/OptionChecks.h"
#include "reference_host/cliphost/ParameterOptions.h"
#include "reference_host/cliphost/Progress.h"
#include "reference_host/cliphost/ResultText.h"
#include "reference_host/cliphost/TurnOption.h"
#include "reference_host/cliphost/Verbs.h"
#include "reference_host/cliphost/Words.h"
#include "reference_host/framework/HostPath.h"

namespace cliphost {
namespace {

using host::DisplayPath;

struct FrameOptions {
    std::filesystem::path movie;
    std::optional<ncfUInt32> track;
    std::uint64_t frame = 0;
    std::string range;
    std::string format;
    std::filesystem::path output;
    bool withAlpha = false;
    TurnOption turn;
    ParameterOptions parameters;
};

// Writes the frames that the command line names; one that can't be decoded is
// reported and skipped.
class FrameRun {
public:
    FrameRun(Essence& essence, const FrameOptions& options)
        : essence_(essence),
          options_(options),
          track_(essence.Track(options.track, TrackKind::Picture)),
          reader_(essence, track_, options.format) {}

    int Run();

private:
    FrameRange WantedFrames();
    void Write(std::uint64_t frame, FrameSink& sink);

    Essence& essence_;
    const FrameOptions& options_;
    const ClipTrack& track_;
    FrameReader reader_;
    std::unique_ptr<FrameReader> alpha_;
    int failed_ = 0;
    int written_ = 0;
};

FrameRange FrameRun::WantedFrames() {
    FrameRange range =
        options_.range.empty() ? OneFrame(options_.frame) : ParseFrameRange(options_.range);
    // One frame need not be counted: it is there or it is not.
    const bool isThere = options_.range.empty() && range.first < reader_.MostFrames() &&
                         reader_.Read(range.first) != NMA_E_NODATA;
    const std::uint64_t count = isThere ? range.first + 1 : reader_.Count();
    if (count == 0) {
        throw Failure(kExitFile, essence_.WhyUnread(track_, range.first, NMA_E_NODATA));
    }
    if (range.CountIn(count) == 0) {
        throw Failure(kExitCaller, essence_.movie(),
                      fmt::format("track {}: there is no frame {}", track_.number, range.first),
                      NumberedFromZero(count, "frame"));
    }
    range.end = std::min(range.end.value_or(count), count);
    return range;
}

int FrameRun::Run() {
    if (options_.withAlpha) {
        const ClipTrack& track = essence_.Track(std::nullopt, TrackKind::Alpha);
        alpha_ = std::make_unique<FrameReader>(essence_, track, "deepest");
    }
    const FrameRange range = WantedFrames();
    const std::uint64_t count = range.CountIn(*range.end);
    const auto sink = MakeFrameSink(options_.output, options_.movie, count == 1,
                                    options_.turn.TurnFor(options_.movie));
    if (sink->IsRaw() && options_.withAlpha) {
        throw Failure(kExitCaller, options_.output, "--with-alpha is for PNG files",
                      "for raw frames of the alpha name its own track, see `cliphost formats "
                      "--use-alpha`");
    }
    if (sink->IsRaw()) {
        Notice("{}\n", RawWords(reader_, track_));
    }
    Progress progress("frames", count);
    try {
        for (std::uint64_t i = 0; i < count; ++i) {
            const std::uint64_t frame = range.first + i * range.step;
            progress.Step(fmt::format("{}", frame));
            Write(frame, *sink);
        }
        if (written_ > 0) {
            sink->Finish();
        }
    } catch (const ReaderGone&) {
        return kExitFine;  // it has seen enough
    }
    if (written_ > 0 && !sink->Summary().empty()) {
        fmt::print("{}\n", sink->Summary());
    }
    return failed_ == 0 ? kExitFine : kExitFile;
}

void FrameRun::Write(std::uint64_t frame, FrameSink& sink) {
    NCFRESULT result = reader_.Read(frame);
    if (result == NCF_OK && alpha_) {
        result = alpha_->Read(frame);
    }
    if (result != NCF_OK) {
        ++failed_;
        essence_.session().TakeNotices();
        Problem problem = essence_.WhyUnread(track_, frame, result);
        problem.reason = fmt::format("frame {} is left out: {}", frame, problem.reason);
        TellProblem(problem, essence_.session().verbosity());
        return;
    }
    sink.Take(frame, reader_, alpha_.get());
    ++written_;
}

}  // namespace

void AddFrame(CLI::App& app, const SessionOptions& session, int& status) {
    auto* const verb =
        app.add_subcommand("frame", "Write frames as PNG pictures, or raw for other programs");
    verb->footer(
        "Example: cliphost frame clip.mov --frame 100 --format deepest -o still.png\n"
        "Example: cliphost frame clip.mov --range 0: -o - |\n"
        "           ffplay -f rawvideo -pixel_format uyvy422 -video_size 1920x1080 -framerate 25 "
        "-i -\n"
        "For raw frames, standard error shows pixel format, size and rate.\n"
        "One process reads all frames; --jobs is for `cliphost describe` and `cliphost contact`.");
    auto options = std::make_shared<FrameOptions>();
    verb->add_option("movie", options->movie, "The movie")->required();
    verb->add_option("--track", options->track,
                     "Number of the track; without it, the first picture track")
        ->check(SmallWholeNumber());
    auto* const frame = verb->add_option("--frame", options->frame, "Number of the frame, from 0")
                            ->check(WholeNumber())
                            ->capture_default_str();
    verb->add_option("--range", options->range,
                     "FIRST:END or FIRST:END:STEP; END itself is not written, and may be left out")
        ->excludes(frame);
    verb->add_option(
        "--format", options->format,
        "A name or number that `cliphost formats` lists, or 'deepest'; without it, the "
        "first that a picture can be made of");
    verb->add_flag("--with-alpha", options->withAlpha,
                   "Write the clip's alpha into the PNG pictures");
    options->turn.AddTo(*verb);
    verb->add_option(
            "-o,--output", options->output,
            "FILE.png, FILE.raw, a folder for one PNG per frame, or - for raw frames on standard "
            "output")
        ->required();
    options->parameters.AddTo(*verb);
    verb->callback([&session, &status, options] {
        SessionOptions own = session;
        if (options->withAlpha) {
            own.host.ignoreAlpha = false;
        }
        Session running(own);
        Essence essence = OpenEssence(running, options->movie, options->parameters);
        status = FrameRun(essence, *options).Run();
    });
}

}  // namespace cliphost
