// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/descriptor_data/QuickTimeToAAFInfoRetriever.h"

#include <gtest/gtest.h>

#include <map>
#include <set>
#include <thread>

#include "tests/unit/descriptor_data/AAFInfoFile.h"
#include "tests/unit/descriptor_data/FakeClip.h"

namespace {

constexpr char kGetInfo[] = "QuickTimeToAAFInfoRetriever::GetInfoFromImageDescription";

constexpr ncfUInt32 Code(const char (&text)[5]) {
    return static_cast<ncfUInt32>(text[0]) << 24 | static_cast<ncfUInt32>(text[1]) << 16 |
           static_cast<ncfUInt32>(text[2]) << 8 | static_cast<ncfUInt32>(text[3]);
}

// The values of an entry by name, so that a test can leave one out.
using Values = std::map<std::string, std::string>;

Values CommonValues() {
    return {{"PictureEssenceCoding", "060e2b34-04010101-04010202-02010100"},
            {"EssenceContainerLabel", "060e2b34-04010101-0d010301-02020101"},
            {"FrameLayout", "1"},
            {"ImageStartOffset", "3"},
            {"ImageAlignmentOffset", "4"},
            {"StoredWidth", "720"},
            {"StoredHeight", "256"},
            {"SampledWidth", "718"},
            {"DisplayWidth", "716"},
            {"DisplayHeight", "243"},
            {"DisplayYOffset", "13"},
            {"AspectRatio",
             "<types:Numerator>4</types:Numerator>"
             "<types:Denominator>3</types:Denominator>"},
            {"VideoLineMap", "<rp210:Element>7</rp210:Element><rp210:Element>270</rp210:Element>"}};
}

Values CDCIValues() {
    Values values = CommonValues();
    values.insert({{"ComponentDepth", "10"},
                   {"HorizontalSubsampling", "2"},
                   {"VerticalSubsampling", "2"},
                   {"ColorSiting", "4"},
                   {"ColorRange", "897"},
                   {"BlackRefLevel", "64"},
                   {"WhiteReflevel", "940"}});
    return values;
}

Values MPEG2Values() {
    Values values = CDCIValues();
    values.insert({{"ProfileAndLevel", "0x82"}, {"BitRate", "50000000"}, {"MaxGOP", "15"}});
    return values;
}

Values RGBAValues() {
    Values values = CommonValues();
    values.insert({{"ComponentMinRef", "1"},
                   {"ComponentMaxRef", "254"},
                   {"PixelLayout",
                    "<rp210:RGBALayout><rp210:Code>B</rp210:Code><rp210:Depth>8</rp210:Depth>"
                    "</rp210:RGBALayout>"}});
    return values;
}

class RetrieverTest : public AAFInfoFile {
protected:
    ~RetrieverTest() override { ShutDownInfoRetriever(); }

    static std::string Join(const Values& values) {
        std::string joined;
        for (const auto& [name, value] : values) {
            joined += Value(name, value);
        }
        return joined;
    }
    // The mapper knows "code" as 1; the descriptor file is the test's.
    NCFRESULT Init(const std::string& entries,
                   const std::string& mapping = "<FourCharMapping FourChar='code' vcid='1'/>") {
        MakeItTheModulesFolder();
        Write("map.xml", "<Map>" + mapping + "</Map>");
        Write("info.xml", Document(entries));
        return QuickTimeToAAFInfoRetriever::Init(&host.console(), host.factory(), "map.xml",
                                                 "info.xml");
    }
    NCFRESULT GetInfo() {
        id_ = 77;
        return QuickTimeToAAFInfoRetriever::GetInstance()->GetInfoFromImageDescription(
            &clip_, &info_, &id_);
    }
    NCFRESULT InitAndGetInfo(const std::string& kind, const Values& values) {
        EXPECT_EQ(Init(Entry("1", kind, Join(values))), NCF_OK);
        return GetInfo();
    }
    static bool IsMPEG() { return QuickTimeToAAFInfoRetriever::GetInstance()->IsMPEGDescriptor(); }
    static bool IsRGBA() { return QuickTimeToAAFInfoRetriever::GetInstance()->IsRGBADescriptor(); }

