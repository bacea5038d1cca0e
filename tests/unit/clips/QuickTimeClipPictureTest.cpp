// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "tests/unit/clips/ClipFixture.h"

namespace {

class QuickTimeClipPicture : public ClipTest {
protected:
    QuickTimeClipPicture() { parser->AddVideoTrack(1); }

    ncfUInt32 ColorSpaceOf() {
        ncfUInt32 colorSpace = 0;
        Load();
        EXPECT_EQ(clip->GetColorSpace(&colorSpace), NCF_OK);
        return colorSpace;
    }
    ncfUInt32 ColorSpaceFor(ncfUInt32 primaries, ncfUInt32 transfer, ncfUInt32 matrix) {
        Picture().SetColor(primaries, transfer, matrix);
        return ColorSpaceOf();
    }
    void ExpectFields(ncfUInt32 order, ncfUInt32 layout) {
        ncfUInt32 value = 0;
        EXPECT_EQ(clip->GetTemporalFieldOrder(&value), NCF_OK);
        EXPECT_EQ(value, order);
        EXPECT_EQ(clip->GetFrameBufferLayout(&value), NCF_OK);
        EXPECT_EQ(value, layout);
        EXPECT_EQ(clip->GetBufferLineOrientation(&value), NCF_OK);
        EXPECT_EQ(value, 1u);
    }
};

const char kProgressiveLine[] =
    "QueryVideoDescBufferDetails says we are full progressive and merged \n";

}  // namespace

// --- identity and size ---------------------------------------------------------------------

TEST_F(QuickTimeClipPicture, TellsFormatAndVendor) {
    Load();
    ncfUInt32 code = 0;
    EXPECT_EQ(clip->GetDataFormat(&code), NCF_OK);
    EXPECT_EQ(code, 0x61766331u);
    EXPECT_EQ(clip->GetVendor(&code), NCF_OK);
    EXPECT_EQ(code, 0x6170706Cu);
    EXPECT_TRUE(log->once("QuickTimeClip::GetVendorvendor: appl"));
    EXPECT_EQ(clip->GetDataFormat(nullptr), NCF_E_POINTER);
    EXPECT_EQ(clip->GetVendor(nullptr), NCF_E_POINTER);
    EXPECT_EQ(clip->GetNivoResolution(nullptr), NCF_E_POINTER);
    Picture().results["GetVendor"] = NCF_E_FAIL;
    EXPECT_EQ(clip->GetVendor(&code), NCF_E_FAIL);
    EXPECT_TRUE(log->returned("80000008", "vdscr->GetVendor(vendor)", "QuickTimeClip::GetVendor"));
}

TEST_F(QuickTimeClipPicture, GivesTheFirstFieldOfTheResolution) {
    Load();
    ncfUInt32 id = 5;
    EXPECT_EQ(clip->GetNivoResolution(&id), NCF_E_PARAMETERNOTAVAILABLE);
    EXPECT_EQ(id, 5u);
    Picture().results.erase("GetNivoResolution");
    Picture().resolution.id = 10950;
    Picture().resolution.reserved[0] = 7;
    EXPECT_EQ(clip->GetNivoResolution(&id), NCF_OK);
    EXPECT_EQ(id, 10950u);
}

TEST_F(QuickTimeClipPicture, AsksForTheSizeOnce) {
    Load();
    journal.clear();
    ncfUInt32 width = 0;
    ncfUInt32 height = 0;
    EXPECT_EQ(clip->GetEncodedWidthAndHeight(&width, &height), NCF_OK);
    EXPECT_EQ(width, 1920u);
    EXPECT_EQ(height, 1080u);
    EXPECT_EQ(clip->GetImageAspectRatio(&width, &height), NCF_OK);
    EXPECT_EQ(width, 16u);
    EXPECT_EQ(height, 9u);
    EXPECT_TRUE(journal.lines().empty());
    EXPECT_EQ(clip->GetEncodedWidthAndHeight(nullptr, &height), NCF_E_POINTER);
    EXPECT_EQ(clip->GetEncodedWidthAndHeight(&width, nullptr), NCF_E_POINTER);
    EXPECT_EQ(clip->GetImageAspectRatio(nullptr, &height), NCF_E_INVALIDARG);
    EXPECT_EQ(clip->GetImageAspectRatio(&width, nullptr), NCF_E_INVALIDARG);
}

