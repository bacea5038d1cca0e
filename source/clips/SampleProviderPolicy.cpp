// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// The rule that decides, for the picture and for each sound track, whether the
// host may read the essence from the file by itself. The steps and free
// functions stand here; the order of the steps belongs to each kind of clip.

#include "source/clips/SampleProviderPolicy.h"

#include <sstream>

#include "source/clips/ClipPicture.h"
#include "source/descriptor_data/QuickTimeToAAFInfoRetriever.h"
#include "source/plugin/FourCharText.h"
#include "source/plugin/PluginLogSink.h"
#include "source/plugin/ResultChecks.h"

namespace {

// Answers of the rule. They are result codes: failures are negative.
constexpr NCFRESULT kNative = 1;
constexpr NCFRESULT kSampleProvider = 0;

}  // namespace

void BaseClip::TellReason(const char* function, const char* reason) {
    TellReason(function, reason, reason);
}

void BaseClip::TellReason(const char* function, const char* reason, const char* consoleLine) {
    slog::Progress(function) << reason;
    console_->Write(2, "%s", consoleLine);
}

NCFRESULT BaseClip::CommonSampleProviderCheck() {
    NCF_FUNCTION("BaseClip::CommonSampleProviderCheck");
    if (IsSelfContained() != 0) {
        return kNative;
    }
    TellReason(ncfFunction, "The movie is not self contained.");
    return kSampleProvider;
}

NCFRESULT BaseClip::IsLPCMAudioByFormatID(ncfUInt32 formatID) {
    NCF_FUNCTION("BaseClip::IsLPCMAudioByFormatID");
    if (formatID == kFormatLPCM) {
        return kNative;
    }
    std::ostringstream reason;
    reason << "The FOURCC audio code of " << FourCharText(formatID)
           << " is not natively supported.";
    TellReason(ncfFunction, reason.str().c_str());
    return kSampleProvider;
}

NCFRESULT BaseClip::IsSupportedBitPerChannel(ncfUInt32 bits) {
    NCF_FUNCTION("BaseClip::IsSupportedBitPerChannel");
    if (bits == 16 || bits == 24) {
        return kNative;
    }
    std::ostringstream reason;
    reason << "An audio bit rate of " << bits
           << " was found but only bit rates of 16 and 24 are natively supported.";
    TellReason(ncfFunction, reason.str().c_str());
    return kSampleProvider;
}

NCFRESULT BaseClip::IsPictureInDataFiles(AAFInfo* aafInfo) {
    QuickTimeToAAFInfoRetriever* const retriever = QuickTimeToAAFInfoRetriever::GetInstance();
    const ClipPicture picture(*this);
    ncfUInt32 vcid = 0;
    return retriever && retriever->GetInfoFromImageDescription(&picture, aafInfo, &vcid) == NCF_OK
               ? kNative
               : kSampleProvider;
}

NCFRESULT BaseClip::IsAudioSampleProviderMedia(ncfUInt32 qtTrack, ncfUInt64*) {
    NCF_FUNCTION("BaseClip::IsAudioSampleProviderMedia");
    if (CommonSampleProviderCheck() == kSampleProvider) {
        return kSampleProvider;
    }
    ncfBool isLPCM = 0;
    NCF_RETURN(IsAudioLPCM(qtTrack, &isLPCM));
    if (!isLPCM) {
        return kSampleProvider;
    }
    AudioTrackMetadata audioInfo;
    NCF_RETURN(GetAudioTrackMetadata(qtTrack, &audioInfo));
    return IsSupportedBitPerChannel(audioInfo.bitsPerChannel);
}

NCFRESULT MovieRequiresSampleProviderForVideo(NCFSmartPtr<INCFConsole> console,
                                              std::tr1::shared_ptr<BaseClip> media,
                                              AAFInfo* aafInfo) {
    NCF_FUNCTION("MovieRequiresSampleProviderForVideo");
    CHK_INARG(console);
    CHK_INARG(media.get());
    const NCFRESULT answer = media->IsVideoSampleProviderMedia(aafInfo);
    if (answer == kSampleProvider) {
        console->Write(2, "Forcing sample provider mode for video.\n");
        slog::Progress(ncfFunction) << "Forcing sample provider mode for video!";
    }
    return answer;
}

NCFRESULT MovieRequiresSampleProviderForAudio(NCFSmartPtr<INCFConsole> console,
                                              std::tr1::shared_ptr<BaseClip> media,
                                              ncfUInt32 qtTrack, ncfUInt64* numAudioSamples) {
    NCF_FUNCTION("MovieRequiresSampleProviderForAudio");
    CHK_PTR(media.get());
    const NCFRESULT answer = media->IsAudioSampleProviderMedia(qtTrack, numAudioSamples);
    if (answer == kSampleProvider) {
        console->Write(2, "Forcing sample provider mode for audio track %lld.\n",
                       static_cast<long long>(qtTrack));
        slog::Progress(ncfFunction)
            << "Forcing sample provider mode for audio track: " << qtTrack << " is enabled!";
    }
    return answer;
}
