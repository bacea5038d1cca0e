// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// Output to what is no file: a disk that is always full, and a pipe.

#include "reference_host/cliphost/OutputFile.h"

#include <fcntl.h>
#include <gtest/gtest.h>
#include <unistd.h>
#include <csignal>

#include "reference_host/cliphost/Failure.h"
#include "tests/support/TestFiles.h"
#include "tests/unit/cliphost/TestFolder.h"

using cliphost::Failure;
using cliphost::OutputFile;
using namespace cliphost_tests;

TEST(OutputDevice, TellsOfAFullDisk) {
    if (access("/dev/full", W_OK) != 0) {
        GTEST_SKIP() << "there is no /dev/full";
    }
    OutputFile file("/dev/full");
    try {
        file.Write("x", 1);
        ADD_FAILURE() << "it was written";
    } catch (const Failure& failure) {
        EXPECT_NE(std::string(failure.what()).find("No space"), std::string::npos);
    }
}

TEST(OutputDevice, TellsThatTheReaderOfAPipeHasGone) {
    const TestFolder folder;
    const auto pipe = folder / "pipe";
    ASSERT_TRUE(MakePipe(pipe));
    const int reader = open(pipe.c_str(), O_RDONLY | O_NONBLOCK | O_CLOEXEC);
    ASSERT_GE(reader, 0);
    std::signal(SIGPIPE, SIG_IGN);  // as the program does
    OutputFile file(pipe);
    file.Write("x", 1);
    close(reader);
    EXPECT_THROW(file.Write("x", 1), cliphost::ReaderGone);
    EXPECT_TRUE(std::filesystem::is_fifo(pipe)) << "a pipe is written as it is";
}
