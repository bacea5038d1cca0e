// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include <fmt/format.h>

#include <cmath>

#include "reference_host/cliphost/ContactSheet.h"
#include "reference_host/cliphost/Failure.h"
#include "reference_host/cliphost/FrameRange.h"
#include "reference_host/cliphost/FrameReader.h"
#include "reference_host/cliphost/OptionChecks.h"
#include "reference_host/cliphost/OutputFile.h"
#include "reference_host/cliphost/ParameterOptions.h"
#include "reference_host/cliphost/PixelsToPicture.h"
#include "reference_host/cliphost/PngFile.h"
#include "reference_host/cliphost/Progress.h"
#include "reference_host/cliphost/ResultText.h"
#include "reference_host/cliphost/TurnOption.h"
#include "reference_host/cliphost/Verbs.h"
#include "reference_host/cliphost/Words.h"
#include "reference_host/framework/HostPath.h"

namespace cliphost {
namespace {

using host::DisplayPath;

struct ContactOptions {
    std::filesystem::path movie;
    std::filesystem::path output;
    int frames = 12;
    int columns = 4;
    int width = 320;
    TurnOption turn;
    ParameterOptions parameters;
};

// Cells have the shape in which the clip is shown, whatever its pixels are.
int CellHeight(const ContactOptions& options, const ClipTrack& track, const FrameReader& reader,
               const PictureTurn& turn) {
    const aafRational_t& shape = track.shape;
    const double stored = shape.denominator > 0 && shape.numerator > 0
                              ? static_cast<double>(shape.denominator) / shape.numerator
                              : static_cast<double>(reader.height()) / reader.width();
    const double shown = turn.swapsSides ? 1.0 / stored : stored;
    const double height = options.width * std::clamp(shown, 0.05, 20.0);
    return std::max(1, static_cast<int>(std::lround(height)));
}

int WriteSheet(Essence& essence, const ContactOptions& options) {
    RefuseOutputOntoMovie(options.output, options.movie);
    const std::string ending = options.output.extension().string();
    if (!ending.empty() && ending != ".png") {
        throw Failure(kExitCaller, options.output,
                      fmt::format("a name that ends in '{}' can't be written", ending),
                      "give FILE.png, or - for standard output");
    }
    const ClipTrack& track = essence.Track(std::nullopt, TrackKind::Picture);
    FrameReader reader(essence, track, "");
    std::unique_ptr<FrameReader> alpha;
    if (const ClipTrack* const shown = essence.First(TrackKind::Alpha)) {
        alpha = std::make_unique<FrameReader>(essence, *shown, "");
    }
    const auto frames = SpreadFrames(reader.Count(), static_cast<std::uint64_t>(options.frames));
    if (frames.empty()) {
        throw Failure(kExitFile, essence.WhyUnread(track, 0, NMA_E_NODATA));
    }
    if (reader.width() == 0) {
        throw Failure(kExitFile, options.movie, "its pictures have no size");
    }
    const PictureTurn turn = options.turn.TurnFor(options.movie);
    ContactSheet sheet(static_cast<int>(frames.size()), options.columns, options.width,
                       CellHeight(options, track, reader, turn));
    Progress progress("frames", frames.size());
    std::size_t failed = 0;
    for (const std::uint64_t frame : frames) {
        progress.Step(fmt::format("{}", frame));
        NCFRESULT result = reader.Read(frame);
        Picture picture = result == NCF_OK ? reader.ToPicture() : Picture();
        if (result == NCF_OK && alpha) {
            result = alpha->Read(frame);
            picture = WithAlpha(picture, alpha->ToPicture());
        }
        if (result != NCF_OK) {
            ++failed;
            picture = {};  // its cell stays empty
            Problem problem = essence.WhyUnread(track, frame, result);
            problem.reason = fmt::format("frame {} stays empty: {}", frame, problem.reason);
            TellProblem(problem, essence.session().verbosity());
        }
        sheet.Add(Turned(std::move(picture), turn));
    }
    if (failed == frames.size()) {
        throw Failure(kExitFile, options.movie, "no frame could be read, so there is no sheet");
    }
    WriteWholeFile(options.output, ToPng(sheet.picture()));
    if (!host::system::IsStandardOutput(options.output)) {
        fmt::print("{}: {} of {}\n", DisplayPath(options.output), frames.size() - failed,
                   Counted(reader.Count(), "frame"));
    }
    return failed == 0 ? kExitFine : kExitFile;
}

}  // namespace

void AddContact(CLI::App& app, const SessionOptions& session, int& status) {
    auto* const verb =
        app.add_subcommand("contact", "Write a contact sheet: thumbnails from the whole movie");
    verb->footer(
        "Example: cliphost contact clip.mov -o sheet.png\n"
        "With --use-alpha transparent parts show a checkerboard.\n"
        "One process makes the sheet; --jobs is for `cliphost describe`.");
    auto options = std::make_shared<ContactOptions>();
    verb->add_option("movie", options->movie, "The movie")->required();
    verb->add_option("-o,--output", options->output, "The PNG file, or - for standard output")
        ->required();
    verb->add_option("--frames", options->frames, "How many frames")
        ->check(CLI::Range(1, 1000))
        ->capture_default_str();
    verb->add_option("--columns", options->columns, "Pictures in a row")
        ->check(CLI::Range(1, 100))
        ->capture_default_str();
    verb->add_option("--width", options->width, "Width of a picture, in pixels")
        ->check(CLI::Range(16, 2048))
        ->capture_default_str();
    options->turn.AddTo(*verb);
    options->parameters.AddTo(*verb);
    verb->callback([&session, &status, options] {
        Session running(session);
        Essence essence = OpenEssence(running, options->movie, options->parameters);
        status = WriteSheet(essence, *options);
    });
}

}  // namespace cliphost
