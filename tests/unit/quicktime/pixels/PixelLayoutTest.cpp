// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include <gtest/gtest.h>

#include "reference_host/quicktime/pixels/PixelLayout.h"

using host::LineBytes;
using host::PictureBytes;
using host::PixelLayout;

namespace {

TEST(PixelLayout, PadsLinesOfTenBitsToFortyEightPixels) {
    EXPECT_EQ(LineBytes(PixelLayout::Yuv10, 1), 128u);
    EXPECT_EQ(LineBytes(PixelLayout::Yuv10, 48), 128u);
    EXPECT_EQ(LineBytes(PixelLayout::Yuv10, 49), 256u);
    EXPECT_EQ(LineBytes(PixelLayout::Yuv10, 1920), 5120u);
    EXPECT_EQ(LineBytes(PixelLayout::Uyvy8, 33), 66u);
}

TEST(PixelLayout, GivesNoSizeAboveTwoToTheThirtyFirst) {
    EXPECT_EQ(PictureBytes(PixelLayout::Argb16, 16384, 16384), 1u << 31);
    EXPECT_EQ(PictureBytes(PixelLayout::Argb16, 16384, 16385), 0u);
    EXPECT_EQ(PictureBytes(PixelLayout::AyuvFloat, 0xFFFFFFFF, 0xFFFFFFFF), 0u);
    EXPECT_EQ(PictureBytes(PixelLayout::Bgra8, 0, 10), 0u);
    EXPECT_EQ(PictureBytes(PixelLayout::Bgra8, 10, 0), 0u);
}

TEST(PixelLayout, KnowsSixCodes) {
    for (const char* code : {"2vuy", "v210", "BGRA", "NVZ2", "b64a", "r4fl"}) {
        ncfUInt32 number = 0;
        for (int i = 0; i < 4; ++i) {
            number = number << 8 | static_cast<unsigned char>(code[i]);
        }
        EXPECT_TRUE(host::IsKnownLayout(number)) << code;
    }
    EXPECT_FALSE(host::IsKnownLayout(0));
    EXPECT_FALSE(host::IsKnownLayout(32));
}

}  // namespace
