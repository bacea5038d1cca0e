// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// Tracks by their number, and what the wrapper tells of timecode and sound.
// Numbers may have gaps, so that each one up to the highest is asked about.

#include <algorithm>

#include "source/clips/OtherClip.h"
#include "source/plugin/PluginLogSink.h"
#include "source/plugin/ResultChecks.h"

using QTWrapper::IQuickTimeWrapper;

// --- counting ------------------------------------------------------------------------

ncfUInt32 OtherClip::HighestTrack() const {
    return std::min(qtWrapper_->GetNumberOfTracks(), kMostTracks);
}

NCFRESULT OtherClip::CountTracks(const char* ncfFunction, TrackTest test,
                                 ncfUInt32* trackCount) const {
    CHK_PTR(trackCount);
    CHK_PTR(qtWrapper_);
    IQuickTimeWrapper& wrapper = *qtWrapper_.inArg();
    const ncfUInt32 highest = HighestTrack();
    ncfUInt32 count = 0;
    for (ncfUInt32 number = 0; number <= highest; ++number) {
        count += (wrapper.*test)(number) ? 1 : 0;
    }
    *trackCount = count;
    return NCF_OK;
}

bool OtherClip::FindTrack(TrackTest test, ncfUInt32 index, ncfUInt32& qtTrack) const {
    IQuickTimeWrapper& wrapper = *qtWrapper_.inArg();
    const ncfUInt32 highest = HighestTrack();
    ncfUInt32 passed = 0;
    for (ncfUInt32 number = 0; number <= highest; ++number) {
        if ((wrapper.*test)(number) && passed++ == index) {
            qtTrack = number;
            return true;
        }
    }
    return false;
}

NCFRESULT OtherClip::GetTrackCount(ncfUInt32* trackCount) {
    NCF_FUNCTION("OtherClip::GetTrackCount");
    CHK_PTR(qtWrapper_);
    const ncfUInt32 highest = qtWrapper_->GetNumberOfTracks();
    if (highest == 0) {
        return NCF_E_NOTFOUND;
    }
    CHK_PTR(trackCount);
    *trackCount = highest;
    return NCF_OK;
}

NCFRESULT OtherClip::GetVideoTrackCountImpl(ncfUInt32* trackCount) {
    return CountTracks("OtherClip::GetVideoTrackCountImpl", &IQuickTimeWrapper::IsVideoTrack,
                       trackCount);
}

NCFRESULT OtherClip::GetAudioTrackCountImpl(ncfUInt32* trackCount) {
    return CountTracks("OtherClip::GetAudioTrackCountImpl", &IQuickTimeWrapper::IsAudioTrack,
                       trackCount);
}

NCFRESULT OtherClip::GetTimeCodeTrackCountImpl(ncfUInt32* trackCount) {
    return CountTracks("OtherClip::GetTimeCodeTrackCountImpl", &IQuickTimeWrapper::IsTimeCodeTrack,
                       trackCount);
}

// --- numbers and kinds ----------------------------------------------------------------

NCFRESULT OtherClip::GetVideoTrackQTId(ncfUInt32 track, ncfUInt32& qtTrack) {
    NCF_FUNCTION("OtherClip::GetVideoTrackQTId");
    CHK_PTR(qtWrapper_);
    return FindTrack(&IQuickTimeWrapper::IsVideoTrack, track, qtTrack) ? NCF_OK : NCF_E_NOTFOUND;
}

NCFRESULT OtherClip::GetAudioTrackQTId(ncfUInt32 track, ncfUInt32& qtTrack) {
    NCF_FUNCTION("OtherClip::GetAudioTrackQTId");
    CHK_PTR(qtWrapper_);
    return FindTrack(&IQuickTimeWrapper::IsAudioTrack, track, qtTrack) ? NCF_OK : NCF_E_NOTFOUND;
}

NCFRESULT OtherClip::GetTimecodeTrackQTId(ncfUInt32 track, ncfUInt32& qtTrack) {
    NCF_FUNCTION("OtherClip::GetTimecodeTrackQTId");
    CHK_PTR(qtWrapper_);
    if (!FindTrack(&IQuickTimeWrapper::IsTimeCodeTrack, track, qtTrack)) {
        slog::Warning(ncfFunction) << "- trackNum: " << track << " , qtTrack: " << qtTrack;
        return NCF_E_INVALIDARG;
    }
    return NCF_OK;
}

NCFRESULT OtherClip::GetTrackType(ncfUInt32 qtTrack, ncfUInt32* trackType) {
    NCF_FUNCTION("OtherClip::GetTrackType");
    CHK_INARG(trackType);
    CHK_PTR(qtWrapper_);
    if (qtTrack > qtWrapper_->GetNumberOfTracks()) {
        return NCF_E_NOTFOUND;
    }
    *trackType = qtWrapper_->IsVideoTrack(qtTrack)      ? kTrackVideo
                 : qtWrapper_->IsAudioTrack(qtTrack)    ? kTrackAudio
                 : qtWrapper_->IsTimeCodeTrack(qtTrack) ? kTrackTimecode
                                                        : kTrackOther;
    return NCF_OK;
}

NCFRESULT OtherClip::GetFirstVideoTrack(ncfUInt32& track) const {
    NCF_FUNCTION("OtherClip::GetFirstVideoTrack");
    CHK_PTR(qtWrapper_);
    return qtWrapper_->GetFirstVideoTrack(&track) ? NCF_OK : NCF_E_NOTFOUND;
}

// --- timecode and sound ---------------------------------------------------------------

NCFRESULT OtherClip::GetTimeCodeTrackMetadata(ncfUInt32 qtTrack, TimeCodeTrackMetadata* tcInfo) {
    NCF_FUNCTION("OtherClip::GetTimeCodeTrackMetadata");
    CHK_PTR(tcInfo);
    CHK_PTR(qtWrapper_);
    *tcInfo = TimeCodeTrackMetadata();
    NCF_RETURN(qtWrapper_->GetTimeCodeInfoForTrack(qtTrack, &tcInfo->hours, &tcInfo->minutes,
                                                   &tcInfo->seconds, &tcInfo->frames,
                                                   &tcInfo->timeScale, &tcInfo->frameDuration,
                                                   &tcInfo->drop, &tcInfo->numFrames));
    return NCF_OK;
}

NCFRESULT OtherClip::GetAudioTrackMetadata(ncfUInt32 qtTrack, AudioTrackMetadata* audioInfo) {
    NCF_FUNCTION("OtherClip::GetAudioTrackMetadata");
    CHK_PTR(audioInfo);
    CHK_PTR(qtWrapper_);
    *audioInfo = AudioTrackMetadata();
    NCF_RETURN(qtWrapper_->GetAudioInfoForTrack(qtTrack, &audioInfo->channelsPerFrame,
                                                &audioInfo->sampleRate, &audioInfo->formatID, NULL,
                                                &audioInfo->bytesPerPacket, NULL,
                                                &audioInfo->bitsPerChannel, &audioInfo->isBigEndian,
                                                &audioInfo->isConstantBitRate));
    return NCF_OK;
}

NCFRESULT OtherClip::IsAudioLPCM(ncfUInt32 qtTrack, ncfBool* isLPCM) {
    NCF_FUNCTION("OtherClip::IsAudioLPCM");
    CHK_PTR(isLPCM);
    AudioTrackMetadata audioInfo;
    NCF_RETURN(GetAudioTrackMetadata(qtTrack, &audioInfo));
    *isLPCM = rule_.IsLPCMAudioByFormatID(audioInfo.formatID);
    return NCF_OK;
}
