// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "reference_host/cliphost/Session.h"

namespace fuzz {

// The built module in the reference host, once for the process.
cliphost::Session& TheSession();

// Ends the process when an object of the module is alive.
void RequireNothingLeft(cliphost::Session& session);

}  // namespace fuzz
