// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

namespace cliphost {

// The whole program: takes the arguments of main() and returns its exit status.
int RunProgram(int argc, char** argv);

}  // namespace cliphost
