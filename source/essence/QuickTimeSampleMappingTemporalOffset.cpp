// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// How far, in samples and in decode order, lies the sample that is displayed
// at the place of another.

#include <limits>

#include "source/essence/QuickTimeSampleMapping.h"
#include "source/plugin/ResultChecks.h"
#include "source/plugin/ResultOf.h"

namespace NMA::Impl {
namespace {

// Differences are taken without a sign, so that no pair of values overflows.
ncfSInt64 Difference(ncfSInt64 left, ncfSInt64 right) {
    return static_cast<ncfSInt64>(static_cast<ncfUInt64>(left) - static_cast<ncfUInt64>(right));
}
ncfSInt64 Sum(ncfSInt64 left, ncfSInt64 right) {
    return static_cast<ncfSInt64>(static_cast<ncfUInt64>(left) + static_cast<ncfUInt64>(right));
}

ncfSInt64 Low32(ncfSInt64 value) {
    return static_cast<ncfSInt32>(static_cast<ncfUInt32>(static_cast<ncfUInt64>(value)));
}

}  // namespace

NCFRESULT QuickTimeSampleMapping::GetSampleTemporalOffset(ncfUInt32 trackNMA, ncfUInt64 sample,
                                                          ncfSInt64* offsetInSamples) {
    NCF_FUNCTION("NMA::Impl::QuickTimeSampleMapping::GetSampleTemporalOffset");
    return ResultOf([&]() -> NCFRESULT {
        CHK_INARG(offsetInSamples);
        ncfUInt32 trackQT = 0;
        NCF_RETURN(AAFTrackToQuickTimeTrack(trackNMA, &trackQT));
        ncfUInt64 numSamples = 0;
        NCF_RETURN(media_->GetNumSamples(trackQT, &numSamples));
        ncfSInt64 decodeDuration = 0;
        NCF_RETURN(media_->GetDecodeDuration(trackQT, sample+1, &decodeDuration));
        ncfSInt64 qtOffset = 0;
        NCF_RETURN(media_->GetDisplayOffset(trackQT, sample+1, &qtOffset));
        if (decodeDuration < 0) {
            return NCF_E_FAIL;
        }
        // A tenth of a sample either way counts as in its place: the answer for
        // every sample of material that is not reordered.
        const ncfSInt64 tolerance = decodeDuration / 10;
        if (-Low32(tolerance) <= Low32(qtOffset) && Low32(qtOffset) <= Low32(tolerance)) {
            *offsetInSamples = 0;
            return NCF_OK;
        }
        // Outward from the sample, at each distance forward first. The bound of
        // the way back stops at sample zero only: past it the index wraps, and
        // the clip's refusal of that index ends the search.
        bool forwardDone = false;
        bool backwardDone = false;
        for (ncfSInt32 curPos = 1; !forwardDone || !backwardDone; ++curPos) {
            const auto distance = static_cast<ncfUInt64>(curPos);
            if (sample + distance + 1 <= numSamples) {
                qtOffset = 0;
                NCF_RETURN_TEXT(
                    "media_->GetDisplayOffset(trackQT, sample + 1 + curPos, &qtOffset)",
                    media_->GetDisplayOffset(trackQT, sample + 1 + distance, &qtOffset));
                if (decodeDuration == 0) {
                    return NCF_E_FAIL;
                }
                if (curPos == Difference(tolerance, qtOffset) / decodeDuration) {
                    *offsetInSamples = curPos;
                    return NCF_OK;
                }
            } else {
                forwardDone = true;
            }
            if (sample + 1 - distance >= 1) {
                qtOffset = 0;
                NCF_RETURN_TEXT(
                    "media_->GetDisplayOffset(trackQT, sample + 1 - curPos, &qtOffset)",
                    media_->GetDisplayOffset(trackQT, sample + 1 - distance, &qtOffset));
                if (decodeDuration == 0) {
                    return NCF_E_FAIL;
                }
                if (curPos == Sum(qtOffset, tolerance) / decodeDuration) {
                    *offsetInSamples = -static_cast<ncfSInt64>(curPos);
                    return NCF_OK;
                }
            } else {
                backwardDone = true;
            }
            if (curPos == std::numeric_limits<ncfSInt32>::max()) {
                break;
            }
        }
        return NCF_E_FAIL;
    });
}

}  // namespace NMA::Impl
