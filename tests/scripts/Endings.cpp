// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// Tests that end in each way; check_endings.sh runs them.

#include <gtest/gtest.h>

#include <cstdlib>

namespace {

TEST(Skipped, One) {
    GTEST_SKIP() << "needs what is nowhere";
}

TEST(Skipped, DISABLED_Another) {
    FAIL() << "it was run";
}

TEST(Mixed, Skipped) {
    GTEST_SKIP() << "needs what is nowhere";
}

TEST(Mixed, Passed) {}

TEST(Failed, One) {
    FAIL() << "as it has to";
}

TEST(Failed, Skipped) {
    GTEST_SKIP() << "needs what is nowhere";
}

TEST(DISABLED_All, One) {
    FAIL() << "it was run";
}

TEST(Exits, One) {
    std::exit(EXIT_SUCCESS);
}

}  // namespace
