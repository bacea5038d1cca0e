// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include <limits>

#include "reference_host/cliphost/FramePieces.h"
#include "reference_host/cliphost/OptionChecks.h"
#include "reference_host/cliphost/PathOption.h"
#include "reference_host/cliphost/Verbs.h"
#include "reference_host/cliphost/WorkerOptions.h"
#include "reference_host/system/FileNumber.h"
#include "reference_host/system/Paths.h"

namespace cliphost {
namespace {

// Processes take longer to start than fewer frames to read.
constexpr std::uint64_t kManyFramesFrom = 24;

// What comes through a pipe is wanted as it is read, and a piece is whole at its end alone. Raw
// frames are hardly more than decoded, and most decoders have threads of their own. A descriptor
// is that of this process.
bool IsForWorkers(const FrameOptions& options, const WantedFrames& wanted, bool areJobsGiven) {
    const WorkerCall& call = options.workers;
    const std::uint64_t most = wanted.range.CountIn(std::numeric_limits<std::uint64_t>::max());
    return call.limits.AreSet() ||
           (call.jobs > 1 && most >= kManyFramesFrom && !OutputFile::IsDevice(options.output) &&
            !host::system::NamesDescriptor(options.movie) &&
            (areJobsGiven || !IsRawFile(options.output)));
}

void AddFrameForParent(CLI::App& app, const SessionOptions& session, int& status) {
    const auto worker = std::make_shared<WorkerVerb>(WorkerVerb{"frame-for-parent", "frame"});
    const auto form = std::make_shared<FrameForm>();
    const auto movie = std::make_shared<std::filesystem::path>();
    CLI::App* const verb = AddWorkerVerb(app, worker);
    form->AddTo(*verb);
    AddPath(*verb, "--of-movie", *movie);
    verb->callback([&session, &status, worker, form, movie] {
        ServePieces(session, *worker, *movie, *form);
        status = kExitFine;
    });
}

}  // namespace

void AddFrame(CLI::App& app, const SessionOptions& session, int& status) {
    auto* const verb =
        app.add_subcommand("frame", "Write frames as PNG pictures, or raw for other programs");
    verb->footer(
        "Examples:\n"
        "  cliphost frame clip.mov --frame 100 --format deepest -o still.png\n"
        "  cliphost frame clip.mov --frame 100 --with-alpha --use-alpha -o title.png\n"
        "  cliphost frame clip.mov --range 0:250:10 -o stills\n"
        "  cliphost frame clip.mov --range 0: -o clip.raw\n"
        "  cliphost frame clip.mov --range 0: -o - |\n"
        "    ffplay -f rawvideo -pixel_format uyvy422 -video_size 1920x1080 -framerate 25 -i -\n\n"
        "For raw frames, standard error shows pixel format, size and rate.");
    auto options = std::make_shared<FrameOptions>();
    AddPath(*verb, "movie", options->movie, "The movie")->required();
    auto* const frame = verb->add_option("--frame", options->frame, "Number of the frame, from 0")
                            ->check(WholeNumber())
                            ->capture_default_str();
    verb->add_option("--range", options->range,
                     "FIRST:END or FIRST:END:STEP; END itself is not written, and may be left out")
        ->excludes(frame);
    AddPath(*verb, "-o,--output", options->output,
            "FILE.png, FILE.raw, a folder for one PNG per frame, or - for raw frames on standard "
            "output")
        ->required();
    options->form.AddTo(*verb);
    AddWorkerOptions(*verb, options->workers, kManyFrames);
    AddFrameForParent(app, session, status);
    verb->callback([&app, verb, &session, &status, options] {
        const WantedFrames wanted = options->Wanted();
        if (!IsForWorkers(*options, wanted, verb->count("--jobs") > 0)) {
            status = WriteFramesHere(session, *options, wanted);
            return;
        }
        RefuseDescriptor(options->workers, options->movie);
        // What is wrong with the module is told as by one process.
        const Session tried(options->form.Of(session));
        TakeWorkerVerb(app, *verb, "frame-for-parent", session, options->workers);
        options->workers.arguments.push_back("--of-movie=" +
                                             host::system::PathText(options->movie));
        status = WriteFramesInPieces(*options, wanted);
    });
}

}  // namespace cliphost
