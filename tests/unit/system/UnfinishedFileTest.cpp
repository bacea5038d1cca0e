// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/system/UnfinishedFile.h"

#include <gtest/gtest.h>

#include <unistd.h>

#include <csignal>

#include "reference_host/cliphost/OutputFile.h"
#include "tests/unit/cliphost/TestFolder.h"

using cliphost::OutputFile;
using host::system::UnfinishedFile;
using namespace cliphost_tests;

TEST(UnfinishedFile, TakesItsPlaceWhenAsked) {
    const TestFolder folder;
    WriteFile(folder / "a.aaf", "before");
    {
        UnfinishedFile file(folder / "a.aaf");
        WriteFile(file.path(), "whole");
        std::error_code error;
        file.TakePlace(error);
        EXPECT_FALSE(error);
    }
    EXPECT_EQ(ContentOf(folder / "a.aaf"), "whole");
    EXPECT_EQ(folder.CountFiles(), 1u);
}

TEST(UnfinishedFile, IsRemovedWhenItCantTakeItsPlace) {
    const TestFolder folder;
    std::filesystem::create_directory(folder / "a.aaf");
    {
        UnfinishedFile file(folder / "a.aaf");
        WriteFile(file.path(), "whole");
        std::error_code error;
        file.TakePlace(error);
        EXPECT_TRUE(error);
    }
    EXPECT_TRUE(std::filesystem::is_directory(folder / "a.aaf"));
    EXPECT_EQ(folder.CountFiles(), 1u);
}

TEST(UnfinishedFile, LeavesWhatIsThereWhenAsked) {
    const TestFolder folder;
    for (const char* const content : {"first", "second"}) {
        UnfinishedFile file(folder / "a.aaf");
        WriteFile(file.path(), content);
        std::error_code error;
        file.TakePlaceIfFree(error);
        EXPECT_FALSE(error);
    }
    EXPECT_EQ(ContentOf(folder / "a.aaf"), "first");
    EXPECT_EQ(folder.CountFiles(), 1u);
    UnfinishedFile file(folder / "missing" / "a.aaf");
    std::error_code error;
    file.TakePlaceIfFree(error);
    EXPECT_TRUE(error);
}

// The longest name that a file can have leaves no room for an ending.
TEST(UnfinishedFile, TakesAPlaceOfAnyName) {
    const TestFolder folder;
    for (const std::size_t length : {200, 223, 224, 250, 255}) {
        const std::filesystem::path place = folder / std::string(length, 'n');
        OutputFile file(place);
        file.Write("whole", 5);
        file.Finish();
        EXPECT_EQ(ContentOf(place), "whole") << length;
    }
    EXPECT_EQ(folder.CountFiles(), 5u);
    EXPECT_EQ(UnfinishedFile(folder / "a.aaf").path().native().find((folder / "a.aaf.").native()),
              0u);
}

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
