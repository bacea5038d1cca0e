// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/essence/TrackMap.h"

#include <algorithm>

#include "source/plugin/ResultChecks.h"

NCFRESULT RemapAAFTracksToQuickTimeTracks(const std::tr1::shared_ptr<BaseClip>& media,
                                          std::vector<ncfUInt32>& vect) {
    NCF_FUNCTION("RemapAAFTracksToQuickTimeTracks");
    vect.clear();
    ncfUInt32 videoTrackCount = 0;
    NCF_RETURN(media->GetVideoTrackCount(&videoTrackCount));
    for (ncfUInt32 track = 0; track < std::min<ncfUInt32>(1, videoTrackCount); ++track) {
        ncfUInt32 qtTrack = 0;
        NCF_RETURN(media->GetVideoTrackQTId(track, qtTrack));
        vect.push_back(qtTrack);
        if (media->ShowsAlpha()) {
            vect.push_back(qtTrack);  // alpha is read from its picture's track
        }
    }
    ncfUInt32 audioTrackCount = 0;
    NCF_RETURN(media->GetAudioTrackCount(&audioTrackCount));
    for (ncfUInt32 track = 0; track < audioTrackCount; ++track) {
        ncfUInt32 qtTrack = 0;
        NCF_RETURN(media->GetAudioTrackQTId(track, qtTrack));
        vect.push_back(qtTrack);
    }
    return NCF_OK;
}
