// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/plugin/CNCFClassFactory.h"

NCFRESULT CNCFClassFactory::Create(CreationFunction creator, const GUID& iid, void** out) {
    if (!creator || !out) {
        return NCF_E_INVALIDARG;
    }
    *out = nullptr;
    auto* const factory = new (std::nothrow) CNCFClassFactory(creator);
    if (!factory) {
        return NCF_E_OUTOFMEMORY;
    }
    factory->AddRef();
    const NCFRESULT answered = factory->QueryInterface(iid, out);
    factory->Release();
    return answered;
}

NCFRESULT CNCFClassFactory::QueryInterface(const GUID& iid, void** out) {
    return ControllingUnknown()->QueryInterface(iid, out);
}
ncfUInt32 CNCFClassFactory::AddRef() {
    return ControllingUnknown()->AddRef();
}
ncfUInt32 CNCFClassFactory::Release() {
    return ControllingUnknown()->Release();
}

NCFRESULT CNCFClassFactory::CreateInstance(INCFUnknown* host, INCFUnknown* outer, const GUID& iid,
                                           void** out) {
    if (!creator_) {
        return NCF_E_UNEXPECTED;
    }
    if (!host || !out) {
        return NCF_E_INVALIDARG;
    }
    *out = nullptr;
    if (outer && !(iid == IID_INCFUnknown)) {
        return NCF_CLASS_E_NOAGGREGATION;
    }
    return creator_(host, outer, iid, out);
}

NCFRESULT CNCFClassFactory::InternalQueryInterface(const GUID& iid, void** out) {
    return QueryListedInterfaces<INCFClassFactory>(this, iid, out);
}
