// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/Failure.h"

#include <gtest/gtest.h>

#include <fstream>

#include "tests/support/TestFiles.h"
#include "tests/unit/cliphost/TestFolder.h"

using cliphost::Failure;
using cliphost::Problem;
using namespace cliphost_tests;

TEST(Failure, OfWhatAFileHoldsIsTheFilesFault) {
    const TestFolder folder;
    WriteFile(folder / "a.mov", "no movie");
    EXPECT_EQ(Failure(Problem{folder / "a.mov", "is no movie"}).status(), cliphost::kExitFile);
    EXPECT_EQ(Failure(Problem{{}, "something"}).status(), cliphost::kExitFile);
}

TEST(Failure, OfWhatCantBeOpenedAsAFileIsTheCallersFault) {
    const TestFolder folder;
    const auto statusOf = [](const std::filesystem::path& path) {
        return Failure(Problem{path, "something"}).status();
    };
    EXPECT_EQ(statusOf(folder / "absent.mov"), cliphost::kExitCaller);
    EXPECT_EQ(statusOf(folder.path()), cliphost::kExitCaller);
    if (MakePipe(folder / "pipe")) {
        EXPECT_EQ(statusOf(folder / "pipe"), cliphost::kExitCaller);
    }
    if (MakeLink("loop", folder / "loop")) {
        EXPECT_EQ(statusOf(folder / "loop"), cliphost::kExitCaller);
    }
    WriteFile(folder / "locked.mov", "x");
    std::filesystem::permissions(folder / "locked.mov", std::filesystem::perms::none);
    if (!std::ifstream(folder / "locked.mov")) {  // root reads everything
        EXPECT_EQ(statusOf(folder / "locked.mov"), cliphost::kExitCaller);
    }
}
