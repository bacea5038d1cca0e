// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/framework/String.h"
#include "host_interfaces/parameters/ParameterValue.h"

// Builds a parameter document from calls, so that a module need not know XML.
//
// Implemented by the host as a component; the module creates one for each document
// that the host asks it for, fills it, and lets go of it. One thread at a time.
//
// The order is: component, Prepare, the description if one is wanted, sets with
// their values, WriteXML. A part goes to the whole that was added last: a choice to
// the last parameter, a parameter to the last group, a value to the last set. Texts
// are UTF-8, zero-terminated and copied; null is empty. An operation out of order
// gives NCF_E_FAIL, an id that is there already NMA_E_ALREADYSET, and a text that
// XML can't hold NCF_E_INVALIDARG; the document is then as it was.
struct IParameterSuite : INCFUnknown {
    // 3. Whose parameters these are.
    virtual NCFRESULT SetComponentId(const GUID& component) = 0;
    // 4. Starts the document of one track, 0 being the first, without anything
    // of what was added before.
    virtual NCFRESULT Prepare(ncfUInt32 track) = 0;
    // 5. Puts the whole document into `out`, the caller's string.
    virtual NCFRESULT WriteXML(INCFString* out) = 0;

    // 6. Opens the description, whose version is 1.
    virtual NCFRESULT BeginDescription(float version) = 0;
    // 7. A heading for the parameters that follow. Without a name it shows none.
    // `zero` is 0; `isShown` is not 0 for a group that is shown.
    virtual NCFRESULT AddGroup(const GUID& group, const char* name, ncfUInt32 zero,
                               ncfUInt32 isShown) = 0;
    // 8. A parameter of a type, with its name in documents and its label for
    // people. kParamTypeChoice is the one type; another: NCF_E_NOTSUPPORTED. `zero`
    // is 0.
    virtual NCFRESULT AddParameter(const GUID& parameter, const char* internalName,
                                   const char* label, ncfUInt32 zero, const GUID& type) = 0;
    // 9. Closes the description. NCF_E_NOTFOUND when a dependency names a
    // parameter that was not added.
    virtual NCFRESULT EndDescription() = 0;
    // 10. A value that the parameter added last may take, and its text for people.
    // `isDefault` is not 0 for the one that a user begins with.
    virtual NCFRESULT AddValueChoice(const char* text, ncfUInt32 value, ncfBool isDefault) = 0;
    // 11. What `kind` makes of `parameter`, which may follow later, while the one
    // added last has this value: 1, the user may change it; 2, the user may not.
    // `one` is 1.
    virtual NCFRESULT AddDependency(ncfUInt32 kind, const GUID& parameter, IParameterValue* value,
                                    ncfUInt32 one) = 0;

    // 12. A set of values; the one added last is the set in use. `zero` is 0, the
    // version 1; `isDefault` is not 0 for the set of what the file itself says.
    virtual NCFRESULT AddParamSet(const GUID& set, const char* name, ncfUInt32 zero, float version,
                                  ncfBool isDefault) = 0;
    // 13. A value in the set added last. `value` is borrowed and must hold 32
    // bits; what it answers when it doesn't is the result.
    virtual NCFRESULT AddParamValue(const GUID& parameter, IParameterValue* value) = 0;

protected:
    ~IParameterSuite() = default;
};

inline constexpr GUID CompID_ParameterSuite = ncfGuid("24AC2A8F-0577-4A6E-ACFE-44E10B9B01F3");
inline constexpr GUID IID_ParameterSuite = ncfGuid("D53181F5-E685-4DD7-8480-3AE8304437D4");
constexpr const GUID& ncfIdOf(const IParameterSuite*) {
    return IID_ParameterSuite;
}
