// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <limits>

#include "host_interfaces/framework/Types.h"

namespace header_parser {

// The greatest value that a field of 32 bits holds. As a duration it says "unknown".
constexpr ncfUInt64 kMax32 = std::numeric_limits<ncfUInt32>::max();

// The last place in a file that the system's calls can name.
constexpr ncfUInt64 kMaxPosition = static_cast<ncfUInt64>(std::numeric_limits<ncfSInt64>::max());

}  // namespace header_parser
