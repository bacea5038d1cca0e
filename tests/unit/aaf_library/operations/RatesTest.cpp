// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/objects/Rates.h"

#include <gtest/gtest.h>

#include <limits>

#include "host_interfaces/aaf/AAFEnumerations.h"

namespace aaf {

namespace {

constexpr aafPosition_t kLowest = std::numeric_limits<aafPosition_t>::min();
constexpr aafPosition_t kHighest = std::numeric_limits<aafPosition_t>::max();

TEST(Rates, SumsStayInRange) {
    EXPECT_EQ(5, Plus(2, 3));
    EXPECT_EQ(kHighest, Plus(kHighest, 1));
    EXPECT_EQ(kLowest, Plus(kLowest, -1));
    EXPECT_EQ(-1, Minus(2, 3));
    EXPECT_EQ(kHighest, Minus(0, kLowest));
    EXPECT_EQ(kLowest, Minus(-2, kHighest));
    EXPECT_EQ(kHighest, Minus(kHighest, -1));
}

TEST(Rates, PositionsAreRoundedDown) {
    EXPECT_EQ(230, Rescaled(115, {25, 1}, {50, 1}));
    EXPECT_EQ(57, Rescaled(115, {50, 1}, {25, 1}));
    EXPECT_EQ(-58, Rescaled(-115, {50, 1}, {25, 1}));
    EXPECT_EQ(1000, Rescaled(1001, {30, 1}, {30000, 1001}));
    EXPECT_EQ(7, Rescaled(7, {0, 0}, {25, 1}));
    EXPECT_EQ(7, Rescaled(7, {25, 1}, {25, -1}));
    EXPECT_EQ(kHighest, Rescaled(kHighest, {1, 1}, {2147483647, 1}));
    EXPECT_EQ(kLowest, Rescaled(kLowest, {1, 2147483647}, {2147483647, 1}));
}

TEST(Rates, TimecodeCountsTheNextWholeNumber) {
    EXPECT_EQ(30, NominalFrames({30000, 1001}));
    EXPECT_EQ(24, NominalFrames({24000, 1001}));
    EXPECT_EQ(25, NominalFrames({25, 1}));
    EXPECT_EQ(0, NominalFrames({25, 0}));
    EXPECT_EQ(0, NominalFrames({-25, 1}));
}

TEST(Rates, PulldownsMakeFramesOfTheirInput) {
    EXPECT_EQ(8, PulldownRatioOf(kAAFTwoThreePD, kAAFTapeToFilmSpeed).ToOwn(10));
    EXPECT_EQ(10, PulldownRatioOf(kAAFTwoThreePD, kAAFFilmToTapeSpeed).ToOwn(8));
    EXPECT_EQ(10, PulldownRatioOf(kAAFTwoThreePD, kAAFTapeToFilmSpeed).ToInput(8));
    EXPECT_EQ(25, PulldownRatioOf(kAAFPALPD, kAAFFilmToTapeSpeed).ToOwn(24));
    EXPECT_EQ(5, PulldownRatioOf(kAAFTwentyFourToSixtyPD, kAAFFilmToTapeSpeed).ToOwn(2));
    EXPECT_EQ(2, PulldownRatioOf(kAAFTwoToOnePD, kAAFFilmToTapeSpeed).ToOwn(1));
    for (const aafPulldownKind_t kind :
         {kAAFOneToOneNTSC, kAAFOneToOnePAL, kAAFVideoTapNTSC, kAAFOneToOneHDSixty}) {
        EXPECT_EQ(9, PulldownRatioOf(kind, kAAFTapeToFilmSpeed).ToOwn(9));
    }
}

}  // namespace

}  // namespace aaf
