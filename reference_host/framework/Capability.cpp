// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/framework/Capability.h"

namespace host {

NCFRESULT Capability::GetValue(ncfUInt32* value) {
    if (value == nullptr) {
        return NCF_E_POINTER;
    }
    *value = value_.load(std::memory_order_relaxed);
    return NCF_OK;
}

void Capability::SetValue(ncfUInt32 value) {
    value_.store(value, std::memory_order_relaxed);
}

}  // namespace host
