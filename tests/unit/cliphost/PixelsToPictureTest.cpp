// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/PixelsToPicture.h"

#include <gtest/gtest.h>

using namespace cliphost;

namespace {

using Bytes = std::vector<unsigned char>;
using Samples = std::vector<std::uint16_t>;

ImageFormat Format(ncfUInt32 pixels, ncfUInt32 component, ncfUInt32 range,
                   ncfUInt32 colorSpace = 2) {
    ImageFormat one;
    one.pixels = pixels;
    one.component = component;
    one.range = range;
    one.colorSpace = colorSpace;
    return one;
}

Picture Make(const ImageFormat& format, int width, int height, const Bytes& bytes) {
    return PixelsToPicture(format, width, height, bytes.data(), bytes.size());
}

ImageFormat Uyvy(ncfUInt32 colorSpace) {
    return Format(format::kCbYCrY, format::kBytes, format::kVideoRange, colorSpace);
}
const ImageFormat kBgraFull = Format(format::kBGRA, format::kBytes, format::kFullRange);
const ImageFormat kBgraVideo = Format(format::kBGRA, format::kBytes, format::kVideoRange);
const ImageFormat kB64a = Format(format::kARGB, format::kWordsVideoRange, format::kVideoRange);
const ImageFormat kAlpha8 = Format(format::kMono, format::kBytes, 0x7FFFFFFF);
const ImageFormat kAlpha10 = Format(format::kMono, format::kTenBits, 0x7FFFFFFF);

}  // namespace

TEST(PixelsToPicture, StretchesVideoRangeLumaToBlackAndWhite) {
    const Picture picture =
        Make(Uyvy(format::kRec709), 4, 1, {128, 16, 128, 235, 128, 0, 128, 255});
    EXPECT_EQ(picture.bits, 8);
    EXPECT_EQ(picture.channels, 3);
    EXPECT_EQ(picture.samples, (Samples{0, 0, 0, 255, 255, 255, 0, 0, 0, 255, 255, 255}));
}

// Saturated red of 100 percent in each matrix: 81 90 240 and 63 102 240.
TEST(PixelsToPicture, TakesTheMatrixThatTheFormatDeclares) {
    const Picture sd = Make(Uyvy(format::kRec601), 2, 1, {90, 81, 240, 81});
    EXPECT_EQ(sd.samples, (Samples{254, 0, 0, 254, 0, 0}));
    const Picture hd = Make(Uyvy(format::kRec709), 2, 1, {102, 63, 240, 63});
    EXPECT_EQ(hd.samples, (Samples{255, 1, 0, 255, 1, 0}));
    EXPECT_NE(Make(Uyvy(format::kRec601), 2, 1, {102, 63, 240, 63}).samples, hd.samples);
}

TEST(PixelsToPicture, GivesAPixelBetweenTwoChromaSamplesTheirMean) {
    // Grey at the first pair, red at the second: pixel 1 lies between.
    const Picture picture = Make(Uyvy(format::kRec601), 4, 1, {128, 81, 128, 81, 90, 81, 240, 81});
    const Picture middle = Make(Uyvy(format::kRec601), 2, 1, {109, 81, 184, 81});
    EXPECT_EQ(picture.samples[0], picture.samples[1]);
    for (int c = 0; c < 3; ++c) {
        EXPECT_EQ(picture.samples[static_cast<std::size_t>(3 + c)],
                  middle.samples[static_cast<std::size_t>(c)]);
        // The last pixel has no pair behind it.
        EXPECT_EQ(picture.samples[static_cast<std::size_t>(9 + c)],
                  picture.samples[static_cast<std::size_t>(6 + c)]);
    }
}

TEST(PixelsToPicture, ReadsNothingBehindAnOddLastPixel) {
    // Three pixels are six bytes: the last comes with Cb and Y alone. The bytes
    // are exactly as many, so that a reader past them is noticed.
    const Bytes bytes = {90, 81, 240, 81, 90, 81};
    const Picture picture = Make(Uyvy(format::kRec601), 3, 1, bytes);
    EXPECT_EQ(picture.samples, (Samples{254, 0, 0, 254, 0, 0, 254, 0, 0}));
    const Picture single = Make(Uyvy(format::kRec601), 1, 1, {128, 235});
    EXPECT_EQ(single.samples, (Samples{255, 255, 255}));
}

