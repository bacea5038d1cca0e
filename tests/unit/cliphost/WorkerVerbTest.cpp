// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/WorkerVerb.h"

#include <gtest/gtest.h>

#include "reference_host/cliphost/OutputFile.h"
#include "reference_host/quicktime/MovieComponents.h"
#include "tests/unit/cliphost/TestFolder.h"

namespace cliphost {
namespace {

using cliphost_tests::WriteFile;

template <class Error>
MovieAnswer AnswerTo(const Error& error) {
    return AnswerSafely("a.mov", [&]() -> MovieAnswer { throw error; });
}

TEST(AnswerSafely, TellsAnErrorThatNobodyExpectedOfItsMovie) {
    const MovieAnswer answer = AnswerTo(std::runtime_error("odd"));
    EXPECT_EQ(answer.status, kExitFile);
    EXPECT_EQ(answer.problem.subject, "a.mov");
    EXPECT_EQ(answer.problem.reason, "odd");
}

TEST(AnswerSafely, KeepsWhatAFailureTells) {
    const MovieAnswer answer = AnswerTo(Failure(kExitCaller, "b.aaf", "full", "make room"));
    EXPECT_EQ(answer.status, kExitCaller);
    EXPECT_EQ(answer.problem.subject, "b.aaf");
    EXPECT_EQ(answer.problem.reason, "full");
    EXPECT_EQ(answer.problem.hint, "make room");
}

// The folder of an output that went away, or a movie in a folder that is closed.
TEST(AnswerSafely, TellsWhichFileTheSystemRefused) {
    const auto gone = std::make_error_code(std::errc::no_such_file_or_directory);
    const MovieAnswer output =
        AnswerTo(std::filesystem::filesystem_error("rename", "/gone/b.aaf", gone));
    EXPECT_EQ(output.status, kExitCaller);
    EXPECT_EQ(output.problem.subject, "/gone/b.aaf");
    EXPECT_EQ(output.problem.reason, gone.message());
    const TestFolder folder;
    WriteFile(folder / "a.mov", "a");
    const auto broken = std::make_error_code(std::errc::io_error);
    const MovieAnswer movie = AnswerSafely(folder / "a.mov", [&]() -> MovieAnswer {
        throw std::filesystem::filesystem_error("read", broken);
    });
    EXPECT_EQ(movie.status, kExitFile);
    EXPECT_EQ(movie.problem.subject, folder / "a.mov");
    EXPECT_EQ(movie.problem.reason, broken.message());
}

TEST(AnswerSafely, TellsAProgramThatLacksALibrary) {
    const MovieAnswer answer = AnswerTo(host::MovieLibraryMissing("no library"));
    EXPECT_EQ(answer.status, kExitCaller);
    EXPECT_EQ(answer.problem.reason, "no library");
}

TEST(AnswerOfMovie, IsNoneWhereTheProgramLacksALibrary) {
    EXPECT_THROW(
        AnswerOfMovie("a.mov", []() -> MovieAnswer { throw host::MovieLibraryMissing("none"); }),
        host::MovieLibraryMissing);
}

TEST(AnswerSafely, LeavesAReaderThatHasGoneToTheRun) {
    EXPECT_THROW(AnswerTo(ReaderGone()), ReaderGone);
}

}  // namespace
}  // namespace cliphost
