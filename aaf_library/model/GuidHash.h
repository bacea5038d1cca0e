// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <cstring>

#include "host_interfaces/framework/Guid.h"

namespace aaf {

struct GuidHash {
    std::size_t operator()(const GUID& id) const {
        std::uint64_t halves[2];
        std::memcpy(halves, &id, sizeof halves);
        return static_cast<std::size_t>(halves[0] * 0x9E3779B97F4A7C15u ^ halves[1]);
    }
};

}  // namespace aaf
