// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/OutputProblem.h"

#include <gtest/gtest.h>

#include <cerrno>

#include "reference_host/cliphost/Failure.h"
#include "tests/unit/cliphost/TestFolder.h"

using namespace cliphost;
using namespace cliphost_tests;

TEST(OutputProblem, TellsTheSystemsWordsAndWhatHelps) {
    const TestFolder folder;
    const std::filesystem::path file = folder / "a.aaf";
    EXPECT_EQ(LineOf(NotWritten(file, ENOSPC)),
              file.u8string() +
                  ": not written: No space left on device; make room there or name another place");
    EXPECT_EQ(LineOf(NotWritten(file, EROFS)),
              file.u8string() + ": not written: Read-only file system; name another place");
    EXPECT_EQ(LineOf(NotWritten(file, EIO)), file.u8string() + ": not written: Input/output error");
    EXPECT_EQ(LineOf(FolderNotMade(file, EROFS)),
              file.u8string() +
                  ": the folder can't be made: Read-only file system; name another "
                  "place");
}

TEST(OutputProblem, NamesTheFolderThatIsMissing) {
    const TestFolder folder;
    EXPECT_EQ(NotWritten(folder / "no/a.aaf", ENOENT).hint,
              "make the folder " + (folder / "no").u8string() + " first");
    EXPECT_EQ(NotWritten(folder / "a.aaf", ENOENT).hint, "") << "its folder is there";
    EXPECT_EQ(NotWritten("no/a.aaf", ENOENT).hint,
              "make the folder " + (std::filesystem::current_path() / "no").u8string() + " first");
}

TEST(OutputProblem, FindsTheSystemsErrorInASentenceOfTheLibrary) {
    EXPECT_EQ(SystemErrorIn("/x/a.aaf: cannot be written: No space left on device"), ENOSPC);
    EXPECT_EQ(SystemErrorIn("No space left on device"), ENOSPC);
    EXPECT_EQ(SystemErrorIn("/x/a.aaf: cannot be written: Input/output error"), EIO);
    EXPECT_EQ(SystemErrorIn("No space left on device: so it is"), 0);
    EXPECT_EQ(SystemErrorIn("a name is too long for a stream"), 0);
    EXPECT_EQ(SystemErrorIn(""), 0);
}
