// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/framework/Types.h"

namespace host::system {

// Tells the system that `bytes` at `memory`, not yet touched, are one large
// block, so that it may back them with large pages: page by page, a block of a
// hundred megabytes costs more to touch than to parse. Only a hint.
void ExpectLargeBlock(ncfUInt8* memory, ncfUInt64 bytes);

}  // namespace host::system
