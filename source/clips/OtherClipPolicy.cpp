// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// Whether the host may read this movie's picture or sound by itself.

#include "source/clips/ClipPicture.h"
#include "source/clips/OtherClip.h"
#include "source/plugin/ResultChecks.h"

namespace {

constexpr char kDurationReason[] = "MovieTrackDurationIssues found.";
constexpr char kDurationLine[] = "MovieTrackDurationIssues found.\n";

}  // namespace

NCFRESULT OtherClip::FindDurationIssues(const char* ncfFunction, ncfBool& sound, ncfBool& picture) {
    CHK_PTR(qtWrapper_);
    NCF_RETURN_TEXT(
        "qtWrapper_->MovieTrackDurationIssues(editRate_.numerator, "
        "editRate_.denominator, length_, &sound, &picture)",
        qtWrapper_->MovieTrackDurationIssues(editRate_.numerator, editRate_.denominator, length_,
                                             &sound, &picture));
    return NCF_OK;
}

NCFRESULT OtherClip::IsAudioSampleProviderMedia(ncfUInt32 qtTrack, ncfUInt64* numAudioSamples) {
    NCF_FUNCTION("OtherClip::IsAudioSampleProviderMedia");
    const NCFRESULT baseAnswer = BaseClip::IsAudioSampleProviderMedia(qtTrack, numAudioSamples);
    NCF_RETURN_TEXT("BaseClip::IsAudioSampleProviderMedia(qtTrack, numAudioSamples)", baseAnswer);
    if (baseAnswer == 0) {
        return 0;
    }
    ncfBool sound = 0;
    ncfBool picture = 0;
    const NCFRESULT asked = FindDurationIssues(ncfFunction, sound, picture);
    if (asked < 0) {
        return asked;
    }
    if (sound) {
        rule_.TellReason(ncfFunction, kDurationReason, kDurationLine);
        return 0;
    }
    return 1;
}

// The cheap questions come first; the data files have the last word.
NCFRESULT OtherClip::IsVideoSampleProviderMedia(AAFInfo* outAAFInfo) {
    NCF_FUNCTION("OtherClip::IsVideoSampleProviderMedia");
    CHK_INARG(outAAFInfo);
    if (rule_.CommonSampleProviderCheck(IsSelfContained()) == 0) {
        return 0;
    }
    CHK_PTR(qtWrapper_);
    if (qtWrapper_->MovieHasMultipleVideoTracks(0, 0)) {
        rule_.TellReason(ncfFunction, "The movie contains more than one video track.",
                         "The movie contains more than 1 video track.\n");
        return 0;
    }
    ncfBool sound = 0;
    ncfBool picture = 0;
    const NCFRESULT asked = FindDurationIssues(ncfFunction, sound, picture);
    if (asked < 0) {
        return asked;
    }
    if (picture) {
        rule_.TellReason(ncfFunction, kDurationReason, kDurationLine);
        return 0;
    }
    if (ShowsAlpha()) {
        rule_.TellReason(ncfFunction, "The movie contains alpha.", "The movie contains alpha.\n");
        return 0;
    }
    ncfUInt32 track = 0;
    NCF_RETURN(GetFirstVideoTrack(track));
    const ncfUInt32 descriptions = qtWrapper_->GetImageDescriptionCount(track);
    if (descriptions == 1) {
        return rule_.IsInDataFiles(ClipPicture(*this), outAAFInfo);
    }
    if (descriptions > 1) {
        rule_.TellReason(ncfFunction, "More than one video ImageDescriptionHandle found",
                         "More than one video ImageDescriptionHandle found.\n");
    } else {
        rule_.TellReason(ncfFunction, "Video is missing a ImageDescriptionHandle.",
                         "Video is missing a ImageDescriptionHandle.\n");
    }
    return 0;
}
