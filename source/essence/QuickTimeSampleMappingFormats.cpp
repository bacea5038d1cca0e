// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// From a codec's abilities and the clip's level setting to the picture formats
// on offer.

#include <cstring>

#include "source/essence/ColorSpace.h"
#include "source/essence/FormatRecipes.h"
#include "source/essence/QuickTimeSampleMapping.h"
#include "source/plugin/PluginLogSink.h"
#include "source/plugin/ResultChecks.h"

namespace NMA::Impl {
namespace {

// What the host would rather have of a codec that stores Y'CbCr. One of them
// is a code that makes no format.
bool IsPreferred(ncfUInt32 fourCC) {
    return fourCC == QuickTime::k2vuyPixelFormat || fourCC == QuickTime::kNVZ1PixelFormat ||
           fourCC == QuickTime::kr4flPixelFormat;
}

// The codec stores Y'CbCr.
constexpr ncfUInt32 kStorageYCbCr = 0;

constexpr QTPixelParams k2vuyParams = {QuickTime::k2vuyPixelFormat, {2, 1}, {2, 1}, nullptr};
// Shown as ten bits, asked of the reader as '2vuy' with room for twice as much.
constexpr QTPixelParams kV210Params = {QuickTime::k2vuyPixelFormat, {4, 1}, {4, 1}, nullptr};

}  // namespace

NCFRESULT QuickTimeSampleMapping::AddSupportedImageFormatsBasedOnCodec() {
    NCF_FUNCTION("NMA::Impl::QuickTimeSampleMapping::AddSupportedImageFormatsBasedOnCodec");
    MediaTrack* const video_track = FirstTrackOf(MediaTrack::kVideo);
    MediaTrack* const alpha_track = FirstAlphaTrackShown();
    CHK_PTR(video_track);
    NCFSmartPtr<QuickTime::IQuickTimeProperty> quickTimeProperty;
    NCF_RETURN(media_->GetQuickTimePropertyComponent(quickTimeProperty));
    NCF_RETURN_TEXT("quickTimeProperty->CreateMovie(_filePath)",
                    quickTimeProperty->CreateMovie(_filePath.inArg()));
    NCF_RETURN(quickTimeProperty->GetCodecStorageType(&_codecStorageType));
    NCF_RETURN(quickTimeProperty->DoesCodecSupportRGB_CCIR(&_codecSupportsRGB_CCIR));
    NCF_RETURN_TEXT("pixBuffer->GetBufferPointer((void**)&codecPixelFormats_ptr)",
                    ReadCodecPixelFormats(quickTimeProperty.inArg()));
    const NCFRESULT added = AddDecompressorPixelFormats(video_track, alpha_track);

    imageFormatsReady_ = video_track->GetNumberOfFormats() > 0;
    if (!imageFormatsReady_) {
        slog::Warning(ncfFunction) << "No one image pixel format was added for video track.";
        _pConsole->Write(2, "No one image pixel format was added for video track.\n");
    }
    if (media_->ShowsAlpha() && (!alpha_track || alpha_track->GetNumberOfFormats() == 0)) {
        slog::Warning(ncfFunction) << "No one image pixel format was added for alpha track.";
        _pConsole->Write(2, "No one image pixel format was added for alpha track.\n");
    }
    return added;
}

// A codec that can't tell its formats has none; only a list that can't be read
// is a failure.
NCFRESULT QuickTimeSampleMapping::ReadCodecPixelFormats(
    QuickTime::IQuickTimeProperty* quickTimeProperty) {
    ncfUInt32 count = 0;
    NCFSmartPtr<INCFBuffer> pixBuffer;
    if (quickTimeProperty->GetCodecPixelFormats(pixBuffer.outArg(), &count) < 0) {
        count = 0;
    }
    void* codecPixelFormats_ptr = nullptr;
    if (count != 0 && pixBuffer) {
        if (const NCFRESULT result = pixBuffer->GetBufferPointer(&codecPixelFormats_ptr);
            result < 0) {
            return result;
        }
    }
    codecPixelFormats_.assign(codecPixelFormats_ptr ? count : 0, 0);
    if (codecPixelFormats_ptr) {
        std::memcpy(codecPixelFormats_.data(), codecPixelFormats_ptr, count * sizeof(ncfUInt32));
    }
    return NCF_OK;
}

// The level setting is copied here: this is where a change of it reaches the
// pixels.
NCFRESULT QuickTimeSampleMapping::AddDecompressorPixelFormats(MediaTrack* video_track,
                                                              MediaTrack* alpha_track) {
    NCF_FUNCTION("NMA::Impl::QuickTimeSampleMapping::AddDecompressorPixelFormats");
    CHK_INARG(video_track);
    CHK_PTR(_pConsole);
    levelRemap_ = media_->GetClipParams()->levelRemap;
    if (codecPixelFormats_.empty()) {
        NCF_RETURN(AddPixelFormat(video_track, alpha_track, QuickTime::k2vuyPixelFormat,
                                  _codecSupportsRGB_CCIR));
    }
    ncfBool isMultiformat = 0;
    NCF_RETURN(media_->IsMultiFormatMovie(&isMultiformat));
    if (isMultiformat) {
        // What one of the codecs likes says nothing about the others.
        NCF_RETURN(AddPixelFormat(video_track, alpha_track, QuickTime::k2vuyPixelFormat,
                                  _codecSupportsRGB_CCIR));
        return NCF_OK;
    }
    bool added = false;
    if (_codecStorageType == kStorageYCbCr) {
        added = AddCodecPixelFormats(video_track, alpha_track, true);
    }
    if (!added) {
        added = AddCodecPixelFormats(video_track, alpha_track, false);
    }
    if (!added) {
        NCF_RETURN(AddPixelFormat(video_track, alpha_track, QuickTime::k2vuyPixelFormat,
                                  _codecSupportsRGB_CCIR));
    }
    return NCF_OK;
}

bool QuickTimeSampleMapping::AddCodecPixelFormats(MediaTrack* video_track, MediaTrack* alpha_track,
                                                  bool preferredOnly) {
    bool added = false;
    for (const ncfUInt32 fourCC : codecPixelFormats_) {
        if (preferredOnly && !IsPreferred(fourCC)) {
            continue;
        }
        if (AddPixelFormat(video_track, alpha_track, fourCC, _codecSupportsRGB_CCIR) == NCF_OK) {
            added = true;
        }
    }
    return added;
}

NCFRESULT QuickTimeSampleMapping::AddPixelFormat(MediaTrack* video_track, MediaTrack* alpha_track,
                                                 ncfUInt32 fourCC, ncfUInt32 supportsRGB_CCIR) {
    NCF_FUNCTION("NMA::Impl::QuickTimeSampleMapping::AddPixelFormat");
    CHK_INARG(video_track);
    const bool hasAlpha = media_->ShowsAlpha();
    const bool levelsAsStored = media_->GetClipParams()->levelRemap == Default_Levels;
    if (fourCC == QuickTime::k2vuyPixelFormat) {
        if (hasAlpha) {
            return NCF_E_FAIL;
        }
        if (!levelsAsStored) {
            // The level tables work on RGB.
            return AddPixelFormat(video_track, alpha_track, QuickTime::kNVZ2PixelFormat,
                                  supportsRGB_CCIR);
        }
        return AddYCbCrPixelFormat(video_track, CT_UCHAR, k2vuyParams,
                                   "Adding support for '2vuy'.\n");
    }
    if (fourCC == QuickTime::kv210PixelFormat) {
        if (hasAlpha || !levelsAsStored) {
            return NCF_E_FAIL;
        }
        return AddYCbCrPixelFormat(video_track, CT_V210, kV210Params,
                                   "Adding support for 'v210'.\n");
    }
    const RGBRecipe* const recipe = FindRGBRecipe(fourCC, supportsRGB_CCIR != 0);
    if (!recipe) {
        return NCF_E_FAIL;
    }
    const FormatRow& video = recipe->video;
    NCF_RETURN_TEXT(video.text,
                    AddImagePixelFormat(video_track, video.pixelFormat, video.chromaSubSampling,
                                        video.colorSpace, video.componentType, video.componentRange,
                                        video.qt_params));
    _pConsole->Write(4, "%s", video.line);
    if (!alpha_track || !recipe->alpha) {
        return NCF_OK;
    }
    NCFASSERT(MediaTrack::kVideoAlpha == alpha_track->GetTrackType());
    const FormatRow& alpha = *recipe->alpha;
    NCF_RETURN_TEXT(alpha.text,
                    AddImagePixelFormat(alpha_track, alpha.pixelFormat, alpha.chromaSubSampling,
                                        alpha.colorSpace, alpha.componentType, alpha.componentRange,
                                        alpha.qt_params));
    _pConsole->Write(4, "%s", alpha.line);
    return NCF_OK;
}

// The colour space is the clip's; a clip that has none, or one that this
// layout can't have, goes by its size.
NCFRESULT QuickTimeSampleMapping::AddYCbCrPixelFormat(MediaTrack* video_track,
                                                      ncfUInt32 componentType,
                                                      const QTPixelParams& qt_params,
                                                      const char* line) {
    NCF_FUNCTION("NMA::Impl::QuickTimeSampleMapping::AddPixelFormat");
    ncfUInt32 colorSpaceToUse = CS_UNDEFINED;
    if (const NCFRESULT told = media_->GetColorSpace(&colorSpaceToUse); told != NMA_E_NOTSET) {
        NCF_RETURN_TEXT("media_->GetColorSpace(&colorSpaceToUse)", told);
    }
    if (colorSpaceToUse == CS_RGB || colorSpaceToUse == CS_UNDEFINED) {
        NCF_RETURN(InferColorSpaceFromStandard(media_, &colorSpaceToUse));
    }
    NCF_RETURN_TEXT(componentType == CT_V210
                        ? "AddImagePixelFormat(video_track, PF_CbYCrY, CSS_4220, colorSpaceToUse, "
                          "CT_V210, CRT_VideoRange, qt_params)"
                        : "AddImagePixelFormat(video_track, PF_CbYCrY, CSS_4220, colorSpaceToUse, "
                          "CT_UCHAR, CRT_VideoRange, qt_params)",
                    AddImagePixelFormat(video_track, PF_CbYCrY, CSS_4220, colorSpaceToUse,
                                        componentType, CRT_VideoRange, qt_params));
    _pConsole->Write(4, "%s", line);
    return NCF_OK;
}

NCFRESULT QuickTimeSampleMapping::AddImagePixelFormat(MediaTrack* track, ncfUInt32 pixelFormat,
                                                      ncfUInt32 chromaSubSampling,
                                                      ncfUInt32 colorSpace, ncfUInt32 componentType,
                                                      ncfUInt32 componentRange,
                                                      const QTPixelParams& qt_params) {
    NCF_FUNCTION("NMA::Impl::QuickTimeSampleMapping::AddImagePixelFormat");
    ncfUInt32 blo = 0;
    ncfUInt32 tfo = 0;
    ncfUInt32 fbl = 0;
    NCF_RETURN(media_->GetBufferLineOrientation(&blo));
    NCF_RETURN(media_->GetTemporalFieldOrder(&tfo));
    NCF_RETURN(media_->GetFrameBufferLayout(&fbl));
    QTImageFormat format;
    format.pixelFormat = pixelFormat;
    format.chromaSubSampling = chromaSubSampling;
    format.componentFormat = componentType;
    format.componentRangeType = componentRange;
    format.colorSpace = colorSpace;
    format.fieldOrder = tfo;
    format.frameLayout = fbl;
    format.orientation = blo;
    format.qt_params = qt_params;
    track->AddFormat(format);
    return NCF_OK;
}

}  // namespace NMA::Impl
