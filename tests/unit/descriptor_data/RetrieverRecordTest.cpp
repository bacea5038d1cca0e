// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// What the retriever makes of an entry: the record and the two flags.

#include <gtest/gtest.h>

#include <thread>

#include "tests/unit/descriptor_data/RetrieverFixture.h"

namespace {

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

TEST_F(RetrieverTest, EveryKindOfEntryTellsTheCommonValues) {
    const std::pair<const char*, Values> kKinds[] = {
        {"CDCI", CDCIValues()}, {"MPEG2Video", MPEG2Values()}, {"RGBA", RGBAValues()}};
    for (const auto& [kind, values] : kKinds) {
        ShutDownInfoRetriever();
        info_ = AAFInfo();
        EXPECT_EQ(InitAndGetInfo(kind, values), NCF_OK) << kind;
        EXPECT_EQ(info_.essenceContainerLabel, ncfGuid("0d010301-0202-0101-060e-2b3404010101"));
        EXPECT_EQ(info_.pictureEssenceCoding, ncfGuid("04010202-0201-0100-060e-2b3404010101"));
        const std::vector<ncfUInt32> told = {
            info_.frameLayout,      info_.storedWidth,         info_.storedHeight,
            info_.sampledWidth,     info_.displayWidth,        info_.displayHeight,
            info_.displayYOffset,   info_.aspectNumerator,     info_.aspectDenominator,
            info_.ImageStartOffset, info_.imageAlignmentOffset};
        EXPECT_EQ(told, (std::vector<ncfUInt32>{1, 720, 256, 718, 716, 243, 13, 4, 3, 3, 4}))
            << kind;
        EXPECT_EQ(info_.videoLineMapVect, (std::vector<ncfSInt32>{7, 270})) << kind;
    }
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
    // Reads an entry without `element`, into a record and into none; the movie is
    // as wide as what is left.
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
        EXPECT_EQ(GetInfoWithoutRecord(), result);
        EXPECT_EQ(log.count(blame), mayBeSilent ? 0 : 2) << "every check runs without a record";
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

// Of several values that are missing the first in this order is told.
TEST_F(SilentEntry, MandatoryGettersRunInTheirOrder) {
    const std::pair<const char*, const char*> kOrder[] = {
        {"EssenceContainerLabel", "GetEssenceContainerLabelFromVCID"},
        {"FrameLayout", "GetFrameLayoutFromVCID"},
        {"StoredWidth", "GetStoredWidthFromVCID"},
        {"StoredHeight", "GetStoredHeightFromVCID"},
        {"AspectRatio", "GetAspectRatioFromVCID"},
        {"PictureEssenceCoding", "GetPictureEssenceCodingFromVCID"},
        {"ComponentDepth", "GetComponentDepthFromVCID"},
        {"VideoLineMap", "GetVideoLineMapFromVCID"},
        {"HorizontalSubsampling", "GetHorizontalSubsamplingFromVCID"},
        {"VerticalSubsampling", "GetVerticalSubsamplingFromVCID"},
        {"ColorSiting", "GetColorSitingFromVCID"},
        {"BlackRefLevel", "GetBlackRefLevelFromVCID"},
        {"WhiteReflevel", "GetWhiteRefLevelFromVCID"},
        {"ColorRange", "GetColorRangeFromVCID"},
        {"BitRate", "GetBitRateFromVCID"},
        {"ProfileAndLevel", "GetProfileAndLevelFromVCID"},
        {"MaxGOP", "GetMaxGOPFromVCID"},
    };
    const Values whole = MPEG2Values();
    Values values;
    values["SampledWidth"] = whole.at("SampledWidth");  // by these two it is found
    values["DisplayHeight"] = whole.at("DisplayHeight");
    clip_.width = 718;
    for (const auto& [element, getter] : kOrder) {
        ShutDownInfoRetriever();
        log.clear();
        EXPECT_LT(InitAndGetInfo("MPEG2Video", values), 0) << getter;
        EXPECT_TRUE(log.contains(std::string(" on call to: ") + getter)) << getter;
        values[element] = whole.at(element);
    }
    ShutDownInfoRetriever();
    EXPECT_EQ(InitAndGetInfo("MPEG2Video", values), NCF_OK);
}

TEST_F(SilentEntry, ARecordThatIsThrownAwayIsCheckedAllTheSame) {
    Values values = MPEG2Values();
    values.erase("MaxGOP");
    EXPECT_EQ(Init(Entry("1", "MPEG2Video", Join(values))), NCF_OK);
    EXPECT_EQ(QuickTimeToAAFInfoRetriever::GetInstance()->GetInfoFromImageDescription(
                  &clip_, nullptr, &id_),
              NCF_E_PARAMETERNOTAVAILABLE);
    EXPECT_EQ(id_, 1u);
    EXPECT_TRUE(IsMPEG()) << "read up to the last value";
    EXPECT_TRUE(log.contains("on call to: GetMaxGOPFromVCID"));
    clip_.layout = 0;
    clip_.layoutResult = NCF_E_NOTFOUND;
    EXPECT_EQ(QuickTimeToAAFInfoRetriever::GetInstance()->GetInfoFromImageDescription(
                  &clip_, nullptr, &id_),
              NCF_E_NOTFOUND);
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
        Values brokenMPEG2 = MPEG2Values();
        brokenMPEG2.erase("MaxGOP");
        EXPECT_EQ(Init(Entry("1", "CDCI", Join(CDCIValues())) +
                           Entry("2", "MPEG2Video", Join(MPEG2Values())) +
                           Entry("3", "RGBA", Join(RGBAValues())) +
                           Entry("4", "RGBA", Join(broken)) + Entry("5", "CDCI", Join(brokenCDCI)) +
                           Entry("6", "MPEG2Video", Join(brokenMPEG2)),
                       "<FourCharMapping FourChar='cdci' vcid='1'/>"
                       "<FourCharMapping FourChar='mpeg' vcid='2'/>"
                       "<FourCharMapping FourChar='rgba' vcid='3'/>"
                       "<FourCharMapping FourChar='brgb' vcid='4'/>"
                       "<FourCharMapping FourChar='bcdc' vcid='5'/>"
                       "<FourCharMapping FourChar='bmpg' vcid='6'/>"),
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

TEST_F(RetrieverFlags, MPEGIsSetBeforeTheValuesThatOnlyMPEGHas) {
    EXPECT_EQ(Read(Code("bmpg")), NCF_E_PARAMETERNOTAVAILABLE);
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