TEST(PixelsToPicture, ExpandsRgbByItsDeclaredRange) {
    const Bytes bytes = {16, 128, 235, 255};
    EXPECT_EQ(Make(kBgraFull, 1, 1, bytes).samples, (Samples{235, 128, 16}));
    EXPECT_EQ(Make(kBgraVideo, 1, 1, bytes).samples, (Samples{255, 130, 0}));
}

TEST(PixelsToPicture, KeepsSixteenBitsOfBigEndianWords) {
    // A, then R at white, G at black, B below black.
    const Picture picture = Make(kB64a, 1, 1, {0xFF, 0xFF, 0xEB, 0x00, 0x10, 0x00, 0x00, 0x01});
    EXPECT_EQ(picture.bits, 16);
    EXPECT_EQ(picture.samples, (Samples{65535, 0, 0}));
    // One step of the source is a step here.
    const Picture step = Make(kB64a, 1, 1, {0, 0, 0x80, 0x00, 0x80, 0x01, 0x80, 0x02});
    EXPECT_EQ(step.samples, (Samples{33516, 33517, 33518}));
    const ImageFormat full = Format(format::kARGB, format::kWordsFullRange, format::kFullRange);
    EXPECT_EQ(Make(full, 1, 1, {0, 0, 0x12, 0x34, 0, 0, 0xFF, 0xFF}).samples,
              (Samples{0x1234, 0, 0xFFFF}));
}

TEST(PixelsToPicture, MakesGreyOfAlphaInEightAndTenBits) {
    const Picture eight = Make(kAlpha8, 2, 1, {0, 200});
    EXPECT_EQ(eight.channels, 1);
    EXPECT_EQ(eight.samples, (Samples{0, 200}));
    // Upper bits of all pixels first, then the lower two: 1023, 0, 512, 1.
    const Picture ten = Make(kAlpha10, 2, 2, {255, 0, 128, 0, 3, 0, 0, 1});
    EXPECT_EQ(ten.bits, 16);
    EXPECT_EQ(ten.samples, (Samples{65535, 0, 32800, 64}));
}

TEST(PixelsToPicture, RefusesTooFewBytesAndUnknownLayouts) {
    EXPECT_TRUE(Make(kBgraFull, 2, 1, Bytes(7)).samples.empty());
    EXPECT_TRUE(Make(kAlpha10, 2, 2, Bytes(7)).samples.empty());
    EXPECT_TRUE(Make(kBgraFull, 0, 1, Bytes(8)).samples.empty());
    EXPECT_TRUE(Make(kBgraFull, -1, 1, Bytes(8)).samples.empty());
    EXPECT_TRUE(Make(Format(64, 16, 1), 1, 1, Bytes(64)).samples.empty());
    EXPECT_TRUE(Make(Format(format::kCbYCrY, format::kV210, 1), 1, 1, Bytes(64)).samples.empty());
    // A size whose product is no size.
    EXPECT_TRUE(Make(kB64a, 0x7FFFFFFF, 0x7FFFFFFF, Bytes(64)).samples.empty());
}

TEST(PixelsToPicture, PutsAlphaBehindColourAtTheColoursDepth) {
    const Picture rgb8{1, 1, 3, 8, {1, 2, 3}};
    const Picture rgb16{1, 1, 3, 16, {1, 2, 3}};
    const Picture alpha8{1, 1, 1, 8, {128}};
    const Picture alpha16{1, 1, 1, 16, {65535}};
    EXPECT_EQ(WithAlpha(rgb8, alpha8).samples, (Samples{1, 2, 3, 128}));
    EXPECT_EQ(WithAlpha(rgb16, alpha8).samples, (Samples{1, 2, 3, 128 * 257}));
    EXPECT_EQ(WithAlpha(rgb8, alpha16).samples, (Samples{1, 2, 3, 255}));
    EXPECT_EQ(WithAlpha(rgb8, alpha16).channels, 4);
    // An alpha of another size is none.
    EXPECT_EQ(WithAlpha(rgb8, Picture{2, 1, 1, 8, {1, 2}}).channels, 3);
}
