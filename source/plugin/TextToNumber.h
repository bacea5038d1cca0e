// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#pragma once

#include <cstdlib>

#include "host_interfaces/framework/Types.h"

// Decimal number at the start of a text; leading blanks and whatever follows
// are passed over, and a text without digits is 0. A number beyond 32 bits
// keeps its low bits.
inline ncfUInt32 TextToNumber(const char* text) {
    return static_cast<ncfUInt32>(std::strtoll(text, nullptr, 10));
}
