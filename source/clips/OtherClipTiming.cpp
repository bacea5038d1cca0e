// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// Rate and length, which the wrapper works out in one go from what the
// editor's project says.

#include "source/clips/OtherClip.h"
#include "source/plugin/ResultChecks.h"

NCFRESULT OtherClip::SettleOnce(const char* ncfFunction, const EditorSettings& editorSettings) {
    if (length_ == 0) {
        NCF_RETURN(SetEditRateAndLengthImpl(editorSettings));
    }
    return NCF_OK;
}

// The lengths of the single tracks are asked for since the wrapper wants the
// room; nothing reads them.
NCFRESULT OtherClip::SetEditRateAndLengthImpl(const EditorSettings& editorSettings) {
    NCF_FUNCTION("OtherClip::SetEditRateAndLengthImpl");
    CHK_PTR(qtWrapper_);
    std::vector<ncfUInt64> trackLengthInFramesArray(HighestTrack());
    const auto trackCount = static_cast<ncfUInt32>(trackLengthInFramesArray.size());
    const bool valid = editorSettings._areSettingsValid != 0;
    const double forcedRate =
        valid && editorSettings._forcedFrameRateEnabled ? editorSettings._forcedFrameRate : 0.0;
    const double editorRate = valid ? editorSettings._editorFrameRate : 0.0;
    const ncfUInt32 singleFrameDuration = valid ? editorSettings._singleFrameDuration : 0;
    const ncfBool useMovieHeader =
        editorSettings._movieDurationCalculationToUse == EditorSettings::kUseMovieHeader;
    Rational movieEditRate;
    ncfUInt64 length = 0;
    NCF_RETURN_TEXT(
        "qtWrapper_->DetermineMovieEditRateAndLength( editorSettings._areSettingsValid && "
        "editorSettings._forcedFrameRateEnabled ? editorSettings._forcedFrameRate : 0.0, "
        "editorSettings._areSettingsValid ? editorSettings._editorFrameRate : 0.0, "
        "editorSettings._areSettingsValid ? editorSettings._singleFrameDuration : 0, "
        "&movieEditRate.numerator, &movieEditRate.denominator, &length_, "
        "trackLengthInFramesArray.get(), TRACKLENGTH_ARRAY_LEN, "
        "editorSettings._movieDurationCalculationToUse == EditorSettings::kUseMovieHeader )",
        qtWrapper_->DetermineMovieEditRateAndLength(
            forcedRate, editorRate, singleFrameDuration, &movieEditRate.numerator,
            &movieEditRate.denominator, &length, trackLengthInFramesArray.data(), trackCount,
            useMovieHeader));
    if (length == 0) {
        console_->Write(1, "The length of the movie can't be determined.\n");
        return NMA_E_NOTINITIALIZED;
    }
    length_ = length;
    editRate_ = movieEditRate.denominator != 0 ? Rational::FromDouble(movieEditRate.ToDouble())
                                               : Rational{0, 1};
    return NCF_OK;
}

NCFRESULT OtherClip::CalculateAudioTrackLengthInSamples(ncfUInt32 qtTrack, ncfUInt64* trackLength) {
    NCF_FUNCTION("OtherClip::CalculateAudioTrackLengthInSamples");
    CHK_INARG(trackLength);
    *trackLength = 0;
    AudioTrackMetadata audioInfo;
    NCF_RETURN(GetAudioTrackMetadata(qtTrack, &audioInfo));
    const auto duration = static_cast<double>(qtWrapper_->GetTrackDuration(qtTrack));
    *trackLength = TruncateToUInt64(
        UnitsIn(duration, qtWrapper_->GetMovieTimeScale(), audioInfo.sampleRate) + 0.5);
    return NCF_OK;
}
