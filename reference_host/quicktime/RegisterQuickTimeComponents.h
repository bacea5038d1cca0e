// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "reference_host/framework/Host.h"

namespace host {

// Lets the host make the movie wrapper and the codec properties.
void RegisterQuickTimeComponents(Host& host);

}  // namespace host
