// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/TimecodeText.h"

#include <gtest/gtest.h>

using namespace cliphost;

namespace {

std::int64_t Frames(const char* text, unsigned fps) {
    const auto time = ReadTimecode(text);
    return time ? FramesOf(*time, fps).value_or(-1) : -2;
}

}  // namespace

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
    EXPECT_EQ(TimecodeText(25 * 60, 25, true), "00:01:00:00");  // nothing is dropped of 25
    EXPECT_EQ(TimecodeText(50 * 60, 50, true), "00:01:00:00");
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

TEST(TimecodeText, IsReadInItsForm) {
    EXPECT_EQ(Frames("01:00:00:00", 25), 90000);
    EXPECT_EQ(Frames("23:59:59:24", 25), 86400 * 25 - 1);
    EXPECT_EQ(Frames("01:00:00;00", 30), 107892);
    EXPECT_EQ(Frames("01:00:00.02", 30), 107894);
    EXPECT_EQ(Frames("00:00:01:100", 120), 220);
    for (const char* const wrong :
         {"", "1:00:00:00", "01:00:00", "24:00:00:00", "00:60:00:00", "00:00:60:00", "00:00:00:0a",
          "00-00:00:00", "00:00;00:00", "+1:00:00:00", "01:00:00:0000", "01:00:00:00 "}) {
        EXPECT_EQ(Frames(wrong, 25), -2) << wrong;
    }
}

TEST(TimecodeText, IsCountedAtTheRate) {
    EXPECT_EQ(Frames("00:00:00:25", 25), -1);
    EXPECT_EQ(Frames("00:00:00;10", 25), -1);  // nothing drops at 25
    EXPECT_EQ(Frames("00:01:00;00", 30), -1);  // left out
    EXPECT_EQ(Frames("00:01:00;01", 30), -1);
    EXPECT_EQ(Frames("00:01:00;02", 30), 1800);
    EXPECT_EQ(Frames("00:10:00;00", 30), 17982);
    EXPECT_EQ(Frames("00:01:00;03", 60), -1);
    EXPECT_EQ(Frames("00:01:00;04", 60), 3600);
    EXPECT_EQ(Frames("00:00:00:00", 0), -1);
}

TEST(TimecodeText, GoesBothWays) {
    for (const unsigned fps : {24u, 25u, 30u, 60u, 120u}) {
        for (const bool drops : {false, fps % 30 == 0}) {
            for (std::int64_t frames = 0; frames < 86000 * fps; frames += 997) {
                const std::string text = TimecodeText(frames, fps, drops);
                ASSERT_EQ(Frames(text.c_str(), fps), frames) << text << " at " << fps;
            }
        }
    }
}
