// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/framework/String.h"
#include "host_interfaces/parameters/ParameterValue.h"

namespace NMA {

// Hears what stands in a parameter document. All that it is given is borrowed
// for the call. A failure that it answers ends the reading.
struct IParametersHandler : INCFUnknown {
    virtual NCFRESULT BeginDocument() = 0;                        // 3
    virtual NCFRESULT BeginComponent(const GUID& component) = 0;  // 4
    // 5. Not 0: nothing of the component is left open.
    virtual NCFRESULT EndComponent(ncfUInt32 isWhole) = 0;
    // 6. A set of the component. The state: 0, not the one in use; 1, in use; 2,
    // in use, but its values are not for taking. The name may be null.
    virtual NCFRESULT BeginParamSet(const GUID& set, INCFString* name, float version,
                                    ncfUInt32 state) = 0;
    // 7. A value of the set begun last.
    virtual NCFRESULT ParamValue(const GUID& parameter, IParameterValue* value) = 0;
    virtual NCFRESULT EndDocument() = 0;  // 8

protected:
    ~IParametersHandler() = default;
};

inline constexpr GUID IID_IParametersHandler = ncfGuid("30F807D9-A27E-4376-BA48-10E3514B2B4B");
constexpr const GUID& ncfIdOf(const IParametersHandler*) {
    return IID_IParametersHandler;
}

}  // namespace NMA

// Reads a parameter document and tells a handler of it.
struct IParametersReader : INCFUnknown {
    // 3. Takes a reference; null takes none and lets go of the one before.
    virtual NCFRESULT SetHandler(NMA::IParametersHandler* handler) = 0;
    // 4. Reads the object's text, whatever the declaration in it claims. The
    // events run during this call, and none of them when the document is no
    // parameter document. The handler's failure is the result.
    virtual NCFRESULT Parse(INCFString* xml) = 0;

protected:
    ~IParametersReader() = default;
};

inline constexpr GUID CompID_ParametersReader = ncfGuid("55F676BA-5A00-4786-A682-BEF1FCAEE168");
inline constexpr GUID IID_ParametersReader = ncfGuid("0D182F2A-352A-4052-8940-FFBC4371318E");
constexpr const GUID& ncfIdOf(const IParametersReader*) {
    return IID_ParametersReader;
}
