// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/system/UnfinishedFile.h"

#include <gtest/gtest.h>

#include <unistd.h>

#include <csignal>

#include "reference_host/cliphost/OutputFile.h"
#include "tests/unit/cliphost/TestFolder.h"

using host::system::UnfinishedFile;
using namespace cliphost_tests;

TEST(UnfinishedFile, IsRemovedWhenASignalEndsTheProgram) {
    for (const int signal : {SIGINT, SIGTERM, SIGHUP, SIGPIPE}) {
        const TestFolder folder;
        WriteFile(folder / "b.aaf", "another");
        const auto interrupted = [&] {
            std::signal(signal, SIG_DFL);
            const UnfinishedFile first(folder / "a.aaf");
            const UnfinishedFile second(folder / "b.aaf");
            WriteFile(first.path(), "half");
            WriteFile(second.path(), "half");
            WriteFile(second.path().native() + UnfinishedFile::kWriterEnding, "half");
            std::raise(signal);
        };
        EXPECT_EXIT(interrupted(), testing::KilledBySignal(signal), "");
        EXPECT_EQ(folder.CountFiles(), 1u) << signal;
        EXPECT_EQ(ContentOf(folder / "b.aaf"), "another");
    }
}

TEST(UnfinishedFile, LeavesASignalIgnoredThatTheCallerIgnores) {
    const TestFolder folder;
    const auto interrupted = [&] {
        std::signal(SIGHUP, SIG_IGN);
        UnfinishedFile file(folder / "a.aaf");
        WriteFile(file.path(), "whole");
        std::raise(SIGHUP);
        std::error_code error;
        file.TakePlace(error);
        _exit(error ? 1 : 0);
    };
    EXPECT_EXIT(interrupted(), testing::ExitedWithCode(0), "");
    EXPECT_EQ(ContentOf(folder / "a.aaf"), "whole");
}

TEST(UnfinishedFile, OfAnOutputIsRemovedByAnInterrupt) {
    const TestFolder folder;
    const auto interrupted = [&] {
        std::signal(SIGINT, SIG_DFL);
        cliphost::OutputFile file(folder / "a.raw");
        file.Write("half", 4);
        std::raise(SIGINT);
    };
    EXPECT_EXIT(interrupted(), testing::KilledBySignal(SIGINT), "");
    EXPECT_EQ(folder.CountFiles(), 0u);
}