TEST_F(QuickTimeClipPicture, RefusesAPictureWithoutSize) {
    Picture().width = 0;
    Load();
    EXPECT_FALSE(clip->IsLoaded());
    EXPECT_TRUE(log->once("NCFASSERT( width_ && height_ )BaseClip::GetEncodedWidthAndHeight"));
    EXPECT_EQ(clip->LoadClipImpl(), NCF_E_FAIL);
}

TEST_F(QuickTimeClipPicture, AsksAgainForASizeOfWhichHalfIsKnown) {
    Picture().width = 0;
    Load();
    Picture().width = 640;
    ncfUInt32 width = 0;
    ncfUInt32 height = 0;
    EXPECT_EQ(clip->GetEncodedWidthAndHeight(&width, &height), NCF_OK);
    EXPECT_EQ(width, 640u);
    EXPECT_EQ(height, 1080u);
}

TEST_F(QuickTimeClipPicture, ChecksTheOutputsOfItsProperties) {
    Load();
    EXPECT_EQ(clip->GetColorSpace(nullptr), NCF_E_POINTER);
    EXPECT_EQ(clip->GetTemporalFieldOrder(nullptr), NCF_E_POINTER);
    EXPECT_EQ(clip->GetFrameBufferLayout(nullptr), NCF_E_POINTER);
    EXPECT_EQ(clip->GetBufferLineOrientation(nullptr), NCF_E_POINTER);
}

TEST_F(QuickTimeClipPicture, HandsAFailingFormatOn) {
    Load();
    Picture().results["GetDataFormat"] = NCF_E_ABORT;
    ncfUInt32 code = 0;
    EXPECT_EQ(clip->GetDataFormat(&code), NCF_E_ABORT);
    EXPECT_TRUE(log->returned("80000007", "vdscr->GetDataFormat(dataFormat)",
                              "QuickTimeClip::GetDataFormat"));
}

TEST_F(QuickTimeClipPicture, RefusesAPictureWithoutRatio) {
    Picture().aspectDenominator = 0;
    Load();
    EXPECT_FALSE(clip->IsLoaded());
    EXPECT_TRUE(
        log->once("NCFASSERT( imageAspectRatioNumerator_ && imageAspectRatioDenominator_ )"
                  "QuickTimeClip::GetImageAspectRatioImpl"));
}

// --- fields ------------------------------------------------------------------------------------

TEST_F(QuickTimeClipPicture, IsProgressiveWithoutFieldInformation) {
    Load();
    ExpectFields(256, 256);
    EXPECT_EQ(clip->GetClipParams()->detectedFieldOrder, 256u);
    EXPECT_EQ(Console(4, kProgressiveLine), 1);
}

TEST_F(QuickTimeClipPicture, IsProgressiveWithoutFieldInformationAlsoAt720By486) {
    Picture().width = 720;
    Picture().height = 486;
    Load();
    ExpectFields(256, 256);
}

TEST_F(QuickTimeClipPicture, NeedsTheSizeWhereFieldsAreNotTold) {
    Load();
    Picture().results["GetEncodedWidthAndHeight"] = NCF_E_ABORT;
    EXPECT_EQ(clip->SetFieldLayoutDetails(), NCF_E_ABORT);
    EXPECT_TRUE(log->returned("80000007", "vdscr->GetEncodedWidthAndHeight(&width, &height)",
                              "QuickTimeClip::SetFieldLayoutDetails"));
}

TEST_F(QuickTimeClipPicture, IsProgressiveWithOneField) {
    Picture().SetFields(1, true, true);
    Load();
    ExpectFields(256, 256);
    EXPECT_EQ(Console(4, kProgressiveLine), 1);
}

