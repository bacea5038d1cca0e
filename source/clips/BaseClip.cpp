// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/clips/BaseClip.h"

#include "host_interfaces/framework/HostSettings.h"
#include "source/plugin/PluginLogSink.h"
#include "source/plugin/ResultChecks.h"

BaseClip::BaseClip(NCFSmartPtr<INCFString> fileName, NCFSmartPtr<INCFConsole> console,
                   NCFSmartPtr<INCFComponentFactory> componentFactory)
    : fileName_(fileName),
      console_(console),
      componentFactory_(componentFactory),
      services_(fileName, componentFactory),
      rule_(console) {}

BaseClip::~BaseClip() = default;

NCFSmartPtr<INCFString> BaseClip::GetFileName() const {
    return fileName_;
}

// What both kinds of clip read from the picture while they load.
NCFRESULT BaseClip::LoadClipBase() {
    NCF_FUNCTION("BaseClip::LoadClipBase");
    ncfUInt32 dummyW = 0;
    ncfUInt32 dummyH = 0;
    NCF_RETURN(GetEncodedWidthAndHeight(&dummyW, &dummyH));
    NCF_RETURN(GetImageAspectRatio(&dummyW, &dummyH));
    NCF_RETURN(SetColorSpaceImpl());
    slog::Progress(ncfFunction) << "color_space: " << ColorSpaceToString(picture_.colorSpace);
    NCF_RETURN(SetGeometryImpl());
    NCF_RETURN(SetFieldLayoutDetails());

    // A clip that can't tell its code is not loaded; the code itself is asked again.
    ncfUInt32 fourCC = 0;
    NCF_RETURN(GetDataFormat(&fourCC));

    // A host without settings leaves the default in force.
    NCFSmartPtr<NMA::IHostSettings> hostSettings;
    NCF_SKIP_TEXT(
        "componentFactory_->CreateComponent(NMA::Impl::CompID_HostSettings, NULL, "
        "NMA::IID_IHostSettings, (void**)&hostSettings)",
        ncfCreate(componentFactory_.inArg(), NMA::Impl::CompID_HostSettings, NMA::IID_IHostSettings,
                  hostSettings));
    if (hostSettings) {
        NCF_SKIP_TEXT(
            "hostSettings->GetHostSettingBoolean(NMA::NMAHostSetting_IgnoreAlpha, "
            "NMA::IHostSettings::kUserScope, &ignoreAlpha_)",
            hostSettings->GetHostSettingBoolean(NMA::NMAHostSetting_IgnoreAlpha,
                                                NMA::IHostSettings::kUserScope,
                                                &picture_.ignoreAlpha));
    }
    loaded_ = 1;
    return NCF_OK;
}

// --- rate and length -----------------------------------------------------------

NCFRESULT BaseClip::SetEditRate(const EditorSettings& editorSettings) {
    NCF_FUNCTION("BaseClip::SetEditRate");
    NCF_RETURN(SetEditRateImpl(editorSettings));
    slog::Progress(ncfFunction) << "edit_rate: " << editRate_.numerator << "/"
                                << editRate_.denominator;
    if (editRate_.numerator == 0 || editRate_.denominator == 0) {
        console_->Write(1, "The frame rate of the movie can't be determined.\n");
    }
    return NCF_OK;
}

NCFRESULT BaseClip::SetMovieLength(const EditorSettings& editorSettings) {
    NCF_FUNCTION("BaseClip::SetMovieLength");
    if (length_ == 0) {
        NCF_RETURN(SetMovieLengthImpl(editorSettings));
        if (length_ == 0) {
            console_->Write(1, "The length of the movie can't be determined.\n");
        }
    }
    slog::Progress(ncfFunction) << "movie_length[in_video_samples]: " << length_;
    return NCF_OK;
}

NCFRESULT BaseClip::GetMovieLengthBase(ncfUInt64* movieLength) const {
    NCF_FUNCTION("BaseClip::GetMovieLengthBase");
    CHK_PTR(movieLength);
    *movieLength = 0;
    if (length_ == 0) {
        return NMA_E_NOTINITIALIZED;
    }
    *movieLength = length_;
    return NCF_OK;
}

