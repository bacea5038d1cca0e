// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "tests/unit/clips/OtherClipFixture.h"

namespace {

class OtherClipPicture : public OtherClipTest {
protected:
    struct Fields {
        ncfUInt32 order;
        ncfUInt32 layout;
        ncfUInt32 detected;
    };
    Fields FieldsOf(OtherClip& asked) {
        Fields fields{};
        EXPECT_EQ(asked.GetTemporalFieldOrder(&fields.order), NCF_OK);
        EXPECT_EQ(asked.GetFrameBufferLayout(&fields.layout), NCF_OK);
        fields.detected = asked.GetClipParams()->detectedFieldOrder;
        return fields;
    }
    void ExpectFields(const Fields& fields, ncfUInt32 order, ncfUInt32 layout, ncfUInt32 detected) {
        EXPECT_EQ(fields.order, order);
        EXPECT_EQ(fields.layout, layout);
        EXPECT_EQ(fields.detected, detected);
    }
    // A movie of that size without a word on fields.
    void LoadWithoutFields(ncfUInt32 width, ncfUInt32 height) {
        wrapper->width = width;
        wrapper->height = height;
        wrapper->aspectNum = 4;
        wrapper->aspectDen = 3;
        wrapper->results["QueryVideoDescBufferDetails"] = NMA_E_FIELDS;
        LoadUsual();
    }

    ncfUInt32 number = 77;
};

}  // namespace

// --- identity ------------------------------------------------------------------------

TEST_F(OtherClipPicture, ReadsItsCodeFromTheTopDown) {
    LoadUsual();
    wrapper->codes[1] = "avc1";
    EXPECT_EQ(other->GetDataFormat(&number), NCF_OK);
    EXPECT_EQ(number, 0x61766331u);
    wrapper->codes[1] = std::string("\xFF\x00\x80\x7F", 4);
    EXPECT_EQ(other->GetDataFormat(&number), NCF_OK);
    EXPECT_EQ(number, 0xFF00807Fu);
}

TEST_F(OtherClipPicture, TellsVendorAndResolution) {
    LoadUsual();
    wrapper->vendor = 0x6170706C;
    wrapper->resolution = 10950;
    EXPECT_EQ(other->GetVendor(&number), NCF_OK);
    EXPECT_EQ(number, 0x6170706Cu);
    EXPECT_EQ(LastRecord(), "OtherClip::GetVendorvendor: appl");
    EXPECT_EQ(other->GetNivoResolution(&number), NCF_OK);
    EXPECT_EQ(number, 10950u);
    EXPECT_EQ(wrapper->lastTrack, 1u);
}

TEST_F(OtherClipPicture, HandsFailuresAboutIdentityOn) {
    LoadUsual();
    wrapper->results["GetFourCCFromImageDescrptor"] = NCF_E_ABORT;
    wrapper->results["GetVendor"] = NCF_E_FAIL;
    EXPECT_EQ(other->GetDataFormat(&number), NCF_E_ABORT);
    EXPECT_EQ(LastRecord(),
              ReturnRecord("80000007",
                           "qtWrapper_->GetFourCCFromImageDescrptor(track, (ncfUInt8*)fourcc_)",
                           "OtherClip::GetDataFormat"));
    EXPECT_EQ(other->GetVendor(&number), NCF_E_FAIL);
    EXPECT_EQ(LastRecord(), ReturnRecord("80000008", "qtWrapper_->GetVendor(track, vendor)",
                                         "OtherClip::GetVendor"));
    EXPECT_EQ(number, 77u);
}

TEST_F(OtherClipPicture, IsNotFoundInASoundOnlyMovie) {
    wrapper->AddSound(1);
    LoadOther();
    struct {
        const char* function;
        std::function<NCFRESULT()> ask;
    } const kQuestions[] = {
        {"GetDataFormat", [&] { return other->GetDataFormat(&number); }},
        {"GetVendor", [&] { return other->GetVendor(&number); }},
        {"GetNivoResolution", [&] { return other->GetNivoResolution(&number); }},
        {"GetNMAFrameLayout", [&] { return other->GetNMAFrameLayout(&number); }},
    };
    for (const auto& question : kQuestions) {
        EXPECT_EQ(question.ask(), NCF_E_NOTFOUND) << question.function;
        EXPECT_EQ(LastRecord(), ReturnRecord("8000000c", "GetFirstVideoTrack(track)",
                                             std::string("OtherClip::") + question.function));
    }
    EXPECT_EQ(number, 77u);
}

