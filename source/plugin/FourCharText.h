// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <string>

#include "host_interfaces/framework/Types.h"

// The four characters of a code, first one in the top byte, for texts that
// people read: bytes that are not printable ASCII show as '?'. Every message
// that names a code goes through here, since the code comes from a file.
std::string FourCharText(ncfUInt32 code);
