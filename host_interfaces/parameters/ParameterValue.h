// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/framework/Unknown.h"

// One value of a parameter, on its way between a module and a document.
//
// Implemented by the host, made by IValueFactory. The module fills one for the
// suite, again and again; the host's reader fills one for a handler. Whoever is given
// one reads it during the call. One thread at a time.
struct IParameterValue : INCFUnknown {
    // 3. Holds nothing afterwards.
    virtual NCFRESULT Clear() = 0;
    // 4. Copies `bytes` bytes of a value of a type, such as kValueTypeUInt32 with
    // four bytes in machine order. `zero` is 0.
    virtual NCFRESULT SetData(const GUID& type, const void* data, ncfUInt32 bytes,
                              ncfUInt32 zero) = 0;
    // 5. Copies the first `bytes` bytes out. When fewer are held: NCF_E_FAIL, and nothing is
    // written.
    virtual NCFRESULT GetData(void* data, ncfUInt32 bytes) = 0;

protected:
    ~IParameterValue() = default;
};

// Makes values of one type. Implemented by the host as a component whose id is that
// of the type; the module creates one where it needs a value, and lets go of it.
struct IValueFactory : INCFUnknown {
    // 3. A new value that holds nothing, one reference for the caller.
    virtual NCFRESULT CreateValue(IParameterValue** out) = 0;

protected:
    ~IValueFactory() = default;
};

inline constexpr GUID IID_IParameterValue = ncfGuid("5D0E7B34-93C1-4F6A-8A27-1C4F60B7D20C");
inline constexpr GUID IID_ValueFactory = ncfGuid("F9EA0EB0-7FD3-11D6-BEF9-00306542A024");
constexpr const GUID& ncfIdOf(const IParameterValue*) {
    return IID_IParameterValue;
}
constexpr const GUID& ncfIdOf(const IValueFactory*) {
    return IID_ValueFactory;
}
