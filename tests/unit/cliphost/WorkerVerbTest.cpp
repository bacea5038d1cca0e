// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/WorkerVerb.h"

#include <gtest/gtest.h>

#include "reference_host/cliphost/OutputFile.h"
#include "reference_host/quicktime/MovieComponents.h"

namespace cliphost {
namespace {

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
