// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/objects/MobId.h"

#include <cstring>

#include "aaf_library/objects/Fresh.h"

namespace aaf {

aafMobID_t NewMobId() {
    return aafMobID_t{{0x06, 0x0A, 0x2B, 0x34, 0x01, 0x01, 0x01, 0x01, 0x01, 0x01, 0x0F, 0x00},
                      0x13,
                      0,
                      0,
                      0,
                      FreshId()};
}

bool IsNilMobId(const aafMobID_t& id) {
    return id == aafMobID_t{};
}

bool operator==(const aafMobID_t& left, const aafMobID_t& right) {
    return std::memcmp(&left, &right, sizeof left) == 0;
}

}  // namespace aaf
