// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/framework/String.h"

// The parameters of one clip, as XML documents.
//
// Implemented by the module (QTParameters). The host queries a sample mapping for
// it; each query makes a new object, and all objects of a clip write the one record
// that the clip keeps. The object keeps its mapping alive. Which threads may call:
// SampleMapping.h. Strings are the caller's, and are filled or read during the call.
// NCF_E_INVALIDARG for a null string, NMA_E_NOTINITIALIZED for parameters that belong
// to no clip.
struct INCFParametersXML : INCFUnknown {
    virtual NCFRESULT GetParameterValuesXML(INCFString* xml) = 0;  // 3. The values in force.
    // 4. The parameters with their choices, and the values in force.
    virtual NCFRESULT GetParameterDescriptionXML(INCFString* xml) = 0;
    virtual NCFRESULT GetDefaultValuesXML(INCFString* xml) = 0;  // 5. What the file says.
    // 6. Takes over the values of the document's set in use. A failure half-way keeps
    // the values that were taken before it. Formats that a mapping has keep their
    // fields: whoever wants to see the change takes a new mapping.
    virtual NCFRESULT SetParameterValuesXML(INCFString* xml) = 0;
    virtual NCFRESULT ParametersUnsupportedOperation(void* reserved) = 0;  // 7. NCF_E_NOTIMPL
    // 8. Goes back to the defaults. What depends on the values follows with the next
    // values that are set.
    virtual NCFRESULT ResetParameters() = 0;

protected:
    ~INCFParametersXML() = default;
};

inline constexpr GUID IID_INCFParametersXML = ncfGuid("45FFBAE6-E8F4-48E9-A4A9-1C85BD8D063A");
constexpr const GUID& ncfIdOf(const INCFParametersXML*) {
    return IID_INCFParametersXML;
}
