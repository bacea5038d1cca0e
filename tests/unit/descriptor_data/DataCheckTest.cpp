// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "tests/unit/descriptor_data/DataCheck.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <map>

#include "tests/unit/descriptor_data/DataHost.h"

namespace {

using ::testing::AllOf;
using ::testing::Contains;
using ::testing::HasSubstr;
using ::testing::IsEmpty;

class DataCheckTest : public DataHost {
protected:
    using Values = std::map<std::string, std::string>;

    // Values that leave nothing to be found.
    static Values Good() {
        return {{"rp210:PictureEssenceCoding", "060e2b34-0401010d-04010202-03060400"},
                {"rp210:EssenceContainerLabel", "060e2b34-0401010d-0d010301-021c0100"},
                {"rp210:FrameLayout", "0"},
                {"rp210:StoredWidth", "720"},
                {"rp210:StoredHeight", "480"},
                {"rp210:ComponentDepth", "10"},
                {"rp210:HorizontalSubsampling", "2"},
                {"rp210:VerticalSubsampling", "1"},
                {"rp210:ColorSiting", "0"},
                {"rp210:ColorRange", "897"},
                {"rp210:BlackRefLevel", "64"},
                {"rp210:WhiteReflevel", "940"}};
    }
    static Values With(const std::string& name, const std::string& value) {
        Values values = Good();
        values["rp210:" + name] = value;
        return values;
    }
    static Values Sized(const std::string& width, const std::string& height) {
        Values values = Good();
        values["rp210:StoredWidth"] = width;
        values["rp210:StoredHeight"] = height;
        return values;
    }
    static std::string Entry(
        const Values& values, const std::string& id = "10000", const std::string& kind = "CDCI",
        const std::string& more =
            "<rp210:VideoLineMap><rp210:Element>23</rp210:Element>"
            "</rp210:VideoLineMap>",
        const std::string& aspect = "types:Numerator='4' types:Denominator='3'") {
        std::string text = "<MediaDescriptorSignature><NivoInfo ResolutionID='" + id +
                           "'/><groups:" + kind + "Descriptor";
        for (const auto& [name, value] : values) {
            text += " " + name + "='" + value + "'";
        }
        return text + "><rp210:AspectRatio " + aspect + "/>" + more + "</groups:" + kind +
               "Descriptor></MediaDescriptorSignature>";
    }
    std::vector<std::string> Check(
        const std::string& entries,
        const std::string& mapping = "<FourCharMapping FourChar='dvc ' vcid='10000'/>") {
        return CheckData(host.factory(), Write("map.xml", "<Map>" + mapping + "</Map>"),
                         Write("info.xml", "<Infos>" + entries + "</Infos>"));
    }
};

TEST_F(DataCheckTest, FindsNothingInTheShippedFiles) {
    EXPECT_THAT(CheckData(host.factory(), SHIPPED_DATA_FOLDER "/FourCharMapper.xml",
                          SHIPPED_DATA_FOLDER "/AAFInfo.xml"),
                IsEmpty());
}

TEST_F(DataCheckTest, FindsNothingInAGoodPair) {
    EXPECT_THAT(Check(Entry(Good())), IsEmpty());
}

TEST_F(DataCheckTest, FindsValuesThatAnAAFLibraryRefuses) {
    for (const auto& [name, value] :
         std::vector<std::pair<std::string, std::string>>{{"ColorSiting", "5"},
                                                          {"ColorSiting", "6"},
                                                          {"ColorSiting", "256"},
                                                          {"HorizontalSubsampling", "3"},
                                                          {"HorizontalSubsampling", "0"},
                                                          {"VerticalSubsampling", "4"},
                                                          {"FrameLayout", "5"},
                                                          {"StoredHeight", "0"},
                                                          {"DisplayWidth", "0"},
                                                          {"ComponentDepth", "17"},
                                                          {"ColorRange", "x"},
                                                          {"BlackRefLevel", "-1"}}) {
        EXPECT_THAT(Check(Entry(With(name, value))),
                    Contains(HasSubstr("rp210:" + name + " can't be \"" + value + "\"")));
    }
}

TEST_F(DataCheckTest, AcceptsTheRestOfTheirRanges) {
    for (const auto& [name, value] :
         std::vector<std::pair<std::string, std::string>>{{"ColorSiting", "4"},
                                                          {"ColorSiting", "255"},
                                                          {"HorizontalSubsampling", "4"},
                                                          {"VerticalSubsampling", "2"},
                                                          {"FrameLayout", "4"}}) {
        EXPECT_THAT(Check(Entry(With(name, value))), IsEmpty()) << name << value;
    }
}

TEST_F(DataCheckTest, FindsEveryValueThatARecordMustHave) {
    for (const auto& value : Good()) {
        Values values = Good();
        values.erase(value.first);
        EXPECT_THAT(Check(Entry(values)), Contains(HasSubstr(value.first + " is missing")));
    }
    EXPECT_THAT(Check(Entry(Good(), "10000", "CDCI", "")),
                Contains(HasSubstr("rp210:VideoLineMap must have one or two line numbers")));
    EXPECT_THAT(Check(Entry(Good(), "10000", "MPEG2Video")),
                AllOf(Contains(HasSubstr("rp210:BitRate is missing")),
                      Contains(HasSubstr("rp210:MaxGOP is missing")),
                      Contains(HasSubstr("rp210:ProfileAndLevel is missing"))));
    EXPECT_THAT(Check(Entry(Good(), "10000", "RGBA")),
                AllOf(Contains(HasSubstr("rp210:ComponentMaxRef is missing")),
                      Contains(HasSubstr("must have one to eight components"))));
    EXPECT_THAT(Check(Entry(Good(), "10000", "CDCI", "", "types:Numerator='0'")),
                AllOf(Contains(HasSubstr("types:Numerator can't be \"0\"")),
                      Contains(HasSubstr("types:Denominator is missing"))));
}

TEST_F(DataCheckTest, FindsMoreComponentsThanALayoutHolds) {
    std::string components;
    for (int i = 0; i < 9; ++i) {
        components += "<rp210:RGBALayout rp210:Code='R' rp210:Depth='8'/>";
    }
    EXPECT_THAT(Check(Entry(Good(), "10000", "RGBA",
                            "<rp210:PixelLayout>" + components + "</rp210:PixelLayout>")),
                Contains(HasSubstr("must have one to eight components")));
}

TEST_F(DataCheckTest, FindsLabelsThatComeOutWrong) {
    EXPECT_THAT(
        Check(Entry(With("PictureEssenceCoding", "{edb35383-6d30-11d3-a036-006094eb75cb}"))),
        Contains(HasSubstr("is no universal label")));
    EXPECT_THAT(Check(Entry(With("PictureEssenceCoding", "060e2b34-0401010d-04010202-030604"))),
                Contains(HasSubstr("is no universal label")));
    EXPECT_THAT(Check(Entry(With("EssenceContainerLabel", "060e2b34-0401010d-04810202-03060400"))),
                Contains(HasSubstr("has a byte of 80h or more")));
}

TEST_F(DataCheckTest, FindsAProfileThatWouldBePassedOver) {
    Values values = Good();
    values.insert({{"rp210:BitRate", "1"}, {"rp210:MaxGOP", "1"}, {"rp210:ProfileAndLevel", "82"}});
    EXPECT_THAT(Check(Entry(values, "10000", "MPEG2Video")),
                Contains(HasSubstr("must be 0x and two digits")));
}

TEST_F(DataCheckTest, FindsNamesThatMeanNothing) {
    EXPECT_THAT(Check(Entry(With("WhiteRefLevel", "940"))),
                Contains(HasSubstr("rp210:WhiteRefLevel means nothing there")));
    EXPECT_THAT(Check(Entry(Good()), "<FourCharMapping FourChar='dvc ' id='10000'/>"),
                Contains(HasSubstr("id means nothing there")));
}

TEST_F(DataCheckTest, FindsBlanksAroundALeaf) {
    EXPECT_THAT(Check(Entry(With("ColorSiting", "0 "))),
                Contains(HasSubstr("rp210:ColorSiting is empty or has outer blanks")));
    EXPECT_THAT(Check(Entry(Good(), "10000", "CDCI",
                            "<rp210:VideoLineMap><rp210:Element>\n 23</rp210:Element>"
                            "</rp210:VideoLineMap>")),
                Contains(HasSubstr("rp210:Element is empty or has outer blanks")));
    EXPECT_THAT(Check(Entry(Good()),
                      "<FourCharMapping FourChar='dvc '><vcid>10000</vcid>"
                      "<Vendor/></FourCharMapping>"),
                Contains(HasSubstr("Vendor is empty or has outer blanks")));
}

TEST_F(DataCheckTest, FindsEntriesWithoutKeyOrDescriptor) {
    EXPECT_THAT(Check("<MediaDescriptorSignature><NivoInfo/></MediaDescriptorSignature>"),
                AllOf(Contains(HasSubstr("ResolutionID is missing")),
                      Contains(HasSubstr("there must be one descriptor, not 0"))));
    EXPECT_THAT(Check(Entry(Good(), "010000")), Contains(HasSubstr("ResolutionID can't be")));
    EXPECT_THAT(Check(Entry(Good()), "<FourCharMapping vcid='1'/>"),
                Contains(HasSubstr("FourChar is missing")));
    EXPECT_THAT(Check(Entry(Good()), "<FourCharMapping FourChar='dvc' vcid='1'/>"),
                Contains(HasSubstr("FourChar must have four characters")));
}

TEST_F(DataCheckTest, FindsAnIdOfOneEntryWhereTheSizeIsNotFixed) {
    const std::string mapping = "<FourCharMapping FourChar='v210' vcid='10000'/>";
    EXPECT_THAT(Check(Entry(Good()), mapping),
                Contains(HasSubstr("id 10000 has one entry, which takes any height")));
    EXPECT_THAT(Check(Entry(Good()) + Entry(Good()), mapping), IsEmpty()) << "a repeat will do";
}

TEST_F(DataCheckTest, FindsEntriesBehindOthers) {
    const auto shadowed = HasSubstr("is found at an entry before it");
    // 486 lines pass for 480 by the rule of six lines more.
    EXPECT_THAT(Check(Entry(Sized("720", "480")) + Entry(Sized("720", "486"))),
                Contains(AllOf(HasSubstr("id 10000, entry 2: 720x486"), shadowed)));
    EXPECT_THAT(Check(Entry(Sized("720", "486")) + Entry(Sized("720", "480"))), IsEmpty());
    // Fields pass for frames and the reverse.
    EXPECT_THAT(Check(Entry(Sized("1920", "1080")) + Entry(Sized("1920", "540"))),
                Contains(AllOf(HasSubstr("entry 2: 1920x540"), shadowed)));
    EXPECT_THAT(Check(Entry(Sized("1920", "540")) + Entry(Sized("1920", "1080"))),
                Contains(AllOf(HasSubstr("entry 2: 1920x1080"), shadowed)));
    EXPECT_THAT(Check(Entry(Sized("1440", "540")) + Entry(Sized("1920", "540"))), IsEmpty());
}

TEST_F(DataCheckTest, FindsIdsThatNoCodeReaches) {
    EXPECT_THAT(Check(Entry(Good()) + Entry(Good(), "10001")),
                Contains("id 10001 is reached by no code"));
    EXPECT_THAT(Check(Entry(Good()) + Entry(Good(), "10950") + Entry(Good(), "10950")), IsEmpty())
        << "movies name these themselves";
}

TEST_F(DataCheckTest, FindsCodesThatLeadNowhere) {
    EXPECT_THAT(Check(Entry(Good()),
                      "<FourCharMapping FourChar='dvc ' vcid='10000'/>"
                      "<FourCharMapping FourChar='dvcp' vcid='10001'/>"
                      "<FourCharMapping FourChar='dvpp'/>"),
                AllOf(Contains("code \"dvcp\" leads to id 10001, which has no entry"),
                      Contains("code \"dvpp\" leads to no id")));
}

TEST_F(DataCheckTest, FindsRowsOfTheBuiltInTableWithoutEntry) {
    const auto findings =
        Check(Entry(Good()),
              "<FourCharMapping FourChar='dvc ' vcid='10000'/>"
              "<FourCharMapping FourChar='apch'/><FourCharMapping FourChar='apch'/>");
    EXPECT_THAT(findings, Contains("code \"apch\" has no entry for 1920x1080 (id 3710)"));
}

TEST_F(DataCheckTest, TellsOfFilesThatCannotBeRead) {
    EXPECT_THAT(Check("<x>"), Contains(HasSubstr("info.xml: ")));
    EXPECT_THAT(Check(""), Contains(HasSubstr("there is no MediaDescriptorSignature")));
}

}  // namespace
