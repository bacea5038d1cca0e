// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// From a request of the host to a filled buffer: one picture, or sound.

#include <cstring>

#include "source/essence/PixelLevels.h"
#include "source/essence/ProviderLock.h"
#include "source/essence/QuickTimeSampleMapping.h"
#include "source/plugin/ResultChecks.h"
#include "source/plugin/ResultOf.h"

namespace NMA::Impl {
namespace {

// What the host gets for a picture that may not be read. It is no failure by
// its sign, though the buffer stays incomplete.
constexpr NCFRESULT kPictureAccessDenied = 0x0AEA0066;

constexpr ncfUInt32 kAll = 0xFFFFFFFFu;

}  // namespace

// The lock is held through decoding and conversion, so that the pixel format
// told to the reader still holds when it reads.
NCFRESULT QuickTimeSampleMapping::ProvideSampleRange(INCFAVBuffer* pAVBuffer, ncfUInt32) {
    NCF_FUNCTION("NMA::Impl::QuickTimeSampleMapping::ProvideSampleRange");
    return ResultOf([&]() -> NCFRESULT {
        CHK_INARG(pAVBuffer);
        const ProviderLock lock(providerLock_);
        ncfUInt32 trackNMA = 0;
        ncfUInt64 sample = 0;
        ncfUInt64 numSamples = 0;
        NCF_RETURN(pAVBuffer->GetSampleRange(&trackNMA, &sample, &numSamples));
        NCFSmartPtr<INCFBuffer> pBuffer;
        NCF_RETURN_TEXT("pAVBuffer->GetBuffer(&pBuffer)", pAVBuffer->GetBuffer(pBuffer.outArg()));
        std::tr1::shared_ptr<MediaTrack> track;
        NCF_RETURN(GetMediaTrack(trackNMA, track));
        if (IsPictureTrack(*track)) {
            return ProvidePicture(*track, sample, numSamples, pBuffer);
        }
        return ProvideSound(trackNMA, *track, sample, numSamples, pBuffer);
    });
}

// --- pictures ------------------------------------------------------------------------

NCFRESULT QuickTimeSampleMapping::ProvidePicture(MediaTrack& pictureTrack, ncfUInt64 sample,
                                                 ncfUInt64 numSamples,
                                                 const NCFSmartPtr<INCFBuffer>& pBuffer) {
    NCF_FUNCTION("NMA::Impl::QuickTimeSampleMapping::ProvideSampleRange");
    if (!_videoReaderHolder) {
        return NMA_E_NOTINITIALIZED;
    }
    NCFASSERT(1 == numSamples);
    // A movie of one frame gives it at every place.
    ncfBool isOneFrame = 0;
    NCF_RETURN(media_->HasOneFrame(&isOneFrame));
    if (isOneFrame) {
        sample = 0;
    }
    ncfUInt32 width = 0;
    ncfUInt32 height = 0;
    NCF_RETURN(media_->GetEncodedWidthAndHeight(&width, &height));
    MediaTrack* const track = &pictureTrack;
    MediaFormatPtr mediaFormat;
    NCF_RETURN(track->GetMediaFormat(track->GetSelectedIndex(), mediaFormat));
    const auto* const video_format = dynamic_cast<const QTImageFormat*>(mediaFormat.get());
    CHK_PTR(video_format);
    // Picture and alpha track share the reader and may differ in this.
    (void)_videoReaderHolder->SetOutputPixelFormat(video_format->qt_params.fourCC, 0, 0);
    const ncfUInt32 nQuickTimeBufSize = _videoReaderHolder->GetFrameBufferSize(kAll, sample, 0);
    NCFASSERT(nQuickTimeBufSize);
    const ncfUInt32 nOutputBufSize = OutputFrameSize(*video_format, width, height);
    NCF_RETURN(pBuffer->Allocate(nOutputBufSize, 1));
    void* start = nullptr;
    NCF_RETURN_TEXT("pBuffer->GetBufferPointer((void**)&pOutputBuffer)",
                    pBuffer->GetBufferPointer(&start));
    auto* const pOutputBuffer = static_cast<ncfUInt8*>(start);
    if (nOutputBufSize != 0) {
        CHK_PTR(pOutputBuffer);
    }
    if (const NCFRESULT rc = ReadPicture(*video_format, sample, width, height, nQuickTimeBufSize,
                                         pOutputBuffer, nOutputBufSize);
        rc != NCF_OK) {
        return rc;
    }
    // A format that isn't defined had no levels: the buffer holds what was read.
    const ncfUInt32 pixelFormat = video_format->pixelFormat;
    const ncfUInt32 componentType = video_format->componentFormat;
    NCFASSERT(PF_UNDEFINED != pixelFormat);
    NCFASSERT(CT_UNDEFINED != componentType);
    NCF_RETURN(pBuffer->SetComplete(kNCFBuffer_Complete, nOutputBufSize, NCF_OK));
    return NCF_OK;
}

// Straight into the host's memory where nothing is to convert. A reader whose
// frame is larger than the host's buffer must not write past its end: it gets a
// block aside, and what fits is copied. The block starts as zeros each time, so
// that what a reader left out is nothing, and not what the memory held before.
NCFRESULT QuickTimeSampleMapping::ReadPicture(const QTImageFormat& format, ncfUInt64 sample,
                                              ncfUInt32 width, ncfUInt32 height,
                                              ncfUInt32 nQuickTimeBufSize, ncfUInt8* pOutputBuffer,
                                              ncfUInt32 nOutputBufSize) {
    const PixelConversion convert = format.qt_params.convert;
    const bool readsAside = convert || nQuickTimeBufSize > nOutputBufSize;
    if (readsAside) {
        scratch_.assign(nQuickTimeBufSize, 0);
    }
    NCFRESULT rc = _videoReaderHolder->ReadFrame(
        sample, readsAside ? scratch_.data() : pOutputBuffer, 0, 0, 0);
    if (rc != NCF_OK) {
        if (rc == NCF_E_ACCESSDENIED) {
            rc = kPictureAccessDenied;
        }
        _pConsole->Write(1, "QuickTime failed to get video sample with number: %ld !\n",
                         static_cast<long>(static_cast<ncfSInt32>(static_cast<ncfUInt32>(sample))));
        return rc;
    }
    LevelPass levels(format.pixelFormat, format.componentFormat, pOutputBuffer, nOutputBufSize,
                     levelRemap_);
    if (convert) {
        convert(scratch_.data(), pOutputBuffer, nQuickTimeBufSize, nOutputBufSize, width, height,
                levels);
    } else if (readsAside && nOutputBufSize != 0) {
        std::memcpy(pOutputBuffer, scratch_.data(), nOutputBufSize);
    }
    levels.Finish();
    return NCF_OK;
}

// --- sound -----------------------------------------------------------------------------

// Sound that can't be read is silence, and no failure: a player goes on. The
// whole size counts as valid whatever the reader did.
NCFRESULT QuickTimeSampleMapping::ProvideSound(ncfUInt32 trackNMA, MediaTrack& soundTrack,
                                               ncfUInt64 sample, ncfUInt64 numSamples,
                                               const NCFSmartPtr<INCFBuffer>& pBuffer) {
    NCF_FUNCTION("NMA::Impl::QuickTimeSampleMapping::ProvideSampleRange");
    if (!_audioReaderHolder) {
        return NMA_E_NOTINITIALIZED;
    }
    MediaTrack* const track = &soundTrack;
    MediaFormatPtr mediaFormat;
    NCF_RETURN(track->GetMediaFormat(track->GetSelectedIndex(), mediaFormat));
    const auto* const audio_format = dynamic_cast<const QTAudioFormat*>(mediaFormat.get());
    CHK_PTR(audio_format);
    const ncfUInt64 bytesPerSample = audio_format->bytesPerSample;
    NCFASSERT(bytesPerSample);
    const auto* const audio_track = dynamic_cast<const AudioMediaTrack*>(track);
    CHK_PTR(audio_track);
    const ncfUInt64 numAudioChannels = audio_track->GetNumberAudioChannels();
    const ncfUInt64 memNeeded = numSamples * numAudioChannels * bytesPerSample;
    NCFASSERT(memNeeded);
    const ncfUInt64 memToAlloc = memNeeded;
    NCF_RETURN(pBuffer->Allocate(memToAlloc, 1));
    void* pWorkingBuffer = nullptr;
    NCF_RETURN_TEXT("pBuffer->GetBufferPointer((void**)&pWorkingBuffer)",
                    pBuffer->GetBufferPointer(&pWorkingBuffer));
    CHK_PTR(pWorkingBuffer);
    ncfUInt32 trackQT = 0;
    NCF_RETURN(AAFTrackToQuickTimeTrack(trackNMA, &trackQT));
    ncfUInt64 count = numSamples;
    const NCFRESULT rc = _audioReaderHolder->ReadSamples(trackQT, sample, &count, pWorkingBuffer,
                                                         memNeeded, false, false);
    if (rc != NCF_OK) {
        _pConsole->Write(1,
                         "QuickTime failed to extract audio, filling the buffers with silence!\n");
        std::memset(pWorkingBuffer, 0, memNeeded);
    }
    NCF_RETURN(pBuffer->SetComplete( kNCFBuffer_Complete,
                                    numSamples * numAudioChannels * bytesPerSample, NCF_OK));
    return NCF_OK;
}

}  // namespace NMA::Impl
