// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/framework/Capability.h"

#include "reference_host/framework/Guard.h"

namespace host {

NCFRESULT Capability::GetValue(ncfUInt32* value) {
    return Give(value_.load(std::memory_order_relaxed), value);
}

void Capability::SetValue(ncfUInt32 value) {
    value_.store(value, std::memory_order_relaxed);
}

}  // namespace host
