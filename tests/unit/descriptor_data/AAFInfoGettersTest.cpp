// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// The values of an entry and the forms in which they are written.

#include <gtest/gtest.h>

#include "tests/unit/descriptor_data/AAFInfoFile.h"

namespace {

using Getter = NCFRESULT (AAFInfoDataContainerReader2::*)(ncfUInt32*);

class AAFInfoGettersTest : public AAFInfoFile {
protected:
    void LoadCDCI(const std::string& values) { Load(Entry("1", "CDCI", Size(720, 480) + values)); }
    aafUID_t Label(const std::string& text) {
        GenericXMLDataContainer fresh;
        ParseAAFInfoXML(
            host.factory(), &fresh,
            NMAString(Write("label.xml",
                            Document(Entry("1", "CDCI",
                                           Size(720, 480) + Value("PictureEssenceCoding", text))))
                          .c_str()));
        AAFInfoDataContainerReader2 reader(&fresh, 1, Rational{}, 720, 480);
        aafUID_t uid{1, 2, 3, {4, 5, 6, 7, 8, 9, 10, 11}};
        EXPECT_EQ(reader.GetPictureEssenceCodingFromVCID(&uid), NCF_OK);
        return uid;
    }
    ncfUInt8 ProfileAndLevel(const std::string& text, ncfUInt8 before = 0x55) {
        GenericXMLDataContainer fresh;
        ParseAAFInfoXML(
            host.factory(), &fresh,
            NMAString(Write("profile.xml",
                            Document(Entry("1", "MPEG2Video",
                                           Size(720, 480) + Value("ProfileAndLevel", text))))
                          .c_str()));
        AAFInfoDataContainerReader2 reader(&fresh, 1, Rational{}, 720, 480);
        EXPECT_EQ(reader.GetProfileAndLevelFromVCID(&before), NCF_OK);
        return before;
    }
};

TEST_F(AAFInfoGettersTest, EachNumberComesFromItsElement) {
    struct Row {
        const char* element;
        Getter getter;
    };
    const Row rows[] = {
        {"FrameLayout", &AAFInfoDataContainerReader2::GetFrameLayoutFromVCID},
        {"SampledWidth", &AAFInfoDataContainerReader2::GetSampledWidthFromVCID},
        {"DisplayWidth", &AAFInfoDataContainerReader2::GetDisplayWidthFromVCID},
        {"DisplayHeight", &AAFInfoDataContainerReader2::GetDisplayHeightFromVCID},
        {"DisplayYOffset", &AAFInfoDataContainerReader2::GetDisplayYOffsetFromVCID},
        {"ImageStartOffset", &AAFInfoDataContainerReader2::GetImageStartOffsetFromVCID},
        {"ImageAlignmentOffset", &AAFInfoDataContainerReader2::GetImageAlignmentOffsetFromVCID},
        {"ComponentDepth", &AAFInfoDataContainerReader2::GetComponentDepthFromVCID},
        {"HorizontalSubsampling", &AAFInfoDataContainerReader2::GetHorizontalSubsamplingFromVCID},
        {"VerticalSubsampling", &AAFInfoDataContainerReader2::GetVerticalSubsamplingFromVCID},
        {"ColorSiting", &AAFInfoDataContainerReader2::GetColorSitingFromVCID},
        {"ColorRange", &AAFInfoDataContainerReader2::GetColorRangeFromVCID},
        {"BlackRefLevel", &AAFInfoDataContainerReader2::GetBlackRefLevelFromVCID},
        {"WhiteReflevel", &AAFInfoDataContainerReader2::GetWhiteRefLevelFromVCID},
        {"BitRate", &AAFInfoDataContainerReader2::GetBitRateFromVCID},
        {"MaxGOP", &AAFInfoDataContainerReader2::GetMaxGOPFromVCID},
    };
    std::string values;
    ncfUInt32 number = 100;
    for (const Row& row : rows) {
        values += Value(row.element, std::to_string(number++));
    }
    values += "<AVCSliceCounter>10</AVCSliceCounter>";
    Load(Entry("1", "MPEG2Video", Size(720, 480) + values));
    Reader reader(*this, 720, 480);
    number = 100;
    for (const Row& row : rows) {
        ncfUInt32 value = 0;
        EXPECT_EQ((reader.*row.getter)(&value), NCF_OK) << row.element;
        EXPECT_EQ(value, number++) << row.element;
    }
    ncfUInt32 value = 0;
    EXPECT_EQ(reader.GetStoredWidthFromVCID(&value), NCF_OK);
    EXPECT_EQ(value, 720u);
    EXPECT_EQ(reader.GetStoredHeightFromVCID(&value), NCF_OK);
    EXPECT_EQ(value, 480u);
    EXPECT_EQ(reader.GetAVCSliceCounter(&value), NCF_OK);
    EXPECT_EQ(value, 10u);
}

TEST_F(AAFInfoGettersTest, AnAbsentNumberKeepsTheOutputAndIsLogged) {
    LoadCDCI("");
    Reader reader(*this, 720, 480);
    ncfUInt32 value = 77;
    EXPECT_EQ(reader.GetColorSitingFromVCID(&value), ncf_detail::Code(0xA000006A));
    EXPECT_EQ(value, 77u);
    ASSERT_EQ(log.records().size(), 1u);
    EXPECT_EQ(log.records()[0].kind, 1u);
    EXPECT_EQ(log.records()[0].text,
              "GetOnePropertyImplNCF_E_PARAMETERNOTAVAILABLE: rp210:ColorSiting");
}

TEST_F(AAFInfoGettersTest, NumbersAreReadLeniently) {
    LoadCDCI(Value("ColorSiting", "  12 lines") + Value("ColorRange", "none") +
             Value("ComponentDepth", "99999999999999999999") + Value("FrameLayout", "-1"));
    Reader reader(*this, 720, 480);
    ncfUInt32 value = 77;
    EXPECT_EQ(reader.GetColorSitingFromVCID(&value), NCF_OK);
    EXPECT_EQ(value, 12u);
    EXPECT_EQ(reader.GetColorRangeFromVCID(&value), NCF_OK);
    EXPECT_EQ(value, 0u);
    EXPECT_EQ(reader.GetFrameLayoutFromVCID(&value), NCF_OK);
    EXPECT_EQ(value, 0xFFFFFFFFu);
    EXPECT_EQ(reader.GetComponentDepthFromVCID(&value), NCF_OK);
}

TEST_F(AAFInfoGettersTest, ReferenceLevelsFollowTheKindFoundBefore) {
    const std::string cdci =
        Size(720, 480) + Value("BlackRefLevel", "16") + Value("WhiteReflevel", "235");
    const std::string rgba =
        Size(720, 480) + Value("ComponentMinRef", "1") + Value("ComponentMaxRef", "254");
    Load(Entry("1", "CDCI", cdci) + Entry("2", "RGBA", rgba));
    Reader fresh(*this, 720, 480, 2);
    ncfUInt32 value = 77;
    EXPECT_EQ(fresh.GetBlackRefLevelFromVCID(&value), NCF_E_PARAMETERNOTAVAILABLE);
    EXPECT_EQ(fresh.GetBlackRefLevelFromVCID(&value), NCF_OK);  // the search has found the kind
    EXPECT_EQ(value, 1u);
    Reader reader(*this, 720, 480, 2);
    bool isRGBA = false;
    EXPECT_EQ(reader.IsDescriptorRGBA(&isRGBA), NCF_OK);
    EXPECT_TRUE(isRGBA);
    EXPECT_EQ(reader.GetWhiteRefLevelFromVCID(&value), NCF_OK);
    EXPECT_EQ(value, 254u);
}

TEST_F(AAFInfoGettersTest, SevenIdsStartAtZeroWhateverTheFileSays) {
    for (const ncfUInt32 id : {2000u, 2003u, 2004u, 2021u, 2022u, 2023u, 2024u}) {
        Reader reader(*this, 720, 480, id);
        ncfUInt32 value = 77;
        EXPECT_EQ(reader.GetImageStartOffsetFromVCID(&value), NCF_OK) << id;
        EXPECT_EQ(value, 0u) << id;
    }
    EXPECT_TRUE(log.records().empty()) << "the file was looked at";
    Load(Entry("2001", "CDCI", Size(720, 480) + Value("ImageStartOffset", "5")) +
         Entry("2002", "CDCI", Size(720, 480)));
    ncfUInt32 value = 77;
    Reader other(*this, 720, 480, 2001);
    EXPECT_EQ(other.GetImageStartOffsetFromVCID(&value), NCF_OK);
    EXPECT_EQ(value, 5u);
    Reader silent(*this, 720, 480, 2002);
    EXPECT_EQ(silent.GetImageStartOffsetFromVCID(&value), NCF_E_PARAMETERNOTAVAILABLE);
}

TEST_F(AAFInfoGettersTest, ALabelChangesItsHalves) {
    const aafUID_t expected = ncfGuid("04010202-0306-0400-060e-2b340401010d");
    EXPECT_EQ(Label("060e2b34-0401010d-04010202-03060400"), expected);
    EXPECT_EQ(Label("060E2B340401010D0401020203060400"), expected);
    EXPECT_EQ(Label("06-0e2b34-04-01010d-0401020203-060400"), expected);
}

TEST_F(AAFInfoGettersTest, BytesFrom80hSetTheBitsAboveThem) {
    // Second half 04 81 02 02 | 03 86 | 84 00.
    EXPECT_EQ(Label("060e2b34-0401010d-04810202-03868400"),
              ncfGuid("FF810202-FF86-8400-060e-2b340401010d"));
    EXPECT_EQ(Label("8040e2b3-ffffffff-7f7f7f7f-7f7f7f7f"),
              ncfGuid("7f7f7f7f-7f7f-7f7f-8040-e2b3ffffffff"));
}

TEST_F(AAFInfoGettersTest, ALabelEndsAtALineFeedOrAfter36Characters) {
    EXPECT_EQ(Label("060e2b34\n0401010d-04010202-03060400"),
              ncfGuid("00000000-0000-0000-060e-2b3400000000"));
    EXPECT_EQ(Label("060e2b34-0401010d-04010202-03060400-ffffffff"),
              ncfGuid("04010202-0306-0400-060e-2b340401010d"));
    // 36 digits are 18 pairs; sixteen bytes are all there are.
    EXPECT_EQ(Label("060e2b340401010d0401020203060400ffff"),
              ncfGuid("04010202-0306-0400-060e-2b340401010d"));
}

TEST_F(AAFInfoGettersTest, WhatIsNoPairOfDigitsIsAZeroByte) {
    EXPECT_EQ(Label("xyzu"), ncfGuid("00000000-0000-0000-0000-000000000000"));
    EXPECT_EQ(Label("06zz2b3"), ncfGuid("00000000-0000-0000-0600-2b0000000000"));
}

TEST_F(AAFInfoGettersTest, AnAbsentLabelIsNotAvailable) {
    LoadCDCI("");
    Reader reader(*this, 720, 480);
    aafUID_t uid{1, 2, 3, {4, 5, 6, 7, 8, 9, 10, 11}};
    const aafUID_t before = uid;
    EXPECT_EQ(reader.GetEssenceContainerLabelFromVCID(&uid), ncf_detail::Code(0xA000006A));
    EXPECT_EQ(uid, before);
}

TEST_F(AAFInfoGettersTest, TheAspectHasThreeWaysToBeIncomplete) {
    const auto read = [this](const std::string& values, ncfUInt32& numerator,
                             ncfUInt32& denominator) {
        GenericXMLDataContainer fresh;
        ParseAAFInfoXML(
            host.factory(), &fresh,
            NMAString(Write("aspect.xml", Document(Entry("1", "CDCI", Size(720, 480) + values)))
                          .c_str()));
        AAFInfoDataContainerReader2 reader(&fresh, 1, Rational{}, 720, 480);
        return reader.GetAspectRatioFromVCID(&numerator, &denominator);
    };
    ncfUInt32 numerator = 7;
    ncfUInt32 denominator = 8;
    EXPECT_EQ(read("", numerator, denominator), ncf_detail::Code(0x8000000D));
    EXPECT_EQ(
        read("<rp210:AspectRatio><types:Denominator>3</types:Denominator></rp210:AspectRatio>",
             numerator, denominator),
        ncf_detail::Code(0xA000006A));
    EXPECT_EQ(numerator, 7u);
    EXPECT_EQ(read("<rp210:AspectRatio><types:Numerator>4</types:Numerator></rp210:AspectRatio>",
                   numerator, denominator),
              ncf_detail::Code(0xA000006A));
    EXPECT_EQ(numerator, 4u) << "the first value is written before the second is missed";
    EXPECT_EQ(denominator, 8u);
    EXPECT_EQ(read("<rp210:SampleRate><types:Numerator>25</types:Numerator>"
                   "<types:Denominator>1</types:Denominator></rp210:SampleRate>"
                   "<rp210:AspectRatio><types:Numerator>16</types:Numerator>"
                   "<types:Denominator>9</types:Denominator></rp210:AspectRatio>",
                   numerator, denominator),
              NCF_OK);
    EXPECT_EQ(numerator, 16u);
    EXPECT_EQ(denominator, 9u);
}

TEST_F(AAFInfoGettersTest, ProfileAndLevelIsTwoHexadecimalDigits) {
    EXPECT_EQ(ProfileAndLevel("0x0A"), 0x0A);
    EXPECT_EQ(ProfileAndLevel("0x82"), 0x82);
    EXPECT_EQ(ProfileAndLevel("0xABC"), 0xAB);
    EXPECT_EQ(ProfileAndLevel("0x5"), 0x05);
}

TEST_F(AAFInfoGettersTest, ProfileAndLevelWithoutPrefixIsPassedOver) {
    EXPECT_EQ(ProfileAndLevel("10"), 0x55);
    EXPECT_EQ(ProfileAndLevel("0X82"), 0x55);
    EXPECT_EQ(ProfileAndLevel("0x"), 0x55);
    EXPECT_EQ(ProfileAndLevel("0xzz"), 0x55);
}

TEST_F(AAFInfoGettersTest, ProfileAndLevelAbsentIsNotAvailable) {
    Load(Entry("1", "MPEG2Video", Size(720, 480)));
    Reader reader(*this, 720, 480);
    ncfUInt8 value = 0x55;
    EXPECT_EQ(reader.GetProfileAndLevelFromVCID(&value), NCF_E_PARAMETERNOTAVAILABLE);
    EXPECT_EQ(value, 0x55);
    EXPECT_TRUE(
        log.once("NCF_RETURN(0xa000006a): GetOneProperty(profileAndLevelNameString, "
                 "&profileAndLevelValueString) : "
                 "AAFInfoDataContainerReader2::GetProfileAndLevelFromVCID"));
}

TEST_F(AAFInfoGettersTest, TheLineMapAppendsInFileOrder) {
    LoadCDCI(
        "<rp210:VideoLineMap><rp210:Element>21</rp210:Element>"
        "<rp210:Element>-4</rp210:Element></rp210:VideoLineMap>");
    Reader reader(*this, 720, 480);
    std::vector<ncfSInt32> lines{9};
    EXPECT_EQ(reader.GetVideoLineMapFromVCID(&lines), NCF_OK);
    EXPECT_EQ(lines, (std::vector<ncfSInt32>{9, 21, -4}));
}

TEST_F(AAFInfoGettersTest, ALineMapWithoutLinesIsNotAvailable) {
    LoadCDCI("<rp210:VideoLineMap/>");
    Reader reader(*this, 720, 480);
    std::vector<ncfSInt32> lines;
    EXPECT_EQ(reader.GetVideoLineMapFromVCID(&lines), NCF_E_PARAMETERNOTAVAILABLE);
    EXPECT_TRUE(lines.empty());
}

std::string Component(const std::string& code, const std::string& depth) {
    return "<rp210:RGBALayout>" + code + depth + "</rp210:RGBALayout>";
}

TEST_F(AAFInfoGettersTest, ThePixelLayoutGivesLettersAndDepths) {
    Load(Entry("1", "RGBA",
               Size(720, 480) + "<rp210:PixelLayout>" +
                   Component(Value("Code", "Alpha"), Value("Depth", "2")) +
                   Component(Value("Code", "R"), Value("Depth", "10")) + "</rp210:PixelLayout>"));
    Reader reader(*this, 720, 480);
    std::vector<aafRGBAComponent_t> layout;
    EXPECT_EQ(reader.GetPixelLayoutFromVCID(&layout), NCF_OK);
    ASSERT_EQ(layout.size(), 2u);
    EXPECT_EQ(layout[0].Code, 'A');
    EXPECT_EQ(layout[0].Size, 2);
    EXPECT_EQ(layout[1].Code, 'R');
    EXPECT_EQ(layout[1].Size, 10);
}

TEST_F(AAFInfoGettersTest, AnIncompleteComponentKeepsThoseBeforeIt) {
    Load(Entry("1", "RGBA",
               Size(720, 480) + "<rp210:PixelLayout>" +
                   Component(Value("Code", "R"), Value("Depth", "8")) +
                   Component(Value("Code", "G"), "") + "</rp210:PixelLayout>") +
         Entry("2", "RGBA", Size(720, 480) + "<rp210:PixelLayout/>") +
         Entry("3", "RGBA", Size(720, 480)));
    std::vector<aafRGBAComponent_t> layout;
    Reader reader(*this, 720, 480);
    EXPECT_EQ(reader.GetPixelLayoutFromVCID(&layout), NCF_E_PARAMETERNOTAVAILABLE);
    EXPECT_EQ(layout.size(), 1u);
    Reader empty(*this, 720, 480, 2);
    EXPECT_EQ(empty.GetPixelLayoutFromVCID(&layout), NCF_E_PARAMETERNOTAVAILABLE);
    Reader none(*this, 720, 480, 3);
    EXPECT_EQ(none.GetPixelLayoutFromVCID(&layout), NCF_E_PARAMETERNOTAVAILABLE);
    EXPECT_EQ(layout.size(), 1u);
}

}  // namespace