TEST_F(OtherClipPicture, ChecksTheOutputsOfIdentity) {
    LoadUsual();
    EXPECT_EQ(other->GetDataFormat(nullptr), NCF_E_POINTER);
    EXPECT_EQ(LastRecord(), "CHK_PTR(dataFormat)OtherClip::GetDataFormat");
    EXPECT_EQ(other->GetVendor(nullptr), NCF_E_POINTER);
    EXPECT_EQ(LastRecord(), "CHK_PTR(vendor)OtherClip::GetVendor");
    EXPECT_EQ(other->GetNivoResolution(nullptr), NCF_E_POINTER);
    EXPECT_EQ(LastRecord(), "CHK_PTR(vcID)OtherClip::GetNivoResolution");
}

// --- size and ratio ----------------------------------------------------------------------

TEST_F(OtherClipPicture, TakesSizeAndRatioInOneAnswerAndSetsTheMovieBack) {
    LoadUsual();
    ncfUInt32 a = 0;
    ncfUInt32 b = 0;
    EXPECT_EQ(other->GetEncodedWidthAndHeight(&a, &b), NCF_OK);
    EXPECT_EQ(a, 1920u);
    EXPECT_EQ(b, 1080u);
    EXPECT_EQ(other->GetImageAspectRatio(&a, &b), NCF_OK);
    EXPECT_EQ(a, 16u);
    EXPECT_EQ(b, 9u);
    EXPECT_EQ(wrapper->boxArguments, "0 0 1080 1920") << "top, left, bottom, right";
    EXPECT_TRUE(journal.lines().empty()) << "known since the load";
}

TEST_F(OtherClipPicture, SetsTheMovieBackInSixteenBits) {
    wrapper->width = 40000;
    wrapper->height = 0x18000;
    LoadUsual();
    EXPECT_TRUE(other->IsLoaded());
    EXPECT_EQ(wrapper->boxArguments, "0 0 -32768 -25536");
    ncfUInt32 a = 0;
    ncfUInt32 b = 0;
    EXPECT_EQ(other->GetEncodedWidthAndHeight(&a, &b), NCF_OK);
    EXPECT_EQ(a, 40000u);
    EXPECT_EQ(b, 0x18000u);
}

TEST_F(OtherClipPicture, ReadsTheRatioAgainWithoutSettingTheMovieBack) {
    wrapper->aspectNum = 0;
    LoadUsual();
    EXPECT_FALSE(other->IsLoaded());
    ncfUInt32 a = 7;
    ncfUInt32 b = 7;
    EXPECT_EQ(other->GetImageAspectRatio(&a, &b), NMA_E_NOTINITIALIZED);
    EXPECT_EQ(a, 7u);
    EXPECT_EQ(journal.lines(), (std::vector<std::string>{"wrapper.GetMovieBox"}));
    wrapper->aspectNum = 4;
    wrapper->aspectDen = 3;
    EXPECT_EQ(other->GetImageAspectRatio(&a, &b), NCF_OK);
    EXPECT_EQ(a, 4u);
    EXPECT_EQ(b, 3u);
}

TEST_F(OtherClipPicture, HasNoSizeAndRatioInASoundOnlyMovie) {
    wrapper->AddSound(1);
    LoadOther();
    Forget();
    ncfUInt32 a = 7;
    ncfUInt32 b = 7;
    EXPECT_EQ(other->GetEncodedWidthAndHeight(&a, &b), NCF_E_FAIL);
    EXPECT_EQ(LastRecord(), "NCFASSERT( width_ && height_ )BaseClip::GetEncodedWidthAndHeight");
    EXPECT_EQ(other->GetImageAspectRatio(&a, &b), NMA_E_NOTINITIALIZED);
    EXPECT_EQ(a, 7u);
    EXPECT_TRUE(journal.lines().empty());
}

TEST_F(OtherClipPicture, HandsFailuresAboutSizeOn) {
    wrapper->width = 0;  // asked again each time
    LoadUsual();
    ncfUInt32 a = 7;
    ncfUInt32 b = 7;
    wrapper->results["GetMovieBox"] = NCF_E_ABORT;
    EXPECT_EQ(other->GetEncodedWidthAndHeight(&a, &b), NCF_E_ABORT);
    EXPECT_TRUE(log->returned("80000007",
                              "qtWrapper_->GetMovieBox(&width_, &height_, "
                              "&imageAspectRatioNumerator_, &imageAspectRatioDenominator_)",
                              "OtherClip::GetEncodedWidthAndHeightImpl"));
    wrapper->results = {{"QTWSetMovieBox", NCF_E_FAIL}};
    EXPECT_EQ(other->GetEncodedWidthAndHeight(&a, &b), NCF_E_FAIL);
    EXPECT_TRUE(log->returned(
        "80000008", "qtWrapper_->QTWSetMovieBox(0, 0, (ncfSInt16)height_, (ncfSInt16)width_)",
        "OtherClip::GetEncodedWidthAndHeightImpl"));
}

