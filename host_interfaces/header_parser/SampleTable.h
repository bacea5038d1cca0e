// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/framework/Unknown.h"

// Properties of a stored sample.
enum QTSampleFlags : ncfUInt32 {
    kQTSampleSync = 1,        // decodes without any other
    kQTSampleDisposable = 2,  // no other needs it
    kQTSampleDependent = 3,   // anything else
};

// The samples of one track in decode order, numbered from 1. A number of 0 or
// above the count gives NCF_E_INVALIDARG and leaves the output untouched.
//
// Implemented by the host's header parser, given out by ITrackInfo; the module asks
// it for each question of a sample mapping, and a host may ask a mapping about
// millions of samples: an answer must not cost a walk from the beginning. One thread
// at a time. Positions are in bytes of the file.
struct IQTSampleTable : INCFUnknown {
    // 3. ISO/IEC 14496-12, 8.7.3 (stsz, stz2).
    virtual NCFRESULT GetNumSamples(ncfUInt64* numSamples) = 0;
    // 4. Place of the sample's first byte.
    virtual NCFRESULT GetDataOffset(ncfUInt64 sample, ncfUInt64* position) = 0;
    // 5. One of QTSampleFlags; stss and sdtp, 8.6.2 and 8.6.4.
    virtual NCFRESULT GetSampleFlags(ncfUInt64 sample, ncfUInt32* flags) = 0;
    // 6. The first sample behind `sample` whose bytes do not follow the one
    // before it, or that has another description; count + 1 at the end.
    virtual NCFRESULT GetNextDiscontiguousDataAttributeChange(ncfUInt64 sample,
                                                              ncfUInt64* next) = 0;
    // 7. Bytes of one sample.
    virtual NCFRESULT GetDataSizePerSample(ncfUInt64 sample, ncfUInt32* bytes) = 0;
    // 8. Presentation minus decode time in media time units, shifted so that
    // the first presented picture has the decode time of the first sample
    // (ctts, 8.6.1.3).
    virtual NCFRESULT GetDisplayOffset(ncfUInt64 sample, ncfSInt64* offset) = 0;
    // 9. Decode duration in media time units (stts, 8.6.1.2).
    virtual NCFRESULT GetDecodeDuration(ncfUInt64 sample, ncfSInt64* duration) = 0;
    // 10. Bytes of the largest sample, 0 without samples.
    virtual NCFRESULT GetMaxDataSizeInBytes(ncfUInt32* bytes) = 0;
    // 11. Non-zero when any shifted display offset is not 0.
    virtual NCFRESULT GetHasOutOfOrderFrameDependencies(ncfBool* outOfOrder) = 0;
    // 12. Place and size in bytes of chunk number (count / 2), from zero.
    // NMA_E_NODATA without chunks. It stands for the track in the content hash.
    virtual NCFRESULT GetChunkFromTheMiddle(ncfUInt64* position, ncfUInt64* size) = 0;
    // 13. The number of the sample shown at a display time in media time units.
    virtual NCFRESULT DisplayTimeToFrameNum(ncfUInt64 displayTime, ncfUInt64* sample) = 0;

protected:
    ~IQTSampleTable() = default;
};

inline constexpr GUID IID_IQTSampleTable = ncfGuid("9D3C1A52-70B4-4C0E-8B8F-27F6C2D1E901");
constexpr const GUID& ncfIdOf(const IQTSampleTable*) {
    return IID_IQTSampleTable;
}
