// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/framework/Buffer.h"

// A request for samples: which ones of which track, and where they go. Made by
// the host for one call of a sample provider.
struct INCFAVBuffer : INCFUnknown {
    virtual NCFRESULT GetBuffer(INCFBuffer** buffer) = 0;  // 3. A new reference.
    // 4. The host's track number, the first sample and the count, all from
    // zero.
    virtual NCFRESULT GetSampleRange(ncfUInt32* track, ncfUInt64* sample, ncfUInt64* count) = 0;

protected:
    ~INCFAVBuffer() = default;
};

inline constexpr GUID IID_INCFAVBuffer = ncfGuid("8D47F0B2-1C5A-4E39-B6A8-27E90C4D5F13");
constexpr const GUID& ncfIdOf(const INCFAVBuffer*) {
    return IID_INCFAVBuffer;
}
