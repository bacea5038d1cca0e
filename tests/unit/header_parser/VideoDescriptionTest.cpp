// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include <gtest/gtest.h>

#include "tests/unit/header_parser/ParsedMovie.h"

namespace {

using movies::Box;
using movies::VideoFormat;

using Description = host::Ref<IVideoSampleDescription>;

Description ParseVideo(const Box& entry) {
    movies::Movie movie = PlainMovie();
    movie.tracks[0].descriptions = {entry};
    return ParsedMovie(movie).VideoDescription();
}

Description ParseVideo(const VideoFormat& format) {
    return ParseVideo(format.ToBox());
}

bool HasAlpha(const char* codec, unsigned depth) {
    VideoFormat format;
    format.codec = codec;
    format.depth = depth;
    return Ask(ParseVideo(format), &IVideoSampleDescription::HasAlpha) == 1;
}

// Count, top field first, split; empty when not available.
std::vector<ncfUInt32> Fields(const VideoFormat& format) {
    ncfUInt32 count = 0, topFirst = 0, split = 0;
    const NCFRESULT result = ParseVideo(format)->GetFieldInfo(&count, &topFirst, &split);
    EXPECT_TRUE(result == NCF_OK || result == NCF_E_PARAMETERNOTAVAILABLE);
    return result == NCF_OK ? std::vector<ncfUInt32>{count, topFirst, split}
                            : std::vector<ncfUInt32>();
}

std::vector<ncfUInt32> Colors(const Description& description) {
    ncfUInt32 codes[3] = {};
    const NCFRESULT result = description->GetVideoColorSpaceDetails(codes);
    EXPECT_TRUE(result == NCF_OK || result == NCF_E_PARAMETERNOTAVAILABLE);
    return result == NCF_OK ? std::vector<ncfUInt32>(codes, codes + 3) : std::vector<ncfUInt32>();
}

std::string Text(const Description& description,
                 NCFRESULT (IVideoSampleDescription::*get)(INCFString**)) {
    host::Ref<INCFString> text;
    const NCFRESULT result = (description.get()->*get)(text.Out());
    if (result == NCF_E_PARAMETERNOTAVAILABLE && !text) {
        return "none";
    }
    char* utf8 = nullptr;
    if (result != NCF_OK || text->ConvertTo(kNCFUTF8) != NCF_OK ||
        text->GetRawUTF8(&utf8) != NCF_OK) {
        return "failed";
    }
    return utf8;
}

using Numbers = std::vector<ncfUInt32>;

TEST(VideoDescription, GivesCodecSizeAndVendor) {
    VideoFormat format;
    format.codec = "apcn";
    format.vendor = "appl";
    format.width = 1440;
    format.height = 1080;
    const Description description = ParseVideo(format);
    EXPECT_EQ(Ask(description, &IVideoSampleDescription::GetDataFormat), 0x6170636Eu);
    EXPECT_EQ(Ask(description, &IVideoSampleDescription::GetVendor), movies::Code("appl"));
    ncfUInt16 width = 0, height = 0;
    ASSERT_EQ(description->GetEncodedWidthAndHeight(&width, &height), NCF_OK);
    EXPECT_EQ(width, 1440);
    EXPECT_EQ(height, 1080);
    EXPECT_EQ(Ask(ParseVideo(VideoFormat()), &IVideoSampleDescription::GetVendor), 0u);
}

TEST(VideoDescription, HasAlphaAtADepthOf32) {
    for (const char* codec : {"ap4h", "ap4x", "rle ", "png ", "raw ", "BGRA", "tiff", "NVj2"}) {
        EXPECT_TRUE(HasAlpha(codec, 32)) << codec;
        EXPECT_FALSE(HasAlpha(codec, 24)) << codec;
    }
    EXPECT_FALSE(HasAlpha("rle ", 16));
    EXPECT_FALSE(HasAlpha("rle ", 40));  // grey
}

TEST(VideoDescription, HasAlphaWhereTheCodecCarriesItByItself) {
    for (const char* codec : {"v408", "r408", "b64a", "r4fl", "y416"}) {
        EXPECT_TRUE(HasAlpha(codec, 24)) << codec;
    }
    EXPECT_FALSE(HasAlpha("v210", 24));
    EXPECT_FALSE(HasAlpha("b48r", 48));
}

TEST(VideoDescription, ReadsTheFieldsOfEachDetail) {
    VideoFormat format;
    EXPECT_EQ(Fields(format), Numbers());
    format.fields = {{1, 0}};
    EXPECT_EQ(Fields(format), (Numbers{1, 0, 0}));
    format.fields = {{2, 1}};
    EXPECT_EQ(Fields(format), (Numbers{2, 1, 1}));
    format.fields = {{2, 6}};
    EXPECT_EQ(Fields(format), (Numbers{2, 0, 1}));
    format.fields = {{2, 9}};
    EXPECT_EQ(Fields(format), (Numbers{2, 1, 0}));
    format.fields = {{2, 14}};
    EXPECT_EQ(Fields(format), (Numbers{2, 0, 0}));
}

TEST(VideoDescription, TakesAnUnknownFieldOrderFromTheRaster) {
    VideoFormat format;
    format.fields = {{2, 0}};
    EXPECT_EQ(Fields(format), (Numbers{2, 1, 0}));
    format.width = 720;
    format.height = 576;
    EXPECT_EQ(Fields(format), (Numbers{2, 1, 0}));
    for (const unsigned height : {480u, 486u, 512u}) {
        format.height = height;
        EXPECT_EQ(Fields(format), (Numbers{2, 0, 0}));
    }
}

TEST(VideoDescription, HasNoFieldsWhereTheAtomIsImpossible) {
    VideoFormat format;
    for (const unsigned count : {0u, 3u, 255u}) {
        format.fields = {{count, 9}};
        EXPECT_EQ(Fields(format), Numbers());
    }
    format.fields.reset();
    format.extensions = {Box("fiel").U8(2)};
    EXPECT_EQ(Fields(format), Numbers());
}

TEST(VideoDescription, NeedNotBeAskedForAllOfItsFields) {
    VideoFormat format;
    format.fields = {{2, 9}};
    ncfUInt32 count = 0;
    EXPECT_EQ(ParseVideo(format)->GetFieldInfo(&count, nullptr, nullptr), NCF_OK);
    EXPECT_EQ(count, 2u);
    EXPECT_EQ(ParseVideo(format)->GetFieldInfo(nullptr, nullptr, nullptr), NCF_E_POINTER);
}

TEST(VideoDescription, ReadsColorsOfBothForms) {
    VideoFormat format;
    format.nclc = {{6, 1, 6}};
    EXPECT_EQ(Colors(ParseVideo(format)), (Numbers{6, 1, 6}));
    format.nclc.reset();
    format.nclx = {{9, 16, 9}};
    EXPECT_EQ(Colors(ParseVideo(format)), (Numbers{9, 16, 9}));
}

TEST(VideoDescription, HasNoColorsWithoutTheAtomOrWithAProfileOrGammaAlone) {
    VideoFormat format;
    EXPECT_EQ(Colors(ParseVideo(format)), Numbers());
    format.gamma = 2.2;
    EXPECT_EQ(Colors(ParseVideo(format)), Numbers());
    format.extensions = {Box("colr").Code("prof").Zeros(200)};
    EXPECT_EQ(Colors(ParseVideo(format)), Numbers());
    format.extensions = {Box("colr").Code("nclc").U16(1).U16(1).U8(1)};
    EXPECT_EQ(Colors(ParseVideo(format)), Numbers());
}

TEST(VideoDescription, TakesTheFirstColorsAlsoBehindAProfile) {
    VideoFormat format;
    format.extensions = {Box("colr").Code("prof").Zeros(20)};
    format.nclc = {{1, 1, 1}};
    format.nclx = {{9, 9, 9}};
    EXPECT_EQ(Colors(ParseVideo(format)), (Numbers{1, 1, 1}));
}

TEST(VideoDescription, PassesOverOtherExtensionsAndAClosingZero) {
    VideoFormat format;
    format.extensions = {Box("avcC").Zeros(30), Box("glbl").Zeros(2), Box("free")};
    format.fields = {{2, 9}};
    format.closingZero = true;
    EXPECT_EQ(Fields(format), (Numbers{2, 1, 0}));
}

TEST(VideoDescription, FindsItsExtensionsBehindAColorTable) {
    Box entry("rle ");
    entry.Zeros(6).U16(1).Zeros(16).U16(320).U16(240).Zeros(14).Zeros(32).U16(2).U16(0);
    entry.U32(0).U16(0).U16(3).Zeros(4 * 8);  // four colours
    entry.Add(Box("colr").Code("nclc").U16(1).U16(2).U16(3));
    EXPECT_EQ(Colors(ParseVideo(entry)), (Numbers{1, 2, 3}));
}

TEST(VideoDescription, StandsWithAColorTableThatDoesNotFit) {
    Box entry("rle ");
    entry.Zeros(6).U16(1).Zeros(16).U16(320).U16(240).Zeros(14).Zeros(32).U16(8).U16(0);
    entry.U32(0).U16(0).U16(0xFFFF).Zeros(16);
    EXPECT_EQ(Colors(ParseVideo(entry)), Numbers());
}

TEST(VideoDescription, GivesTheAttributeTexts) {
    VideoFormat format;
    EXPECT_EQ(Text(ParseVideo(format), &IVideoSampleDescription::GetRIAttributes), "none");
    EXPECT_EQ(Text(ParseVideo(format), &IVideoSampleDescription::GetCMAttributes), "none");
    format.rasterText = "<Bounds>\xC3\xA9</Bounds>";
    format.colorText = std::string("<ColorSpaceDescriptor/>\0behind", 30);
    EXPECT_EQ(Text(ParseVideo(format), &IVideoSampleDescription::GetRIAttributes),
              "<Bounds>\xC3\xA9</Bounds>");
    EXPECT_EQ(Text(ParseVideo(format), &IVideoSampleDescription::GetCMAttributes),
              "<ColorSpaceDescriptor/>");
    format.rasterText = "";
    EXPECT_EQ(Text(ParseVideo(format), &IVideoSampleDescription::GetRIAttributes), "");
}

TEST(VideoDescription, GivesTheResolutionIdWhereThereIsOne) {
    VideoFormat format;
    QTNivoResolution resolution{1, {}};
    EXPECT_EQ(ParseVideo(format)->GetNivoResolution(&resolution), NCF_E_PARAMETERNOTAVAILABLE);
    EXPECT_EQ(resolution.id, 1u);
    format.resolutionId = 10950;
    EXPECT_EQ(ParseVideo(format)->GetNivoResolution(&resolution), NCF_OK);
    EXPECT_EQ(resolution.id, 10950u);
    format.resolutionId.reset();
    format.extensions = {Box("chRS").Version(1).U32(7)};
    EXPECT_EQ(ParseVideo(format)->GetNivoResolution(&resolution), NCF_E_PARAMETERNOTAVAILABLE);
    format.extensions = {Box("chRS").Version(0).U16(7)};
    EXPECT_EQ(ParseVideo(format)->GetNivoResolution(&resolution), NCF_E_PARAMETERNOTAVAILABLE);
}

TEST(VideoDescription, ListsItsAlphaCodings) {
    VideoFormat format;
    format.codec = "NVj2";
    EXPECT_EQ(Ask(ParseVideo(format), &IVideoSampleDescription::GetNivoAlphaCodingCount), 0u);
    format.alphaCodings = {{0, 5}};
    const Description description = ParseVideo(format);
    EXPECT_EQ(Ask(description, &IVideoSampleDescription::GetNivoAlphaCodingCount), 2u);
    ncfUInt32 coding = 9;
    EXPECT_EQ(description->GetNivoAlphaCoding(0, &coding), NCF_OK);
    EXPECT_EQ(coding, 0u);
    EXPECT_EQ(description->GetNivoAlphaCoding(1, &coding), NCF_OK);
    EXPECT_EQ(coding, 5u);
    EXPECT_EQ(description->GetNivoAlphaCoding(2, &coding), NCF_E_NOTFOUND);
    format.alphaCodings.reset();
    format.extensions = {Box("chAC").Version(0).U32(3).U32(1).U32(1)};
    EXPECT_EQ(Ask(ParseVideo(format), &IVideoSampleDescription::GetNivoAlphaCodingCount), 0u);
}

TEST(VideoDescription, RefusesNullOutputs) {
    const Description description = ParseVideo(VideoFormat());
    EXPECT_EQ(description->GetDataFormat(nullptr), NCF_E_POINTER);
    EXPECT_EQ(description->GetEncodedWidthAndHeight(nullptr, nullptr), NCF_E_POINTER);
    EXPECT_EQ(description->HasAlpha(nullptr), NCF_E_POINTER);
    EXPECT_EQ(description->GetVendor(nullptr), NCF_E_POINTER);
    EXPECT_EQ(description->GetImageAspectRatio(nullptr, nullptr), NCF_E_POINTER);
    EXPECT_EQ(description->GetVideoColorSpaceDetails(nullptr), NCF_E_POINTER);
    EXPECT_EQ(description->GetNivoAlphaCodingCount(nullptr), NCF_E_POINTER);
    EXPECT_EQ(description->GetNivoAlphaCoding(0, nullptr), NCF_E_POINTER);
    EXPECT_EQ(description->GetNivoResolution(nullptr), NCF_E_POINTER);
    EXPECT_EQ(description->GetRIAttributes(nullptr), NCF_E_POINTER);
    EXPECT_EQ(description->GetCMAttributes(nullptr), NCF_E_POINTER);
}

}  // namespace
