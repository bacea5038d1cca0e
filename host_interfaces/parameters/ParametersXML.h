// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/framework/String.h"

// The parameters of one clip, as documents. Strings are the caller's objects,
// filled or read. NCF_E_INVALIDARG for a null string, NMA_E_NOTINITIALIZED for
// parameters that belong to no clip.
struct INCFParametersXML : INCFUnknown {
    virtual NCFRESULT GetParameterValuesXML(INCFString* xml) = 0;  // 3. What holds now.
    // 4. The parameters with their choices, and what holds now.
    virtual NCFRESULT GetParameterDescriptionXML(INCFString* xml) = 0;
    virtual NCFRESULT GetDefaultValuesXML(INCFString* xml) = 0;  // 5. What the file says.
    // 6. Takes over the values of the set in use. A failure half-way keeps those
    // that were taken before it.
    virtual NCFRESULT SetParameterValuesXML(INCFString* xml) = 0;
    virtual NCFRESULT ParametersUnsupportedOperation(void*) = 0;  // 7. NCF_E_NOTIMPL
    // 8. Back to the defaults. What depends on the values follows with the next
    // values that are set.
    virtual NCFRESULT ResetParameters() = 0;

protected:
    ~INCFParametersXML() = default;
};

inline constexpr GUID IID_INCFParametersXML = ncfGuid("45FFBAE6-E8F4-48E9-A4A9-1C85BD8D063A");
constexpr const GUID& ncfIdOf(const INCFParametersXML*) {
    return IID_INCFParametersXML;
}
