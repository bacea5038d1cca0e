// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// The tracks that the mapping keeps, and the way from the host's track numbers
// to the movie's.

#include "source/essence/QuickTimeSampleMapping.h"
#include "source/essence/TrackMap.h"
#include "source/plugin/PluginLogSink.h"
#include "source/plugin/ResultChecks.h"

namespace NMA::Impl {
namespace {

constexpr ncfUInt16 kSoundBytes = 3;
constexpr ncfUInt16 kSoundBits = 24;

}  // namespace

// Picture formats are added when they are first asked for: that takes a codec.
NCFRESULT QuickTimeSampleMapping::InitializeMediaTracks(
    const std::tr1::shared_ptr<BaseClip>& media) {
    NCF_FUNCTION("NMA::Impl::QuickTimeSampleMapping::InitializeMediaTracks");
    using TrackPtr = std::tr1::shared_ptr<MediaTrack>;
    ncfUInt32 videoTrackCount = 0;
    NCF_RETURN(media->GetVideoTrackCount(&videoTrackCount));
    if (videoTrackCount > 1) {
        slog::Warning(ncfFunction) << "videoTrackCount > 1";
    }
    for (ncfUInt32 track = 0; track < videoTrackCount; ++track) {
        mediaTracks_.push_back(TrackPtr(new VideoMediaTrack(MediaTrack::kVideo)));
    }
    if (media->ShowsAlpha()) {
        mediaTracks_.push_back(TrackPtr(new VideoMediaTrack(MediaTrack::kVideoAlpha)));
    }
    ncfUInt32 audioTrackCount = 0;
    NCF_RETURN(media->GetAudioTrackCount(&audioTrackCount));
    for (ncfUInt32 track = 0; track < audioTrackCount; ++track) {
        const TrackPtr audioTrack(new AudioMediaTrack);
        audioTrack->AddFormat(QTAudioFormat(SF_PCM_INT_LE, kSoundBytes, kSoundBits));
        audioTrack->AddFormat(QTAudioFormat(SF_PCM_INT_BE, kSoundBytes, kSoundBits));
        mediaTracks_.push_back(audioTrack);
    }
    return NCF_OK;
}

NCFRESULT QuickTimeSampleMapping::AAFTrackToQuickTimeTrack(ncfUInt32 trackNMA,
                                                           ncfUInt32* trackQTOut) {
    NCF_FUNCTION("NMA::Impl::QuickTimeSampleMapping::AAFTrackToQuickTimeTrack");
    CHK_INARG(trackQTOut);
    CHK_PTR(media_);
    if (_trackRemapVect.empty()) {
        NCF_RETURN(RemapAAFTracksToQuickTimeTracks(media_, _trackRemapVect));
    }
    if (trackNMA >= _trackRemapVect.size()) {
        _pConsole->Write(2,
                         "QuickTimeSampleMapping::AAFTrackToQuickTimeTrack: Index into vector is "
                         "larger than vector size.\n");
        return NCF_E_FAIL;
    }
    const ncfUInt32 trackQT = _trackRemapVect[trackNMA];
    if (trackQT == 0) {
        _pConsole->Write(2,
                         "QuickTimeSampleMapping::AAFTrackToQuickTimeTrack: 0, an invalid "
                         "QuickTime track value, was returned.\n");
        return NCF_E_FAIL;
    }
    *trackQTOut = trackQT;
    return NCF_OK;
}

NCFRESULT QuickTimeSampleMapping::GetMediaTrack(
    ncfUInt32 trackNMA, std::tr1::shared_ptr<MediaTrack>& mediaTrack) const {
    NCF_FUNCTION("NMA::Impl::QuickTimeSampleMapping::GetMediaTrack");
    if (trackNMA >= mediaTracks_.size()) {
        return NCF_E_INVALIDARG;
    }
    mediaTrack = mediaTracks_[trackNMA];
    NCFASSERT(mediaTrack.get());
    return NCF_OK;
}

MediaTrack* QuickTimeSampleMapping::FirstTrackOf(ncfUInt32 trackType) const {
    for (const std::tr1::shared_ptr<MediaTrack>& track : mediaTracks_) {
        if (track && track->GetTrackType() == trackType) {
            return track.get();
        }
    }
    return nullptr;
}

MediaTrack* QuickTimeSampleMapping::FirstAlphaTrackShown() const {
    return media_->ShowsAlpha() ? FirstTrackOf(MediaTrack::kVideoAlpha) : nullptr;
}

}  // namespace NMA::Impl
