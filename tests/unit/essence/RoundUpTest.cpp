// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/essence/RoundUp.h"

#include <gtest/gtest.h>

TEST(RoundUp, GivesTheNextMultiple) {
    EXPECT_EQ(RoundUp(1, 48), 48u);
    EXPECT_EQ(RoundUp(48, 48), 48u);
    EXPECT_EQ(RoundUp(49, 48), 96u);
    EXPECT_EQ(RoundUp(1000, 48), 1008u);
    EXPECT_EQ(RoundUp(1920, 48), 1920u);
}

TEST(RoundUp, LeavesTheValueForMultipleZero) {
    EXPECT_EQ(RoundUp(7, 0), 7u);
    EXPECT_EQ(RoundUp(0, 0), 0u);
}

TEST(RoundUp, TakesZeroBelowTheRange) {
    EXPECT_EQ(RoundUp(0, 48), 4294967232u);
    EXPECT_EQ(RoundUp(0, 1), 0u);
}
