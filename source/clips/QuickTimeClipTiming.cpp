// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// Rate and length. Three clocks meet here: the movie's time scale, each
// track's media time scale, and the count of samples. The order of the
// arithmetic decides how results round, so it stays as it stands.

#include <ios>

#include "source/clips/QuickTimeClip.h"
#include "source/plugin/PluginLogSink.h"
#include "source/plugin/ResultChecks.h"

namespace {

// Slower than this is no rate.
constexpr double kSlowestRate = 0.01;

}  // namespace

// A video track gives the rate; without one the editor's rate stands in. The
// forced rate is taken first but never outlasts the steps behind it.
NCFRESULT QuickTimeClip::SetEditRateImpl(const EditorSettings& editorSettings) {
    NCF_FUNCTION("QuickTimeClip::SetEditRateImpl");
    const bool valid = editorSettings._areSettingsValid != 0;
    const double forcedRate = valid && editorSettings._forcedFrameRateEnabled != 0
                                  ? editorSettings._forcedFrameRate
                                  : 0.0;
    const double editorRate = valid ? editorSettings._editorFrameRate : 0.0;
    if (forcedRate > kSlowestRate) {
        editRate_ = Rational::FromDouble(forcedRate);
    }
    ncfUInt32 videoTrackCount = 0;
    if (qtParser_->GetVideoTrackCount(&videoTrackCount) >= 0 && videoTrackCount != 0) {
        NCF_RETURN(SetAverageFrameRate(editRate_));
        return NCF_OK;
    }
    if (editorRate > kSlowestRate) {
        editRate_ = Rational::FromDouble(editorRate);
        return NCF_OK;
    }
    slog::Error(ncfFunction) << "unknown edit rate!";
    return NCF_E_UNEXPECTED;
}

// The mean rate of the media: a movie of varying rate gets its average.
NCFRESULT QuickTimeClip::SetAverageFrameRate(Rational& rate) {
    NCF_FUNCTION("QuickTimeClip::SetAverageFrameRate");
    NCFSmartPtr<IVideoTrackInfo> vti = GetFirstVideoTrackInfo();
    CHK_PTR(vti);
    ncfSInt64 mediaOffset = 0;
    NCFSmartPtr<IQTSampleTable> stbl;
    ncfUInt64 numSamples = 0;
    ncfUInt32 mediaDuration = 0;
    ncfUInt32 mediaTS = 0;
    NCF_RETURN(vti->TrackTimeToMediaTime(0, &mediaOffset));
    NCF_RETURN(vti->GetSampleTable(stbl.outArg()));
    NCF_RETURN(stbl->GetNumSamples(&numSamples));
    NCF_RETURN(vti->GetMediaDuration(&mediaDuration));
    NCF_RETURN(vti->GetMediaTS(&mediaTS));
    const double fps = static_cast<double>(numSamples) * mediaTS / mediaDuration;
    rate = Rational::FromDouble(fps);
    return NCF_OK;
}

NCFRESULT QuickTimeClip::SetMovieLengthImpl(const EditorSettings&) {
    NCF_FUNCTION("QuickTimeClip::SetMovieLengthImpl");
    ncfUInt32 videoTrackCount = 0;
    NCF_RETURN(GetVideoTrackCount(&videoTrackCount));
    if (videoTrackCount != 0) {
        NCF_RETURN(SetAVMovieLength());
    } else {
        NCF_RETURN(SetOnlyAudioMovieLength());
    }
    return NCF_OK;
}

