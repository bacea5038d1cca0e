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
    return AskSampleTable("QuickTimeClip::GetNumSamples", qtTrack, numSamples, "numSamples",
                          [&](auto& table) { return table->GetNumSamples(numSamples); });
}

NCFRESULT QuickTimeClip::GetDataOffset(ncfUInt32 qtTrack, ncfUInt64 sampleNum,
                                       ncfUInt64* samplePosition) {
    return AskSampleTable(
        "QuickTimeClip::GetDataOffset", qtTrack, samplePosition, "samplePosition",
        [&](auto& table) { return table->GetDataOffset(sampleNum, samplePosition); });
}

NCFRESULT QuickTimeClip::GetSampleFlags(ncfUInt32 qtTrack, ncfUInt64 sampleNum, ncfUInt32* flags) {
    return AskSampleTable("QuickTimeClip::GetSampleFlags", qtTrack, flags, "flags",
                          [&](auto& table) { return table->GetSampleFlags(sampleNum, flags); });
}

NCFRESULT QuickTimeClip::GetNextDiscontiguousDataAttributeChange(ncfUInt32 qtTrack,
                                                                 ncfUInt64 sampleNum,
                                                                 ncfUInt64* lastSample) {
    return AskSampleTable("QuickTimeClip::GetNextDiscontiguousDataAttributeChange", qtTrack,
                          lastSample, "lastSample", [&](auto& table) {
                              return table->GetNextDiscontiguousDataAttributeChange(sampleNum,
                                                                                    lastSample);
                          });
}

NCFRESULT QuickTimeClip::GetDataSizePerSample(ncfUInt32 qtTrack, ncfUInt64 sampleNum,
                                              ncfUInt32* dataSizeInBytes) {
    return AskSampleTable(
        "QuickTimeClip::GetDataSizePerSample", qtTrack, dataSizeInBytes, "dataSizeInBytes",
        [&](auto& table) { return table->GetDataSizePerSample(sampleNum, dataSizeInBytes); });
}

NCFRESULT QuickTimeClip::GetDisplayOffset(ncfUInt32 qtTrack, ncfUInt64 sampleNum,
                                          ncfSInt64* outOffset) {
    return AskSampleTable(
        "QuickTimeClip::GetDisplayOffset", qtTrack, outOffset, "outOffset",
        [&](auto& table) { return table->GetDisplayOffset(sampleNum, outOffset); });
}

NCFRESULT QuickTimeClip::GetDecodeDuration(ncfUInt32 qtTrack, ncfUInt64 sampleNum,
                                           ncfSInt64* decodeDuration) {
    return AskSampleTable(
        "QuickTimeClip::GetDecodeDuration", qtTrack, decodeDuration, "decodeDuration",
        [&](auto& table) { return table->GetDecodeDuration(sampleNum, decodeDuration); });
}

NCFRESULT QuickTimeClip::GetMaxDataSizeInBytes(ncfUInt32 qtTrack, ncfUInt32* maxDataSize) {
    return AskSampleTable("QuickTimeClip::GetMaxDataSizeInBytes", qtTrack, maxDataSize,
                          "maxDataSize",
                          [&](auto& table) { return table->GetMaxDataSizeInBytes(maxDataSize); });
}

NCFRESULT QuickTimeClip::GetHasOutOfOrderFrameDependencies(ncfUInt32 qtTrack, ncfBool* outOfOrder) {
    return AskSampleTable(
        "QuickTimeClip::GetHasOutOfOrderFrameDependencies", qtTrack, outOfOrder, "outOfOrder",
        [&](auto& table) { return table->GetHasOutOfOrderFrameDependencies(outOfOrder); });
}

NCFRESULT QuickTimeClip::DisplayTimeToFrameNum(ncfUInt32 qtTrack, ncfUInt64 displayTime,
                                               ncfUInt64* sampleNum) {
    return AskSampleTable(
        "QuickTimeClip::DisplayTimeToFrameNum", qtTrack, sampleNum, "sampleNum",
        [&](auto& table) { return table->DisplayTimeToFrameNum(displayTime, sampleNum); });
}