TEST_F(OtherClipPicture, HasTheRectanglesOfItsSize) {
    LoadUsual();
    GeometryDetails details;
    EXPECT_EQ(other->GetGeometryDetails(&details), NCF_OK);
    EXPECT_EQ(details.source.width, (Rational{1600, 1}));
    EXPECT_EQ(details.source.height, (Rational{900, 1}));
    EXPECT_EQ(details.source.positionX, (Rational{-800, 1}));
    EXPECT_EQ(details.source.positionY, (Rational{-450, 1}));
    for (const BoundsBox* box : {&details.framing, &details.valid, &details.essence}) {
        EXPECT_EQ(box->width, details.source.width);
        EXPECT_EQ(box->positionY, details.source.positionY);
    }
}

// --- fields --------------------------------------------------------------------------------

TEST_F(OtherClipPicture, TakesTheFieldsThatTheWrapperTells) {
    struct {
        ncfUInt32 interlaced;
        ncfUInt32 bits;
        ncfUInt32 order;
        const char* line;
    } const kCases[] = {
        {0, 9, 256, "QueryVideoDescBufferDetails says we are full progressive and merged \n"},
        {1, 0, 4096,
         "QueryVideoDescBufferDetails says we are interlaced, merged, and bottom first \n"},
        {1, 1, 512, "QueryVideoDescBufferDetails says we are interlaced, merged, and top first \n"},
        {1, 8, 4096,
         "QueryVideoDescBufferDetails says we are interlaced, split, and bottom first \n"},
        {1, 9, 512, "QueryVideoDescBufferDetails says we are interlaced, split, and top first \n"},
        {1, 6, 4096,
         "QueryVideoDescBufferDetails says we are interlaced, merged, and bottom first \n"},
    };
    LoadUsual();
    for (const auto& expected : kCases) {
        wrapper->interlaced = expected.interlaced;
        wrapper->fieldBits = expected.bits;
        host->console().clear();
        EXPECT_EQ(other->SetFieldLayoutDetails(), NCF_OK);
        ExpectFields(FieldsOf(*other), expected.order, 256, expected.order);
        EXPECT_EQ(Console(4, expected.line), 1) << expected.line;
    }
}

TEST_F(OtherClipPicture, ReadsSmallStandardPicturesWithoutFieldsAsBottomFirst) {
    LoadWithoutFields(720, 486);
    EXPECT_TRUE(other->IsLoaded());
    ExpectFields(FieldsOf(*other), 4096, 256, 4096);
    EXPECT_EQ(other->SetFieldLayoutDetails(), NCF_OK);
    EXPECT_EQ(
        Console(4,
                "QueryVideoDescBufferDetails says we are interlaced, merged, and bottom first "
                "\n"),
        1);
}

TEST_F(OtherClipPicture, ReadsOtherPicturesWithoutFieldsAsProgressive) {
    LoadWithoutFields(720, 576);
    ExpectFields(FieldsOf(*other), 256, 256, 256);
}

TEST_F(OtherClipPicture, LaysTheUsersChoiceOverTheDefaultOfTheSize) {
    LoadWithoutFields(720, 486);
    other->GetClipParams()->fieldOrderInFile = 512;
    other->GetClipParams()->fieldLayout = 3;
    EXPECT_EQ(other->SetFieldLayoutDetails(), NCF_OK);
    ExpectFields(FieldsOf(*other), 512, 512, 4096);
    other->GetClipParams()->fieldOrderInFile = 8192;
    other->GetClipParams()->fieldLayout = 1;
    EXPECT_EQ(other->SetFieldLayoutDetails(), NCF_OK);
    ExpectFields(FieldsOf(*other), 4096, 256, 4096);
}

TEST_F(OtherClipPicture, LaysTheUsersChoiceOverProgressivePicturesToo) {
    LoadWithoutFields(720, 576);
    other->GetClipParams()->fieldOrderInFile = 4096;
    other->GetClipParams()->fieldLayout = 3;
    EXPECT_EQ(other->SetFieldLayoutDetails(), NCF_OK);
    ExpectFields(FieldsOf(*other), 4096, 512, 256);
}

