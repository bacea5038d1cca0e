// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// The working format of a sound track.

#include "source/essence/ProviderLock.h"
#include "source/essence/QuickTimeSampleMapping.h"
#include "source/plugin/PluginLogSink.h"
#include "source/plugin/ResultChecks.h"
#include "source/plugin/ResultOf.h"

namespace NMA::Impl {

NCFRESULT QuickTimeSampleMapping::GetNumberOfAudioFormats(ncfUInt32 trackNMA,
                                                          ncfUInt32* numFormats) {
    NCF_FUNCTION("NMA::Impl::QuickTimeSampleMapping::GetNumberOfAudioFormats");
    return ResultOf([&]() -> NCFRESULT {
        CHK_INARG(numFormats);
        std::tr1::shared_ptr<MediaTrack> track;
        NCF_RETURN(GetMediaTrack(trackNMA, track));
        if (!IsAudioTrack(*track)) {
            return NCF_E_INVALIDARG;
        }
        const ProviderLock lock(providerLock_);
        *numFormats = static_cast<ncfUInt32>(track->GetFormats().size());
        return NCF_OK;
    });
}

NCFRESULT QuickTimeSampleMapping::GetAudioFormat(ncfUInt32 trackNMA, ncfUInt32 formatIndex,
                                                 ncfUInt32* sampleFormat, ncfUInt16* bytesPerSample,
                                                 ncfUInt16* bitsPerSample) {
    NCF_FUNCTION("NMA::Impl::QuickTimeSampleMapping::GetAudioFormat");
    return ResultOf([&]() -> NCFRESULT {
        CHK_INARG(sampleFormat);
        CHK_INARG(bytesPerSample);
        CHK_INARG(bitsPerSample);
        std::tr1::shared_ptr<MediaTrack> track;
        NCF_RETURN(GetMediaTrack(trackNMA, track));
        if (!IsAudioTrack(*track)) {
            return NCF_E_INVALIDARG;
        }
        const ProviderLock lock(providerLock_);
        MediaFormatPtr mediaFormat;
        NCF_RETURN(track->GetMediaFormat(formatIndex, mediaFormat));
        const auto* const audio_format = dynamic_cast<const QTAudioFormat*>(mediaFormat.get());
        CHK_PTR(audio_format);
        *sampleFormat = audio_format->sampleFormat;
        *bytesPerSample = audio_format->bytesPerSample;
        *bitsPerSample = audio_format->bitsPerSample;
        return NCF_OK;
    });
}

// The one reader is told about each track in turn. It says how many channels
// it will deliver, and that number, not the file's, sizes what is delivered.
NCFRESULT QuickTimeSampleMapping::SetWorkingAudioFormat(ncfUInt32 trackNMA, ncfUInt32 formatIndex) {
    NCF_FUNCTION("NMA::Impl::QuickTimeSampleMapping::SetWorkingAudioFormat");
    return ResultOf([&]() -> NCFRESULT {
        CHK_PTR(_audioReaderHolder);
        std::tr1::shared_ptr<MediaTrack> track;
        NCF_RETURN(GetMediaTrack(trackNMA, track));
        if (!IsAudioTrack(*track)) {
            return NCF_E_INVALIDARG;
        }
        const ProviderLock lock(providerLock_);
        track->SetSelectedIndex(formatIndex);
        ncfUInt32 trackQT = 0;
        NCF_RETURN(AAFTrackToQuickTimeTrack(trackNMA, &trackQT));
        MediaFormatPtr mediaFormat;
        NCF_RETURN(track->GetMediaFormat(formatIndex, mediaFormat));
        const auto* const audio_format = dynamic_cast<const QTAudioFormat*>(mediaFormat.get());
        CHK_PTR(audio_format);
        const ncfUInt32 bytesPerSample = audio_format->bytesPerSample;
        NCFSmartPtr<QTWrapper::IQuickTimeWrapper> qtWrapper;
        NCF_RETURN(media_->GetQuickTimeInterface(qtWrapper));
        double sampleRate = 0.0;
        NCF_RETURN_TEXT(
            "qtWrapper->GetAudioInfoForTrack(trackQT, NULL, &sampleRate, NULL, NULL, NULL, NULL, "
            "NULL, NULL, NULL)",
            qtWrapper->GetAudioInfoForTrack(trackQT, nullptr, &sampleRate, nullptr, nullptr,
                                            nullptr, nullptr, nullptr, nullptr, nullptr));
        ncfUInt32 numAudioChannels = 1;
        NCF_RETURN(_audioReaderHolder->SetParams(trackQT, bytesPerSample,
                                                 audio_format->GetSampleFormat() == SF_PCM_INT_LE,
                                                 sampleRate, numAudioChannels));
        AudioTrackMetadata audioInfo;
        NCF_RETURN(media_->GetAudioTrackMetadata(trackQT, &audioInfo));
        if (numAudioChannels != audioInfo.channelsPerFrame) {
            slog::Warning(ncfFunction)
                << "numAudioChannels(" << numAudioChannels << ") != audioInfo.channelsPerFrame("
                << audioInfo.channelsPerFrame << ")";
        }
        auto* const audio_track = dynamic_cast<AudioMediaTrack*>(track.get());
        CHK_PTR(audio_track);
        NCF_RETURN(audio_track->SetNumberAudioChannels(numAudioChannels));
        return NCF_OK;
    });
}

}  // namespace NMA::Impl
