// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// Tracks by their id, and the questions that go on to a track's sample table
// or sound description.

#include "source/clips/QuickTimeClip.h"
#include "source/plugin/ResultChecks.h"

// --- tracks ---------------------------------------------------------------------------

NCFRESULT QuickTimeClip::FindTrack(ncfUInt32 index, ncfUInt32 type, ncfUInt32& qtTrack) const {
    const auto found = trackIds_.find({type, index});
    if (found == trackIds_.end()) {
        return NCF_E_NOTFOUND;
    }
    qtTrack = found->second;
    return NCF_OK;
}

NCFRESULT QuickTimeClip::GetTrackType(ncfUInt32 qtTrack, ncfUInt32* trackType) {
    NCF_FUNCTION("QuickTimeClip::GetTrackType");
    CHK_INARG(trackType);
    const auto it = tracks_.find(qtTrack);
    if (it == tracks_.end()) {
        return NCF_E_NOTFOUND;
    }
    *trackType = it->second.type;
    return NCF_OK;
}

NCFRESULT QuickTimeClip::GetTrackInfo(ncfUInt32 qtTrack, ITrackInfo** trackInfo) {
    NCF_FUNCTION("QuickTimeClip::GetTrackInfo");
    CHK_INARG(trackInfo);
    *trackInfo = nullptr;
    const auto it = tracks_.find(qtTrack);
    if (it == tracks_.end()) {
        return NCF_E_NOTFOUND;
    }
    *trackInfo = NCFSmartPtr<ITrackInfo>(it->second.info_).detach();
    return NCF_OK;
}

NCFRESULT QuickTimeClip::GetAudioTrack(ncfUInt32 qtTrack, IAudioTrackInfo** audioTrackInfo) {
    NCF_FUNCTION("QuickTimeClip::GetAudioTrack");
    CHK_INARG(audioTrackInfo);
    *audioTrackInfo = nullptr;
    NCFSmartPtr<ITrackInfo> trackInfo;
    NCF_RETURN(GetTrackInfo(qtTrack, trackInfo.outArg()));
    void* found = nullptr;
    NCF_RETURN_TEXT("trackInfo->QueryInterface(IID_IAudioTrackInfo, (void**)audioTrackInfo)",
                    trackInfo->QueryInterface(IID_IAudioTrackInfo, &found));
    *audioTrackInfo = static_cast<IAudioTrackInfo*>(found);
    return NCF_OK;
}

NCFRESULT QuickTimeClip::GetVideoTrack(ncfUInt32 qtTrack, IVideoTrackInfo** videoTrackInfo) {
    NCF_FUNCTION("QuickTimeClip::GetVideoTrack");
    CHK_INARG(videoTrackInfo);
    *videoTrackInfo = nullptr;
    NCFSmartPtr<ITrackInfo> trackInfo;
    NCF_RETURN(GetTrackInfo(qtTrack, trackInfo.outArg()));
    void* found = nullptr;
    NCF_RETURN_TEXT("trackInfo->QueryInterface(IID_IVideoTrackInfo, (void**)videoTrackInfo)",
                    trackInfo->QueryInterface(IID_IVideoTrackInfo, &found));
    *videoTrackInfo = static_cast<IVideoTrackInfo*>(found);
    return NCF_OK;
}

NCFSmartPtr<IVideoTrackInfo>& QuickTimeClip::GetFirstVideoTrackInfo() const {
    ncfUInt32 count = 0;
    if (firstVideoTrackInfo_.isNull() && qtParser_->GetVideoTrackCount(&count) >= 0 && count != 0) {
        qtParser_->GetVideoTrackInfo(0, firstVideoTrackInfo_.outArg());
    }
    return firstVideoTrackInfo_;
}

NCFSmartPtr<IAudioTrackInfo>& QuickTimeClip::GetFirstAudioTrackInfo() const {
    ncfUInt32 count = 0;
    if (firstAudioTrackInfo_.isNull() && qtParser_->GetAudioTrackCount(&count) >= 0 && count != 0) {
        qtParser_->GetAudioTrackInfo(0, firstAudioTrackInfo_.outArg());
    }
    return firstAudioTrackInfo_;
}