NCFRESULT BaseClip::GetEditRateBase(Rational* editRate) const {
    NCF_FUNCTION("BaseClip::GetEditRateBase");
    CHK_PTR(editRate);
    *editRate = Rational{1, 1};
    if (editRate_.numerator == 0 || editRate_.denominator == 0) {
        return NMA_E_NOTINITIALIZED;
    }
    *editRate = editRate_;
    return NCF_OK;
}

NCFRESULT BaseClip::ObtainAudioTrackLength(ncfUInt32 qtTrack, ncfUInt64* adjustedNumSamples,
                                           bool* hasEnoughAudio) {
    NCF_FUNCTION("BaseClip::ObtainAudioTrackLength");
    CHK_INARG(adjustedNumSamples);
    *adjustedNumSamples = 0;

    AudioTrackMetadata audioInfo;
    ncfUInt64 audioSamplesInAudioTrackTS = 0;
    Rational avgMovieEditRate;
    ncfUInt64 numVideoSamples = 0;
    NCF_RETURN(GetAudioTrackMetadata(qtTrack, &audioInfo));
    NCF_RETURN(CalculateAudioTrackLengthInSamples(qtTrack, &audioSamplesInAudioTrackTS));
    NCF_RETURN(GetEditRate(&avgMovieEditRate));
    NCF_RETURN(GetMovieLength(&numVideoSamples));

    const auto audioLength = static_cast<double>(audioSamplesInAudioTrackTS);
    const double audioSamplesInVideoTS =
        (audioInfo.sampleRate / avgMovieEditRate.ToDouble()) * static_cast<double>(numVideoSamples);
    *adjustedNumSamples = TruncateToUInt64(audioLength + 0.5);

    const bool enough = audioLength >= audioSamplesInVideoTS;
    if (enough) {
        *adjustedNumSamples = TruncateToUInt64(audioSamplesInVideoTS + 0.5);
        slog::Progress(ncfFunction)
            << "audioSamplesInVideoTS: " << audioSamplesInVideoTS
            << "; audioSamplesInAudioTrackTS: " << audioSamplesInAudioTrackTS;
    } else {
        slog::Progress(ncfFunction)
            << "Not enough audio, audioSamplesInVideoTS(" << audioSamplesInVideoTS
            << ") > audioSamplesInAudioTrackTS(" << audioSamplesInAudioTrackTS << ")";
    }
    if (hasEnoughAudio) {
        *hasEnoughAudio = enough;
    }
    return NCF_OK;
}

// --- picture properties ----------------------------------------------------------

NCFRESULT BaseClip::GetEncodedWidthAndHeight(ncfUInt32* width, ncfUInt32* height) {
    NCF_FUNCTION("BaseClip::GetEncodedWidthAndHeight");
    CHK_PTR(width);
    CHK_PTR(height);
    if (picture_.width == 0 || picture_.height == 0) {
        NCF_RETURN(GetEncodedWidthAndHeightImpl(width, height));
        slog::Progress(ncfFunction)
            << "width x height: " << picture_.width << " x " << picture_.height;
    }
    NCFASSERT_TEXT("width_ && height_", picture_.width && picture_.height);
    *width = picture_.width;
    *height = picture_.height;
    return NCF_OK;
}

NCFRESULT BaseClip::GetImageAspectRatio(ncfUInt32* numerator, ncfUInt32* denominator) {
    NCF_FUNCTION("BaseClip::GetImageAspectRatio");
    CHK_INARG(numerator);
    CHK_INARG(denominator);
    if (picture_.aspectNumerator == 0 || picture_.aspectDenominator == 0) {
        NCF_RETURN(GetImageAspectRatioImpl(numerator, denominator));
        slog::Progress(ncfFunction) << "image_aspect_ratio: " << picture_.aspectNumerator << "/"
                                    << picture_.aspectDenominator;
    }
    // A size of 0 is a broken movie; a ratio of 0 is only not known, and
    // nothing is logged for it.
    if (picture_.aspectNumerator == 0 || picture_.aspectDenominator == 0) {
        return NMA_E_NOTINITIALIZED;
    }
    *numerator = picture_.aspectNumerator;
    *denominator = picture_.aspectDenominator;
    return NCF_OK;
}

