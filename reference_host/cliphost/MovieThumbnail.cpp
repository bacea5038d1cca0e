// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/MovieThumbnail.h"

#include "reference_host/cliphost/ContactSheet.h"
#include "reference_host/cliphost/Essence.h"
#include "reference_host/cliphost/Failure.h"
#include "reference_host/cliphost/FrameRange.h"
#include "reference_host/cliphost/SheetPictures.h"
#include "reference_host/quicktime/DisplayMatrix.h"

namespace cliphost {

std::optional<Picture> ThumbnailOf(Session& session, const std::filesystem::path& movie) {
    Essence essence(session, movie);
    const ClipTrack* const first = essence.First(TrackKind::Picture);
    if (!first) {
        return std::nullopt;
    }
    const ClipTrack track = *first;
    auto pictures = SmallPictures(essence, track, false);
    if (!pictures) {
        pictures = DeliveredPictures(essence, track);
    }
    const auto frames = SpreadFrames(pictures->Count(), 1);
    if (frames.empty() || pictures->width() == 0) {
        throw Failure(kExitFile, essence.WhyUnread(track, 0, NMA_E_NODATA));
    }
    const PictureTurn turn = TurnOf(host::DisplayMatrixOf(movie));
    const int height = ShownHeight(kThumbnailWidth, track, *pictures, turn);
    pictures->Prepare(turn.swapsSides ? height : kThumbnailWidth,
                      turn.swapsSides ? kThumbnailWidth : height, frames.size());
    Picture picture;
    const NCFRESULT result = pictures->Read(frames.front(), picture);
    if (result != NCF_OK) {
        throw Failure(kExitFile, essence.WhyUnread(track, frames.front(), result));
    }
    return Shrunk(Turned(std::move(picture), turn), kThumbnailWidth, height);
}

}  // namespace cliphost
