// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "tests/system/Command.h"

#include <gtest/gtest.h>
#include <sys/wait.h>

#include <cstdio>

#include "tests/system/SystemTest.h"

CommandResult RunCommand(const std::string& command) {
    CommandResult result;
    std::FILE* const pipe = popen(command.c_str(), "r");
    EXPECT_NE(pipe, nullptr) << command;
    if (!pipe) {
        return result;
    }
    char piece[65536];
    for (std::size_t got; (got = std::fread(piece, 1, sizeof piece, pipe)) > 0;) {
        result.out.append(piece, got);
    }
    const int status = pclose(pipe);
    result.status = WIFEXITED(status) ? WEXITSTATUS(status) : 128;
    return result;
}

CommandResult RunCliphost(const std::string& arguments) {
    return RunCommand(Quoted(ProgramFolder() / "cliphost") + " " + arguments + " 2>&1");
}

void ExpectSays(const CommandResult& result, int status, const std::string& words) {
    EXPECT_EQ(result.status, status) << result.out;
    EXPECT_NE(result.out.find(words), std::string::npos) << words << "\nis not in:\n" << result.out;
}
