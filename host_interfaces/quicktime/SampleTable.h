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
// Times are in media time units of the track.
struct IQTWSampleTable : INCFUnknown {
    virtual NCFRESULT GetNumSamples(ncfUInt32 track, ncfUInt64* n) = 0;  // 3
    virtual NCFRESULT GetDataOffset(ncfUInt32 track, ncfUInt64 sample,
                                    ncfUInt64* position) = 0;  // 4
    virtual NCFRESULT GetSampleFlags(ncfUInt32 track, ncfUInt64 sample,
                                     QTWSamplePropertyFlags_t* flags) = 0;  // 5
    // 6. First sample whose bytes do not follow the one before; count + 1 at
    // the end.
    virtual NCFRESULT GetNextDiscontiguousDataAttributeChange(ncfUInt32 track, ncfUInt64 sample,
                                                              ncfUInt64* next) = 0;
    virtual NCFRESULT GetDataSizePerSample(ncfUInt32 track, ncfUInt64 sample,
                                           ncfUInt32* bytes) = 0;  // 7
    // 8. Relative to display order: the first presented picture has 0.
    virtual NCFRESULT GetDisplayOffset(ncfUInt32 track, ncfUInt64 sample,
                                       ncfSInt64* offset) = 0;  // 8
    virtual NCFRESULT GetDecodeDuration(ncfUInt32 track, ncfUInt64 sample,
                                        ncfSInt64* duration) = 0;         // 9
    virtual ncfUInt32 GetMaxDataSize(ncfUInt32 track) = 0;                // 10
    virtual ncfBool HasOutOfOrderFrameDependencies(ncfUInt32 track) = 0;  // 11

protected:
    ~IQTWSampleTable() = default;
};

inline constexpr GUID IID_IQTWSampleTable = ncfGuid("7C1E94A6-0B5D-4E2F-93D8-1A6F0C7B5E08");
constexpr const GUID& ncfIdOf(const IQTWSampleTable*) {
    return IID_IQTWSampleTable;
}

}  // namespace QTWrapper
