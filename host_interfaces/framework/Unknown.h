// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/framework/Guid.h"
#include "host_interfaces/framework/ResultCodes.h"

// Root of every interface of the framework. An implementation is thread-safe
// in these three operations; other operations are not unless they say so.
struct INCFUnknown {
    // Hands out the interface `iid` of the object with a new reference that
    // the caller releases. NCF_E_NOINTERFACE and null when it has none.
    virtual NCFRESULT QueryInterface(const GUID& iid, void** out) = 0;
    virtual ncfUInt32 AddRef() = 0;
    virtual ncfUInt32 Release() = 0;

protected:
    ~INCFUnknown() = default;  // no place in the table: objects end by Release
};

inline constexpr GUID IID_INCFUnknown = ncfGuid("00000000-0000-0000-C000-000000000046");
constexpr const GUID& ncfIdOf(const INCFUnknown*) {
    return IID_INCFUnknown;
}
