// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <string_view>

namespace host::files {

// Whether a bare name matches a pattern in which "*" stands for any run of
// characters and "?" for one. Case counts as the file system counts it.
bool MatchesPattern(std::u32string_view name, std::u32string_view pattern);

}  // namespace host::files