TEST_F(QuickTimeClipPicture, IsInterlacedWithAnyCountOfFieldsButOne) {
    for (const ncfUInt32 fields : {0u, 2u, 3u, 4u}) {
        Picture().SetFields(fields, true, false);
        Load();
        EXPECT_TRUE(clip->IsLoaded());
        ExpectFields(512, 256);
        EXPECT_EQ(clip->GetClipParams()->detectedFieldOrder, 512u) << fields;
    }
}

TEST_F(QuickTimeClipPicture, TellsTheFourKindsOfInterlacedPictures) {
    struct {
        bool top;
        bool split;
        ncfUInt32 order;
        const char* line;
    } const kKinds[] = {
        {true, true, 512,
         "QueryVideoDescBufferDetails says we are interlaced, split, and top first \n"},
        {false, true, 4096,
         "QueryVideoDescBufferDetails says we are interlaced, split, and bottom first \n"},
        {true, false, 512,
         "QueryVideoDescBufferDetails says we are interlaced, merged, and top first \n"},
        {false, false, 4096,
         "QueryVideoDescBufferDetails says we are interlaced, merged, and bottom first \n"},
    };
    for (const auto& kind : kKinds) {
        Picture().SetFields(2, kind.top, kind.split);
        Load();
        EXPECT_EQ(Console(4, kind.line), 1);
        ExpectFields(kind.order, 256);  // split files too
        EXPECT_EQ(clip->GetClipParams()->detectedFieldOrder, kind.order);
    }
}

TEST_F(QuickTimeClipPicture, LaysTheUsersChoiceOverTheFields) {
    struct {
        ncfUInt32 order;
        ncfUInt32 layout;
        ncfUInt32 expectedOrder;
        ncfUInt32 expectedLayout;
    } const kChoices[] = {
        {256, 3, 256, 256},  // progressive leaves the layout
        {512, 1, 512, 256},  // an order alone keeps merged fields merged
        {512, 2, 512, 256},  {4096, 3, 4096, 512}, {8192, 1, 512, 256},  // nothing chosen
        {8192, 2, 512, 256}, {8192, 3, 512, 512},  {7, 3, 512, 512},     // no order at all
    };
    Picture().SetFields(2, true, false);
    Load();
    for (const auto& choice : kChoices) {
        clip->GetClipParams()->fieldOrderInFile = choice.order;
        clip->GetClipParams()->fieldLayout = choice.layout;
        EXPECT_EQ(clip->SetFieldLayoutDetails(), NCF_OK);
        ExpectFields(choice.expectedOrder, choice.expectedLayout);
        EXPECT_EQ(clip->GetClipParams()->detectedFieldOrder, 512u);
    }
}

TEST_F(QuickTimeClipPicture, LetsTheUserTurnTheFieldsRound) {
    struct {
        bool topInFile;
        ncfUInt32 chosen;
    } const kTurns[] = {{false, 512}, {true, 4096}};
    for (const auto& turn : kTurns) {
        Picture().SetFields(2, turn.topInFile, false);
        Load();
        clip->GetClipParams()->fieldOrderInFile = turn.chosen;
        EXPECT_EQ(clip->SetFieldLayoutDetails(), NCF_OK);
        ExpectFields(turn.chosen, 256);
        EXPECT_EQ(clip->GetClipParams()->detectedFieldOrder, turn.topInFile ? 512u : 4096u);
    }
}

TEST_F(QuickTimeClipPicture, LaysTheUsersChoiceOverProgressivePicturesToo) {
    struct {
        ncfUInt32 order;
        ncfUInt32 layout;
        ncfUInt32 expectedOrder;
        ncfUInt32 expectedLayout;
    } const kChoices[] = {
        {256, 3, 256, 256},   {512, 1, 512, 256},  {512, 2, 512, 256},
        {4096, 3, 4096, 512}, {8192, 1, 256, 256},  // nothing chosen
        {8192, 2, 256, 256},  {8192, 3, 256, 512}, {7, 3, 256, 512},
    };
    Load();
    for (const auto& choice : kChoices) {
        clip->GetClipParams()->fieldOrderInFile = choice.order;
        clip->GetClipParams()->fieldLayout = choice.layout;
        host->console().clear();
        EXPECT_EQ(clip->SetFieldLayoutDetails(), NCF_OK);
        ExpectFields(choice.expectedOrder, choice.expectedLayout);
        EXPECT_EQ(clip->GetClipParams()->detectedFieldOrder, 256u) << "the file says the same";
        EXPECT_EQ(
            Console(4, "QueryVideoDescBufferDetails says we are full progressive and merged \n"),
            1);
    }
}

