// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// The working format of a picture track, its buffers, and the reader that
// comes into being with it.

#include "source/essence/ProviderLock.h"
#include "source/essence/QuickTimeSampleMapping.h"
#include "source/essence/RoundUp.h"
#include "source/plugin/ResultChecks.h"
#include "source/plugin/ResultOf.h"

namespace NMA::Impl {
namespace {

// Packed ten-bit lines come in groups of this many pixels.
constexpr ncfUInt32 kV210Group = 48;

const char* LabelOf(ncfUInt32 fourCC) {
    struct Label {
        ncfUInt32 fourCC;
        const char* text;
    };
    constexpr Label labels[] = {
        {QuickTime::k2vuyPixelFormat, "2vuy"}, {QuickTime::kBGRAPixelFormat, "BGRA 8-bit"},
        {QuickTime::kv210PixelFormat, "V210"}, {QuickTime::kb64aPixelFormat, "b64a"},
        {QuickTime::kb48rPixelFormat, "b48r"}, {QuickTime::kr4flPixelFormat, "r4fl"},
    };
    for (const Label& label : labels) {
        if (label.fourCC == fourCC) {
            return label.text;
        }
    }
    return "Unknown";
}

}  // namespace

// --- the list ------------------------------------------------------------------------

NCFRESULT QuickTimeSampleMapping::GetNumberOfImageFormats(ncfUInt32 trackNMA,
                                                          ncfUInt32* numFormats) {
    NCF_FUNCTION("NMA::Impl::QuickTimeSampleMapping::GetNumberOfImageFormats");
    return ResultOf([&]() -> NCFRESULT {
        CHK_INARG(numFormats);
        std::tr1::shared_ptr<MediaTrack> track;
        NCF_RETURN(GetMediaTrack(trackNMA, track));
        if (!IsPictureTrack(*track)) {
            return NCF_E_INVALIDARG;
        }
        *numFormats = track->GetNumberOfFormats();
        return NCF_OK;
    });
}

// A bad track outranks a null pointer here; with sound it is the other way.
NCFRESULT QuickTimeSampleMapping::GetImageFormat(
    ncfUInt32 trackNMA, ncfUInt32 formatIndex, ncfUInt32* pixelFormat, ncfUInt32* chromaSubSampling,
    ncfUInt32* componentFormat, ncfUInt32* componentRangeType, ncfUInt32* colorSpace,
    ncfUInt32* fieldOrder, ncfUInt32* frameLayout, ncfUInt32* orientation) {
    NCF_FUNCTION("NMA::Impl::QuickTimeSampleMapping::GetImageFormat");
    return ResultOf([&]() -> NCFRESULT {
        std::tr1::shared_ptr<MediaTrack> track;
        NCF_RETURN(GetMediaTrack(trackNMA, track));
        if (!IsPictureTrack(*track)) {
            return NCF_E_INVALIDARG;
        }
        CHK_INARG(pixelFormat);
        CHK_INARG(chromaSubSampling);
        CHK_INARG(componentFormat);
        CHK_INARG(componentRangeType);
        CHK_INARG(colorSpace);
        CHK_INARG(fieldOrder);
        CHK_INARG(frameLayout);
        CHK_INARG(orientation);
        const ProviderLock lock(providerLock_);
        MediaFormatPtr mediaFormat;
        NCF_RETURN(track->GetMediaFormat(formatIndex, mediaFormat));
        const auto* const image_format = dynamic_cast<const QTImageFormat*>(mediaFormat.get());
        CHK_PTR(image_format);
        *pixelFormat = image_format->pixelFormat;
        *chromaSubSampling = image_format->chromaSubSampling;
        *componentFormat = image_format->componentFormat;
        *componentRangeType = image_format->componentRangeType;
        *colorSpace = image_format->colorSpace;
        *fieldOrder = image_format->fieldOrder;
        *frameLayout = image_format->frameLayout;
        *orientation = image_format->orientation;
        return NCF_OK;
    });
}

// --- the choice -------------------------------------------------------------------------

// The choice stands from the moment that the format is known; a reader that
// then fails to start doesn't undo it.
NCFRESULT QuickTimeSampleMapping::SetWorkingImageFormat(ncfUInt32 trackNMA, ncfUInt32 formatIndex) {
    NCF_FUNCTION("NMA::Impl::QuickTimeSampleMapping::SetWorkingImageFormat");
    return ResultOf([&]() -> NCFRESULT {
        std::tr1::shared_ptr<MediaTrack> track;
        NCF_RETURN(GetMediaTrack(trackNMA, track));
        if (!IsPictureTrack(*track)) {
            return NCF_E_INVALIDARG;
        }
        const ProviderLock lock(providerLock_);
        MediaFormatPtr mediaFormat;
        NCF_RETURN(track->GetMediaFormat(formatIndex, mediaFormat));
        const auto* const image_format = dynamic_cast<const QTImageFormat*>(mediaFormat.get());
        CHK_PTR(image_format);
        const auto* const current =
            dynamic_cast<const QTImageFormat*>(track->GetSelectedFormat().get());
        if (current && *current == *image_format) {
            return NCF_OK;
        }
        track->SetSelectedFormat(mediaFormat);
        track->SetSelectedIndex(formatIndex);
        _pConsole->Write(4, "Player negotiated for QuickTime format: %s \n",
                         LabelOf(image_format->qt_params.fourCC));
        return RestartVideoReader(*track);
    });
}

// One reader serves all picture tracks: it is started with the format that was
// chosen last, and told the format at hand before each frame.
NCFRESULT QuickTimeSampleMapping::RestartVideoReader(const MediaTrack& selectedTrack) {
    NCF_FUNCTION("NMA::Impl::QuickTimeSampleMapping::SetWorkingImageFormat");
    const MediaTrack* const track = &selectedTrack;
    MediaFormatPtr mediaFormat;
    NCF_RETURN(track->GetMediaFormat(track->GetSelectedIndex(), mediaFormat));
    const auto* const selected_image_format = dynamic_cast<const QTImageFormat*>(mediaFormat.get());
    CHK_PTR(selected_image_format);
    const ncfUInt32 fourCC = selected_image_format->qt_params.fourCC;
    NCFSmartPtr<QTWrapper::IQuickTimeWrapper> qtWrapper;
    NCF_RETURN(media_->GetQuickTimeInterface(qtWrapper));
    if (fourCC == QuickTime::kv210PixelFormat) {
        (void)qtWrapper->PreparePixelFormat(fourCC);
    }
    if (_videoReaderHolder) {
        (void)_videoReaderHolder->ReleaseQT();
    } else {
        NCF_RETURN(media_->GetQuickTimeVideoReader(_videoReaderHolder));
    }
    (void)_videoReaderHolder->SetOutputPixelFormat(fourCC, 0, 0);
    NCF_RETURN(_videoReaderHolder->InitQT( QTWrapper::kUseDecompressionSession));
    return NCF_OK;
}

// --- sizes ----------------------------------------------------------------------------------

void QuickTimeSampleMapping::GetAlignedWidth(ncfUInt32 componentType, ncfUInt32 width,
                                             ncfUInt32* alignedWidth) {
    if (!alignedWidth) {
        return;
    }
    const ProviderLock lock(providerLock_);
    *alignedWidth = componentType == CT_V210 ? RoundUp(width, kV210Group) : width;
}

ncfUInt32 QuickTimeSampleMapping::OutputFrameSize(const QTImageFormat& format, ncfUInt32 width,
                                                  ncfUInt32 height) {
    ncfUInt32 alignedWidth = 0;
    GetAlignedWidth(format.componentFormat, width, &alignedWidth);
    const Rational& bytes = format.qt_params.outputBytesPerPixel;
    return alignedWidth * height * static_cast<ncfUInt32>(bytes.numerator) /
           static_cast<ncfUInt32>(bytes.denominator);
}

// The height is that of one field where there are two; the buffer below is
// always that of a frame.
NCFRESULT QuickTimeSampleMapping::GetWorkingImageSize(ncfUInt32, ncfUInt32* width,
                                                      ncfUInt32* height) {
    NCF_FUNCTION("NMA::Impl::QuickTimeSampleMapping::GetWorkingImageSize");
    return ResultOf([&]() -> NCFRESULT {
        CHK_INARG(width);
        CHK_INARG(height);
        if (!media_) {
            return NMA_E_NOTINITIALIZED;
        }
        ncfUInt32 movieHeight = 0;
        NCF_RETURN(media_->GetEncodedWidthAndHeight(width, &movieHeight));
        const ProviderLock lock(providerLock_);
        ncfUInt32 temporalFieldOrder = 0;
        NCF_RETURN(media_->GetTemporalFieldOrder(&temporalFieldOrder));
        switch (temporalFieldOrder) {
            case kProgressive:
                *height = movieHeight;
                return NCF_OK;
            case kTopFieldFirst:
            case kBottomFieldFirst:
                *height = movieHeight / 2;
                return NCF_OK;
            default:
                return NCF_E_FAIL;
        }
    });
}

NCFRESULT QuickTimeSampleMapping::GetWorkingImageBufferRequirements(ncfUInt32 trackNMA,
                                                                    ncfUInt16* bufferStartAlignment,
                                                                    ncfUInt64* maxBufferSize) {
    NCF_FUNCTION("NMA::Impl::QuickTimeSampleMapping::GetWorkingImageBufferRequirements");
    return ResultOf([&]() -> NCFRESULT {
        CHK_INARG(bufferStartAlignment);
        CHK_INARG(maxBufferSize);
        *bufferStartAlignment = 1;
        const ProviderLock lock(providerLock_);
        std::tr1::shared_ptr<MediaTrack> track;
        NCF_RETURN(GetMediaTrack(trackNMA, track));
        if (!IsPictureTrack(*track)) {
            return NCF_E_INVALIDARG;
        }
        ncfUInt32 width = 0;
        ncfUInt32 height = 0;
        NCF_RETURN(media_->GetEncodedWidthAndHeight(&width, &height));
        MediaFormatPtr mediaFormat;
        NCF_RETURN(track->GetMediaFormat(track->GetSelectedIndex(), mediaFormat));
        // A picture track holds picture formats only.
        const auto& image_format = static_cast<const QTImageFormat&>(*mediaFormat);
        *maxBufferSize = OutputFrameSize(image_format, width, height);
        return NCF_OK;
    });
}

}  // namespace NMA::Impl
