// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/framework/String.h"
#include "host_interfaces/parameters/ParameterValue.h"

namespace NMA {

// Is told what a parameter document contains, in its order.
//
// Implemented by the module (QTParameters); the host's reader calls it during
// IParametersReader::Parse, on the same thread. It borrows all that it is given. A
// failure that it answers ends the reading.
struct IParametersHandler : INCFUnknown {
    virtual NCFRESULT BeginDocument() = 0;  // 3
    // 4. Parameters of a component follow; a handler takes only its own.
    virtual NCFRESULT BeginComponent(const GUID& component) = 0;
    // 5. `isWhole` is not 0 when nothing of the component is left open.
    virtual NCFRESULT EndComponent(ncfUInt32 isWhole) = 0;
    // 6. A set of the component begins. `state` is 0 when it is not the set in use,
    // 1 when it is, 2 when it is but its values may not be taken over. The name may
    // be null.
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

// Reads a parameter document and tells a handler what it contains.
//
// Implemented by the host as a component; the module creates one for each document
// that it is given. One thread at a time.
struct IParametersReader : INCFUnknown {
    // 3. Keeps a reference to the handler and lets go of the one before; null only
    // lets go.
    virtual NCFRESULT SetHandler(NMA::IParametersHandler* handler) = 0;
    // 4. Reads the string's own text, whatever encoding is declared in it. The events
    // come during this call; when the text is no sound parameter document, none
    // comes. A failure that the handler answers is the result.
    virtual NCFRESULT Parse(INCFString* xml) = 0;

protected:
    ~IParametersReader() = default;
};

inline constexpr GUID CompID_ParametersReader = ncfGuid("55F676BA-5A00-4786-A682-BEF1FCAEE168");
inline constexpr GUID IID_ParametersReader = ncfGuid("0D182F2A-352A-4052-8940-FFBC4371318E");
constexpr const GUID& ncfIdOf(const IParametersReader*) {
    return IID_ParametersReader;
}
