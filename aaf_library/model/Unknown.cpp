// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/model/Unknown.h"

#include "aaf_library/model/Model.h"

namespace aaf {

namespace {

// By this id an object tells another object of this library where it is.
constexpr GUID kImplementationId = ncfGuid("7C1D52F0-93B6-4E0A-8F3C-2A5E8B64D917");

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
    if (iid == IID_IUnknown_Zero || iid == IID_IUnknown_COM) {
        return Identity();
    }
    return iid == kImplementationId ? this : nullptr;
}

HRESULT Unknown::Query(const GUID& iid, void** out) {
    if (out == nullptr) {
        return AAF_E_INVALIDARG;
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
    if (any == nullptr || any->QueryInterface(kImplementationId, &found) < 0 || found == nullptr) {
        return nullptr;
    }
    auto* object = static_cast<Unknown*>(found);
    object->Release();
    return object;
}

}  // namespace aaf
