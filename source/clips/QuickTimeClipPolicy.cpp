// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// Whether the host may read this movie's picture or sound by itself.

#include "source/clips/ClipPicture.h"
#include "source/clips/QuickTimeClip.h"
#include "source/plugin/ResultChecks.h"

NCFRESULT QuickTimeClip::IsAudioSampleProviderMedia(ncfUInt32 qtTrack, ncfUInt64* numAudioSamples) {
    NCF_FUNCTION("QuickTimeClip::IsAudioSampleProviderMedia");
    const NCFRESULT baseAnswer = BaseClip::IsAudioSampleProviderMedia(qtTrack, numAudioSamples);
    NCF_RETURN_TEXT("BaseClip::IsAudioSampleProviderMedia(qtTrack, numAudioSamples)", baseAnswer);
    if (baseAnswer == 0) {
        return 0;
    }
    NCFSmartPtr<IAudioTrackInfo> ati;
    NCF_RETURN(GetAudioTrack(qtTrack, ati.outArg()));
    ncfBool linear = 0;
    ncfBool areMediaAndTrackTimesProportional = 0;
    NCF_RETURN(ati->IsTrackLinear(&linear, &areMediaAndTrackTimesProportional, NULL, NULL));
    if (!areMediaAndTrackTimesProportional) {
        rule_.TellReason(ncfFunction, "The audio track contains non-trivial edit list(s).");
        return 0;
    }
    const NCFRESULT varying = ati->HasConstantSampleRate(nullptr);
    NCF_RETURN_TEXT("ati->HasConstantSampleRate(NULL)", varying);
    if (varying == 1) {
        rule_.TellReason(ncfFunction, "The audio track contains variable sample size.");
        return 0;
    }
    ncfUInt64 trackNumSamples = 0;
    ncfUInt64 mediaNumSamples = 0;
    NCF_RETURN(CalculateAudioTrackLengthInSamples(qtTrack, &trackNumSamples));
    NCF_RETURN(CalculateMediaOnTrackLengthInSamples(qtTrack, &mediaNumSamples));
    if (trackNumSamples != mediaNumSamples) {
        rule_.TellReason(ncfFunction,
                         "The audio track length doesn't match corresponding media length.");
        return 0;
    }
    return 1;
}

// Which codecs are native stands in the data files: a picture is, when its
// code leads to a full record there.
NCFRESULT QuickTimeClip::IsVideoSampleProviderMedia(AAFInfo* aafInfo) {
    NCF_FUNCTION("QuickTimeClip::IsVideoSampleProviderMedia");
    if (rule_.CommonSampleProviderCheck(IsSelfContained()) == 0) {
        return 0;
    }
    NCFSmartPtr<IVideoTrackInfo> vti = GetFirstVideoTrackInfo();
    CHK_PTR(vti.inArg());
    ncfUInt32 descCount = 1;
    NCF_RETURN(vti->GetSampleDescriptionCount(&descCount));
    if (descCount > 1) {
        rule_.TellReason(
            ncfFunction,
            "The movie contains video track with more than one video image description.");
        return 0;
    }
    ncfUInt32 trackCount = 1;
    NCF_RETURN(qtParser_->GetVideoTrackCount(&trackCount));
    if (trackCount > 1) {
        rule_.TellReason(ncfFunction, "The movie contains more than 1 video track.");
        return 0;
    }
    if (ShowsAlpha()) {
        rule_.TellReason(ncfFunction, "The movie contains alpha.");
        return 0;
    }
    return rule_.IsInDataFiles(ClipPicture(*this), aafInfo);
}
