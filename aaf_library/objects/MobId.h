// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/aaf/AAFPlainTypes.h"

namespace aaf {

// An id that no mob has had, of the label that all new mobs carry.
aafMobID_t NewMobId();

// Whether all bytes are zero: a reference that ends a chain.
bool IsNilMobId(const aafMobID_t& id);

bool operator==(const aafMobID_t& left, const aafMobID_t& right);

}  // namespace aaf
