// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/SheetRun.h"

#include <fmt/format.h>

#include "reference_host/cliphost/ContactSheet.h"
#include "reference_host/cliphost/FrameRange.h"
#include "reference_host/cliphost/JsonAnswer.h"
#include "reference_host/cliphost/MachinePath.h"
#include "reference_host/cliphost/OutputFile.h"
#include "reference_host/cliphost/PngFile.h"
#include "reference_host/cliphost/SheetPictures.h"
#include "reference_host/cliphost/Words.h"
#include "reference_host/framework/HostPath.h"

namespace cliphost {
namespace {

// Parameters change the levels of what the module delivers.
std::unique_ptr<SheetPictures> PicturesFor(Essence& essence, const ClipTrack& track,
                                           const SheetForm& form) {
    auto small = form.parameters.IsEmpty() ? SmallPictures(essence, track, form.isExact) : nullptr;
    return small ? std::move(small) : DeliveredPictures(essence, track);
}

}  // namespace

MovieAnswer MakeSheet(Session& session, const std::filesystem::path& movie, const SheetForm& form,
                      const PlaceOfFile& place) {
    Essence essence = OpenEssence(session, movie, form.parameters);
    const ClipTrack& track = essence.Track(std::nullopt, TrackKind::Picture);
    const auto pictures = PicturesFor(essence, track, form);
    const auto frames = SpreadFrames(pictures->Count(), static_cast<std::uint64_t>(form.frames));
    if (frames.empty()) {
        throw Failure(kExitFile, essence.WhyUnread(track, 0, NMA_E_NODATA));
    }
    if (pictures->width() == 0) {
        throw Failure(kExitFile, movie, "its pictures have no size");
    }
    const PictureTurn turn = form.turn.TurnFor(movie);
    const int cellHeight = ShownHeight(form.width, track, *pictures, turn);
    ContactSheet sheet(static_cast<int>(frames.size()), form.columns, form.width, cellHeight);
    pictures->Prepare(turn.swapsSides ? cellHeight : form.width,
                      turn.swapsSides ? form.width : cellHeight, frames.size());
    std::optional<Progress> progress;
    if (form.showsProgress) {
        progress.emplace("frames", frames.size());
    }
    std::size_t failed = 0;
    for (const std::uint64_t frame : frames) {
        if (progress) {
            progress->Step(fmt::format("{}", frame));
        }
        Picture picture;  // of a frame that can't be read its cell stays empty
        const NCFRESULT result = pictures->Read(frame, picture);
        if (result != NCF_OK) {
            ++failed;
            Problem problem = essence.WhyUnread(track, frame, result);
            problem.reason = fmt::format("frame {} stays empty: {}", frame, problem.reason);
            TellProblem(problem, session.verbosity());
        }
        sheet.Add(Turned(std::move(picture), turn));
    }
    if (failed == frames.size()) {
        throw Failure(kExitFile, movie, "no frame could be read, so there is no sheet");
    }
    WriteWholeFile(place(), ToPng(sheet.picture()));
    MovieAnswer answer;
    answer.description =
        fmt::format("{} of {}", frames.size() - failed, Counted(pictures->Count(), "frame"));
    answer.isPartial = failed > 0;
    return answer;
}

void SheetRun::Show(const std::filesystem::path& movie, const MovieAnswer& answer,
                    const std::filesystem::path& saved) {
    if (options_.lines) {
        nlohmann::ordered_json members = {{"output", MachinePath(saved)}};
        if (answer.isPartial) {
            members["isPartial"] = true;
        }
        PrintMovieLine(schema::kContactLine, movie, members);
    } else if (!host::system::IsStandardOutput(saved)) {
        fmt::print("{}: {}\n", host::DisplayPath(saved), answer.description);
    }
}

void SheetRun::ShowFailure(const std::filesystem::path& movie, const Problem& problem) {
    if (options_.lines) {
        PrintFailureLine(schema::kContactLine, movie, problem);
    }
}

void SheetRun::ShowDone(const std::filesystem::path& movie, const std::filesystem::path& saved) {
    if (options_.lines) {
        PrintMovieLine(schema::kContactLine, movie,
                       {{"output", MachinePath(saved)}, {"doneAlready", true}});
    }
}

void SheetRun::Finish(int made, int failed) {
    if (doneBefore() > 0 && !options_.lines) {
        fmt::print("{} made, {} not, {} done already\n", made, failed, doneBefore());
    }
}

}  // namespace cliphost
