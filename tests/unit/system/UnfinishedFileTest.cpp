// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/system/UnfinishedFile.h"

#include <gtest/gtest.h>

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
