// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/OutputFolder.h"

#include <gtest/gtest.h>

#include "reference_host/cliphost/Failure.h"
#include "tests/unit/cliphost/TestFolder.h"

using namespace cliphost;
using namespace cliphost_tests;

TEST(OutputFolder, IsMadeWithTheFoldersOnTheWayAndStaysWithWhatIsInIt) {
    const TestFolder folder;
    {
        const OutputFolder made(folder / "a/b");
        EXPECT_TRUE(std::filesystem::is_directory(folder / "a/b"));
        WriteFile(folder / "a/b/file", "x");
    }
    EXPECT_TRUE(std::filesystem::exists(folder / "a/b/file"));
}

TEST(OutputFolder, GoesAgainWhereItStaysEmpty) {
    const TestFolder folder;
    { const OutputFolder made(folder / "a/b"); }
    EXPECT_FALSE(std::filesystem::exists(folder / "a"));
    std::filesystem::create_directory(folder / "mine");
    { const OutputFolder made(folder / "mine"); }
    EXPECT_TRUE(std::filesystem::exists(folder / "mine")) << "it was there before";
}

TEST(OutputFolder, EndsAVerbWhereItCantBeMade) {
    const TestFolder folder;
    WriteFile(folder / "file", "x");
    try {
        const OutputFolder made(folder / "file/b");
        ADD_FAILURE() << "it was made";
    } catch (const Failure& failure) {
        EXPECT_EQ(failure.status(), kExitCaller);
        EXPECT_EQ(failure.problem().reason, "the folder can't be made: Not a directory");
    }
    EXPECT_TRUE(std::filesystem::exists(folder / "file"));
}
