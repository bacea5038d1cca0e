// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <string>
#include <vector>

namespace cliphost {

// The whole program: takes the name and the arguments that it was called with, and returns its exit
// status.
int RunProgram(const std::vector<std::string>& commandLine);

}  // namespace cliphost
