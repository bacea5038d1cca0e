// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/framework/String.h"

namespace host::util {

// An empty string that refuses every change, shown where the host made none:
// a caller that passes it on gets a failure back, not a null pointer. One
// object for the process, which references don't end.
INCFString* RefusingString();

}  // namespace host::util
