// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/framework/Unknown.h"

namespace QTWrapper {

// Properties of a stored sample: 1 sync, 2 no other needs it, 3 otherwise.
enum QTWSamplePropertyFlags_t : ncfUInt32 {
    kQTWSampleSync = 1,
    kQTWSampleDisposable = 2,
    kQTWSampleDependent = 3,
};

// Samples of every track of an open movie, in decode order, numbered from 1:
// the whole media, edit list or not. A sample of 0 or above the count gives
// NCF_E_INVALIDARG, an unknown track NCF_E_NOTFOUND; the output stays as it is.
// Times are in media time units of the track, positions in bytes of the file.
//
// Implemented by the host, given out by IQuickTimeWrapper; the module takes it when
// it loads a clip that the header parser refuses, and asks it for each question of a
// sample mapping. One thread at a time.
struct IQTWSampleTable : INCFUnknown {
    virtual NCFRESULT GetNumSamples(ncfUInt32 track, ncfUInt64* n) = 0;  // 3
    // 4. Place of the sample's first byte.
    virtual NCFRESULT GetDataOffset(ncfUInt32 track, ncfUInt64 sample, ncfUInt64* position) = 0;
    virtual NCFRESULT GetSampleFlags(ncfUInt32 track, ncfUInt64 sample,
                                     QTWSamplePropertyFlags_t* flags) = 0;  // 5
    // 6. First sample whose bytes do not follow the one before; count + 1 at
    // the end.
    virtual NCFRESULT GetNextDiscontiguousDataAttributeChange(ncfUInt32 track, ncfUInt64 sample,
                                                              ncfUInt64* next) = 0;
    virtual NCFRESULT GetDataSizePerSample(ncfUInt32 track, ncfUInt64 sample,
                                           ncfUInt32* bytes) = 0;  // 7
    // 8. Presentation minus decode time, shifted so that the first presented picture
    // has 0.
    virtual NCFRESULT GetDisplayOffset(ncfUInt32 track, ncfUInt64 sample, ncfSInt64* offset) = 0;
    virtual NCFRESULT GetDecodeDuration(ncfUInt32 track, ncfUInt64 sample,
                                        ncfSInt64* duration) = 0;  // 9
    // 10. Bytes of the largest sample; 0 without samples or track.
    virtual ncfUInt32 GetMaxDataSize(ncfUInt32 track) = 0;
    // 11. Not 0 when any display offset is not 0.
    virtual ncfBool HasOutOfOrderFrameDependencies(ncfUInt32 track) = 0;

protected:
    ~IQTWSampleTable() = default;
};

inline constexpr GUID IID_IQTWSampleTable = ncfGuid("7C1E94A6-0B5D-4E2F-93D8-1A6F0C7B5E08");
constexpr const GUID& ncfIdOf(const IQTWSampleTable*) {
    return IID_IQTWSampleTable;
}

}  // namespace QTWrapper
