// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/ContactSheet.h"

#include <gtest/gtest.h>

#include <algorithm>

using cliphost::ContactSheet;
using cliphost::Picture;
using cliphost::Shrunk;

namespace {

Picture Plain(int width, int height, std::vector<std::uint16_t> color, int bits = 8) {
    Picture picture{width, height, static_cast<int>(color.size()), bits, {}};
    for (std::size_t i = 0; i < picture.Pixels(); ++i) {
        picture.samples.insert(picture.samples.end(), color.begin(), color.end());
    }
    return picture;
}

std::vector<std::uint16_t> At(const Picture& picture, int x, int y) {
    const auto start = picture.samples.begin() + (y * picture.width + x) * picture.channels;
    return {start, start + picture.channels};
}

}  // namespace

TEST(ContactSheet, ShrinksByTheMeanOfWhatAPixelCovers) {
    Picture picture{4, 2, 1, 8, {0, 100, 200, 200, 100, 200, 200, 201}};
    const Picture small = Shrunk(picture, 2, 1);
    EXPECT_EQ(small.samples, (std::vector<std::uint16_t>{100, 100, 100, 200, 200, 200}));
}

TEST(ContactSheet, TakesTheUpperBitsOfDeepPictures) {
    EXPECT_EQ(At(Shrunk(Plain(4, 4, {0xFF00, 0x8000, 0x0100}, 16), 2, 2), 0, 0),
              (std::vector<std::uint16_t>{255, 128, 1}));
}

TEST(ContactSheet, EnlargesByRepeating) {
    const Picture large = Shrunk(Plain(1, 1, {10, 20, 30}), 3, 2);
    EXPECT_EQ(large.Pixels(), 6u);
    EXPECT_EQ(At(large, 2, 1), (std::vector<std::uint16_t>{10, 20, 30}));
}

TEST(ContactSheet, LetsACheckerboardShowThroughWhatIsTransparent) {
    const Picture opaque = Shrunk(Plain(48, 48, {10, 20, 30, 255}), 48, 48);
    EXPECT_EQ(At(opaque, 0, 0), (std::vector<std::uint16_t>{10, 20, 30}));
    const Picture clear = Shrunk(Plain(48, 48, {10, 20, 30, 0}), 48, 48);
    EXPECT_NE(At(clear, 0, 0), At(clear, 2, 0));
    EXPECT_EQ(At(clear, 0, 0), At(clear, 2, 2));
    EXPECT_EQ(At(clear, 0, 0)[0], At(clear, 0, 0)[2]) << "it is grey";
}

TEST(ContactSheet, PutsPicturesIntoRowsAndLeavesGapsBetween) {
    ContactSheet sheet(3, 2, 10, 6);
    sheet.Add(Plain(20, 12, {255, 0, 0}));
    sheet.Add({});  // a frame that could not be read
    sheet.Add(Plain(20, 12, {0, 0, 255}));
    sheet.Add(Plain(20, 12, {0, 255, 0}));
    sheet.Add(Plain(20, 12, {0, 255, 0}));  // no room; nothing happens
    const Picture& picture = sheet.picture();
    EXPECT_EQ(picture.width, 2 * 18 + 8);
    EXPECT_EQ(picture.height, 2 * 14 + 8);
    EXPECT_EQ(At(picture, 8, 8), (std::vector<std::uint16_t>{255, 0, 0}));
    EXPECT_EQ(At(picture, 17, 13), (std::vector<std::uint16_t>{255, 0, 0}));
    EXPECT_EQ(At(picture, 18, 8), At(picture, 0, 0)) << "the gap";
    EXPECT_EQ(At(picture, 26, 8), At(picture, 0, 0)) << "an empty cell";
    EXPECT_EQ(At(picture, 8, 22), (std::vector<std::uint16_t>{0, 0, 255}));
}
