// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/ImageFormats.h"

#include <gtest/gtest.h>

using namespace cliphost;

namespace {

ImageFormat Format(ncfUInt32 index, ncfUInt32 pixels, ncfUInt32 component, ncfUInt32 range,
                   ncfUInt32 colorSpace = 2) {
    ImageFormat one;
    one.index = index;
    one.pixels = pixels;
    one.component = component;
    one.range = range;
    one.colorSpace = colorSpace;
    one.fieldOrder = format::kProgressive;
    one.frameLayout = format::kMerged;
    return one;
}

const ImageFormat k2vuy =
    Format(0, format::kCbYCrY, format::kBytes, format::kVideoRange, format::kRec709);
const ImageFormat kV210 = Format(1, format::kCbYCrY, format::kV210, format::kVideoRange);
const ImageFormat kB64a = Format(2, format::kARGB, format::kWordsVideoRange, format::kVideoRange);
const ImageFormat kBgra = Format(3, format::kBGRA, format::kBytes, format::kFullRange);
const ImageFormat kBgraVideo = Format(4, format::kBGRA, format::kBytes, format::kVideoRange);
const ImageFormat kAlpha8 = Format(5, format::kMono, format::kBytes, 0x7FFFFFFF);
const ImageFormat kAlpha10 = Format(6, format::kMono, format::kTenBits, 0x7FFFFFFF);
const ImageFormat kUnknown = Format(7, 64, 16, format::kFullRange);

}  // namespace

TEST(ImageFormats, HaveNamesForTheCommandLine) {
    EXPECT_EQ(NameOf(k2vuy), "2vuy");
    EXPECT_EQ(NameOf(kV210), "v210");
    EXPECT_EQ(NameOf(kB64a), "b64a");
    EXPECT_EQ(NameOf(kBgra), "bgra");
    EXPECT_EQ(NameOf(kBgraVideo), "bgra-video");
    EXPECT_EQ(NameOf(kAlpha8), "a8");
    EXPECT_EQ(NameOf(kAlpha10), "a10");
    EXPECT_EQ(NameOf(kUnknown), "64/16");
}

TEST(ImageFormats, SayInWordsWhatTheirNumbersMean) {
    EXPECT_EQ(WordsFor(k2vuy),
              "8-bit Y'CbCr 4:2:2, bytes Cb Y Cr Y, Rec. 709, video range, progressive");
    ImageFormat fields = kBgra;
    fields.fieldOrder = format::kBottomFirst;
    fields.frameLayout = format::kSplit;
    EXPECT_EQ(WordsFor(fields),
              "8-bit R'G'B' 4:4:4:4, bytes B G R A, full range, interlaced, bottom field first, "
              "each field by itself");
    fields.fieldOrder = format::kProgressive;
    EXPECT_EQ(WordsFor(fields),
              "8-bit R'G'B' 4:4:4:4, bytes B G R A, full range, progressive, each field by itself")
        << "a layout can be chosen without an order";
    EXPECT_NE(WordsFor(kUnknown).find("not known"), std::string::npos);
}

TEST(ImageFormats, MakeNoPictureOfALayoutWhoseBytesAreNotWhatItsLabelSays) {
    EXPECT_FALSE(IsUsable(kV210));
    EXPECT_FALSE(IsUsable(kUnknown));
    EXPECT_TRUE(IsUsable(kB64a));
    EXPECT_EQ(ChooseFormat({kV210}, ""), nullptr);
    EXPECT_EQ(ChooseFormat({kV210}, "v210"), nullptr);
    EXPECT_EQ(ChooseFormat({kV210, kBgra}, "deepest")->index, kBgra.index);
}

TEST(ImageFormats, AreChosenByNameNumberDepthOrOrder) {
    const std::vector<ImageFormat> offered = {k2vuy, kV210, kB64a, kBgra};
    EXPECT_EQ(ChooseFormat(offered, "")->index, 0u);
    EXPECT_EQ(ChooseFormat(offered, "deepest")->index, 2u);
    EXPECT_EQ(ChooseFormat(offered, "bgra")->index, 3u);
    EXPECT_EQ(ChooseFormat(offered, "2")->index, 2u);
    EXPECT_EQ(ChooseFormat(offered, "a8"), nullptr);
    EXPECT_EQ(ChooseFormat(offered, "9"), nullptr);
    EXPECT_EQ(ChooseFormat({}, ""), nullptr);
}

TEST(ImageFormats, KnowWhatFfmpegCallsThemWhereItHasAName) {
    EXPECT_STREQ(LayoutOf(k2vuy)->rawName, "uyvy422");
    EXPECT_STREQ(LayoutOf(kBgraVideo)->rawName, "bgra");
    EXPECT_STREQ(LayoutOf(kAlpha8)->rawName, "gray");
    EXPECT_EQ(LayoutOf(kB64a)->rawName, nullptr);
    EXPECT_EQ(LayoutOf(kAlpha10)->rawName, nullptr);
}
