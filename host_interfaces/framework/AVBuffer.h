// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/framework/Buffer.h"

// A request for samples: which ones of which track, and where they go.
//
// Implemented by the host, which passes one to each call of
// ISampleProvider::ProvideSampleRange and may use it again for the next. The
// module asks it during that call, on that thread, and keeps nothing of it.
struct INCFAVBuffer : INCFUnknown {
    // 3. Where the samples go, with a reference for the caller.
    virtual NCFRESULT GetBuffer(INCFBuffer** buffer) = 0;
    // 4. The host's track number and the first sample, both from zero, and how
    // many samples: one picture, or frames of sound.
    virtual NCFRESULT GetSampleRange(ncfUInt32* track, ncfUInt64* sample, ncfUInt64* count) = 0;

protected:
    ~INCFAVBuffer() = default;
};

inline constexpr GUID IID_INCFAVBuffer = ncfGuid("8D47F0B2-1C5A-4E39-B6A8-27E90C4D5F13");
constexpr const GUID& ncfIdOf(const INCFAVBuffer*) {
    return IID_INCFAVBuffer;
}
