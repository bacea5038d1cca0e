// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/header_parser/ImageAspect.h"

#include <gtest/gtest.h>

#include "tests/unit/header_parser/ParsedMovie.h"

namespace {

using header_parser::CleanAperture;
using header_parser::ImageAspect;
using header_parser::Ratio;

std::string Text(const Ratio& ratio) {
    return std::to_string(ratio.numerator) + "/" + std::to_string(ratio.denominator);
}

TEST(ImageAspect, IsTheSizeReducedWhenNothingElseIsKnown) {
    EXPECT_EQ(Text(ImageAspect(1920, 1080, {}, {})), "16/9");
    EXPECT_EQ(Text(ImageAspect(848, 480, {}, {})), "53/30");
    EXPECT_EQ(Text(ImageAspect(1, 1, {}, {})), "1/1");
    EXPECT_EQ(Text(ImageAspect(65535, 65534, {}, {})), "65535/65534");
}

TEST(ImageAspect, MultipliesByThePixelsRatio) {
    EXPECT_EQ(Text(ImageAspect(1440, 1080, {}, Ratio{4, 3})), "16/9");
    EXPECT_EQ(Text(ImageAspect(640, 480, {}, Ratio{16, 9})), "64/27");
    EXPECT_EQ(Text(ImageAspect(800, 640, {}, Ratio{64, 45})), "16/9");
}

TEST(ImageAspect, TakesTheCleanApertureWhereThereIsOne) {
    const CleanAperture clean{{1888, 1}, {1062, 1}};
    EXPECT_EQ(Text(ImageAspect(1920, 1080, clean, {})), "16/9");
    const CleanAperture square{{1000, 1}, {1000, 1}};
    EXPECT_EQ(Text(ImageAspect(1920, 1080, square, {})), "1/1");
    const CleanAperture fraction{{41472, 59}, {576, 1}};
    EXPECT_EQ(Text(ImageAspect(1920, 1080, fraction, {})), "72/59");
}

TEST(ImageAspect, SnapsStandardDefinitionToFourThirdsAndSixteenNinths) {
    EXPECT_EQ(Text(ImageAspect(720, 480, {}, Ratio{10, 11})), "4/3");    // 1.364
    EXPECT_EQ(Text(ImageAspect(720, 480, {}, Ratio{8, 9})), "4/3");      // exact
    EXPECT_EQ(Text(ImageAspect(720, 576, {}, Ratio{59, 54})), "4/3");    // 1.366
    EXPECT_EQ(Text(ImageAspect(720, 486, {}, Ratio{10, 11})), "4/3");    // 1.347
    EXPECT_EQ(Text(ImageAspect(720, 480, {}, Ratio{40, 33})), "16/9");   // 1.818
    EXPECT_EQ(Text(ImageAspect(720, 576, {}, Ratio{118, 81})), "16/9");  // 1.821
    EXPECT_EQ(Text(ImageAspect(704, 608, {}, Ratio{16, 14})), "4/3");    // 1.323
}

TEST(ImageAspect, SnapsWithinTwoAndAHalfPerCentOnly) {
    EXPECT_EQ(Text(ImageAspect(720, 480, {}, Ratio{9111, 10000})), "4/3");        // + 2.4988 %
    EXPECT_EQ(Text(ImageAspect(720, 480, {}, Ratio{9112, 10000})), "3417/2500");  // + 2.51 %
    EXPECT_EQ(Text(ImageAspect(720, 480, {}, {})), "3/2");
    EXPECT_EQ(Text(ImageAspect(704, 576, {}, {})), "11/9");
}

TEST(ImageAspect, SnapsNoOtherRaster) {
    EXPECT_EQ(Text(ImageAspect(721, 480, {}, Ratio{10, 11})), "721/528");
    EXPECT_EQ(Text(ImageAspect(720, 479, {}, Ratio{10, 11})), "7200/5269");
    EXPECT_EQ(Text(ImageAspect(720, 609, {}, Ratio{15, 13})), "3600/2639");
    EXPECT_EQ(Text(ImageAspect(1440, 1080, {}, Ratio{135, 100})), "9/5");
}

TEST(ImageAspect, LeavesOutWhatDoesNotFit32Bits) {
    const CleanAperture wild{{2147483647, 2147483629}, {2147483587, 2147483563}};
    EXPECT_EQ(Text(ImageAspect(16, 9, wild, {})), "16/9");
    EXPECT_EQ(Text(ImageAspect(16, 9, {}, Ratio{4294967291u, 4294967279u})), "16/9");
}

TEST(ImageAspect, OfADescriptionIgnoresImpossibleAtoms) {
    const auto aspect = [](const movies::VideoFormat& format) {
        movies::Movie movie = PlainMovie();
        movie.tracks[0].descriptions = {format.ToBox()};
        Ratio ratio{0, 0};
        const auto description = ParsedMovie(movie).VideoDescription();
        const NCFRESULT result =
            description->GetImageAspectRatio(&ratio.numerator, &ratio.denominator);
        return result == NCF_OK ? Text(ratio) : std::string("none");
    };
    movies::VideoFormat format;
    EXPECT_EQ(aspect(format), "16/9");
    format.pixelAspect = {{0, 1}};
    EXPECT_EQ(aspect(format), "16/9");
    format.pixelAspect = {{2, 1}};
    EXPECT_EQ(aspect(format), "32/9");
    format.cleanAperture = {{-1000, 1, 1000, 1, 0, 1, 0, 1}};
    EXPECT_EQ(aspect(format), "32/9");
    format.cleanAperture = {{1000, 0, 1000, 1, 0, 1, 0, 1}};
    EXPECT_EQ(aspect(format), "32/9");
    format.cleanAperture = {{1921, 1, 1000, 1, 0, 1, 0, 1}};
    EXPECT_EQ(aspect(format), "32/9");
    format.cleanAperture = {{1000, 1, 1000, 1, 0, 1, 0, 1}};
    EXPECT_EQ(aspect(format), "2/1");
    format.height = 0;
    EXPECT_EQ(aspect(format), "none");
}

TEST(ImageAspect, OfADescriptionNeedsWidthAndHeight) {
    const auto result = [](unsigned width, unsigned height) {
        movies::Movie movie = PlainMovie();
        movies::VideoFormat format;
        format.width = width;
        format.height = height;
        movie.tracks[0].descriptions = {format.ToBox()};
        ncfUInt32 above = 0;
        ncfUInt32 below = 0;
        return ParsedMovie(movie).VideoDescription()->GetImageAspectRatio(&above, &below);
    };
    EXPECT_EQ(result(0, 1080), NCF_E_PARAMETERNOTAVAILABLE);
    EXPECT_EQ(result(1920, 0), NCF_E_PARAMETERNOTAVAILABLE);
    EXPECT_EQ(result(1, 1), NCF_OK);
}

}  // namespace
