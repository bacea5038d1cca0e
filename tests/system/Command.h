// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <string>

#include "tests/support/Quoted.h"

// What a command prints, and how it ends; fails the test when it can't run.
struct CommandResult {
    int status = -1;
    std::string out;  // both streams where asked for
};
CommandResult RunCommand(const std::string& command);
// The program under test, with arguments; standard error is in `out` too.
CommandResult RunCliphost(const std::string& arguments);
// The same of its end: the exit status, and words among what it printed.
void ExpectSays(const CommandResult& result, int status, const std::string& words);