    struct Clip {
        FakeClip clip;
        Clip() {
            clip.code = Code("code");
            clip.vendor = Code("appl");
            clip.width = 720;
            clip.height = 486;
            clip.layout = 1;
        }
    };
    Clip holder_;
    FakeClip& clip_ = holder_.clip;
    AAFInfo info_;
    ncfUInt32 id_ = 77;
};

// --- life ---------------------------------------------------------------------

TEST_F(RetrieverTest, IsMadeOnceFromTheModulesFolder) {
    EXPECT_EQ(QuickTimeToAAFInfoRetriever::GetInstance(), nullptr);
    EXPECT_EQ(Init(Entry("1", "CDCI", Join(CDCIValues()))), NCF_OK);
    QuickTimeToAAFInfoRetriever* const made = QuickTimeToAAFInfoRetriever::GetInstance();
    ASSERT_NE(made, nullptr);
    EXPECT_EQ(QuickTimeToAAFInfoRetriever::Init(&host.console(), host.factory(), "none", "none"),
              NCF_OK);
    EXPECT_EQ(QuickTimeToAAFInfoRetriever::GetInstance(), made);
    EXPECT_TRUE(host.console().lines().empty());
}

TEST_F(RetrieverTest, ReadsTheMapperBeforeTheDescriptors) {
    UseScript();
    SetModulesFolder("D:\\plugins\\");
    EXPECT_EQ(QuickTimeToAAFInfoRetriever::Init(&host.console(), host.factory(), "a.xml", "b.xml"),
              NCF_OK);
    EXPECT_EQ(journal.startingWith("parser Parse"),
              (std::vector<std::string>{"parser Parse 0 D:\\plugins\\a.xml",
                                        "parser Parse 0 D:\\plugins\\b.xml"}));
}

TEST_F(RetrieverTest, AddsNoSeparatorToTheFolder) {
    UseScript();
    SetModulesFolder("folder");
    EXPECT_EQ(QuickTimeToAAFInfoRetriever::Init(&host.console(), host.factory(), "a.xml", "b.xml"),
              NCF_OK);
    EXPECT_EQ(journal.count("parser Parse 0 foldera.xml"), 1);
}

TEST_F(RetrieverTest, AMissingMapperLeavesNothingAndTheNextClipTriesAgain) {
    MakeItTheModulesFolder();
    Write("info.xml", Document(""));
    const auto init = [this] {
        return QuickTimeToAAFInfoRetriever::Init(&host.console(), host.factory(), "map.xml",
                                                 "info.xml");
    };
    EXPECT_EQ(init(), ncf_detail::Code(0x8000FFFF));
    EXPECT_EQ(QuickTimeToAAFInfoRetriever::GetInstance(), nullptr);
    EXPECT_EQ(init(), NCF_E_UNEXPECTED);
    EXPECT_EQ(host.console().count(1, "Unable to init QuickTimeToAAFInfoRetriever.\n"), 2);
    EXPECT_TRUE(log.contains("ParseHelperFunctions::ParseXMLfilePath: "));
    Write("map.xml", "<Map/>");
    EXPECT_EQ(init(), NCF_OK);
}

TEST_F(RetrieverTest, AMissingOrBrokenDescriptorFileIsTheSameFailure) {
    MakeItTheModulesFolder();
    Write("map.xml", "<Map/>");
    EXPECT_EQ(QuickTimeToAAFInfoRetriever::Init(&host.console(), host.factory(), "map.xml", "none"),
              NCF_E_UNEXPECTED);
    Write("broken.xml", "<Infos>");
    EXPECT_EQ(
        QuickTimeToAAFInfoRetriever::Init(&host.console(), host.factory(), "map.xml", "broken.xml"),
        NCF_E_UNEXPECTED);
    EXPECT_EQ(QuickTimeToAAFInfoRetriever::GetInstance(), nullptr);
    EXPECT_EQ(host.console().count(1, "Unable to init QuickTimeToAAFInfoRetriever.\n"), 2);
}

TEST_F(RetrieverTest, WithoutFolderOrConsoleInitFailsCleanly) {
    EXPECT_EQ(QuickTimeToAAFInfoRetriever::Init(nullptr, host.factory(), "map.xml", "info.xml"),
              NCF_E_UNEXPECTED);
    EXPECT_EQ(QuickTimeToAAFInfoRetriever::Init(nullptr, nullptr, "map.xml", "info.xml"),
              NCF_E_UNEXPECTED);
}

TEST_F(RetrieverTest, ShutDownIsHarmlessBeforeInitAndTwice) {
    ShutDownInfoRetriever();
    EXPECT_EQ(Init(""), NCF_OK);
    ShutDownInfoRetriever();
    EXPECT_EQ(QuickTimeToAAFInfoRetriever::GetInstance(), nullptr);
    ShutDownInfoRetriever();
    EXPECT_EQ(Init(""), NCF_OK);
}

TEST_F(RetrieverTest, ManyThreadsMakeOneObject) {
    MakeItTheModulesFolder();
    Write("map.xml", "<Map/>");
    Write("info.xml", Document(""));
    std::vector<QuickTimeToAAFInfoRetriever*> seen(4);
    std::vector<std::thread> threads;
    // The fakes' journal belongs to one thread, so the object is made first.
    EXPECT_EQ(Init(""), NCF_OK);
    for (auto& place : seen) {
        threads.emplace_back([&place] {
            EXPECT_EQ(QuickTimeToAAFInfoRetriever::Init(nullptr, nullptr, "", ""), NCF_OK);
            place = QuickTimeToAAFInfoRetriever::GetInstance();
        });
    }
    for (std::thread& thread : threads) {
        thread.join();
    }
    EXPECT_EQ(std::set<QuickTimeToAAFInfoRetriever*>(seen.begin(), seen.end()).size(), 1u);
    EXPECT_NE(seen[0], nullptr);
}

// --- what is asked of the clip ----------------------------------------------------

TEST_F(RetrieverTest, AsksTheClipInOrder) {
    EXPECT_EQ(InitAndGetInfo("CDCI", CDCIValues()), NCF_OK);
    EXPECT_EQ(clip_.asked,
              (std::vector<std::string>{"GetDataFormat", "GetVendor", "GetEncodedWidthAndHeight",
                                        "GetNMAFrameLayout", "GetEditRate"}));
    EXPECT_EQ(id_, 1u);
}

TEST_F(RetrieverTest, EachFailureOfTheClipIsLoggedAndReturned) {
    EXPECT_EQ(Init(Entry("1", "CDCI", Join(CDCIValues()))), NCF_OK);
    const std::pair<NCFRESULT FakeClip::*, const char*> steps[] = {
        {&FakeClip::codeResult, "media->GetDataFormat(&fourCC)"},
        {&FakeClip::vendorResult, "media->GetVendor(&vendor)"},
        {&FakeClip::sizeResult,
         "const_cast<BaseClip*>(media)->GetEncodedWidthAndHeight(&width, &height)"},
        {&FakeClip::rateResult, "media->GetEditRate(&movieEditRate)"}};
    for (const auto& [result, expression] : steps) {
        clip_.*result = NCF_E_NOTFOUND;
        log.clear();
        EXPECT_EQ(GetInfo(), NCF_E_NOTFOUND);
        ASSERT_EQ(log.records().size(), 1u) << expression;
        EXPECT_EQ(log.records()[0].text,
                  std::string("NCF_RETURN(0x8000000c): ") + expression + " : " + kGetInfo);
        clip_.*result = NCF_OK;
    }
}

TEST_F(RetrieverTest, AFailedFrameLayoutIsReturnedInSilence) {
    EXPECT_EQ(Init(Entry("1", "CDCI", Join(CDCIValues()))), NCF_OK);
    clip_.layoutResult = NCF_E_NOTFOUND;
    EXPECT_EQ(GetInfo(), NCF_E_NOTFOUND);
    clip_.layoutResult = 1;
    EXPECT_EQ(GetInfo(), 1);
    EXPECT_TRUE(log.records().empty());
}

TEST_F(RetrieverTest, FieldsHalveTheHeight) {
    const std::string two = Entry("1", "CDCI", Join(CDCIValues()));
    EXPECT_EQ(
        Init(two + two, "<FourCharMapping FourChar='apch'/><FourCharMapping FourChar='apch'/>"),
        NCF_OK);
    clip_.code = Code("apch");
    clip_.width = 1920;
    clip_.height = 1080;
    EXPECT_EQ(GetInfo(), NCF_E_NOTSUPPORTED);
    EXPECT_EQ(id_, 3712u) << "540 lines, separate fields";
    clip_.layout = 0;
    EXPECT_EQ(GetInfo(), NCF_E_NOTSUPPORTED);
    EXPECT_EQ(id_, 3710u);
}

TEST_F(RetrieverTest, AClipThatDoesNotTellItsLayoutIsAFullFrame) {
    const std::string two = Entry("1", "CDCI", Join(CDCIValues()));
    EXPECT_EQ(
        Init(two + two, "<FourCharMapping FourChar='apch'/><FourCharMapping FourChar='apch'/>"),
        NCF_OK);
    clip_.code = Code("apch");
    clip_.width = 1920;
    clip_.height = 1080;
    clip_.layoutResult = NCF_E_PARAMETERNOTAVAILABLE;
    EXPECT_EQ(GetInfo(), NCF_E_NOTSUPPORTED);
    EXPECT_EQ(id_, 3710u);
    EXPECT_EQ(info_.frameLayout, 0u);
}

TEST_F(RetrieverTest, AnUnknownCodeIsToldToLogAndConsole) {
    EXPECT_EQ(Init(""), NCF_OK);
    clip_.code = Code(
        "%s\x01"
        "z");
    info_.storedWidth = 5;
    EXPECT_EQ(GetInfo(), ncf_detail::Code(0x8000000D));
    EXPECT_EQ(id_, 0u);
    EXPECT_EQ(info_.storedWidth, 5u);
    ASSERT_EQ(log.records().size(), 1u);
    EXPECT_EQ(log.records()[0].kind, 1u);
    EXPECT_EQ(log.records()[0].text,
              std::string(kGetInfo) + "The FOURCC video code of %s?z is not natively supported.");
    EXPECT_EQ(host.console().count(2, "The FOURCC video code of %s?z is not natively supported.\n"),
              1);
}

TEST_F(RetrieverTest, WithoutIdTheMovieItselfIsAsked) {
    EXPECT_EQ(Init(Entry("9", "CDCI", Join(CDCIValues())), "<FourCharMapping FourChar='code'/>"),
              NCF_OK);
    EXPECT_EQ(GetInfo(), NCF_E_PARAMETERNOTAVAILABLE);
    EXPECT_EQ(log.count(std::string("NCF_RETURN(0xa000006a): media->GetNivoResolution(&vcid) : ") +
                        kGetInfo),
              1);
    clip_.resolutionResult = NCF_OK;
    clip_.resolution = 9;
    EXPECT_EQ(GetInfo(), NCF_OK);
    EXPECT_EQ(id_, 9u);
    clip_.resolution = 0;
    EXPECT_EQ(GetInfo(), NCF_E_NOTSUPPORTED);
}

TEST_F(RetrieverTest, AnIdThatTheFileLacksIsNotSupported) {
    EXPECT_EQ(Init(Entry("2", "CDCI", Join(CDCIValues()))), NCF_OK);
    EXPECT_EQ(GetInfo(), ncf_detail::Code(0x8000000D));
    EXPECT_EQ(log.count(std::string("NCF_RETURN(0x8000000d): "
                                    "m_aafInfoReader.IsDescriptorRGBA(&isRGBADescr) : ") +
                        kGetInfo),
              1);
    EXPECT_FALSE(log.contains("failed, Error of")) << "no getter is to blame";
    EXPECT_TRUE(host.console().lines().empty());
}

TEST_F(RetrieverTest, TheRecordMayBeLeftOut) {
    EXPECT_EQ(Init(Entry("1", "CDCI", Join(CDCIValues()))), NCF_OK);
    ncfUInt32 id = 0;
    EXPECT_EQ(QuickTimeToAAFInfoRetriever::GetInstance()->GetInfoFromImageDescription(&clip_,
                                                                                      nullptr, &id),
              NCF_OK);
    EXPECT_EQ(id, 1u);
    EXPECT_EQ(QuickTimeToAAFInfoRetriever::GetInstance()->GetInfoFromImageDescription(
                  &clip_, nullptr, nullptr),
              NCF_E_INVALIDARG);
}

// --- what the record holds ----------------------------------------------------------

TEST_F(RetrieverTest, ARecordStartsWithItsDefaults) {
    EXPECT_EQ(info_.essenceContainerLabel, ncfGuid("060E2B34-0401-0101-0E04-040102010100"));
    EXPECT_EQ(info_.pictureEssenceCoding, ncfGuid("00000000-0000-0000-0000-000000000000"));
    EXPECT_EQ(info_.componentDepth, 8u);
    EXPECT_EQ(info_.horizontalSubsampling, 1u);
    EXPECT_EQ(info_.verticalSubsampling, 1u);
    EXPECT_EQ(info_.whiteRefLevel, 255u);
    for (const ncfUInt32 zero :
         {info_.frameLayout, info_.storedWidth, info_.sampledWidth, info_.storedHeight,
          info_.displayWidth, info_.displayHeight, info_.displayYOffset, info_.aspectNumerator,
          info_.aspectDenominator, info_.ImageStartOffset, info_.imageAlignmentOffset,
          info_.colorSiting, info_.colorRange, info_.blackRefLevel, info_.sliceCounter,
          info_.maxGOP, info_.bitRate, ncfUInt32{info_.levelAndProfile}}) {
        EXPECT_EQ(zero, 0u);
    }
    EXPECT_FALSE(info_.swapAspectRatio);
    EXPECT_TRUE(info_.videoLineMapVect.empty());
    EXPECT_TRUE(info_.pixelLayout.empty());
}

TEST_F(RetrieverTest, ACompleteEntryFillsTheRecord) {
    Values values = CDCIValues();
    EXPECT_EQ(Init(Entry("1", "CDCI", Join(values) + "<AVCSliceCounter>10</AVCSliceCounter>")),
              NCF_OK);
    EXPECT_EQ(GetInfo(), NCF_OK);
    EXPECT_EQ(info_.essenceContainerLabel, ncfGuid("0d010301-0202-0101-060e-2b3404010101"));
    EXPECT_EQ(info_.pictureEssenceCoding, ncfGuid("04010202-0201-0100-060e-2b3404010101"));
    EXPECT_EQ(info_.frameLayout, 1u);
    EXPECT_EQ(info_.storedWidth, 720u);
    EXPECT_EQ(info_.storedHeight, 256u);
    EXPECT_EQ(info_.sampledWidth, 718u);
    EXPECT_EQ(info_.displayWidth, 716u);
    EXPECT_EQ(info_.displayHeight, 243u);
    EXPECT_EQ(info_.displayYOffset, 13u);
    EXPECT_EQ(info_.aspectNumerator, 4u);
    EXPECT_EQ(info_.aspectDenominator, 3u);
    EXPECT_EQ(info_.ImageStartOffset, 3u);
    EXPECT_EQ(info_.imageAlignmentOffset, 4u);
    EXPECT_EQ(info_.componentDepth, 10u);
    EXPECT_EQ(info_.videoLineMapVect, (std::vector<ncfSInt32>{7, 270}));
    EXPECT_EQ(info_.horizontalSubsampling, 2u);
    EXPECT_EQ(info_.verticalSubsampling, 2u);
    EXPECT_EQ(info_.colorSiting, 4u);
    EXPECT_EQ(info_.colorRange, 897u);
    EXPECT_EQ(info_.blackRefLevel, 64u);
    EXPECT_EQ(info_.whiteRefLevel, 940u);
    EXPECT_EQ(info_.sliceCounter, 10u);
    EXPECT_EQ(info_.bitRate, 0u);
    EXPECT_FALSE(IsMPEG());
    EXPECT_FALSE(IsRGBA());
}

TEST_F(RetrieverTest, TheEntrysFrameLayoutOverridesTheClips) {
    Values values = CDCIValues();
    values["FrameLayout"] = "3";
    EXPECT_EQ(InitAndGetInfo("CDCI", values), NCF_OK);
    EXPECT_EQ(info_.frameLayout, 3u);
}

TEST_F(RetrieverTest, AnMPEG2EntryFillsThreeValuesMore) {
    EXPECT_EQ(InitAndGetInfo("MPEG2Video", MPEG2Values()), NCF_OK);
    EXPECT_EQ(info_.bitRate, 50000000u);
    EXPECT_EQ(info_.levelAndProfile, 0x82);
    EXPECT_EQ(info_.maxGOP, 15u);
    EXPECT_EQ(info_.blackRefLevel, 64u);
    log.clear();
    EXPECT_TRUE(IsMPEG());
    EXPECT_FALSE(IsRGBA());
    ASSERT_EQ(log.records().size(), 1u);
    EXPECT_EQ(log.records()[0].text, "QuickTimeToAAFInfoRetriever::IsMPEGDescriptor : true!");
}

TEST_F(RetrieverTest, AnRGBAEntryReadsItsLayoutAndLevels) {
    EXPECT_EQ(InitAndGetInfo("RGBA", RGBAValues()), NCF_OK);
    ASSERT_EQ(info_.pixelLayout.size(), 1u);
    EXPECT_EQ(info_.pixelLayout[0].Code, 'B');
    EXPECT_EQ(info_.pixelLayout[0].Size, 8);
    EXPECT_EQ(info_.blackRefLevel, 1u);
    EXPECT_EQ(info_.whiteRefLevel, 254u);
    EXPECT_EQ(info_.componentDepth, 8u);
    EXPECT_EQ(info_.horizontalSubsampling, 1u);
    log.clear();
    EXPECT_TRUE(IsRGBA());
    EXPECT_FALSE(IsMPEG());
    ASSERT_EQ(log.records().size(), 1u);
    EXPECT_EQ(log.records()[0].text, "QuickTimeToAAFInfoRetriever::IsRGBADescriptor : true!");
}

// --- silent entries -------------------------------------------------------------------

// What it means that an entry of each kind lacks a value: the getter to blame,
// or null where the entry may be silent.
struct SilenceRow {
    const char* element;
    const char* getter;
    bool mayBeSilentInCDCI;
    bool mayBeSilentInRGBA;
};

const SilenceRow kSilences[] = {
    {"EssenceContainerLabel", "GetEssenceContainerLabelFromVCID", false, false},
    {"FrameLayout", "GetFrameLayoutFromVCID", false, false},
    {"StoredWidth", "GetStoredWidthFromVCID", false, false},
    {"StoredHeight", "GetStoredHeightFromVCID", false, false},
    {"SampledWidth", "GetSampledWidthFromVCID", true, true},
    {"DisplayWidth", "GetDisplayWidthFromVCID", true, true},
    {"DisplayHeight", "GetDisplayHeightFromVCID", true, true},
    {"DisplayYOffset", "GetDisplayYOffsetFromVCID", true, true},
    {"ImageStartOffset", "GetImageStartOffsetFromVCID", true, true},
    {"ImageAlignmentOffset", "GetImageAlignmentOffsetFromVCID", true, true},
    {"PictureEssenceCoding", "GetPictureEssenceCodingFromVCID", false, false},
    {"ComponentDepth", "GetComponentDepthFromVCID", false, true},
    {"VideoLineMap", "GetVideoLineMapFromVCID", false, false},
    {"HorizontalSubsampling", "GetHorizontalSubsamplingFromVCID", false, true},
    {"VerticalSubsampling", "GetVerticalSubsamplingFromVCID", false, true},
    {"ColorSiting", "GetColorSitingFromVCID", false, true},
    {"ColorRange", "GetColorRangeFromVCID", false, true},
};

class SilentEntry : public RetrieverTest {
protected:
    // Reads an entry without `element`; the movie is as wide as what is left.
    void Expect(const char* kind, Values values, const char* element, bool mayBeSilent,
                const char* getter, const char* failure = "a000006a") {
        SCOPED_TRACE(std::string(kind) + " without " + element);
        values.erase(element);
        if (std::string(element) == "StoredWidth") {
            clip_.width = 718;  // found by the sampled width
        }
        ShutDownInfoRetriever();
        log.clear();
        const NCFRESULT result = InitAndGetInfo(kind, values);
        const std::string blame = std::string(kGetInfo) +
                                  "GetInfoFromImageDescription failed, Error of: " + failure +
                                  " on call to: " + getter + "\n";
        EXPECT_EQ(result >= 0, mayBeSilent);
        EXPECT_EQ(log.count(blame), mayBeSilent ? 0 : 1);
        clip_.width = 720;
    }
};

TEST_F(SilentEntry, ACDCIEntryMayLeaveOutSixValues) {
    for (const SilenceRow& row : kSilences) {
        Expect("CDCI", CDCIValues(), row.element, row.mayBeSilentInCDCI, row.getter);
    }
    Expect("CDCI", CDCIValues(), "BlackRefLevel", false, "GetBlackRefLevelFromVCID");
    Expect("CDCI", CDCIValues(), "WhiteReflevel", false, "GetWhiteRefLevelFromVCID");
    Expect("CDCI", CDCIValues(), "AspectRatio", false, "GetAspectRatioFromVCID", "8000000d");
}

TEST_F(SilentEntry, AnRGBAEntryMayLeaveOutTheValuesThatOnlyCDCIHas) {
    for (const SilenceRow& row : kSilences) {
        Expect("RGBA", RGBAValues(), row.element, row.mayBeSilentInRGBA, row.getter);
    }
    Expect("RGBA", RGBAValues(), "ComponentMinRef", false, "GetBlackRefLevelFromVCID");
    Expect("RGBA", RGBAValues(), "ComponentMaxRef", false, "GetWhiteRefLevelFromVCID");
    Expect("RGBA", RGBAValues(), "PixelLayout", false, "GetPixelLayoutFromVCID");
}

TEST_F(SilentEntry, AnMPEG2EntryMustHaveItsThreeValues) {
    Expect("MPEG2Video", MPEG2Values(), "BitRate", false, "GetBitRateFromVCID");
    Expect("MPEG2Video", MPEG2Values(), "ProfileAndLevel", false, "GetProfileAndLevelFromVCID");
    Expect("MPEG2Video", MPEG2Values(), "MaxGOP", false, "GetMaxGOPFromVCID");
}

TEST_F(SilentEntry, WidthsAndHeightsFallBackToTheStoredOnes) {
    Values values = CDCIValues();
    values.erase("SampledWidth");
    values.erase("DisplayWidth");
    values.erase("DisplayHeight");
    values.erase("DisplayYOffset");
    EXPECT_EQ(InitAndGetInfo("CDCI", values), NCF_OK);
    EXPECT_EQ(info_.sampledWidth, 720u);
    EXPECT_EQ(info_.displayWidth, 720u);
    EXPECT_EQ(info_.displayHeight, 256u);
    EXPECT_EQ(info_.displayYOffset, 0u);
    EXPECT_EQ(info_.sliceCounter, 0u);
}

TEST_F(SilentEntry, TheFailureIsANoticeAndWhatWasReadBeforeStays) {
    Values values = CDCIValues();
    values.erase("ColorRange");
    EXPECT_EQ(InitAndGetInfo("CDCI", values), ncf_detail::Code(0xA000006A));
    EXPECT_EQ(log.records().back().kind, 1u);
    EXPECT_EQ(info_.storedWidth, 720u);
    EXPECT_EQ(info_.whiteRefLevel, 940u);
}

TEST_F(SilentEntry, GettersRunInTheirOrder) {
    // An entry with nothing but its size fails at the first value it must have.
    EXPECT_EQ(Init(Entry("1", "RGBA", Size(720, 256))), NCF_OK);
    EXPECT_EQ(GetInfo(), NCF_E_PARAMETERNOTAVAILABLE);
    EXPECT_TRUE(log.contains("on call to: GetPixelLayoutFromVCID"));
    ShutDownInfoRetriever();
    log.clear();
    // Of an entry with everything, each silent value is asked for in turn.
    Values values = CDCIValues();
    for (const char* element : {"SampledWidth", "DisplayWidth", "DisplayHeight", "DisplayYOffset",
                                "ImageStartOffset", "ImageAlignmentOffset", "ColorRange"}) {
        values.erase(element);
    }
    EXPECT_NE(InitAndGetInfo("CDCI", values), NCF_OK);
    std::vector<std::string> missed;
    const std::string start = "GetOnePropertyImplNCF_E_PARAMETERNOTAVAILABLE: rp210:";
    for (const LoggedRecord& record : log.records()) {
        if (record.text.compare(0, start.size(), start) == 0) {
            missed.push_back(record.text.substr(start.size()));
        }
    }
    EXPECT_EQ(missed, (std::vector<std::string>{"SampledWidth", "DisplayWidth", "DisplayHeight",
                                                "DisplayYOffset", "ImageStartOffset",
                                                "ImageAlignmentOffset", "ColorRange"}));
}

// --- the two flags ----------------------------------------------------------------------

class RetrieverFlags : public RetrieverTest {
protected:
    RetrieverFlags() {
        Values broken = RGBAValues();
        broken.erase("VideoLineMap");
        Values brokenCDCI = CDCIValues();
        brokenCDCI.erase("VideoLineMap");
        EXPECT_EQ(Init(Entry("1", "CDCI", Join(CDCIValues())) +
                           Entry("2", "MPEG2Video", Join(MPEG2Values())) +
                           Entry("3", "RGBA", Join(RGBAValues())) +
                           Entry("4", "RGBA", Join(broken)) + Entry("5", "CDCI", Join(brokenCDCI)),
                       "<FourCharMapping FourChar='cdci' vcid='1'/>"
                       "<FourCharMapping FourChar='mpeg' vcid='2'/>"
                       "<FourCharMapping FourChar='rgba' vcid='3'/>"
                       "<FourCharMapping FourChar='brgb' vcid='4'/>"
                       "<FourCharMapping FourChar='bcdc' vcid='5'/>"),
                  NCF_OK);
    }
    NCFRESULT Read(ncfUInt32 code) {
        clip_.code = code;
        return GetInfo();
    }
};

TEST_F(RetrieverFlags, FollowTheLastRecord) {
    EXPECT_EQ(Read(Code("mpeg")), NCF_OK);
    EXPECT_TRUE(IsMPEG());
    EXPECT_EQ(Read(Code("rgba")), NCF_OK);
    EXPECT_FALSE(IsMPEG());
    EXPECT_TRUE(IsRGBA());
    EXPECT_EQ(Read(Code("cdci")), NCF_OK);
    EXPECT_FALSE(IsRGBA());
}

TEST_F(RetrieverFlags, OutliveAClipWhoseCodeIsUnknown) {
    EXPECT_EQ(Read(Code("rgba")), NCF_OK);
    EXPECT_EQ(Read(Code("none")), NCF_E_NOTSUPPORTED);
    EXPECT_TRUE(IsRGBA());
}

TEST_F(RetrieverFlags, RGBAIsSetAtTheFirstGetterAndStaysWhenALaterOneFails) {
    EXPECT_EQ(Read(Code("brgb")), NCF_E_PARAMETERNOTAVAILABLE);
    EXPECT_TRUE(IsRGBA());
    EXPECT_EQ(Read(Code("bcdc")), NCF_E_PARAMETERNOTAVAILABLE);
    EXPECT_FALSE(IsRGBA());
}

TEST_F(RetrieverFlags, MPEGIsSetOnlyAfterAllGetters) {
    EXPECT_EQ(Read(Code("mpeg")), NCF_OK);
    EXPECT_EQ(Read(Code("bcdc")), NCF_E_PARAMETERNOTAVAILABLE);
    EXPECT_TRUE(IsMPEG());
}

TEST_F(RetrieverFlags, BelongToTheThread) {
    EXPECT_EQ(Read(Code("rgba")), NCF_OK);
    bool other = true;
    std::thread([&other] { other = IsRGBA(); }).join();
    EXPECT_FALSE(other);
    EXPECT_TRUE(IsRGBA());
}

TEST_F(RetrieverFlags, AreClearedWithANewObject) {
    EXPECT_EQ(Read(Code("rgba")), NCF_OK);
    EXPECT_EQ(Init(""), NCF_OK) << "the object is there";
    EXPECT_TRUE(IsRGBA());
    ShutDownInfoRetriever();
    EXPECT_EQ(Init(""), NCF_OK);
    EXPECT_FALSE(IsRGBA());
}

}  // namespace
