// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/framework/Unknown.h"

// The two definition objects that a module fills in when it registers. The module
// creates them through the host's component factory instead of bringing its own,
// so the host can read back what it holds without asking the module.

// Describes one plug-in module.
//
// Implemented by the host. Filled in by NCFRegisterPlugin, which hands it to the
// host as its output; the module keeps no reference. One thread at a time.
struct INCFPluginDefinition : INCFUnknown {
    // 3. Stores a copy of `bytes` bytes of `value` under an attribute id; the type
    // is one of those below. Text is UTF-8; with 0xFFFFFFFF bytes it ends at its
    // zero. Attributes keep the order in which they were set.
    virtual NCFRESULT SetAttribute(const GUID& attribute, const GUID& valueType, const void* value,
                                   ncfUInt32 bytes) = 0;
    virtual NCFRESULT ReservedPluginDefinitionA() { return NCF_E_NOTIMPL; }  // 4
    virtual NCFRESULT ReservedPluginDefinitionB() { return NCF_E_NOTIMPL; }  // 5
    // 6. Names the module: its id and version, how many components it has (their
    // indexes go from 0), and its name and vendor in UTF-8, which are copied. What
    // the second id and the last number (1) mean is the host's affair.
    virtual NCFRESULT Define(const GUID& pluginId, ncfUInt32 major, ncfUInt32 minor,
                             const char* name, const GUID& secondId, const char* vendor,
                             ncfUInt32 componentCount, ncfUInt32 last) = 0;

protected:
    ~INCFPluginDefinition() = default;
};

inline constexpr GUID CompID_PluginDefinition = ncfGuid("6F8508AE-7295-11D6-8952-0030658A6504");
inline constexpr GUID IID_INCFPluginDefinition = ncfGuid("00EEF015-7FD0-11D6-8485-00306542A024");
constexpr const GUID& ncfIdOf(const INCFPluginDefinition*) {
    return IID_INCFPluginDefinition;
}

// Describes one component of a module.
//
// Implemented by the host. Filled in by NCFRegisterComponent, once for each index,
// and handed over like the definition of the module.
struct INCFComponentDefinition : INCFUnknown {
    // 3. As INCFPluginDefinition::SetAttribute.
    virtual NCFRESULT SetAttribute(const GUID& attribute, const GUID& valueType, const void* value,
                                   ncfUInt32 bytes) = 0;
    virtual NCFRESULT ReservedComponentDefinitionA() { return NCF_E_NOTIMPL; }  // 4
    virtual NCFRESULT ReservedComponentDefinitionB() { return NCF_E_NOTIMPL; }  // 5
    // 6. `componentId` is what callers create by, `classId` what reaches
    // NCFGetClassFactory; the type is the same for all components of a module. The
    // display name is UTF-8, copied.
    virtual NCFRESULT Define(const GUID& componentId, const GUID& componentType, ncfUInt32 major,
                             ncfUInt32 minor, const GUID& classId, const char* displayName) = 0;

protected:
    ~INCFComponentDefinition() = default;
};

inline constexpr GUID CompID_ComponentDefinition = ncfGuid("6C422BFA-70E5-11D6-8CDD-0030658A6504");
inline constexpr GUID IID_INCFComponentDefinition = ncfGuid("1718A226-7FD0-11D6-BD1D-00306542A024");
constexpr const GUID& ncfIdOf(const INCFComponentDefinition*) {
    return IID_INCFComponentDefinition;
}

// Value types of attributes.
inline constexpr GUID kNCFValueTypeText = ncfGuid("40C6B9BA-7103-11D6-BB30-0030658A6504");
inline constexpr GUID kNCFValueTypeUInt32 = ncfGuid("4EB1A950-7103-11D6-A663-0030658A6504");
inline constexpr GUID kNCFValueTypeFourBytes = ncfGuid("27A179D8-7103-11D6-94F7-0030658A6504");