TEST_F(OtherClipPicture, HandsOtherFailuresAboutFieldsOn) {
    wrapper->results["QueryVideoDescBufferDetails"] = NCF_E_ABORT;
    wrapper->AddPicture(1);
    EXPECT_FALSE(LoadOther().IsLoaded());
    EXPECT_EQ(Console(4,
                      "QueryVideoDescBufferDetails failed, default to full progressive and merged "
                      "\n"),
              1);
    EXPECT_EQ(other->SetFieldLayoutDetails(), NCF_E_ABORT);
    ncfUInt32 order = 5;
    EXPECT_EQ(other->GetTemporalFieldOrder(&order), NMA_E_NOTSET) << "nothing is set";
    EXPECT_EQ(other->GetFrameBufferLayout(&order), NMA_E_NOTSET);
    wrapper->results = {{"QueryVideoDescBufferDetails", NMA_E_FIELDS}, {"GetMovieBox", NCF_E_FAIL}};
    EXPECT_EQ(other->SetFieldLayoutDetails(), NCF_E_FAIL);
    EXPECT_EQ(LastRecord(),
              ReturnRecord("80000008", "qtWrapper_->GetMovieBox(&width, &height, NULL, NULL)",
                           "OtherClip::SetFieldLayoutDetails"));
}

TEST_F(OtherClipPicture, TellsTheLayoutByTheNumberOfFields) {
    LoadUsual();
    struct {
        ncfUInt32 fields;
        ncfUInt32 layout;
    } const kCases[] = {{0, 0}, {1, 0}, {2, 1}, {3, 0}};
    for (const auto& expected : kCases) {
        wrapper->fieldCount = expected.fields;
        number = 77;
        EXPECT_EQ(other->GetNMAFrameLayout(&number), NCF_OK) << expected.fields;
        EXPECT_EQ(number, expected.layout) << expected.fields;
    }
    EXPECT_EQ(wrapper->lastTrack, 1u);
    EXPECT_EQ(other->GetNMAFrameLayout(nullptr), NCF_OK);
}

// --- colour ----------------------------------------------------------------------------------

TEST_F(OtherClipPicture, TakesColourFromTheTwoFlags) {
    struct {
        ncfBool found709;
        ncfBool found601;
        const char* line;
        ncfUInt32 colorSpace;
        ncfUInt32 codes[3];
    } const kCases[] = {
        {1,
         1,
         "GetVideoColorSpaceDetails Undefined behavior: both 601 and 709 were detected! Just pick "
         "709.\n",
         8,
         {1, 1, 1}},
        {1, 0, "GetVideoColorSpaceDetails detected 709.\n", 8, {1, 1, 1}},
        {0, 1, "GetVideoColorSpaceDetails detected 601.\n", 4, {6, 1, 6}},
        {0, 0, "GetVideoColorSpaceDetails defaulting to RGB.\n", 2, {2, 2, 2}},
    };
    LoadUsual();
    for (const auto& expected : kCases) {
        wrapper->found709 = expected.found709;
        wrapper->found601 = expected.found601;
        host->console().clear();
        EXPECT_EQ(other->SetColorSpaceImpl(), NCF_OK);
        ASSERT_EQ(host->console().lines().size(), 1u);
        EXPECT_EQ(Console(4, expected.line), 1) << expected.line;
        ncfUInt32 colorSpace = 0;
        ColorDetails details;
        EXPECT_EQ(other->GetColorSpace(&colorSpace), NCF_OK);
        EXPECT_EQ(other->GetColorDetails(&details), NCF_OK);
        EXPECT_EQ(colorSpace, expected.colorSpace);
        EXPECT_EQ(details.colorPrimaries, expected.codes[0]);
        EXPECT_EQ(details.transferFunction, expected.codes[1]);
        EXPECT_EQ(details.matrix, expected.codes[2]);
        EXPECT_FALSE(details.hasVendorMetadata);
        EXPECT_EQ(details.refBlack, -1);
        EXPECT_EQ(details.refWhite, -1);
    }
}

TEST_F(OtherClipPicture, HandsFailuresAboutColourOn) {
    wrapper->found709 = 1;
    LoadUsual();
    wrapper->results["GetCodecColorSpaceInfo"] = NCF_E_ABORT;
    EXPECT_EQ(other->SetColorSpaceImpl(), NCF_E_ABORT);
    EXPECT_EQ(
        LastRecord(),
        ReturnRecord("80000007",
                     "qtWrapper_->GetCodecColorSpaceInfo( &bYCbCr_709Found, &bYCbCr_601Found)",
                     "OtherClip::SetColorSpaceImpl"));
    ncfUInt32 colorSpace = 0;
    EXPECT_EQ(other->GetColorSpace(&colorSpace), NCF_OK);
    EXPECT_EQ(colorSpace, 2u) << "the start of each look";
}
