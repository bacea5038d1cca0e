// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/OutputFile.h"

#include <gtest/gtest.h>

#include "reference_host/cliphost/Failure.h"
#include "tests/unit/cliphost/TestFolder.h"

using cliphost::Failure;
using cliphost::OutputFile;
using namespace cliphost_tests;

TEST(OutputFile, IsThereOnceItIsFinished) {
    const TestFolder folder;
    {
        OutputFile file(folder / "a.raw");
        file.Write("one", 3);
        EXPECT_FALSE(std::filesystem::exists(folder / "a.raw"));
        file.Write("two", 3);
        file.Finish();
        EXPECT_EQ(ContentOf(folder / "a.raw"), "onetwo");
    }
    EXPECT_EQ(ContentOf(folder / "a.raw"), "onetwo");
    EXPECT_EQ(folder.CountFiles(), 1u);
}

TEST(OutputFile, LeavesNothingWhenItEndsUnfinishedAndKeepsWhatWasThereBefore) {
    const TestFolder folder;
    WriteFile(folder / "a.raw", "before");
    {
        OutputFile file(folder / "a.raw");
        file.Write("half", 4);
    }
    EXPECT_EQ(ContentOf(folder / "a.raw"), "before");
    EXPECT_EQ(folder.CountFiles(), 1u);
}

TEST(OutputFile, LeavesTheWritingToAnother) {
    const TestFolder folder;
    {
        OutputFile file(folder / "a.aaf", OutputFile::Writer::Other);
        EXPECT_EQ(folder.CountFiles(), 0u);
        WriteFile(file.NameForOther(), "whole");
        EXPECT_FALSE(std::filesystem::exists(folder / "a.aaf"));
        file.Finish();
    }
    EXPECT_EQ(ContentOf(folder / "a.aaf"), "whole");
    {
        OutputFile file(folder / "a.aaf", OutputFile::Writer::Other);
        WriteFile(file.NameForOther(), "half");
    }
    EXPECT_EQ(ContentOf(folder / "a.aaf"), "whole");
    EXPECT_EQ(folder.CountFiles(), 1u);
}

TEST(OutputFile, TellsWhyAnotherCantWrite) {
    const TestFolder folder;
    OutputFile possible(folder / "a.aaf", OutputFile::Writer::Other);
    EXPECT_NO_THROW(possible.TryPlace());
    OutputFile file(folder / "no" / "a.aaf", OutputFile::Writer::Other);
    try {
        file.TryPlace();
        ADD_FAILURE() << "nothing can be written there";
    } catch (const Failure& failure) {
        EXPECT_NE(std::string(failure.what()).find("a.aaf: not written: No such file"),
                  std::string::npos)
            << failure.what();
    }
}

TEST(OutputFile, TellsWhyItCantBeWritten) {
    const TestFolder folder;
    const auto expectFailure = [](const std::filesystem::path& path, const char* why) {
        try {
            OutputFile file(path);
            ADD_FAILURE() << path << " was opened";
        } catch (const Failure& failure) {
            EXPECT_EQ(failure.status(), cliphost::kExitCaller);
            EXPECT_NE(std::string(failure.what()).find(path.u8string() + ": not written: "),
                      std::string::npos)
                << failure.what();
            EXPECT_NE(std::string(failure.what()).find(why), std::string::npos) << failure.what();
        }
    };
    expectFailure(folder / "no" / "such" / "a.raw", "No such file");
    expectFailure(folder.path(), "Is a directory");
}
