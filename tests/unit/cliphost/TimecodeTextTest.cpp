// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/TimecodeText.h"

#include <gtest/gtest.h>

using namespace cliphost;

TEST(TimecodeText, CountsFramesOfAnyRate) {
    EXPECT_EQ(TimecodeText(0, 25, false), "00:00:00:00");
    EXPECT_EQ(TimecodeText(25 * 3600 * 10 + 24, 25, false), "10:00:00:24");
    EXPECT_EQ(TimecodeText(3 + 24 * 62, 24, false), "00:01:02:03");
    EXPECT_EQ(TimecodeText(119, 120, false), "00:00:00:119");
}

TEST(TimecodeText, DropsNumbersInEachMinuteButTheTenth) {
    EXPECT_EQ(TimecodeText(1799, 30, true), "00:00:59;29");
    EXPECT_EQ(TimecodeText(1800, 30, true), "00:01:00;02");
    EXPECT_EQ(TimecodeText(17981, 30, true), "00:09:59;29");
    EXPECT_EQ(TimecodeText(17982, 30, true), "00:10:00;00");
    EXPECT_EQ(TimecodeText(107892, 30, true), "01:00:00;00");
    EXPECT_EQ(TimecodeText(3600, 60, true), "00:01:00;04");
    EXPECT_EQ(TimecodeText(25 * 60, 25, true), "00:01:00;00");  // nothing is dropped of 25
}

// Every number comes once, and in order, but for those that are dropped.
TEST(TimecodeText, NamesEachFrameOfAnHourOnce) {
    std::string before;
    for (int frame = 0; frame < 107892; ++frame) {
        const std::string text = TimecodeText(frame, 30, true);
        EXPECT_LT(before, text);
        const bool isDropped = text.compare(6, 2, "00") == 0 && text[4] != '0' &&
                               (text.compare(9, 2, "00") == 0 || text.compare(9, 2, "01") == 0);
        EXPECT_FALSE(isDropped) << text;
        before = text;
    }
}

TEST(TimecodeText, BeginsAgainAfterADay) {
    EXPECT_EQ(TimecodeText(25 * 3600 * 24, 25, false), "00:00:00:00");
    EXPECT_EQ(TimecodeText(-1, 25, false), "23:59:59:24");
    EXPECT_EQ(TimecodeText(-1, 30, true), "23:59:59;29");
}

TEST(TimecodeText, NeedsARate) {
    EXPECT_EQ(TimecodeText(1, 0, false), "");
    EXPECT_EQ(TimecodeText(1, -25, true), "");
    EXPECT_EQ(TimecodeText(1, 65535, true), "");
}