// --- timecode and sound ------------------------------------------------------------------

// The parser keeps the data of one timecode track, so the id makes no
// difference.
NCFRESULT QuickTimeClip::GetTimeCodeTrackMetadata(ncfUInt32, TimeCodeTrackMetadata* tcInfo) {
    NCF_FUNCTION("QuickTimeClip::GetTimeCodeTrackMetadata");
    CHK_PTR(tcInfo);
    return qtParser_->GetTimeCodeInfo(&tcInfo->hours, &tcInfo->minutes, &tcInfo->seconds,
                                      &tcInfo->frames, &tcInfo->timeScale, &tcInfo->frameDuration,
                                      &tcInfo->drop, &tcInfo->numFrames);
}

NCFRESULT QuickTimeClip::GetOnlyAudioDescription(const char* ncfFunction, ncfUInt32 qtTrack,
                                                 NCFSmartPtr<IAudioSampleDescription>& adscr) {
    NCFSmartPtr<IAudioTrackInfo> ati;
    ncfUInt32 count = 0;
    NCF_RETURN(GetAudioTrack(qtTrack, ati.outArg()));
    NCF_RETURN(ati->GetSampleDescriptionCount(&count));
    if (count >= 2) {
        return NCF_E_NOTFOUND;
    }
    NCF_RETURN(ati->GetAudioSampleDescription(0, adscr.outArg()));
    return NCF_OK;
}

// One value that can't be read doesn't keep the others back.
NCFRESULT QuickTimeClip::GetAudioTrackMetadata(ncfUInt32 qtTrack, AudioTrackMetadata* audioInfo) {
    NCF_FUNCTION("QuickTimeClip::GetAudioTrackMetadata");
    CHK_PTR(audioInfo);
    *audioInfo = AudioTrackMetadata();
    NCFSmartPtr<IAudioSampleDescription> adscr;
    const NCFRESULT opened = GetOnlyAudioDescription(ncfFunction, qtTrack, adscr);
    if (opened < 0) {
        return opened;
    }
    NCFRESULT lastFailure = NCF_OK;
    const auto keep = [&lastFailure](NCFRESULT result) {
        if (result != NCF_OK) {
            lastFailure = result;
        }
    };
    ncfBool isLPCM = 0;
    ncfBool isLittleEndian = 0;
    ncfBool isConstantBitRate = 0;
    keep(adscr->GetChannelsPerFrame(&audioInfo->channelsPerFrame));
    keep(adscr->GetSampleRate(&audioInfo->sampleRate));
    keep(adscr->IsLPCM(&isLPCM));
    keep(adscr->GetBytesPerPacket(&audioInfo->bytesPerPacket));
    keep(adscr->IsLittleEndian(&isLittleEndian));
    keep(adscr->GetBitsPerChannel(&audioInfo->bitsPerChannel));
    keep(adscr->IsConstantBitRate(&isConstantBitRate));
    audioInfo->formatID = isLPCM ? kFormatLPCM : 0;
    audioInfo->isBigEndian = isLittleEndian == 0;
    audioInfo->isConstantBitRate = isConstantBitRate != 0;
    return lastFailure;
}

NCFRESULT QuickTimeClip::IsAudioLPCM(ncfUInt32 qtTrack, ncfBool* isLPCM) {
    NCF_FUNCTION("QuickTimeClip::IsAudioLPCM");
    CHK_PTR(isLPCM);
    NCFSmartPtr<IAudioSampleDescription> adscr;
    const NCFRESULT opened = GetOnlyAudioDescription(ncfFunction, qtTrack, adscr);
    if (opened < 0) {
        return opened;
    }
    NCF_RETURN(adscr->IsLPCM(isLPCM));
    return NCF_OK;
}