TEST_F(QuickTimeClipPicture, EndsTheLoadWhenFieldsCannotBeRead) {
    Picture().results["GetFieldInfo"] = NCF_E_FAIL;
    Load();
    EXPECT_FALSE(clip->IsLoaded());
    EXPECT_EQ(Console(4, "SetFieldLayoutDetails failed, default to full progressive and merged \n"),
              1);
    ncfUInt32 value = 7;
    EXPECT_EQ(clip->GetTemporalFieldOrder(&value), NMA_E_NOTSET);
    EXPECT_EQ(clip->GetFrameBufferLayout(&value), NMA_E_NOTSET);
    EXPECT_EQ(value, 7u);
    EXPECT_EQ(clip->SetFieldLayoutDetails(), NCF_E_FAIL);
}

TEST_F(QuickTimeClipPicture, StartsWithParametersThatChangeNothing) {
    Load();
    EXPECT_EQ(clip->GetClipParams()->fieldOrderInFile, 8192u);
    EXPECT_EQ(clip->GetClipParams()->levelRemap, 16u);
    EXPECT_EQ(clip->GetClipParams()->fieldLayout, 1u);
}

TEST_F(QuickTimeClipPicture, TellsTheFrameLayout) {
    Load();
    ncfUInt32 layout = 7;
    EXPECT_EQ(clip->GetNMAFrameLayout(&layout), NCF_E_PARAMETERNOTAVAILABLE);
    EXPECT_EQ(layout, 0u);
    struct {
        ncfUInt32 fields;
        ncfUInt32 layout;
    } const kCounts[] = {{0, 0}, {1, 0}, {2, 1}, {3, 0}};
    for (const auto& count : kCounts) {
        Picture().SetFields(count.fields, false, false);
        EXPECT_EQ(clip->GetNMAFrameLayout(&layout), NCF_OK);
        EXPECT_EQ(layout, count.layout) << count.fields;
    }
    EXPECT_EQ(clip->GetNMAFrameLayout(nullptr), NCF_OK);
    Picture().results["GetFieldInfo"] = NCF_E_ABORT;
    EXPECT_EQ(clip->GetNMAFrameLayout(&layout), NCF_E_ABORT);
    EXPECT_EQ(layout, 0u);
}

// --- colour
// ----------------------------------------------------------------------------------------

TEST_F(QuickTimeClipPicture, IsRgbWithoutColourAtom) {
    EXPECT_EQ(ColorSpaceOf(), ncfUInt32{CS_RGB});
    EXPECT_EQ(Console(4, "GetVideoColorSpaceDetails defaulting to RGB.\n"), 1);
    ColorDetails details;
    EXPECT_EQ(clip->GetColorDetails(&details), NCF_OK);
    EXPECT_FALSE(details.hasVendorMetadata);
    EXPECT_EQ(details.colorPrimaries, 2u);
    EXPECT_EQ(details.transferFunction, 2u);
    EXPECT_EQ(details.matrix, 2u);
    EXPECT_EQ(details.refBlack, -1);
    EXPECT_EQ(details.refWhite, -1);
    EXPECT_EQ(clip->GetColorDetails(nullptr), NCF_E_INVALIDARG);
}

