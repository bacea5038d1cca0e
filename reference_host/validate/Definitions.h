// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "reference_host/framework/Host.h"

namespace validate {

// What was called of definition objects, and which call is refused.
struct DefinitionCalls {
    int all = 0;      // SetAttribute and Define
    int defines = 0;  // Define alone
    int refused = 0;  // this one of all calls gets NCF_E_OUTOFMEMORY; 0: none
    bool wasDefineRefused = false;
};

// Puts definition objects that count in place of the host's; `calls` outlives the host.
void RegisterCountingDefinitions(host::Host& host, DefinitionCalls& calls);

}  // namespace validate
