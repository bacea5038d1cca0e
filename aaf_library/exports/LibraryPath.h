// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <string>

namespace aaf {

// Where this library's file lies; empty when the system does not tell.
std::wstring LibraryPath();

}  // namespace aaf
