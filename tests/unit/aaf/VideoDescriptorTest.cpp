// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "host_interfaces/aaf/AAFDescriptors.h"
#include "source/aaf/VideoDescriptor.h"

#include "tests/unit/aaf/support/VideoDescriptorTest.h"

namespace NMA::Impl {
namespace {

constexpr char kAddVideoDescriptors[] = "NMA::Impl::AddVideoDescriptor";

// Without queries for other interfaces.
std::vector<std::string> CallsUntilTheLength(const std::vector<std::string>& lines) {
    std::vector<std::string> calls;
    for (const std::string& line : lines) {
        if (line.find("QueryInterface") == std::string::npos) {
            calls.push_back(line);
        }
        if (line.find("SetLength") != std::string::npos) {
            break;
        }
    }
    return calls;
}

TEST_F(VideoDescriptorTest, ChecksItsArgumentsInOrder) {
    const std::tr1::shared_ptr<BaseClip> none;
    EXPECT_EQ(AddVideoDescriptor(none, nullptr, nullptr, nullptr, nullptr, nullptr), NCF_E_POINTER);
    EXPECT_EQ(AddVideoDescriptor(Media(), nullptr, nullptr, nullptr, nullptr, nullptr),
              NCF_E_POINTER);
    EXPECT_EQ(AddVideoDescriptor(Media(), Console(), nullptr, nullptr, nullptr, nullptr),
              NCF_E_POINTER);
    EXPECT_EQ(AddVideoDescriptor(Media(), Console(), mob, nullptr, nullptr, nullptr),
              NCF_E_POINTER);
    EXPECT_EQ(AddVideoDescriptor(Media(), Console(), mob, header, nullptr, nullptr), NCF_E_POINTER);
    EXPECT_EQ(AddVideoDescriptor(Media(), Console(), mob, header, Dictionary(), nullptr),
              NCF_E_POINTER);
    std::vector<std::string> texts;
    for (const LoggedRecord& record : log.records()) {
        texts.push_back(record.text);
    }
    std::vector<std::string> expected;
    for (const char* name : {"media.get()", "pConsole", "pMobMasterMob", "pHeader", "pDictionary",
                             "pMultiDescriptor"}) {
        expected.push_back(std::string("CHK_PTR(") + name + ")" + kAddVideoDescriptors);
    }
    EXPECT_EQ(texts, expected);
}

TEST_F(VideoDescriptorTest, TheSampleProviderRoadInOrder) {
    ASSERT_EQ(Add(), NCF_OK);
    EXPECT_EQ(CallsUntilTheLength(aaf.journal().lines()),
              (std::vector<std::string>{
                  "Dictionary.CreateInstance CDCIDescriptor",
                  "CDCIDescriptor1.Initialize",
                  "MasterMob1.AppendComment 'Video' 'H.264'",
                  "MasterMob1.AppendComment 'Image Aspect Ratio' '16:9'",
                  "CDCIDescriptor1.SetBlackReferenceLevel 0",
                  "CDCIDescriptor1.SetWhiteReferenceLevel 255",
                  "MasterMob1.AppendComment 'Video File Format' 'MOV'",
                  "CDCIDescriptor1.SetCompression 0E040201-027F-0000-060E-2B3404010101",
                  "Dictionary.LookupContainerDef 060E2B34-0401-0101-0E04-040102010100",
                  "Dictionary.CreateInstance ContainerDef",
                  "ContainerDef1.Initialize 060E2B34-0401-0101-0E04-040102010100 '' ''",
                  "Dictionary.RegisterContainerDef ContainerDef1",
                  "CDCIDescriptor1.SetContainerFormat ContainerDef1",
                  "CDCIDescriptor1.SetFrameLayout 0",
                  "CDCIDescriptor1.SetStoredView 1080 1920",
                  "CDCIDescriptor1.SetSampledView 1080 0 0 0",
                  "CDCIDescriptor1.SetDisplayView 1080 1920 0 0",
                  "CDCIDescriptor1.SetImageAspectRatio 16/9",
                  "CDCIDescriptor1.SetSampleRate 25/1",
                  "CDCIDescriptor1.SetLength 100"}));
    const std::vector<std::string>& all = aaf.journal().lines();
    EXPECT_EQ(std::vector<std::string>(all.end() - 3, all.end()),
              (std::vector<std::string>{
                  "MultipleDescriptor1.GetSampleRate", "MultipleDescriptor1.SetSampleRate 25/1",
                  "MultipleDescriptor1.AppendFileDescriptor CDCIDescriptor1"}));
}

TEST_F(VideoDescriptorTest, AProviderClipHasNoComponentValues) {
    ASSERT_EQ(Add(), NCF_OK);
    for (const char* method :
         {"SetVideoLineMap", "SetFieldStartOffset", "SetComponentWidth", "SetHorizontalSubsampling",
          "SetVerticalSubsampling", "SetColorSiting", "SetColorRange", "SetMaxGOP",
          "SetPixelLayout", "CreateValue ["}) {
        EXPECT_FALSE(Called(method)) << method;
    }
}

TEST_F(VideoDescriptorTest, AskTheClipInOrder) {
    journal.clear();
    ASSERT_EQ(Add(), NCF_OK);
    std::vector<std::string> asked = journal.startingWith("clip ");
    EXPECT_EQ(asked,
              (std::vector<std::string>{"clip IsVideoSampleProviderMedia", "clip GetDataFormat",
                                        "clip GetCodecName", "clip GetEncodedWidthAndHeight",
                                        "clip GetImageAspectRatio", "clip GetNMAFrameLayout",
                                        "clip GetColorDetails", "clip GetEditRate",
                                        "clip GetMovieLength", "clip GetGeometryDetails"}));
}

struct LayoutCase {
    ncfUInt32 width;
    ncfUInt32 height;
    NCFRESULT result;
    ncfUInt32 layout;
    int expectedLayout;
    int expectedHeight;
};

void PrintTo(const LayoutCase& given, std::ostream* to) {
    *to << given.width << 'x' << given.height << " layout " << given.layout << " result "
        << static_cast<ncfUInt32>(given.result);
}

class FrameLayoutTest : public VideoDescriptorTest,
                        public ::testing::WithParamInterface<LayoutCase> {};

TEST_P(FrameLayoutTest, HalvesTheHeightOfSeparateFields) {
    const LayoutCase& given = GetParam();
    clip->pictureWidth = given.width;
    clip->pictureHeight = given.height;
    clip->layoutResult = given.result;
    clip->layout = given.layout;
    ASSERT_EQ(Add(), NCF_OK);
    const std::string height = std::to_string(given.expectedHeight);
    const std::string width = std::to_string(given.width);
    EXPECT_TRUE(aaf.has("CDCIDescriptor1.SetFrameLayout " + std::to_string(given.expectedLayout)));
    EXPECT_TRUE(aaf.has("CDCIDescriptor1.SetStoredView " + height + " " + width));
    EXPECT_TRUE(aaf.has("CDCIDescriptor1.SetSampledView " + height + " 0 0 0"));
    EXPECT_TRUE(aaf.has("CDCIDescriptor1.SetDisplayView " + height + " " + width + " 0 0"));
}

INSTANTIATE_TEST_SUITE_P(
    Rasters, FrameLayoutTest,
    ::testing::Values(LayoutCase{1920, 1080, NCF_OK, 0, 0, 1080},
                      LayoutCase{1920, 1080, NCF_OK, 1, 1, 540},
                      LayoutCase{720, 486, NCF_E_PARAMETERNOTAVAILABLE, 0, 1, 243},
                      LayoutCase{720, 576, NCF_E_PARAMETERNOTAVAILABLE, 0, 1, 288},
                      LayoutCase{720, 480, NCF_E_PARAMETERNOTAVAILABLE, 0, 0, 480},
                      LayoutCase{704, 576, NCF_E_PARAMETERNOTAVAILABLE, 0, 0, 576},
                      LayoutCase{1920, 1080, NCF_E_PARAMETERNOTAVAILABLE, 0, 0, 1080},
                      LayoutCase{720, 486, NCF_OK, 0, 0, 486},
                      LayoutCase{1920, 1081, NCF_OK, 1, 1, 540}));

TEST_F(VideoDescriptorTest, AnyOtherLayoutAnswerIsReturnedWithoutALogLine) {
    for (const NCFRESULT answer : {NCF_E_FAIL, NCFRESULT(1)}) {
        clip->layoutResult = answer;
        EXPECT_EQ(Add(), answer);
    }
    EXPECT_FALSE(log.contains("GetNMAFrameLayout"));
}

TEST_F(VideoDescriptorTest, APictureOfNoSizeIsRefused) {
    clip->pictureHeight = 1;
    clip->layout = 1;
    EXPECT_EQ(Add(), NCF_E_FAIL);
    EXPECT_TRUE(log.once(std::string("NCFASSERT( aafInfo.displayHeight && aafInfo.displayWidth )") +
                         kAddVideoDescriptors));
    // What comes before the display is set, nothing behind it.
    EXPECT_TRUE(aaf.has("CDCIDescriptor1.SetSampledView 0 0 0 0"));
    EXPECT_FALSE(Called("SetDisplayView"));
    clip->layout = 0;
    clip->pictureWidth = 0;
    EXPECT_EQ(Add(), NCF_E_FAIL);
}

TEST_F(VideoDescriptorTest, TheDirectRoadInOrder) {
    MakeNative("cdci");
    ASSERT_EQ(Add(), NCF_OK);
    EXPECT_EQ(CallsUntilTheLength(aaf.journal().lines()),
              (std::vector<std::string>{
                  "Dictionary.CreateInstance CDCIDescriptor",
                  "CDCIDescriptor1.Initialize",
                  "CDCIDescriptor1.SetFieldStartOffset 8",
                  "CDCIDescriptor1.SetVideoLineMap 42 7",
                  "CDCIDescriptor1.SetComponentWidth 10",
                  "CDCIDescriptor1.SetHorizontalSubsampling 2",
                  "CDCIDescriptor1.SetVerticalSubsampling 1",
                  "CDCIDescriptor1.SetColorSiting 4",
                  "CDCIDescriptor1.SetColorRange 897",
                  "CDCIDescriptor1.SetBlackReferenceLevel 64",
                  "CDCIDescriptor1.SetWhiteReferenceLevel 940",
                  "MasterMob1.AppendComment 'Video File Format' 'MOV'",
                  "CDCIDescriptor1.SetCompression 04010202-0306-0100-060E-2B340401010D",
                  "Dictionary.LookupContainerDef 0D010301-021C-0100-060E-2B340401010D",
                  "Dictionary.CreateInstance ContainerDef",
                  "ContainerDef1.Initialize 0D010301-021C-0100-060E-2B340401010D '' ''",
                  "Dictionary.RegisterContainerDef ContainerDef1",
                  "CDCIDescriptor1.SetContainerFormat ContainerDef1",
                  "CDCIDescriptor1.SetFrameLayout 0",
                  "CDCIDescriptor1.SetStoredView 1088 1920",
                  "CDCIDescriptor1.SetSampledView 1088 1918 0 0",
                  "CDCIDescriptor1.SetDisplayView 1080 1900 0 4",
                  "CDCIDescriptor1.SetImageAspectRatio 16/9",
                  "CDCIDescriptor1.SetSampleRate 25/1",
                  "CDCIDescriptor1.SetLength 100"}));
}

TEST_F(VideoDescriptorTest, ARecordWithSlicesHasTheirCount) {
    MakeNative("cdci");
    ASSERT_EQ(Add(), NCF_OK);
    EXPECT_TRUE(aaf.has("CDCIDescriptor1.SetPropertyValue PropertyAVCISliceCount1 Value1"));
    // The count stands before the boxes.
    EXPECT_LT(aaf.place("CDCIDescriptor1.SetPropertyValue PropertyAVCISliceCount1"),
              aaf.place("CDCIDescriptor1.SetPropertyValue PropertyEssenceBox1"));
}

TEST_F(VideoDescriptorTest, ARecordWithoutSlicesHasNone) {
    MakeNative("mpeg");
    ASSERT_EQ(Add(), NCF_OK);
    EXPECT_FALSE(Called("SetPropertyValue PropertyAVCISliceCount"));
}

TEST_F(VideoDescriptorTest, AnMpegPictureHasTheClassOfItsOwnSeenAsComponents) {
    MakeNative("mpeg");
    ASSERT_EQ(Add(), NCF_OK);
    EXPECT_EQ(aaf.linesOf("MPEGVideoDescriptor1").at(0), "MPEGVideoDescriptor1.InitializeMPEG");
    EXPECT_EQ(aaf.linesOf("MPEGVideoDescriptor1").at(1), "MPEGVideoDescriptor1.SetMaxGOP 12");
    EXPECT_EQ(aaf.linesOf("MPEGVideoDescriptor1").at(2),
              "MPEGVideoDescriptor1.SetBitRate 50000000");
    EXPECT_EQ(aaf.linesOf("MPEGVideoDescriptor1").at(3),
              "MPEGVideoDescriptor1.SetProfileAndLevel 130");
    EXPECT_EQ(aaf.linesOf("MPEGVideoDescriptor1").at(5), "MPEGVideoDescriptor1.Initialize");
    EXPECT_TRUE(aaf.has("MPEGVideoDescriptor1.SetComponentWidth 10"));
    EXPECT_EQ(aaf.place("Dictionary.CreateInstance CDCIDescriptor"), -1);
}

TEST_F(VideoDescriptorTest, AProviderClipAfterAnMpegClipHasTheCommonClass) {
    MakeNative("mpeg");
    ASSERT_EQ(Add(), NCF_OK);
    clip->askRetriever = false;
    aaf.clearJournal();
    ASSERT_EQ(Add(), NCF_OK);
    EXPECT_TRUE(aaf.has("Dictionary.CreateInstance CDCIDescriptor"));
    EXPECT_FALSE(Called("InitializeMPEG"));
}

TEST_F(VideoDescriptorTest, AnRgbaPictureHasAPixelLayoutAndItsOwnLevels) {
    MakeNative("rgba");
    ASSERT_EQ(Add(), NCF_OK);
    EXPECT_TRUE(aaf.has("RGBADescriptor1.SetPixelLayout 82x8 71x8 66x8"));
    EXPECT_TRUE(aaf.has("RGBADescriptor1.SetComponentMinRef 1"));
    EXPECT_TRUE(aaf.has("RGBADescriptor1.SetComponentMaxRef 254"));
    EXPECT_LT(aaf.place("RGBADescriptor1.SetComponentMinRef"),
              aaf.place("RGBADescriptor1.SetComponentMaxRef"));
    EXPECT_FALSE(Called("SetComponentWidth"));
    EXPECT_FALSE(Called("SetBlackReferenceLevel"));
    EXPECT_EQ(aaf.place("RGBADescriptor1.Initialize"), -1);
}

TEST_F(VideoDescriptorTest, AProviderClipAfterAnRgbaClipFails) {
    MakeNative("rgba");
    ASSERT_EQ(Add(), NCF_OK);
    clip->askRetriever = false;
    try {
        Add();
        FAIL() << "the missing RGBA object was not noticed";
    } catch (const char* text) {
        EXPECT_STREQ(text, "_rep");
    }
}

struct LevelsCase {
    const char* name;
    const char* record;  // none for the sample provider
    int refBlack, refWhite;
    const char* black;
    const char* white;
};

void PrintTo(const LevelsCase& given, std::ostream* to) {
    *to << given.name;
}

class ReferenceLevelsTest : public VideoDescriptorTest,
                            public ::testing::WithParamInterface<LevelsCase> {};

TEST_P(ReferenceLevelsTest, AreThoseOfTheClipWhereItGivesBoth) {
    const LevelsCase& given = GetParam();
    if (given.record) {
        MakeNative(given.record);
    }
    clip->color().refBlack = given.refBlack;
    clip->color().refWhite = given.refWhite;
    ASSERT_EQ(Add(), NCF_OK);
    EXPECT_TRUE(aaf.has(given.black));
    EXPECT_TRUE(aaf.has(given.white));
}

// A level is missing only where all its bits are set.
INSTANTIATE_TEST_SUITE_P(
    Levels, ReferenceLevelsTest,
    ::testing::Values(
        LevelsCase{"both", nullptr, 4, 1019, "CDCIDescriptor1.SetBlackReferenceLevel 4",
                   "CDCIDescriptor1.SetWhiteReferenceLevel 1019"},
        LevelsCase{"black_alone", nullptr, 4, -1, "CDCIDescriptor1.SetBlackReferenceLevel 0",
                   "CDCIDescriptor1.SetWhiteReferenceLevel 255"},
        LevelsCase{"white_alone", nullptr, -1, 1019, "CDCIDescriptor1.SetBlackReferenceLevel 0",
                   "CDCIDescriptor1.SetWhiteReferenceLevel 255"},
        LevelsCase{"not_all_bits", nullptr, 0, -2, "CDCIDescriptor1.SetBlackReferenceLevel 0",
                   "CDCIDescriptor1.SetWhiteReferenceLevel 4294967294"},
        LevelsCase{"rgba", "rgba", 16, 235, "RGBADescriptor1.SetComponentMinRef 16",
                   "RGBADescriptor1.SetComponentMaxRef 235"}),
    [](const auto& test) { return std::string(test.param.name); });

TEST_F(VideoDescriptorTest, AVendorsMetadataIsToldAndLabelled) {
    clip->color().hasVendorMetadata = true;
    clip->color().transferCharacteristicUID = ncfGuid("0E170000-0001-0101-060E-2B340401010C");
    ASSERT_EQ(Add(), NCF_OK);
    EXPECT_EQ(host.console().count(
                  4, "Supported vendor found. Filling vendor-specific metadata into AAF\n"),
              1);
    EXPECT_TRUE(
        aaf.has("CDCIDescriptor1.SetTransferCharacteristic 0E170000-0001-0101-060E-2B340401010C"));
    EXPECT_FALSE(Called("SetColorPrimaries"));
}

TEST_F(VideoDescriptorTest, CodesOfTheColourAtomAreLabelled) {
    clip->color().transferFunction = 1;
    clip->color().colorPrimaries = 6;
    ASSERT_EQ(Add(), NCF_OK);
    EXPECT_TRUE(Called("SetTransferCharacteristic 04010101-0102-0000-060E-2B3404010101"));
    EXPECT_TRUE(Called("SetColorPrimaries 04010101-0301-0000-060E-2B3404010106"));
}

TEST_F(VideoDescriptorTest, AKnownContainerIsNotRegisteredAgain) {
    ASSERT_EQ(Add(), NCF_OK);
    aaf.clearJournal();
    ASSERT_EQ(Add(), NCF_OK);
    EXPECT_EQ(aaf.place("Dictionary.RegisterContainerDef"), -1);
    EXPECT_TRUE(aaf.has("CDCIDescriptor2.SetContainerFormat ContainerDef1"));
}

TEST_F(VideoDescriptorTest, AnyAnswerButZeroMeansThatTheContainerIsUnknown) {
    aaf.refuse("Dictionary.LookupContainerDef", HRESULT(1));
    ASSERT_EQ(Add(), NCF_OK);
    EXPECT_TRUE(aaf.has("CDCIDescriptor1.SetContainerFormat ContainerDef1"));
}

TEST_F(VideoDescriptorTest, ASecondDescriptorIsLikeTheFirst) {
    MakeNative("cdci");
    ASSERT_EQ(Add(), NCF_OK);
    std::vector<std::string> first = aaf.linesOf("CDCIDescriptor1.Set");
    ASSERT_EQ(Add(), NCF_OK);
    std::vector<std::string> second = aaf.linesOf("CDCIDescriptor2.Set");
    ASSERT_EQ(first.size(), second.size());
    for (std::size_t i = 0; i < first.size(); ++i) {
        if (first[i].find("SetPropertyValue") == std::string::npos) {
            EXPECT_EQ(first[i].substr(15), second[i].substr(15));
        }
    }
    EXPECT_EQ(aaf.journal().count("MasterMob1.AppendComment 'Video File Format' 'MOV'"), 2);
    EXPECT_EQ(aaf.linesOf("MultipleDescriptor1.SetSampleRate").size(), 1u);
    EXPECT_TRUE(aaf.has("MultipleDescriptor1.AppendFileDescriptor CDCIDescriptor2"));
}

TEST_F(VideoDescriptorTest, ARecordReadByHalfLeavesItsTracesOnTheProviderRoad) {
    clip->halfReadRecord = true;
    clip->record.pictureEssenceCoding = ncfGuid("04010202-0306-0100-060E-2B340401010D");
    clip->record.sampledWidth = 33;
    clip->record.displayYOffset = 2;
    clip->record.swapAspectRatio = true;
    clip->record.sliceCounter = 10;
    ASSERT_EQ(Add(), NCF_OK);
    EXPECT_TRUE(aaf.has("CDCIDescriptor1.SetCompression 04010202-0306-0100-060E-2B340401010D"));
    EXPECT_TRUE(aaf.has("CDCIDescriptor1.SetSampledView 1080 33 0 0"));
    EXPECT_TRUE(aaf.has("CDCIDescriptor1.SetDisplayView 1080 1920 0 2"));
    // Only the exchange of the aspect is undone, and slices are for native pictures.
    EXPECT_TRUE(aaf.has("CDCIDescriptor1.SetImageAspectRatio 16/9"));
    EXPECT_FALSE(Called("SetPropertyValue PropertyAVCISliceCount"));
}

TEST_F(VideoDescriptorTest, AnEmptyLineMapIsTheLibrarysToRefuse) {
    clip->nativePicture = 1;
    clip->record.displayHeight = clip->record.displayWidth = 10;
    EXPECT_EQ(Add(), AAFRESULT_NULL_PARAM);
    EXPECT_TRUE(log.returned(AAFRESULT_NULL_PARAM,
                             "pDigitalImageDescriptor->SetVideoLineMap( "
                             "(aafUInt32)aafInfo.videoLineMapVect.size(), "
                             "(aafInt32*)&aafInfo.videoLineMapVect[0] )",
                             kAddVideoDescriptors));
}

TEST_F(VideoDescriptorTest, AFailedPolicyIsReturnedAsItStands) {
    for (const NCFRESULT answer : {NCF_E_HANDLE, NCFRESULT(2)}) {
        clip->failures["IsVideoSampleProviderMedia"] = answer;
        EXPECT_EQ(Add(), answer);
    }
    EXPECT_EQ(aaf.callCount(), 0);
}

TEST_F(VideoDescriptorTest, FailuresOfTheClipAreLoggedAndReturned) {
    const std::pair<const char*, const char*> statements[] = {
        {"GetDataFormat", "AddVideoBinColumnEntry(media, pMobMasterMob, pConsole)"},
        {"GetEncodedWidthAndHeight", "media->GetEncodedWidthAndHeight(&movieWidth, &movieHeight)"},
        {"GetImageAspectRatio",
         "media->GetImageAspectRatio(&pictAspectRatioNumerator, &pictAspectRatioDenominator)"},
        {"GetColorDetails", "media->GetColorDetails(&colorDetails)"},
        {"GetEditRate", "media->GetEditRate(&movieEditRate)"},
        {"GetMovieLength", "media->GetMovieLength(&movieLength)"},
        {"GetGeometryDetails", "media->GetGeometryDetails(&geometryDetails)"},
    };
    for (const auto& [operation, statement] : statements) {
        clip->failures = {{operation, NCF_E_NOTFOUND}};
        EXPECT_EQ(Add(), NCF_E_NOTFOUND) << operation;
        EXPECT_TRUE(log.returned(NCF_E_NOTFOUND, statement, kAddVideoDescriptors)) << operation;
    }
}

TEST_F(VideoDescriptorTest, ARefusedFileFormatCellEndsTheClip) {
    aaf.refuse("MasterMob1.AppendComment 'Video File Format'");
    EXPECT_EQ(Add(), NCF_E_FAIL);
    EXPECT_TRUE(log.returned(NCF_E_FAIL,
                             "AddBinColumnEntry(pMobMasterMob, pConsole, &vff[0], &QTVff[0])",
                             kAddVideoDescriptors));
}

TEST_F(VideoDescriptorTest, TheMultipleDescriptorsRateIsSetOnceOnly) {
    EXPECT_EQ(FixMultiDescSampleRate(nullptr, {25, 1}), NCF_E_INVALIDARG);
    EXPECT_TRUE(log.once("CHK_INARG(pMultiDesc)NMA::Impl::FixMultiDescSampleRate"));
    EXPECT_EQ(FixMultiDescSampleRate(multi, {48000, 1}), NCF_OK);
    EXPECT_EQ(FixMultiDescSampleRate(multi, {25, 1}), NCF_OK);
    EXPECT_EQ(aaf.linesOf("MultipleDescriptor1.SetSampleRate"),
              std::vector<std::string>{"MultipleDescriptor1.SetSampleRate 48000/1"});
}

TEST_F(VideoDescriptorTest, AnyRateButZeroOverZeroIsARate) {
    for (const aafRational_t& rate : {aafRational_t{0, 1}, aafRational_t{1, 0}}) {
        const auto other = Make<IAAFMultipleDescriptor>("Other");
        EXPECT_EQ(FixMultiDescSampleRate(other, rate), NCF_OK);
        aaf.clearJournal();
        EXPECT_EQ(FixMultiDescSampleRate(other, {25, 1}), NCF_OK);
        EXPECT_FALSE(Called("SetSampleRate"));
    }
}

TEST_F(VideoDescriptorTest, TheMultipleDescriptorsRateLogsTheStatementThatFailed) {
    const std::pair<const char*, const char*> statements[] = {
        {"MultipleDescriptor1.QueryInterface",
         "pMultiDesc->QueryInterface(IID_IAAFFileDescriptor, (void**)&pFileDescriptor)"},
        {"MultipleDescriptor1.GetSampleRate", "pFileDescriptor->GetSampleRate(&currentSampleRate)"},
        {"MultipleDescriptor1.SetSampleRate", "pFileDescriptor->SetSampleRate(sampleRate)"},
    };
    for (const auto& [call, statement] : statements) {
        aaf.clearRefusals();
        aaf.refuse(call, AAFRESULT_NOMEMORY);
        EXPECT_EQ(FixMultiDescSampleRate(multi, {25, 1}), AAFRESULT_NOMEMORY);
        EXPECT_TRUE(
            log.returned(AAFRESULT_NOMEMORY, statement, "NMA::Impl::FixMultiDescSampleRate"));
    }
}

}  // namespace
}  // namespace NMA::Impl
