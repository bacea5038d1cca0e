// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/model/Unknown.h"

#include "aaf_library/model/Model.h"

namespace aaf {

namespace {

// By this id an object tells another object of this library where it is; unlike an interface, it
// is given without a reference.
constexpr GUID kImplementationId = ncfGuid("87589AAF-6606-496E-ABE1-ED45AB0FC7D9");

}  // namespace

Unknown::~Unknown() {
    if (model_ != nullptr && !kept_) {
        model_->Release();
    }
}

void Unknown::JoinModel(Model& model) {
    model_ = &model;
    model_->AddRef();
}

void Unknown::Keep() {
    if (kept_) {
        return;
    }
    kept_ = true;
    if (references_ == 1 && model_ != nullptr) {
        model_->Release();
    }
}

void Unknown::Free() {
    if (!kept_) {
        return;
    }
    kept_ = false;
    if (references_ == 1 && model_ != nullptr) {
        model_->AddRef();
    }
}

HRESULT Unknown::QueryInterface(REFIID iid, void** out) {
    return Query(iid, out);
}

void* Unknown::FindInterface(const GUID& iid) {
    return iid == IID_IUnknown_Zero || iid == IID_IUnknown_COM ? Identity() : nullptr;
}

HRESULT Unknown::Query(const GUID& iid, void** out) {
    if (out == nullptr) {
        return AAF_E_INVALIDARG;
    }
    if (iid == kImplementationId) {
        *out = this;
        return AAFRESULT_SUCCESS;
    }
    *out = FindInterface(iid);
    if (*out == nullptr) {
        return AAF_E_NOINTERFACE;
    }
    AddReference();
    return AAFRESULT_SUCCESS;
}

ULONG Unknown::AddReference() {
    if (++references_ == 2 && kept_ && model_ != nullptr) {
        model_->AddRef();
    }
    return references_;
}

ULONG Unknown::ReleaseReference() {
    const ULONG left = --references_;
    if (left == 0) {
        delete this;
    } else if (left == 1 && kept_ && model_ != nullptr) {
        // Nobody but the owner is left. This may end the model and with it this object.
        model_->Release();
    }
    return left;
}

Unknown* ImplementationOf(IUnknown* any) {
    void* found = nullptr;
    return any != nullptr && any->QueryInterface(kImplementationId, &found) >= 0
               ? static_cast<Unknown*>(found)
               : nullptr;
}

}  // namespace aaf
