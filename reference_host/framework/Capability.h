// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <atomic>

#include "host_interfaces/framework/Capability.h"
#include "reference_host/framework/Component.h"

namespace host {

// Which way of access the host prefers; 0 until set.
class Capability final : public Component<INCFCapability> {
public:
    NCFRESULT GetValue(ncfUInt32* value) override;

    void SetValue(ncfUInt32 value);

private:
    std::atomic<ncfUInt32> value_{0};
};

}  // namespace host