TEST_F(QuickTimeClipPicture, DetectsRec709) {
    EXPECT_EQ(ColorSpaceFor(1, 1, 1), ncfUInt32{CS_YCbCr_709});
    EXPECT_EQ(Console(4, "GetVideoColorSpaceDetails detected 709.\n"), 1);
    EXPECT_EQ(ColorSpaceFor(1, 2, 2), ncfUInt32{CS_YCbCr_709});
    EXPECT_EQ(ColorSpaceFor(2, 2, 1), ncfUInt32{CS_YCbCr_709});
    EXPECT_EQ(ColorSpaceFor(2, 2, 7), ncfUInt32{CS_YCbCr_709});
    EXPECT_EQ(ColorSpaceFor(2, 7, 2), ncfUInt32{CS_YCbCr_709});
}

TEST_F(QuickTimeClipPicture, DetectsRec601ByTheMatrix) {
    EXPECT_EQ(ColorSpaceFor(6, 6, 6), ncfUInt32{CS_YCbCr_601});
    EXPECT_EQ(Console(4, "GetVideoColorSpaceDetails detected 601.\n"), 1);
    ColorDetails details;
    clip->GetColorDetails(&details);
    EXPECT_EQ(details.colorPrimaries, 6u);
    EXPECT_EQ(details.transferFunction, 6u);
    EXPECT_EQ(details.matrix, 6u);
}

TEST_F(QuickTimeClipPicture, DoesNotTakeTheTransferOf709ForRec709) {
    EXPECT_EQ(ColorSpaceFor(5, 1, 6), ncfUInt32{CS_YCbCr_601});
    EXPECT_EQ(ColorSpaceFor(6, 1, 6), ncfUInt32{CS_YCbCr_601});
}

TEST_F(QuickTimeClipPicture, StaysRgbWithUnspecifiedColour) {
    EXPECT_EQ(ColorSpaceFor(2, 2, 2), ncfUInt32{CS_RGB});
    EXPECT_EQ(ColorSpaceFor(9, 16, 9), ncfUInt32{CS_RGB});
    EXPECT_EQ(Console(4, "GetVideoColorSpaceDetails defaulting to RGB.\n"), 0);
}

TEST_F(QuickTimeClipPicture, GoesOnWhenColourCannotBeRead) {
    Picture().results["GetVideoColorSpaceDetails"] = NCF_E_FAIL;
    EXPECT_EQ(ColorSpaceOf(), ncfUInt32{CS_RGB});
    EXPECT_TRUE(clip->IsLoaded());
    EXPECT_EQ(Console(4, "GetVideoColorSpaceDetails defaulting to RGB.\n"), 0);
}

TEST_F(QuickTimeClipPicture, TakesMarksOfTheParserForVendorMetadata) {
    parser->color = new FakeParserColor(&journal);
    Picture().SetColor(1, 1, 1);
    for (int flag = 0; flag < 2; ++flag) {
        parser->color->flagA = flag == 0 ? 0 : 1;
        parser->color->flagB = flag == 1 ? 0 : 1;
        EXPECT_EQ(ColorSpaceOf(), ncfUInt32{CS_RGB});
        ColorDetails details;
        clip->GetColorDetails(&details);
        EXPECT_TRUE(details.hasVendorMetadata);
        EXPECT_EQ(details.refBlack, -1);
        EXPECT_EQ(details.refWhite, -1);
        const ncfUInt8 expected[16] = {0x00, 0x00, 0x17, 0x0E, 0x01, 0x00, 0x01, 0x01,
                                       0x06, 0x0E, 0x2B, 0x34, 0x04, 0x01, 0x01, 0x0C};
        EXPECT_EQ(std::memcmp(&details.transferCharacteristicUID, expected, 16), 0);
    }
    parser->color->flagA = parser->color->flagB = 1;
    EXPECT_EQ(ColorSpaceOf(), ncfUInt32{CS_YCbCr_709});
}

TEST_F(QuickTimeClipPicture, AsksBothMarksTheFifthOperationFirst) {
    parser->color = new FakeParserColor(&journal);
    parser->color->flagB = 0;
    Load();
    EXPECT_EQ(journal.startingWith("parser color"),
              (std::vector<std::string>{"parser color.ColorFlagB", "parser color.ColorFlagA"}));
}
