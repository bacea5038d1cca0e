// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <string>
#include <string_view>

#include "host_interfaces/framework/Guid.h"

namespace host {

// The text form of an id in parameter documents: 36 characters, without braces.
std::string GuidText(const GUID& id);
// The same back, in letters of either case; false, with `out` unchanged, for
// anything else.
bool ReadGuid(std::string_view text, GUID& out);

}  // namespace host
