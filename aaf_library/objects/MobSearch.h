// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <string>

#include "host_interfaces/aaf/AAFPlainTypes.h"

namespace aaf {

class Mob;

// What GetMobs looks for, copied out of the caller's criterion, which may be
// gone while the enumerator runs.
class MobSearch {
public:
    // Takes a criterion; null means all mobs. Fails with a tag or a kind that
    // this library does not know.
    HRESULT Set(const aafSearchCrit_t* criterion);
    bool IsForAll() const;
    bool Matches(Mob& mob) const;

private:
    aafSearchCrit_t criterion_{};  // kAAFNoSearch
    std::wstring name_;
};

}  // namespace aaf
