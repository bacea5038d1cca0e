// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/Program.h"
#include "reference_host/system/Process.h"

int main(int argc, char** argv) {
    return cliphost::RunProgram(host::system::CommandLineWords(argc, argv));
}
