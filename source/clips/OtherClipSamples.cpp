// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// Questions about single samples: each goes on to the wrapper's sample table.
// An output is written only with an answer.

#include "source/clips/OtherClip.h"
#include "source/plugin/ResultChecks.h"

NCFRESULT OtherClip::GetNumSamples(ncfUInt32 qtTrack, ncfUInt64* numSamples) {
    NCF_FUNCTION("OtherClip::GetNumSamples");
    CHK_INARG(numSamples);
    CHK_PTR(sampleTable_);
    NCF_RETURN(sampleTable_->GetNumSamples(qtTrack, numSamples));
    return NCF_OK;
}

NCFRESULT OtherClip::GetDataOffset(ncfUInt32 qtTrack, ncfUInt64 sampleNum,
                                   ncfUInt64* samplePosition) {
    NCF_FUNCTION("OtherClip::GetDataOffset");
    CHK_INARG(samplePosition);
    CHK_PTR(sampleTable_);
    NCF_RETURN(sampleTable_->GetDataOffset(qtTrack, sampleNum, samplePosition));
    return NCF_OK;
}

NCFRESULT OtherClip::GetSampleFlags(ncfUInt32 qtTrack, ncfUInt64 sampleNum, ncfUInt32* flags) {
    NCF_FUNCTION("OtherClip::GetSampleFlags");
    CHK_INARG(flags);
    CHK_PTR(sampleTable_);
    QTWrapper::QTWSamplePropertyFlags_t properties{};
    NCF_RETURN_TEXT(
        "sampleTable_->GetSampleFlags(qtTrack, sampleNum, "
        "(QTWrapper::QTWSamplePropertyFlags_t*)flags)",
        sampleTable_->GetSampleFlags(qtTrack, sampleNum, &properties));
    *flags = properties;
    return NCF_OK;
}

NCFRESULT OtherClip::GetNextDiscontiguousDataAttributeChange(ncfUInt32 qtTrack, ncfUInt64 sampleNum,
                                                             ncfUInt64* lastSample) {
    NCF_FUNCTION("OtherClip::GetNextDiscontiguousDataAttributeChange");
    CHK_INARG(lastSample);
    CHK_PTR(sampleTable_);
    NCF_RETURN(
        sampleTable_->GetNextDiscontiguousDataAttributeChange(qtTrack, sampleNum, lastSample));
    return NCF_OK;
}

NCFRESULT OtherClip::GetDataSizePerSample(ncfUInt32 qtTrack, ncfUInt64 sampleNum,
                                          ncfUInt32* dataSizeInBytes) {
    NCF_FUNCTION("OtherClip::GetDataSizePerSample");
    CHK_INARG(dataSizeInBytes);
    CHK_PTR(sampleTable_);
    NCF_RETURN(sampleTable_->GetDataSizePerSample(qtTrack, sampleNum, dataSizeInBytes));
    return NCF_OK;
}

NCFRESULT OtherClip::GetDisplayOffset(ncfUInt32 qtTrack, ncfUInt64 sampleNum,
                                      ncfSInt64* outOffset) {
    NCF_FUNCTION("OtherClip::GetDisplayOffset");
    CHK_INARG(outOffset);
    CHK_PTR(sampleTable_);
    NCF_RETURN(sampleTable_->GetDisplayOffset(qtTrack, sampleNum, outOffset));
    return NCF_OK;
}

NCFRESULT OtherClip::GetDecodeDuration(ncfUInt32 qtTrack, ncfUInt64 sampleNum,
                                       ncfSInt64* decodeDuration) {
    NCF_FUNCTION("OtherClip::GetDecodeDuration");
    CHK_INARG(decodeDuration);
    CHK_PTR(sampleTable_);
    NCF_RETURN(sampleTable_->GetDecodeDuration(qtTrack, sampleNum, decodeDuration));
    return NCF_OK;
}

NCFRESULT OtherClip::GetMaxDataSizeInBytes(ncfUInt32 qtTrack, ncfUInt32* maxDataSize) {
    NCF_FUNCTION("OtherClip::GetMaxDataSizeInBytes");
    CHK_INARG(maxDataSize);
    CHK_PTR(sampleTable_);
    *maxDataSize = sampleTable_->GetMaxDataSize(qtTrack);
    return NCF_OK;
}

NCFRESULT OtherClip::GetHasOutOfOrderFrameDependencies(ncfUInt32 qtTrack, ncfBool* outOfOrder) {
    NCF_FUNCTION("OtherClip::GetHasOutOfOrderFrameDependencies");
    CHK_INARG(outOfOrder);
    CHK_PTR(sampleTable_);
    *outOfOrder = sampleTable_->HasOutOfOrderFrameDependencies(qtTrack);
    return NCF_OK;
}
