// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/framework/Unknown.h"

// Tells containers which of two ways of access the host prefers.
//
// Implemented by the host as a component of its own, one object for all.
// QuickTimeContainer creates it when it is made, goes on without it when there is
// none, and asks it in GetCapabilities. Thread-safe.
struct INCFCapability : INCFUnknown {
    // 3. 0 or not: the container adds flag 256 or 512. The caller zeroes the value
    // and ignores the result.
    virtual NCFRESULT GetValue(ncfUInt32* value) = 0;

protected:
    ~INCFCapability() = default;
};

inline constexpr GUID CompID_Capability = ncfGuid("93EE46B2-9EFD-4B41-808A-C96061F0F4EC");
inline constexpr GUID IID_INCFCapability = ncfGuid("6A0C2371-128B-40AF-89D6-7247D691A66D");
constexpr const GUID& ncfIdOf(const INCFCapability*) {
    return IID_INCFCapability;
}
