// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/framework/Unknown.h"

// One value of a parameter, for the journey between a module and a document. It
// may be filled again and again; whoever is given one reads it during the call.
struct IParameterValue : INCFUnknown {
    // 3. Holds nothing afterwards.
    virtual NCFRESULT Clear() = 0;
    // 4. Takes `bytes` bytes of a value of a type, such as kValueTypeUInt32 with
    // four bytes in machine order. The last argument is 0.
    virtual NCFRESULT SetData(const GUID& type, const void* data, ncfUInt32 bytes,
                              ncfUInt32 zero) = 0;
    // 5. The first `bytes` bytes. When fewer are held: NCF_E_FAIL, and nothing is
    // written.
    virtual NCFRESULT GetData(void* data, ncfUInt32 bytes) = 0;

protected:
    ~IParameterValue() = default;
};

// Makes values of the type by whose id the factory was created.
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
