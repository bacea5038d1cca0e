// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// Questions about single samples: each goes on to the sample table of its
// track, whose answer is handed back as it is.

#include "source/clips/QuickTimeClip.h"
#include "source/plugin/ResultChecks.h"

NCFRESULT QuickTimeClip::GetSampleTable(ncfUInt32 qtTrack, IQTSampleTable** sampleTable) {
    NCF_FUNCTION("QuickTimeClip::GetSampleTable");
    CHK_INARG(sampleTable);
    *sampleTable = nullptr;
    const auto it = tracks_.find(qtTrack);
    if (it == tracks_.end()) {
        return NCF_E_NOTFOUND;
    }
    NCF_RETURN(it->second.info_.inArg()->GetSampleTable(sampleTable));
    return NCF_OK;
}

NCFRESULT QuickTimeClip::GetNumSamples(ncfUInt32 qtTrack, ncfUInt64* numSamples) {
    NCF_FUNCTION("QuickTimeClip::GetNumSamples");
    CHK_PTR(numSamples);
    NCFSmartPtr<IQTSampleTable> sampleTable;
    NCF_RETURN(GetSampleTable(qtTrack, sampleTable.outArg()));
    return sampleTable->GetNumSamples(numSamples);
}

NCFRESULT QuickTimeClip::GetDataOffset(ncfUInt32 qtTrack, ncfUInt64 sampleNum,
                                       ncfUInt64* samplePosition) {
    NCF_FUNCTION("QuickTimeClip::GetDataOffset");
    CHK_PTR(samplePosition);
    NCFSmartPtr<IQTSampleTable> sampleTable;
    NCF_RETURN(GetSampleTable(qtTrack, sampleTable.outArg()));
    return sampleTable->GetDataOffset(sampleNum, samplePosition);
}

NCFRESULT QuickTimeClip::GetSampleFlags(ncfUInt32 qtTrack, ncfUInt64 sampleNum, ncfUInt32* flags) {
    NCF_FUNCTION("QuickTimeClip::GetSampleFlags");
    CHK_PTR(flags);
    NCFSmartPtr<IQTSampleTable> sampleTable;
    NCF_RETURN(GetSampleTable(qtTrack, sampleTable.outArg()));
    return sampleTable->GetSampleFlags(sampleNum, flags);
}

NCFRESULT QuickTimeClip::GetNextDiscontiguousDataAttributeChange(ncfUInt32 qtTrack,
                                                                 ncfUInt64 sampleNum,
                                                                 ncfUInt64* lastSample) {
    NCF_FUNCTION("QuickTimeClip::GetNextDiscontiguousDataAttributeChange");
    CHK_PTR(lastSample);
    NCFSmartPtr<IQTSampleTable> sampleTable;
    NCF_RETURN(GetSampleTable(qtTrack, sampleTable.outArg()));
    return sampleTable->GetNextDiscontiguousDataAttributeChange(sampleNum, lastSample);
}

NCFRESULT QuickTimeClip::GetDataSizePerSample(ncfUInt32 qtTrack, ncfUInt64 sampleNum,
                                              ncfUInt32* dataSizeInBytes) {
    NCF_FUNCTION("QuickTimeClip::GetDataSizePerSample");
    CHK_PTR(dataSizeInBytes);
    NCFSmartPtr<IQTSampleTable> sampleTable;
    NCF_RETURN(GetSampleTable(qtTrack, sampleTable.outArg()));
    return sampleTable->GetDataSizePerSample(sampleNum, dataSizeInBytes);
}

NCFRESULT QuickTimeClip::GetDisplayOffset(ncfUInt32 qtTrack, ncfUInt64 sampleNum,
                                          ncfSInt64* outOffset) {
    NCF_FUNCTION("QuickTimeClip::GetDisplayOffset");
    CHK_PTR(outOffset);
    NCFSmartPtr<IQTSampleTable> sampleTable;
    NCF_RETURN(GetSampleTable(qtTrack, sampleTable.outArg()));
    return sampleTable->GetDisplayOffset(sampleNum, outOffset);
}

NCFRESULT QuickTimeClip::GetDecodeDuration(ncfUInt32 qtTrack, ncfUInt64 sampleNum,
                                           ncfSInt64* decodeDuration) {
    NCF_FUNCTION("QuickTimeClip::GetDecodeDuration");
    CHK_PTR(decodeDuration);
    NCFSmartPtr<IQTSampleTable> sampleTable;
    NCF_RETURN(GetSampleTable(qtTrack, sampleTable.outArg()));
    return sampleTable->GetDecodeDuration(sampleNum, decodeDuration);
}

NCFRESULT QuickTimeClip::GetMaxDataSizeInBytes(ncfUInt32 qtTrack, ncfUInt32* maxDataSize) {
    NCF_FUNCTION("QuickTimeClip::GetMaxDataSizeInBytes");
    CHK_PTR(maxDataSize);
    NCFSmartPtr<IQTSampleTable> sampleTable;
    NCF_RETURN(GetSampleTable(qtTrack, sampleTable.outArg()));
    return sampleTable->GetMaxDataSizeInBytes(maxDataSize);
}

NCFRESULT QuickTimeClip::GetHasOutOfOrderFrameDependencies(ncfUInt32 qtTrack, ncfBool* outOfOrder) {
    NCF_FUNCTION("QuickTimeClip::GetHasOutOfOrderFrameDependencies");
    CHK_PTR(outOfOrder);
    NCFSmartPtr<IQTSampleTable> sampleTable;
    NCF_RETURN(GetSampleTable(qtTrack, sampleTable.outArg()));
    return sampleTable->GetHasOutOfOrderFrameDependencies(outOfOrder);
}

NCFRESULT QuickTimeClip::DisplayTimeToFrameNum(ncfUInt32 qtTrack, ncfUInt64 displayTime,
                                               ncfUInt64* sampleNum) {
    NCF_FUNCTION("QuickTimeClip::DisplayTimeToFrameNum");
    CHK_PTR(sampleNum);
    NCFSmartPtr<IQTSampleTable> sampleTable;
    NCF_RETURN(GetSampleTable(qtTrack, sampleTable.outArg()));
    return sampleTable->DisplayTimeToFrameNum(displayTime, sampleNum);
}
