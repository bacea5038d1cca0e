// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/essence/AlphaExtraction.h"
#include "source/essence/ColorSpace.h"
#include "source/essence/FloatConversion.h"
#include "tests/unit/essence/support/MappingFixture.h"

namespace {

using namespace QuickTime;

class SampleMappingFormats : public MappingFixture {
protected:
    // One picture track, with alpha behind it when asked for.
    void Movie(bool alpha = false) {
        AddVideo(1);
        clip->setAlpha(alpha);
        Bind();
    }
    NCFRESULT Add(ncfUInt32 fourCC, ncfUInt32 videoRange = 0) {
        MediaTrack* const alpha =
            mapping->mediaTracks_.size() > 1 ? mapping->mediaTracks_[1].get() : nullptr;
        return mapping->AddPixelFormat(mapping->mediaTracks_[0].get(), alpha, fourCC, videoRange);
    }
    Lines ConsoleTexts() {
        Lines texts;
        for (const auto& line : host->console().lines()) {
            texts.push_back(std::to_string(line.level) + ": " + line.text);
        }
        return texts;
    }
    const Lines kNothing;
};

bool IsRatio(const Rational& ratio, ncfSInt32 numerator) {
    return ratio == Rational{numerator, 1};
}

// --- the table of codes ------------------------------------------------------------

TEST_F(SampleMappingFormats, BGRAComesInTheRangeThatTheCodecMakes) {
    Movie(true);
    EXPECT_EQ(Add(kBGRAPixelFormat), NCF_OK);
    EXPECT_EQ(Offered(0), Lines{"8/4/2/1/2 <- BGRA"});
    EXPECT_EQ(Offered(1), Lines{"1024/128/1/1/2147483647 <- BGRA"});
    EXPECT_EQ(ConsoleTexts(),
              (Lines{"4: Adding support for BGRA.\n", "4: Adding support for a8.\n"}));
    EXPECT_EQ(Add(kBGRAPixelFormat, 1), NCF_OK);
    EXPECT_EQ(Offered(0), (Lines{"8/4/2/1/2 <- BGRA", "8/4/2/1/1 <- BGRA"}));
    EXPECT_EQ(Offered(1).size(), 1u) << "the alpha format is the same";
    EXPECT_TRUE(IsRatio(Format(0, 0).qt_params.decodedBytesPerPixel, 4));
    EXPECT_TRUE(IsRatio(Format(0, 0).qt_params.outputBytesPerPixel, 4));
    EXPECT_EQ(Format(0, 0).qt_params.convert, nullptr);
    EXPECT_TRUE(IsRatio(Format(1, 0).qt_params.decodedBytesPerPixel, 4));
    EXPECT_TRUE(IsRatio(Format(1, 0).qt_params.outputBytesPerPixel, 1));
    EXPECT_EQ(Format(1, 0).qt_params.convert, &ExtractAlpha8);
}

TEST_F(SampleMappingFormats, ThreeCodesAskForBGRA) {
    Movie();
    for (const ncfUInt32 code : {kBGRAPixelFormat, kRGBAPixelFormat, k32ARGBPixelFormat}) {
        EXPECT_EQ(Add(code), NCF_OK);
    }
    EXPECT_EQ(Offered(0), Lines{"8/4/2/1/2 <- BGRA"});
    EXPECT_EQ(Console(4, "Adding support for BGRA.\n"), 3);
}

TEST_F(SampleMappingFormats, EachOfTheThreeCodesTakesTheRangeOfTheCodec) {
    for (const ncfUInt32 code : {kBGRAPixelFormat, kRGBAPixelFormat, k32ARGBPixelFormat}) {
        mapping->mediaTracks_.clear();
        clip->video.clear();
        Movie();
        EXPECT_EQ(Add(code, 2), NCF_OK) << "any flag but 0";
        EXPECT_EQ(Add(code, 0), NCF_OK);
        EXPECT_EQ(Offered(0), (Lines{"8/4/2/1/1 <- BGRA", "8/4/2/1/2 <- BGRA"})) << CodeText(code);
    }
}

TEST_F(SampleMappingFormats, NVZ2IsAlwaysVideoRangeAndHasNoAlpha) {
    Movie(true);
    EXPECT_EQ(Add(kNVZ2PixelFormat, 0), NCF_OK);
    EXPECT_EQ(Add(kNVZ2PixelFormat, 1), NCF_OK);
    EXPECT_EQ(Offered(0), Lines{"8/4/2/1/1 <- NVZ2"});
    EXPECT_EQ(Offered(1), kNothing);
    EXPECT_EQ(Console(4, "Adding support for BGRA video range.\n"), 2);
    EXPECT_TRUE(IsRatio(Format(0, 0).qt_params.decodedBytesPerPixel, 4));
    EXPECT_TRUE(IsRatio(Format(0, 0).qt_params.outputBytesPerPixel, 4));
    EXPECT_EQ(Format(0, 0).qt_params.convert, nullptr);
}

TEST_F(SampleMappingFormats, B64aGivesWordsAndTenBitAlpha) {
    Movie(true);
    EXPECT_EQ(Add(kb64aPixelFormat), NCF_OK);
    EXPECT_EQ(Offered(0), Lines{"4/4/2/4096/1 <- b64a"});
    EXPECT_EQ(Offered(1), Lines{"1024/128/1/2/2147483647 <- b64a"});
    EXPECT_EQ(ConsoleTexts(),
              (Lines{"4: Adding support for 'b64a'.\n", "4: Adding support for a10.\n"}));
    EXPECT_TRUE(IsRatio(Format(0, 0).qt_params.decodedBytesPerPixel, 8));
    EXPECT_TRUE(IsRatio(Format(0, 0).qt_params.outputBytesPerPixel, 8));
    EXPECT_EQ(Format(0, 0).qt_params.convert, nullptr);
    EXPECT_TRUE(IsRatio(Format(1, 0).qt_params.decodedBytesPerPixel, 8));
    EXPECT_TRUE(IsRatio(Format(1, 0).qt_params.outputBytesPerPixel, 2));
    EXPECT_EQ(Format(1, 0).qt_params.convert, &ExtractAlpha10FromB64a);
}

TEST_F(SampleMappingFormats, R4flIsConvertedToWordsAndTenBitAlpha) {
    Movie(true);
    EXPECT_EQ(Add(kr4flPixelFormat), NCF_OK);
    EXPECT_EQ(Offered(0), Lines{"4/4/2/4096/1 <- r4fl"});
    EXPECT_EQ(Offered(1), Lines{"1024/128/1/2/2147483647 <- r4fl"});
    EXPECT_EQ(ConsoleTexts(),
              (Lines{"4: Adding support for 'r4fl'.\n", "4: Adding support for a10.\n"}));
    EXPECT_TRUE(IsRatio(Format(0, 0).qt_params.decodedBytesPerPixel, 16));
    EXPECT_TRUE(IsRatio(Format(0, 0).qt_params.outputBytesPerPixel, 8));
    EXPECT_EQ(Format(0, 0).qt_params.convert, &ConvertR4flToB64a);
    EXPECT_TRUE(IsRatio(Format(1, 0).qt_params.decodedBytesPerPixel, 16));
    EXPECT_TRUE(IsRatio(Format(1, 0).qt_params.outputBytesPerPixel, 2));
    EXPECT_EQ(Format(1, 0).qt_params.convert, &ExtractAlpha10FromR4fl);
}

TEST_F(SampleMappingFormats, EightBitYCbCrComesInTheClipsColourSpace) {
    Movie();
    clip->setColorSpace(CS_YCbCr_601);
    EXPECT_EQ(Add(k2vuyPixelFormat), NCF_OK);
    EXPECT_EQ(Offered(0), Lines{"2/1/4/1/1 <- 2vuy"});
    EXPECT_EQ(ConsoleTexts(), Lines{"4: Adding support for '2vuy'.\n"});
    EXPECT_TRUE(IsRatio(Format(0, 0).qt_params.decodedBytesPerPixel, 2));
    EXPECT_TRUE(IsRatio(Format(0, 0).qt_params.outputBytesPerPixel, 2));
    EXPECT_EQ(Format(0, 0).qt_params.convert, nullptr);
}

TEST_F(SampleMappingFormats, ClipWithoutColourKeepsItsColourSpace) {
    Movie();
    clip->setColorSpace(CS_MONO);
    clip->setSize(720, 576);
    EXPECT_EQ(Add(k2vuyPixelFormat), NCF_OK);
    EXPECT_EQ(Add(kv210PixelFormat), NCF_OK);
    EXPECT_EQ(Offered(0), (Lines{"2/1/1/1/1 <- 2vuy", "2/1/1/1024/1 <- 2vuy"}));
}

TEST_F(SampleMappingFormats, TenBitYCbCrIsAskedForAsEightBitWithFourBytesAPixel) {
    Movie();
    EXPECT_EQ(Add(kv210PixelFormat), NCF_OK);
    EXPECT_EQ(Offered(0), Lines{"2/1/8/1024/1 <- 2vuy"});
    EXPECT_EQ(ConsoleTexts(), Lines{"4: Adding support for 'v210'.\n"});
    EXPECT_TRUE(IsRatio(Format(0, 0).qt_params.decodedBytesPerPixel, 4));
    EXPECT_TRUE(IsRatio(Format(0, 0).qt_params.outputBytesPerPixel, 4));
}

TEST_F(SampleMappingFormats, YCbCrDoesNotGoWithAlpha) {
    Movie(true);
    EXPECT_EQ(Add(k2vuyPixelFormat), NCF_E_FAIL);
    EXPECT_EQ(Add(kv210PixelFormat), NCF_E_FAIL);
    clip->setLevels(Expand_Levels);
    EXPECT_EQ(Add(k2vuyPixelFormat), NCF_E_FAIL) << "alpha outranks the level";
    EXPECT_EQ(Offered(0), kNothing);
    EXPECT_TRUE(host->console().lines().empty());
    EXPECT_TRUE(log->records().empty());
}

TEST_F(SampleMappingFormats, LevelsOtherThanTheDefaultTakeThePictureThroughBGRA) {
    for (const ncfUInt32 level : {1u, 2u, 0u}) {
        clip->video.clear();
        mapping->mediaTracks_.clear();
        Movie();
        clip->setLevels(level);
        EXPECT_EQ(Add(k2vuyPixelFormat), NCF_OK);
        EXPECT_EQ(Offered(0), Lines{"8/4/2/1/1 <- NVZ2"});
        EXPECT_EQ(Add(kv210PixelFormat), NCF_E_FAIL);
    }
}

TEST_F(SampleMappingFormats, OtherCodesGiveNothing) {
    Movie();
    for (const ncfUInt32 code : {0u, 33u, kNVZ1PixelFormat, kb48rPixelFormat, 0xFFFFFFFFu}) {
        EXPECT_EQ(Add(code), NCF_E_FAIL);
    }
    EXPECT_EQ(Offered(0), kNothing);
    EXPECT_TRUE(log->records().empty());
    EXPECT_TRUE(host->console().lines().empty());
}

TEST_F(SampleMappingFormats, AlphaGoesToAnAlphaTrackOnlyAndThePictureStays) {
    Movie();
    AudioMediaTrack wrong;
    for (const ncfUInt32 code : {kBGRAPixelFormat, kb64aPixelFormat, kr4flPixelFormat}) {
        log->clear();
        EXPECT_EQ(mapping->AddPixelFormat(mapping->mediaTracks_[0].get(), &wrong, code, 0),
                  NCF_E_FAIL);
        EXPECT_TRUE(
            log->once(Check("NCFASSERT( MediaTrack::kVideoAlpha == alpha_track->GetTrackType() )",
                            "AddPixelFormat")));
    }
    EXPECT_EQ(Offered(0).size(), 3u);
    EXPECT_EQ(wrong.GetNumberOfFormats(), 0u);
    EXPECT_EQ(mapping->AddPixelFormat(mapping->mediaTracks_[0].get(), &wrong, kNVZ2PixelFormat, 0),
              NCF_OK)
        << "a row without alpha doesn't look";
}

TEST_F(SampleMappingFormats, PictureTrackIsNeeded) {
    Movie();
    EXPECT_EQ(mapping->AddPixelFormat(nullptr, nullptr, kBGRAPixelFormat, 0), NCF_E_INVALIDARG);
    EXPECT_TRUE(log->once(Check("CHK_INARG(video_track)", "AddPixelFormat")));
    EXPECT_EQ(mapping->AddDecompressorPixelFormats(nullptr, nullptr), NCF_E_INVALIDARG);
    EXPECT_TRUE(log->once(Check("CHK_INARG(video_track)", "AddDecompressorPixelFormats")));
}

TEST_F(SampleMappingFormats, ConsoleIsNeeded) {
    Movie();
    mapping->_pConsole = nullptr;
    EXPECT_EQ(mapping->AddDecompressorPixelFormats(mapping->mediaTracks_[0].get(), nullptr),
              NCF_E_POINTER);
    EXPECT_TRUE(log->once(Check("CHK_PTR(_pConsole)", "AddDecompressorPixelFormats")));
}

TEST_F(SampleMappingFormats, FormatKeepsTheClipsFieldsAsOfItsMaking) {
    Movie();
    clip->setFieldOrder(kTopFieldFirst);
    clip->setLayout(kLayoutSplit);
    clip->setOrientation(3);
    EXPECT_EQ(Add(kBGRAPixelFormat), NCF_OK);
    EXPECT_EQ(Format(0, 0).fieldOrder, static_cast<ncfUInt32>(kTopFieldFirst));
    EXPECT_EQ(Format(0, 0).frameLayout, static_cast<ncfUInt32>(kLayoutSplit));
    EXPECT_EQ(Format(0, 0).orientation, 3u);
    clip->setFieldOrder(kBottomFieldFirst);
    EXPECT_EQ(Add(kBGRAPixelFormat), NCF_OK);
    EXPECT_EQ(Offered(0).size(), 2u) << "another field order is another format";
    EXPECT_EQ(Format(0, 0).fieldOrder, static_cast<ncfUInt32>(kTopFieldFirst));
}

TEST_F(SampleMappingFormats, GivesTheClipsFailureWithTheTextOfItsRow) {
    Movie(true);
    const std::pair<const char*, const char*> calls[] = {
        {"GetBufferLineOrientation", "media_->GetBufferLineOrientation(&blo)"},
        {"GetTemporalFieldOrder", "media_->GetTemporalFieldOrder(&tfo)"},
        {"GetFrameBufferLayout", "media_->GetFrameBufferLayout(&fbl)"},
    };
    for (const auto& call : calls) {
        clip->results = {{call.first, NCF_E_ABORT}};
        EXPECT_EQ(Add(kBGRAPixelFormat, 1), NCF_E_ABORT);
        EXPECT_TRUE(log->once(Record("80000007", call.second, "AddImagePixelFormat")));
    }
    EXPECT_EQ(log->count(Record("80000007",
                                "AddImagePixelFormat(video_track, PF_BGRA, CSS_4444, CS_RGB, "
                                "CT_UCHAR, CRT_VideoRange, qt_params)",
                                "AddPixelFormat")),
              3);
    EXPECT_EQ(Add(kBGRAPixelFormat, 0), NCF_E_ABORT);
    EXPECT_TRUE(log->once(Record("80000007",
                                 "AddImagePixelFormat(video_track, PF_BGRA, CSS_4444, CS_RGB, "
                                 "CT_UCHAR, CRT_FullRange, qt_params)",
                                 "AddPixelFormat")));
    EXPECT_EQ(Add(kb64aPixelFormat), NCF_E_ABORT);
    EXPECT_EQ(Add(kr4flPixelFormat), NCF_E_ABORT);
    EXPECT_EQ(log->count(Record("80000007",
                                "AddImagePixelFormat(video_track, PF_ARGB, CSS_4444, CS_RGB, "
                                "CT_USHORT_BE_VideoRange, CRT_VideoRange, qt_params)",
                                "AddPixelFormat")),
              2);
    EXPECT_TRUE(host->console().lines().empty()) << "no line for what was not added";
    clip->setAlpha(false);
    EXPECT_EQ(Add(k2vuyPixelFormat), NCF_E_ABORT);
    EXPECT_TRUE(log->once(Record("80000007",
                                 "AddImagePixelFormat(video_track, PF_CbYCrY, CSS_4220, "
                                 "colorSpaceToUse, CT_UCHAR, CRT_VideoRange, qt_params)",
                                 "AddPixelFormat")));
    EXPECT_EQ(Add(kv210PixelFormat), NCF_E_ABORT);
    EXPECT_TRUE(log->once(Record("80000007",
                                 "AddImagePixelFormat(video_track, PF_CbYCrY, CSS_4220, "
                                 "colorSpaceToUse, CT_V210, CRT_VideoRange, qt_params)",
                                 "AddPixelFormat")));
}

TEST_F(SampleMappingFormats, FailureAtTheAlphaStepLeavesThePictureFormat) {
    struct Row {
        ncfUInt32 code;
        const char* type;
        const char* line;
    };
    const Row rows[] = {{kBGRAPixelFormat, "CT_UCHAR", "Adding support for BGRA.\n"},
                        {kb64aPixelFormat, "CT_10Bit", "Adding support for 'b64a'.\n"},
                        {kr4flPixelFormat, "CT_10Bit", "Adding support for 'r4fl'.\n"}};
    Movie(true);
    clip->results["GetBufferLineOrientation"] = NCF_E_ABORT;
    for (const Row& row : rows) {
        log->clear();
        host->console().clear();
        clip->spared["GetBufferLineOrientation"] = 1;
        EXPECT_EQ(Add(row.code), NCF_E_ABORT);
        EXPECT_TRUE(log->once(Record("80000007",
                                     std::string("AddImagePixelFormat(alpha_track, PF_Mono, "
                                                 "CSS_None, CS_MONO, ") +
                                         row.type + ", CRT_UNDEFINED, qt_params)",
                                     "AddPixelFormat")))
            << CodeText(row.code);
        EXPECT_EQ(ConsoleTexts(), Lines{std::string("4: ") + row.line});
    }
    EXPECT_EQ(Offered(0).size(), 3u);
    EXPECT_EQ(Offered(1), kNothing);
}

TEST_F(SampleMappingFormats, ClipWithoutFieldOrderHasNoFormats) {
    Movie();
    clip->setFieldOrder(kPropertyNotSet);
    EXPECT_EQ(Add(kBGRAPixelFormat), NMA_E_NOTSET);
}

// --- colour space by size --------------------------------------------------------------

TEST_F(SampleMappingFormats, ColourSpaceGoesBySizeWhereTheClipHasNone) {
    struct Case {
        ncfUInt32 width;
        ncfUInt32 height;
        ncfUInt32 space;
    };
    const Case cases[] = {{720, 576, CS_YCbCr_601}, {1920, 1080, CS_YCbCr_709},
                          {960, 720, CS_YCbCr_709}, {959, 720, CS_YCbCr_601},
                          {960, 719, CS_YCbCr_601}, {1280, 576, CS_YCbCr_601},
                          {959, 1080, CS_YCbCr_601}};
    for (const Case& size : cases) {
        for (const ncfUInt32 told : {CS_UNDEFINED, CS_RGB}) {
            mapping->mediaTracks_.clear();
            clip->video.clear();
            Movie();
            clip->setSize(size.width, size.height);
            clip->setColorSpace(told);
            EXPECT_EQ(Add(k2vuyPixelFormat), NCF_OK);
            EXPECT_EQ(Format(0, 0).colorSpace, size.space) << size.width << " " << size.height;
        }
    }
}

TEST_F(SampleMappingFormats, ColourSpaceNeedsAnOutputAndASize) {
    Movie();
    EXPECT_EQ(InferColorSpaceFromStandard(clip, nullptr), NCF_E_INVALIDARG);
    EXPECT_TRUE(log->once("CHK_INARG(colorSpace)InferColorSpaceFromStandard"));
    clip->setColorSpace(CS_UNDEFINED);
    clip->results["GetEncodedWidthAndHeight"] = NCF_E_HANDLE;
    EXPECT_EQ(Add(k2vuyPixelFormat), NCF_E_HANDLE);
    EXPECT_TRUE(log->once(Record(
        "80000006", "InferColorSpaceFromStandard(media_, &colorSpaceToUse)", "AddPixelFormat")));
}

TEST_F(SampleMappingFormats, OtherFailureOfTheColourSpaceIsAFailure) {
    Movie();
    clip->results["GetColorSpace"] = NCF_E_ABORT;
    EXPECT_EQ(Add(k2vuyPixelFormat), NCF_E_ABORT);
    EXPECT_TRUE(
        log->once(Record("80000007", "media_->GetColorSpace(&colorSpaceToUse)", "AddPixelFormat")));
}

// --- from the codec's list ------------------------------------------------------------------

TEST_F(SampleMappingFormats, CodecWithoutFormatsGives2vuy) {
    Movie();
    EXPECT_EQ(QueryImages(), NCF_OK);
    EXPECT_EQ(Offered(0), Lines{"2/1/8/1/1 <- 2vuy"});
}

// The list without codes is walked like any other and ends at the same format.
TEST_F(SampleMappingFormats, CodecWithoutFormatsIsAskedForSeveralAllTheSame) {
    Movie();
    clip->results["IsMultiFormatMovie"] = NCF_E_ABORT;
    EXPECT_EQ(QueryImages(), NCF_E_ABORT);
    EXPECT_EQ(Offered(0).size(), 1u);
    EXPECT_TRUE(mapping->imageFormatsReady_) << "there is a format, whatever failed after it";
    clip->results.clear();
    host->console().clear();
    EXPECT_EQ(mapping->AddDecompressorPixelFormats(mapping->mediaTracks_[0].get(), nullptr),
              NCF_OK);
    EXPECT_EQ(Offered(0), Lines{"2/1/8/1/1 <- 2vuy"});
    EXPECT_EQ(Console(4, "Adding support for '2vuy'.\n"), 2) << "told, though it is there";
}

TEST_F(SampleMappingFormats, LastResortFailsOnAClipWithAlpha) {
    Movie(true);
    const auto* const record =
        "AddPixelFormat(video_track, alpha_track, QuickTime::k2vuyPixelFormat, "
        "_codecSupportsRGB_CCIR)";
    property->codes = {kv210PixelFormat, k2vuyPixelFormat, 5};
    EXPECT_EQ(QueryImages(), NCF_E_FAIL) << "no code of the list makes a format";
    EXPECT_TRUE(log->once(Record("80000008", record, "AddDecompressorPixelFormats")));
    property->codes = {kBGRAPixelFormat};
    clip->multiFormat = 1;
    EXPECT_EQ(QueryImages(), NCF_E_FAIL) << "no codec's own formats for several";
    EXPECT_EQ(log->count(Record("80000008", record, "AddDecompressorPixelFormats")), 2);
    EXPECT_EQ(Offered(0), kNothing);
    EXPECT_EQ(Offered(1), kNothing);
    EXPECT_EQ(Console(2, "No one image pixel format was added for video track.\n"), 2);
    EXPECT_EQ(Console(2, "No one image pixel format was added for alpha track.\n"), 2);
    clip->multiFormat = 0;
    EXPECT_EQ(QueryImages(), NCF_OK);
    EXPECT_EQ(Offered(0), Lines{"8/4/2/1/2 <- BGRA"});
}

TEST_F(SampleMappingFormats, AlphaTrackAloneCanBeLeftWithoutFormats) {
    Movie(true);
    property->codes = {kNVZ2PixelFormat};
    EXPECT_EQ(QueryImages(), NCF_OK);
    EXPECT_EQ(Offered(0), Lines{"8/4/2/1/1 <- NVZ2"});
    EXPECT_EQ(Console(2, "No one image pixel format was added for video track.\n"), 0);
    EXPECT_EQ(Console(2, "No one image pixel format was added for alpha track.\n"), 1);
    EXPECT_TRUE(mapping->imageFormatsReady_) << "the picture decides";
}

TEST_F(SampleMappingFormats, AlphaThatIsIgnoredIsNoAlpha) {
    Movie();
    mapping->mediaTracks_.emplace_back(new VideoMediaTrack(MediaTrack::kVideoAlpha));
    clip->setAlpha(true);
    clip->setIgnoreAlpha(true);
    property->storageType = 1;
    property->codes = {k2vuyPixelFormat, kBGRAPixelFormat};
    EXPECT_EQ(QueryImages(), NCF_OK);
    EXPECT_EQ(Offered(0), (Lines{"2/1/8/1/1 <- 2vuy", "8/4/2/1/2 <- BGRA"}));
    EXPECT_EQ(Offered(1), kNothing);
    EXPECT_EQ(Console(2, "No one image pixel format was added for alpha track.\n"), 0);
}

TEST_F(SampleMappingFormats, CodecWithoutFormatsGivesNothingToAClipWithAlpha) {
    Movie(true);
    EXPECT_EQ(QueryImages(), NCF_E_FAIL);
    EXPECT_EQ(Offered(0), kNothing);
    EXPECT_EQ(Console(2, "No one image pixel format was added for video track.\n"), 1);
    EXPECT_EQ(Console(2, "No one image pixel format was added for alpha track.\n"), 1);
    EXPECT_TRUE(log->contains("No one image pixel format was added for video track."));
    EXPECT_TRUE(log->contains("No one image pixel format was added for alpha track."));
    EXPECT_TRUE(log->once(Record("80000008",
                                 "AddPixelFormat(video_track, alpha_track, "
                                 "QuickTime::k2vuyPixelFormat, _codecSupportsRGB_CCIR)",
                                 "AddDecompressorPixelFormats")));
}

TEST_F(SampleMappingFormats, YCbCrCodecGivesItsPreferredFormatsOnly) {
    Movie();
    property->codes = {kBGRAPixelFormat, k2vuyPixelFormat};
    EXPECT_EQ(QueryImages(), NCF_OK);
    EXPECT_EQ(Offered(0), Lines{"2/1/8/1/1 <- 2vuy"});
}

TEST_F(SampleMappingFormats, YCbCrCodecGives2vuyAndR4flOfADeepList) {
    Movie();
    property->codes = {k2vuyPixelFormat, kr4flPixelFormat, kv210PixelFormat, kb64aPixelFormat,
                       kBGRAPixelFormat};
    EXPECT_EQ(QueryImages(), NCF_OK);
    EXPECT_EQ(Offered(0), (Lines{"2/1/8/1/1 <- 2vuy", "4/4/2/4096/1 <- r4fl"}));
}

TEST_F(SampleMappingFormats, DeepListWithAlphaGivesR4flAndTenBitAlpha) {
    Movie(true);
    property->codes = {k2vuyPixelFormat, kr4flPixelFormat, kv210PixelFormat, kb64aPixelFormat,
                       kBGRAPixelFormat};
    EXPECT_EQ(QueryImages(), NCF_OK);
    EXPECT_EQ(Offered(0), Lines{"4/4/2/4096/1 <- r4fl"});
    EXPECT_EQ(Offered(1), Lines{"1024/128/1/2/2147483647 <- r4fl"});
}

TEST_F(SampleMappingFormats, RGBCodecGivesEverythingInItsOrder) {
    Movie();
    property->storageType = 1;
    property->codes = {kBGRAPixelFormat, 0x12345678, k2vuyPixelFormat};
    EXPECT_EQ(QueryImages(), NCF_OK);
    EXPECT_EQ(Offered(0), (Lines{"8/4/2/1/2 <- BGRA", "2/1/8/1/1 <- 2vuy"}));
    EXPECT_TRUE(log->records().empty() || !log->contains("NCF_RETURN(0x80000008)"))
        << "an unknown code is passed over in silence";
}

TEST_F(SampleMappingFormats, YCbCrCodecWithoutPreferredFormatsGivesTheOthers) {
    Movie();
    property->codes = {kNVZ1PixelFormat, kBGRAPixelFormat};
    EXPECT_EQ(QueryImages(), NCF_OK);
    EXPECT_EQ(Offered(0), Lines{"8/4/2/1/2 <- BGRA"}) << "NVZ1 is preferred, but makes nothing";
}

TEST_F(SampleMappingFormats, CodecWithUnknownFormatsOnlyGives2vuy) {
    Movie();
    property->storageType = 1;
    property->codes = {1, 2, 3};
    EXPECT_EQ(QueryImages(), NCF_OK);
    EXPECT_EQ(Offered(0), Lines{"2/1/8/1/1 <- 2vuy"});
}

TEST_F(SampleMappingFormats, CodecThatMakesRGBInVideoRangeChangesTheBGRARowOnly) {
    Movie();
    property->storageType = 1;
    property->videoRange = 1;
    property->codes = {kBGRAPixelFormat, kb64aPixelFormat};
    EXPECT_EQ(QueryImages(), NCF_OK);
    EXPECT_EQ(Offered(0), (Lines{"8/4/2/1/1 <- BGRA", "4/4/2/4096/1 <- b64a"}));
}

TEST_F(SampleMappingFormats, MovieOfSeveralFormatsGives2vuyOnly) {
    Movie();
    clip->multiFormat = 1;
    property->codes = {kr4flPixelFormat, kBGRAPixelFormat};
    EXPECT_EQ(QueryImages(), NCF_OK);
    EXPECT_EQ(Offered(0), Lines{"2/1/8/1/1 <- 2vuy"});
}

TEST_F(SampleMappingFormats, GivesTheFailureOfTheQuestionForSeveralFormats) {
    Movie();
    clip->results["IsMultiFormatMovie"] = NCF_E_ABORT;
    property->codes = {kBGRAPixelFormat};
    EXPECT_EQ(QueryImages(), NCF_E_ABORT);
    EXPECT_TRUE(log->once(Record("80000007", "media_->IsMultiFormatMovie(&isMultiformat)",
                                 "AddDecompressorPixelFormats")));
}

TEST_F(SampleMappingFormats, CopiesTheLevelWhenItLooksForFormats) {
    Movie();
    EXPECT_EQ(mapping->levelRemap_, static_cast<ncfUInt32>(Default_Levels));
    clip->setLevels(Compress_Levels);
    EXPECT_EQ(mapping->levelRemap_, static_cast<ncfUInt32>(Default_Levels));
    EXPECT_EQ(QueryImages(), NCF_OK);
    EXPECT_EQ(mapping->levelRemap_, static_cast<ncfUInt32>(Compress_Levels));
}

// --- asking the property component --------------------------------------------------------------

TEST_F(SampleMappingFormats, AsksThePropertyComponentInOrder) {
    Movie();
    property->codes = {kBGRAPixelFormat};
    EXPECT_EQ(QueryImages(), NCF_OK);
    const Lines lines = journal.lines();
    const Lines asked(lines.begin() + 2, lines.begin() + 7);
    EXPECT_EQ(asked, (Lines{"property.CreateMovie", "property.GetCodecStorageType",
                            "property.DoesCodecSupportRGB_CCIR", "property.GetCodecPixelFormats",
                            "codes.GetBufferPointer"}));
}

TEST_F(SampleMappingFormats, GivesTheFailureOfEachQuestion) {
    Movie();
    const std::pair<const char*, const char*> calls[] = {
        {"CreateMovie", "quickTimeProperty->CreateMovie(_filePath)"},
        {"GetCodecStorageType", "quickTimeProperty->GetCodecStorageType(&_codecStorageType)"},
        {"DoesCodecSupportRGB_CCIR",
         "quickTimeProperty->DoesCodecSupportRGB_CCIR(&_codecSupportsRGB_CCIR)"},
    };
    for (const auto& call : calls) {
        property->results = {{call.first, NCF_E_ABORT}};
        EXPECT_EQ(QueryImages(), NCF_E_ABORT);
        EXPECT_TRUE(
            log->once(Record("80000007", call.second, "AddSupportedImageFormatsBasedOnCodec")));
    }
    property->results.clear();
    property->codes = {kBGRAPixelFormat};
    property->bufferResult = NCF_E_HANDLE;
    EXPECT_EQ(QueryImages(), NCF_E_HANDLE);
    EXPECT_TRUE(
        log->once(Record("80000006", "pixBuffer->GetBufferPointer((void**)&codecPixelFormats_ptr)",
                         "AddSupportedImageFormatsBasedOnCodec")));
    EXPECT_EQ(Offered(0), kNothing);
}

TEST_F(SampleMappingFormats, NeedsThePropertyComponent) {
    Movie();
    host->refuseCreation(QuickTime::CompID_QuickTimeProperty, NCF_E_OUTOFMEMORY);
    EXPECT_EQ(QueryImages(), NCF_E_OUTOFMEMORY);
    EXPECT_TRUE(
        log->once(Record("80000002", "media_->GetQuickTimePropertyComponent(quickTimeProperty)",
                         "AddSupportedImageFormatsBasedOnCodec")));
}

TEST_F(SampleMappingFormats, CodecThatCannotTellItsFormatsHasNone) {
    Movie();
    property->codes = {kBGRAPixelFormat};
    property->results["GetCodecPixelFormats"] = NCF_E_FAIL;
    EXPECT_EQ(QueryImages(), NCF_OK);
    EXPECT_EQ(Offered(0), Lines{"2/1/8/1/1 <- 2vuy"});
    EXPECT_TRUE(mapping->codecPixelFormats_.empty());
    EXPECT_TRUE(log->records().empty()) << "no failure, no record";
}

TEST_F(SampleMappingFormats, CountWithoutABufferIsNoList) {
    Movie();
    property->codes = {kBGRAPixelFormat};
    property->bufferless = true;
    EXPECT_EQ(QueryImages(), NCF_OK);
    EXPECT_EQ(Offered(0), Lines{"2/1/8/1/1 <- 2vuy"});
}

TEST_F(SampleMappingFormats, ClipWithoutAPictureHasNoFormats) {
    AddAudio(1);
    Bind();
    EXPECT_EQ(QueryImages(), NCF_E_POINTER);
    EXPECT_TRUE(log->once(Check("CHK_PTR(video_track)", "AddSupportedImageFormatsBasedOnCodec")));
    EXPECT_EQ(journal.count("property.CreateMovie"), 0);
}

TEST_F(SampleMappingFormats, FirstOfSeveralPictureTracksGetsTheFormats) {
    AddVideo(1);
    AddVideo(2);
    Bind();
    EXPECT_EQ(QueryImages(), NCF_OK);
    EXPECT_EQ(Offered(0).size(), 1u);
    EXPECT_EQ(Offered(1), kNothing);
}

}  // namespace
