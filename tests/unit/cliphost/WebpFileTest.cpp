// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/WebpFile.h"

#include <gtest/gtest.h>
#include <webp/decode.h>

#include <cstdlib>

#include "tests/unit/cliphost/NoisyPicture.h"

using cliphost::Picture;
using cliphost::ToWebp;

namespace {

constexpr std::size_t kPlenty = 1'000'000;

// Left half of one colour, right half of another.
Picture TwoColors(int width, int height) {
    Picture picture{width, height, 3, 8, {}};
    for (int i = 0; i < width * height; ++i) {
        const bool isLeft = i % width < width / 2;
        picture.samples.insert(picture.samples.end(),
                               {static_cast<std::uint16_t>(isLeft ? 200 : 20), 100,
                                static_cast<std::uint16_t>(isLeft ? 40 : 220)});
    }
    return picture;
}

TEST(WebpFiles, ShowThePicture) {
    const auto webp = ToWebp(TwoColors(64, 32), kPlenty);
    int width = 0, height = 0;
    std::uint8_t* const rgb = WebPDecodeRGB(webp.data(), webp.size(), &width, &height);
    ASSERT_NE(rgb, nullptr);
    EXPECT_EQ(width, 64);
    EXPECT_EQ(height, 32);
    const int left[] = {200, 100, 40};
    const int right[] = {20, 100, 220};
    for (int c = 0; c < 3; ++c) {
        EXPECT_NEAR(rgb[(16 * 64 + 8) * 3 + c], left[c], 8);
        EXPECT_NEAR(rgb[(16 * 64 + 56) * 3 + c], right[c], 8);
    }
    WebPFree(rgb);
}

TEST(WebpFiles, KeepToTheBytesThatTheyMayHave) {
    const Picture noise = NoisyPicture(200, 112);
    const std::size_t full = ToWebp(noise, kPlenty).size();
    const std::size_t small = ToWebp(noise, full / 2).size();
    EXPECT_GT(small, 0u);
    EXPECT_LE(small, full / 2);
}

TEST(WebpFiles, AreEmptyOfWhatIsNoSuchPicture) {
    EXPECT_TRUE(ToWebp({}, kPlenty).empty());
    EXPECT_TRUE(ToWebp({0, 4, 3, 8, {}}, kPlenty).empty());
    EXPECT_TRUE(ToWebp({2, 2, 3, 8, {1, 2, 3}}, kPlenty).empty());
    EXPECT_TRUE(ToWebp({1, 1, 4, 8, {1, 2, 3, 4}}, kPlenty).empty());
    EXPECT_TRUE(ToWebp({1, 1, 3, 16, {1, 2, 3}}, kPlenty).empty());
    EXPECT_TRUE(ToWebp({20000, 1, 3, 8, std::vector<std::uint16_t>(60000)}, kPlenty).empty());
}

}  // namespace
