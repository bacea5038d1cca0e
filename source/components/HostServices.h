// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/framework/Console.h"
#include "source/plugin/NCFSmartPtr.h"
#include "source/plugin/ResultChecks.h"

namespace NMA::Impl {

// What components take from the host unknown when they are made; both throw an
// NCFRESULT.
inline void TakeComponentFactory(INCFUnknown* host, NCFSmartPtr<INCFComponentFactory>& factory) {
    if (!host) {
        ThrowIfFailed(NCF_E_POINTER);
    }
    ThrowIfFailed(ncfQuery(host, IID_INCFComponentFactory, factory));
}

inline void TakeConsole(INCFUnknown* host, NCFSmartPtr<INCFConsole>& console) {
    ThrowIfFailed(ncfQuery(host, IID_INCFConsole, console));
}

// Creates a component of this module and gives its class; a component that is
// not what was asked for is thrown as NCF_E_UNEXPECTED. `*out` holds the
// interface with its reference.
template <class Class, class Interface>
Class& CreateOwnComponent(INCFComponentFactory* factory, const GUID& component, const GUID& iid,
                          Interface** out) {
    void* created = nullptr;
    const NCFRESULT result =
        factory ? factory->CreateComponent(component, nullptr, iid, &created) : NCF_E_POINTER;
    *out = static_cast<Interface*>(created);
    ThrowIfFailed(result);
    auto* const object = dynamic_cast<Class*>(*out);
    if (!object) {
        ThrowIfFailed(NCF_E_UNEXPECTED);
    }
    return *object;
}

}  // namespace NMA::Impl
