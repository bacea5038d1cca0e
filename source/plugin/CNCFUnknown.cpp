// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/plugin/CNCFUnknown.h"

namespace {

std::atomic<ncfUInt32> objectCount{0};

}  // namespace

ncfUInt32 GetObjectCount() {
    return objectCount.load(std::memory_order_relaxed);
}

CNCFUnknown::CNCFUnknown() : CNCFUnknown(nullptr) {}

CNCFUnknown::CNCFUnknown(INCFUnknown* outer)
    : controllingUnknown_(outer ? outer : &privateUnknown_), privateUnknown_(this) {
    objectCount.fetch_add(1, std::memory_order_relaxed);
}

CNCFUnknown::~CNCFUnknown() {
    objectCount.fetch_sub(1, std::memory_order_relaxed);
}

NCFRESULT CNCFUnknown::InitializeInstance(INCFUnknown*) {
    return NCF_OK;
}

void CNCFUnknown::FinalRelease() {}

void CNCFUnknown::DeleteThis() {
    delete this;
}

NCFRESULT CNCFUnknown::InternalQueryInterface(const GUID& iid, void** out) {
    if (!out) {
        return NCF_E_INVALIDARG;
    }
    *out = nullptr;
    if (iid == IID_INCFUnknown) {
        *out = static_cast<INCFUnknown*>(&privateUnknown_);
        privateUnknown_.AddRef();
        return NCF_OK;
    }
    return NCF_E_NOINTERFACE;
}

ncfUInt32 CNCFUnknown::InternalAddRef() {
    return referenceCount_.fetch_add(1, std::memory_order_relaxed) + 1;
}

ncfUInt32 CNCFUnknown::InternalRelease() {
    const ncfUInt32 left = referenceCount_.fetch_sub(1, std::memory_order_acq_rel) - 1;
    if (left == 0) {
        FinalRelease();
        DeleteThis();
    }
    return left;
}
