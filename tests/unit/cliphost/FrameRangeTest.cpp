// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/FrameRange.h"

#include <gtest/gtest.h>

#include "reference_host/cliphost/Failure.h"

using cliphost::FrameRange;
using cliphost::ParseFrameRange;
using cliphost::SpreadFrames;

TEST(FrameRange, ReadsFirstEndAndStep) {
    const FrameRange range = ParseFrameRange("10:30:5");
    EXPECT_EQ(range.first, 10u);
    EXPECT_EQ(range.end, 30u);
    EXPECT_EQ(range.step, 5u);
}

TEST(FrameRange, BeginsAtZeroAndGoesToTheEndWhereNothingIsSaid) {
    const FrameRange range = ParseFrameRange(":");
    EXPECT_EQ(range.first, 0u);
    EXPECT_FALSE(range.end.has_value());
    EXPECT_EQ(range.step, 1u);
    EXPECT_EQ(ParseFrameRange("7:").first, 7u);
    EXPECT_EQ(ParseFrameRange(":7").end, 7u);
}

TEST(FrameRange, HoldsOneFrameWhateverItsNumber) {
    EXPECT_EQ(cliphost::OneFrame(7).CountIn(100), 1u);
    EXPECT_EQ(cliphost::OneFrame(99).CountIn(100), 1u);
    EXPECT_EQ(cliphost::OneFrame(100).CountIn(100), 0u);
    EXPECT_EQ(cliphost::OneFrame(UINT64_MAX).CountIn(100), 0u);
}

TEST(FrameRange, CountsItsFramesInAClip) {
    EXPECT_EQ(ParseFrameRange("0:25").CountIn(100), 25u);
    EXPECT_EQ(ParseFrameRange("0:25").CountIn(10), 10u);
    EXPECT_EQ(ParseFrameRange("0:10:3").CountIn(100), 4u);  // 0 3 6 9
    EXPECT_EQ(ParseFrameRange("1:10:3").CountIn(100), 3u);  // 1 4 7
    EXPECT_EQ(ParseFrameRange("10:").CountIn(10), 0u);
    EXPECT_EQ(ParseFrameRange("9:").CountIn(10), 1u);
}

TEST(FrameRange, RefusesWhatIsNoRangeAndShowsHowToWriteOne) {
    for (const char* const text : {"", "5", "a:b", "5:5", "6:5", "0:5:0", "0:5:1:1", "-1:5", "0:5x",
                                   "0:99999999999999999999", " 0:5", "0:5:"}) {
        try {
            ParseFrameRange(text);
            ADD_FAILURE() << "'" << text << "' was taken";
        } catch (const cliphost::Failure& failure) {
            EXPECT_EQ(failure.status(), cliphost::kExitCaller);
            EXPECT_NE(std::string(failure.what()).find("FIRST:END"), std::string::npos);
        }
    }
}

TEST(FrameRange, SpreadsFramesEvenlyFromTheMiddleOfEachPart) {
    EXPECT_EQ(SpreadFrames(100, 4), (std::vector<std::uint64_t>{12, 37, 62, 87}));
    EXPECT_EQ(SpreadFrames(3, 12), (std::vector<std::uint64_t>{0, 1, 2}));
    EXPECT_EQ(SpreadFrames(1, 1), (std::vector<std::uint64_t>{0}));
    EXPECT_TRUE(SpreadFrames(0, 12).empty());
}