NCFRESULT BaseClip::GetColorSpace(ncfUInt32* colorSpace) const {
    NCF_FUNCTION("BaseClip::GetColorSpace");
    CHK_PTR(colorSpace);
    if (picture_.colorSpace == kPropertyNotSet) {
        return NMA_E_NOTSET;
    }
    *colorSpace = picture_.colorSpace;
    return NCF_OK;
}

NCFRESULT BaseClip::GetTemporalFieldOrder(ncfUInt32* temporalFieldOrder) const {
    NCF_FUNCTION("BaseClip::GetTemporalFieldOrder");
    CHK_PTR(temporalFieldOrder);
    if (picture_.fields.order == kPropertyNotSet) {
        return NMA_E_NOTSET;
    }
    *temporalFieldOrder = picture_.fields.order;
    return NCF_OK;
}

NCFRESULT BaseClip::GetFrameBufferLayout(ncfUInt32* frameBufferLayout) const {
    NCF_FUNCTION("BaseClip::GetFrameBufferLayout");
    CHK_PTR(frameBufferLayout);
    if (picture_.fields.layout == kPropertyNotSet) {
        return NMA_E_NOTSET;
    }
    *frameBufferLayout = picture_.fields.layout;
    return NCF_OK;
}

NCFRESULT BaseClip::GetBufferLineOrientation(ncfUInt32* bufferLineOrientation) const {
    NCF_FUNCTION("BaseClip::GetBufferLineOrientation");
    CHK_PTR(bufferLineOrientation);
    if (picture_.fields.lineOrientation == kPropertyNotSet) {
        return NMA_E_NOTSET;
    }
    *bufferLineOrientation = picture_.fields.lineOrientation;
    return NCF_OK;
}

NCFRESULT BaseClip::GetColorDetails(ColorDetails* colorDetails) const {
    if (!colorDetails) {
        return NCF_E_INVALIDARG;
    }
    *colorDetails = picture_.color;
    return NCF_OK;
}

NCFRESULT BaseClip::GetGeometryDetails(GeometryDetails* geometryDetails) const {
    if (!geometryDetails) {
        return NCF_E_INVALIDARG;
    }
    *geometryDetails = picture_.geometry;
    return NCF_OK;
}

// --- tracks ------------------------------------------------------------------------

NCFRESULT BaseClip::GetTimeCodeTrackCount(ncfUInt32* trackCount) {
    return GetTimeCodeTrackCountImpl(trackCount);
}

NCFRESULT BaseClip::GetVideoTrackCount(ncfUInt32* trackCount) {
    return GetVideoTrackCountImpl(trackCount);
}

NCFRESULT BaseClip::GetAudioTrackCount(ncfUInt32* trackCount) {
    return GetAudioTrackCountImpl(trackCount);
}

// --- the sample-provider rule for sound ------------------------------------------------

NCFRESULT BaseClip::IsAudioSampleProviderMedia(ncfUInt32 qtTrack, ncfUInt64*) {
    NCF_FUNCTION("BaseClip::IsAudioSampleProviderMedia");
    if (rule_.CommonSampleProviderCheck(IsSelfContained()) == 0) {
        return 0;
    }
    ncfBool isLPCM = 0;
    NCF_RETURN(IsAudioLPCM(qtTrack, &isLPCM));
    if (!isLPCM) {
        return 0;
    }
    AudioTrackMetadata audioInfo;
    NCF_RETURN(GetAudioTrackMetadata(qtTrack, &audioInfo));
    return rule_.IsSupportedBitPerChannel(audioInfo.bitsPerChannel);
}
