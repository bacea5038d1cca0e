// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/clips/SampleProviderRule.h"

#include <sstream>

#include "source/clips/ClipRecords.h"
#include "source/descriptor_data/QuickTimeToAAFInfoRetriever.h"
#include "source/plugin/FourCharText.h"
#include "source/plugin/PluginLogSink.h"
#include "source/plugin/ResultChecks.h"

namespace {

// Answers of the rule. They are result codes: failures are negative.
constexpr NCFRESULT kNative = 1;
constexpr NCFRESULT kSampleProvider = 0;

}  // namespace

void SampleProviderRule::TellReason(const char* function, const char* reason,
                                    const char* consoleLine) const {
    slog::Progress(function) << reason;
    console_->Write(2, "%s", consoleLine);
}

NCFRESULT SampleProviderRule::CommonSampleProviderCheck(NCFRESULT selfContained) const {
    NCF_FUNCTION("BaseClip::CommonSampleProviderCheck");
    if (selfContained != 0) {
        return kNative;
    }
    TellReason(ncfFunction, "The movie is not self contained.");
    return kSampleProvider;
}

NCFRESULT SampleProviderRule::IsLPCMAudioByFormatID(ncfUInt32 formatID) const {
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

NCFRESULT SampleProviderRule::IsSupportedBitPerChannel(ncfUInt32 bits) const {
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

NCFRESULT SampleProviderRule::IsInDataFiles(const DescribedPicture& picture,
                                            AAFInfo* aafInfo) const {
    QuickTimeToAAFInfoRetriever* const retriever = QuickTimeToAAFInfoRetriever::GetInstance();
    ncfUInt32 vcid = 0;
    return retriever && retriever->GetInfoFromImageDescription(&picture, aafInfo, &vcid) == NCF_OK
               ? kNative
               : kSampleProvider;
}
