// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/Program.h"

int main(int argc, char** argv) {
    return cliphost::RunProgram(argc, argv);
}
