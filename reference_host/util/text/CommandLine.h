// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <string>
#include <vector>

namespace host::text {

// One text out of a program's name and its arguments, from which a program on Windows gets the same
// back: there a process is handed a text, and parts it itself.
std::string CommandLine(const std::vector<std::string>& words);

}  // namespace host::text
