// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <atomic>

#include "host_interfaces/framework/Unknown.h"

namespace validate {

// An object that others are made inside of. It has no interface but its root.
class Outer final : public INCFUnknown {
public:
    NCFRESULT QueryInterface(const GUID& iid, void** out) override {
        const bool isRoot = iid == IID_INCFUnknown;
        *out = isRoot ? this : nullptr;
        if (isRoot) {
            AddRef();
        }
        return isRoot ? NCF_OK : NCF_E_NOINTERFACE;
    }
    ncfUInt32 AddRef() override { return static_cast<ncfUInt32>(++references_); }
    ncfUInt32 Release() override { return static_cast<ncfUInt32>(--references_); }

    int References() const { return references_; }

private:
    std::atomic<int> references_{1};
};

}  // namespace validate
