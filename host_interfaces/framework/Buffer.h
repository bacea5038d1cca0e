// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/framework/Unknown.h"

// State of a buffer whose content is final.
inline constexpr ncfUInt32 kNCFBuffer_Complete = 3;

// A block of memory of the host: output of a sample request, or a list of
// 32-bit pixel format codes (IQuickTimeProperty).
//
// Implemented by the host. For samples the module calls 3, 4 and 5 in this order,
// within one ProvideSampleRange; from a list of codes it reads by 4 alone. The
// memory belongs to the buffer, and lasts until the next Allocate or its end.
struct INCFBuffer : INCFUnknown {
    // 3. Makes room for `size` bytes at a multiple of `alignment` bytes, which is
    // 0 (any place) or a power of two; zeroed. What was there before is lost.
    virtual NCFRESULT Allocate(ncfUInt64 size, ncfUInt32 alignment) = 0;
    // 4. Start of the block, null before Allocate.
    virtual NCFRESULT GetBufferPointer(void** start) = 0;
    // 5. Hands the content over: kNCFBuffer_Complete, how many bytes are valid
    // (at most those allocated), and with which result they were made.
    virtual NCFRESULT SetComplete(ncfUInt32 state, ncfUInt64 validBytes, NCFRESULT result) = 0;

protected:
    ~INCFBuffer() = default;
};

inline constexpr GUID IID_INCFBuffer = ncfGuid("5B0C2A94-6E1F-4D6C-9C0B-6E0D5C3B7A11");
constexpr const GUID& ncfIdOf(const INCFBuffer*) {
    return IID_INCFBuffer;
}
