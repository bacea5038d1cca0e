// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/framework/Unknown.h"

// Creates any registered component: the way to every service of the host.
// Obtained by QueryInterface on the host unknown. Thread-safe.
struct INCFComponentFactory : INCFUnknown {
    // 3. `outer` is the aggregating object, usually null. `*out` is null on
    // failure; an unknown component gives NCF_CLASS_E_CLASSNOTAVAILABLE.
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

// Makes objects of one class on the host's request.
struct INCFClassFactory : INCFUnknown {
    // 3. `host` is the host unknown, from which the new object takes its
    // services. An aggregated object is asked for IID_INCFUnknown only.
    virtual NCFRESULT CreateInstance(INCFUnknown* host, INCFUnknown* outer, const GUID& iid,
                                     void** out) = 0;

protected:
    ~INCFClassFactory() = default;
};

inline constexpr GUID IID_INCFClassFactory = ncfGuid("80996EEE-7FCF-11D6-ACA8-00306542A024");
constexpr const GUID& ncfIdOf(const INCFClassFactory*) {
    return IID_INCFClassFactory;
}

// An interface that the host unknown must offer before a plug-in registers
// with it. It has no operations of its own.
inline constexpr GUID IID_INCFHostUnknown = ncfGuid("E51741F1-7FCF-11D6-AAC3-00306542A024");
