// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

namespace host {

class Host;

// Makes the suite, the reader and the factory of values known to a host.
void RegisterParameterComponents(Host& host);

}  // namespace host
