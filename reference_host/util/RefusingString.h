// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/framework/String.h"

namespace host::util {

// An empty string that refuses every change. It stands in for a string that the host
// failed to make: a caller that passes it on gets a failure and not a null pointer.
// The process has one, and releasing it does not end it.
INCFString* RefusingString();

}  // namespace host::util
