// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <functional>

#include "host_interfaces/framework/Unknown.h"

namespace host {

// Sees every query for an interface of the host's objects before it is answered; a
// negative result becomes the answer, as with ComponentFactory's rule for
// creations. `number` counts from 1 since the rule was set.
using QueryRule = std::function<NCFRESULT(const GUID& iid, ncfUInt32 number)>;

// Process-wide, since objects outlive their host. Empty: every question is
// answered. Set it while no other thread asks.
void SetQueryRule(QueryRule rule);

// For the host's objects.
NCFRESULT AskQueryRule(const GUID& iid);

}  // namespace host
