// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/framework/String.h"
#include "host_interfaces/parameters/ParameterValue.h"

// Builds a parameter document from calls. The order is: component, Prepare, the
// description if one is wanted, sets with their values, WriteXML. What belongs
// to something else goes to the one added last. Texts are UTF-8, zero-terminated
// and copied; null is empty. An operation out of order gives NCF_E_FAIL, an id
// that stands already NMA_E_ALREADYSET, and a text that XML has no place for
// NCF_E_INVALIDARG; the document is then as it was.
struct IParameterSuite : INCFUnknown {
    // 3. Whose parameters these are.
    virtual NCFRESULT SetComponentId(const GUID& component) = 0;
    // 4. Starts the document of one track, 0 being the first, without anything
    // of what was added before.
    virtual NCFRESULT Prepare(ncfUInt32 track) = 0;
    // 5. Puts the whole document into `out`, the caller's string.
    virtual NCFRESULT WriteXML(INCFString* out) = 0;

    // 6. Opens the description; it has a version.
    virtual NCFRESULT BeginDescription(float version) = 0;
    // 7. A heading for the parameters that follow. Without a name it shows none.
    // The first number is 0; the second is not 0 for a group that is shown.
    virtual NCFRESULT AddGroup(const GUID& group, const char* name, ncfUInt32 zero,
                               ncfUInt32 isShown) = 0;
    // 8. A parameter of a type, with its name in documents and its label for
    // people. kParamTypeChoice is the one type; another: NCF_E_NOTSUPPORTED.
    virtual NCFRESULT AddParameter(const GUID& parameter, const char* internalName,
                                   const char* label, ncfUInt32 zero, const GUID& type) = 0;
    // 9. Closes the description. NCF_E_NOTFOUND when a dependency names a
    // parameter that was not added.
    virtual NCFRESULT EndDescription() = 0;
    // 10. A value that the parameter added last may take.
    virtual NCFRESULT AddValueChoice(const char* text, ncfUInt32 value, ncfBool isDefault) = 0;
    // 11. What becomes of `parameter`, which may follow later, while the one
    // added last has a value: 1, the user may change it; 2, not. The last number
    // is 1.
    virtual NCFRESULT AddDependency(ncfUInt32 kind, const GUID& parameter, IParameterValue* value,
                                    ncfUInt32 one) = 0;

    // 12. A set of values; the one added last is the set in use.
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