NCFRESULT QuickTimeClip::SetAVMovieLength() {
    NCF_FUNCTION("QuickTimeClip::SetAVMovieLength");
    NCFSmartPtr<IVideoTrackInfo> vti = GetFirstVideoTrackInfo();
    CHK_PTR(vti.inArg());
    ncfBool linear = 0;
    ncfBool proportional = 0;
    ncfSInt64 offset = 0;
    ncfUInt32 trackTimescale = 0;
    const NCFRESULT asked = vti->IsTrackLinear(&linear, &proportional, &offset, &trackTimescale);
    if (asked < 0) {
        slog::Progress(ncfFunction) << "IsTrackLinear failed: "
                                    << "0x" << std::hex << static_cast<ncfUInt32>(asked);
    }
    double timescale = trackTimescale;
    if (!linear) {
        slog::Progress(ncfFunction) << "track is not linear!";
        ncfUInt32 movieTimescale = 0;
        NCF_RETURN(qtParser_->GetTimeScale(&movieTimescale));
        timescale = movieTimescale;
    }
    ncfUInt32 trackDuration = 0;
    NCF_RETURN(vti->GetTrackDuration(&trackDuration));
    length_ = TruncateToUInt64(UnitsIn(trackDuration, timescale, editRate_.ToDouble()) + 0.5);
    return NCF_OK;
}

// Sound that ends within a frame doesn't fill it: nothing is added before the
// cut, other than with video.
NCFRESULT QuickTimeClip::SetOnlyAudioMovieLength() {
    NCF_FUNCTION("QuickTimeClip::SetOnlyAudioMovieLength");
    ncfUInt32 movieTimescale = 0;
    ncfUInt32 movieDuration = 0;
    NCF_RETURN(qtParser_->GetTimeScale(&movieTimescale));
    NCF_RETURN(qtParser_->GetMovieDuration(&movieDuration));
    length_ = TruncateToUInt64(UnitsIn(movieDuration, movieTimescale, editRate_.ToDouble()));
    return NCF_OK;
}

NCFRESULT QuickTimeClip::CalculateAudioTrackLengthInSamples(ncfUInt32 qtTrack,
                                                            ncfUInt64* trackNumSamples) {
    NCF_FUNCTION("QuickTimeClip::CalculateAudioTrackLengthInSamples");
    CHK_INARG(trackNumSamples);
    *trackNumSamples = 0;
    NCFSmartPtr<IAudioTrackInfo> ati;
    AudioTrackMetadata audioInfo;
    ncfUInt32 trackDuration = 0;
    ncfUInt32 movieTimescale = 0;
    NCF_RETURN(GetAudioTrack(qtTrack, ati.outArg()));
    NCF_RETURN(GetAudioTrackMetadata(qtTrack, &audioInfo));
    NCF_RETURN(ati->GetTrackDuration(&trackDuration));
    NCF_RETURN(qtParser_->GetTimeScale(&movieTimescale));
    *trackNumSamples =
        TruncateToUInt64(UnitsIn(trackDuration, movieTimescale, audioInfo.sampleRate) + 0.5);
    return NCF_OK;
}

NCFRESULT QuickTimeClip::CalculateMediaOnTrackLengthInSamples(ncfUInt32 qtTrack,
                                                              ncfUInt64* mediaNumSamples) {
    NCF_FUNCTION("QuickTimeClip::CalculateMediaOnTrackLengthInSamples");
    CHK_INARG(mediaNumSamples);
    *mediaNumSamples = 0;
    NCFSmartPtr<IAudioTrackInfo> ati;
    AudioTrackMetadata audioInfo;
    ncfUInt32 mediaOnTrackDuration = 0;
    ncfUInt32 mediaTimescale = 0;
    NCF_RETURN(GetAudioTrack(qtTrack, ati.outArg()));
    NCF_RETURN(GetAudioTrackMetadata(qtTrack, &audioInfo));
    NCF_RETURN(ati->GetMediaDuration(&mediaOnTrackDuration));
    NCF_RETURN(ati->GetMediaTS(&mediaTimescale));
    *mediaNumSamples =
        TruncateToUInt64(UnitsIn(mediaOnTrackDuration, mediaTimescale, audioInfo.sampleRate) + 0.5);
    return NCF_OK;
}
