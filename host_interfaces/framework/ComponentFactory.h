// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/framework/Unknown.h"

// Creates any registered component, of the host or of a module: the way to every
// service.
//
// Implemented by the host; a module queries the host unknown for it, which every
// exported function and every new object is given. Called at any time from
// NCFRegisterPlugin on. Thread-safe. The caller owns what is made.
struct INCFComponentFactory : INCFUnknown {
    // 3. Makes a `component` and gives its interface `iid`. `outer` is the
    // aggregating object, usually null; the host's own components can't be
    // aggregated. An unknown component gives NCF_CLASS_E_CLASSNOTAVAILABLE.
    virtual NCFRESULT CreateComponent(const GUID& component, INCFUnknown* outer, const GUID& iid,
                                      void** out) = 0;

    // The operation's second name.
    NCFRESULT CreateInstance(const GUID& component, INCFUnknown* outer, const GUID& iid,
                             void** out) {
        return CreateComponent(component, outer, iid, out);
    }

protected:
    ~INCFComponentFactory() = default;
};

inline constexpr GUID IID_INCFComponentFactory = ncfGuid("382B6A96-7FD0-11D6-BCFE-00306542A024");
constexpr const GUID& ncfIdOf(const INCFComponentFactory*) {
    return IID_INCFComponentFactory;
}

// Makes objects of one class.
//
// Implemented by the module, which makes one for each NCFGetClassFactory; the
// host's component factory calls it for a component of that module. It may be kept
// and used again, but counts as an object that is alive: a module with one can't
// be unloaded. The caller owns what is made.
struct INCFClassFactory : INCFUnknown {
    // 3. `host` is the host unknown, from which the new object takes its
    // services; the object may keep it. `outer` is the aggregating object or null;
    // with one, `iid` must be IID_INCFUnknown.
    virtual NCFRESULT CreateInstance(INCFUnknown* host, INCFUnknown* outer, const GUID& iid,
                                     void** out) = 0;

protected:
    ~INCFClassFactory() = default;
};

inline constexpr GUID IID_INCFClassFactory = ncfGuid("80996EEE-7FCF-11D6-ACA8-00306542A024");
constexpr const GUID& ncfIdOf(const INCFClassFactory*) {
    return IID_INCFClassFactory;
}

// An interface that the host unknown must offer before a plug-in registers with
// it: the mark by which a module knows a host. It has no operations of its own.
inline constexpr GUID IID_INCFHostUnknown = ncfGuid("E51741F1-7FCF-11D6-AAC3-00306542A024");
