// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include <gtest/gtest.h>

#include "host_interfaces/util/NMAUtil.h"

namespace {

ncfUInt32 Frames(ncfUInt32 h, ncfUInt32 m, ncfUInt32 s, ncfUInt32 f, ncfUInt32 fps, bool drop) {
    ncfUInt32 frames = 0xFFFFFFFF;
    EXPECT_EQ(NCF_OK, ConvertTCToFrames(h, m, s, f, fps, drop, &frames));
    return frames;
}

}  // namespace

TEST(Timecode, CountsEveryFrameWithoutDropping) {
    EXPECT_EQ(0u, Frames(0, 0, 0, 0, 25, false));
    EXPECT_EQ(90000u, Frames(1, 0, 0, 0, 25, false));
    EXPECT_EQ(107999u, Frames(0, 59, 59, 29, 30, false));
}

TEST(Timecode, DropsTwoNumbersAMinuteButEveryTenthAtThirty) {
    EXPECT_EQ(1799u, Frames(0, 0, 59, 29, 30, true));
    EXPECT_EQ(1800u, Frames(0, 1, 0, 2, 30, true));
    EXPECT_EQ(17982u, Frames(0, 10, 0, 0, 30, true));
    EXPECT_EQ(107892u, Frames(1, 0, 0, 0, 30, true));
    EXPECT_EQ(2589407u, Frames(23, 59, 59, 29, 30, true));
}

TEST(Timecode, DropsInProportionAtSixtyAndAHundredAndTwenty) {
    EXPECT_EQ(2 * 107892u, Frames(1, 0, 0, 0, 60, true));
    EXPECT_EQ(4 * 107892u, Frames(1, 0, 0, 0, 120, true));
}

TEST(Timecode, IgnoresDroppingAtEveryOtherRate) {
    for (const ncfUInt32 fps : {1u, 24u, 25u, 29u, 31u, 48u, 50u, 59u, 90u, 240u}) {
        EXPECT_EQ(3600 * fps, Frames(1, 0, 0, 0, fps, true)) << fps;
        EXPECT_EQ(86400 * fps, GetMaxDuration(fps, true)) << fps;
    }
}

TEST(Timecode, RefusesARateOfZeroAndANullOutput) {
    ncfUInt32 frames = 77;
    EXPECT_EQ(NCF_E_INVALIDARG, ConvertTCToFrames(1, 0, 0, 0, 0, false, &frames));
    EXPECT_EQ(77u, frames);
    EXPECT_EQ(NCF_E_INVALIDARG, ConvertTCToFrames(1, 0, 0, 0, 25, false, nullptr));
}

TEST(Timecode, LongestDurationIsADay) {
    EXPECT_EQ(2160000u, GetMaxDuration(25, false));
    EXPECT_EQ(2592000u, GetMaxDuration(30, false));
    EXPECT_EQ(2589408u, GetMaxDuration(30, true));
    EXPECT_EQ(5178816u, GetMaxDuration(60, true));
    EXPECT_EQ(0u, GetMaxDuration(0, false));
}
