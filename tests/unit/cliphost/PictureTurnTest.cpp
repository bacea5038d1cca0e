// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/PictureTurn.h"

#include <gtest/gtest.h>

#include <string>

using cliphost::Picture;
using cliphost::Turned;
using cliphost::TurnOf;
using host::DisplayMatrix;

namespace {

// Two rows of three, "abc" above "def".
Picture Letters(int channels = 1) {
    Picture picture{3, 2, channels, 8, {}};
    for (const char letter : std::string("abcdef")) {
        picture.samples.insert(picture.samples.end(), static_cast<std::size_t>(channels),
                               static_cast<std::uint16_t>(letter));
    }
    return picture;
}

// Rows with a slash between.
std::string Rows(const Picture& picture) {
    std::string text;
    for (int y = 0; y < picture.height; ++y) {
        text += y == 0 ? "" : "/";
        for (int x = 0; x < picture.width; ++x) {
            text += static_cast<char>(
                picture
                    .samples[static_cast<std::size_t>((y * picture.width + x) * picture.channels)]);
        }
    }
    return text;
}

std::string Shown(const DisplayMatrix& matrix) {
    return Rows(Turned(Letters(), TurnOf(matrix)));
}

}  // namespace

TEST(PictureTurn, FollowsQuarterTurnsAndMirrors) {
    EXPECT_EQ(Shown({1, 0, 0, 1}), "abc/def");
    EXPECT_EQ(Shown({0, 1, -1, 0}), "da/eb/fc") << "a quarter clockwise";
    EXPECT_EQ(Shown({-1, 0, 0, -1}), "fed/cba") << "upside down";
    EXPECT_EQ(Shown({0, -1, 1, 0}), "cf/be/ad") << "a quarter counter-clockwise";
    EXPECT_EQ(Shown({-1, 0, 0, 1}), "cba/fed") << "left becomes right";
    EXPECT_EQ(Shown({1, 0, 0, -1}), "def/abc") << "top becomes bottom";
    EXPECT_EQ(Shown({0, 1, 1, 0}), "ad/be/cf") << "rows become columns";
    EXPECT_EQ(Shown({0, -1, -1, 0}), "fc/eb/da");
}

TEST(PictureTurn, LooksAtNoScale) {
    EXPECT_EQ(Shown({0, 0.25, -40, 0}), "da/eb/fc");
    EXPECT_EQ(Shown({-2, 0, 0, 0.001}), "cba/fed");
}

TEST(PictureTurn, TakesRoundedNumbersForWhatTheyMean) {
    EXPECT_EQ(Shown({0.0001, 0.9999, -0.9999, -0.0001}), "da/eb/fc");
    EXPECT_EQ(Shown({-0.9998, 0.0175, -0.0175, -0.9998}), "fed/cba");
}

TEST(PictureTurn, LeavesOtherAnglesAndShearsAsTheyAreStored) {
    for (const DisplayMatrix& matrix :
         {DisplayMatrix{0.7, 0.7, -0.7, 0.7}, DisplayMatrix{1, 0.5, 0, 1},
          DisplayMatrix{0, 0, 0, 0}, DisplayMatrix{0, 1, 0, 1}, DisplayMatrix{0, 1, -1, 1}}) {
        EXPECT_EQ(Shown(matrix), "abc/def");
    }
}

TEST(PictureTurn, KeepsThePixelsOfEachKindOfPictureWhole) {
    for (const int channels : {1, 3, 4}) {
        const Picture picture = Turned(Letters(channels), TurnOf({0, 1, -1, 0}));
        EXPECT_EQ(picture.channels, channels);
        EXPECT_EQ(picture.samples.size(), 6u * static_cast<std::size_t>(channels));
        EXPECT_EQ(Rows(picture), "da/eb/fc");
    }
    Picture deep = Letters();
    deep.bits = 16;
    EXPECT_EQ(Turned(deep, TurnOf({-1, 0, 0, 1})).bits, 16);
}

TEST(PictureTurn, OfNoPictureIsNone) {
    EXPECT_TRUE(Turned(Picture(), TurnOf({0, 1, -1, 0})).samples.empty());
}
