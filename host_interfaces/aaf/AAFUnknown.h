// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/aaf/AAFPlainTypes.h"

// Root of the published interfaces. A pointer given out carries one reference
// that belongs to the caller; arguments are borrowed.
struct IUnknown {
    virtual HRESULT QueryInterface(REFIID iid, void** out) = 0;
    virtual ULONG AddRef() = 0;
    virtual ULONG Release() = 0;

protected:
    ~IUnknown() = default;
};

// The usual id, which the published library answers on Windows only, and the
// one of all zero bytes that it answers elsewhere.
inline constexpr GUID IID_IUnknown_COM = ncfGuid("00000000-0000-0000-C000-000000000046");
inline constexpr GUID IID_IUnknown_Zero = ncfGuid("00000000-0000-0000-0000-000000000000");
#ifdef _WIN32
inline constexpr GUID IID_IUnknown = IID_IUnknown_COM;
#else
inline constexpr GUID IID_IUnknown = IID_IUnknown_Zero;
#endif
constexpr const GUID& aafIdOf(const IUnknown*) {
    return IID_IUnknown;
}

// Used by DllGetClassObject only.
inline constexpr GUID IID_IClassFactory = ncfGuid("00000001-0000-0000-C000-000000000046");
