// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/data_check/DataCheck.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <map>

#include "tests/support/TestFolder.h"

namespace {

using data_check::CheckedData;
using data_check::Finding;
using ::testing::AllOf;
using ::testing::Contains;
using ::testing::ElementsAre;
using ::testing::HasSubstr;
using ::testing::IsEmpty;
using ::testing::Not;
using Texts = std::vector<std::string>;

// Each on one line as "file:line:column: what; what helps".
Texts TextsOf(const CheckedData& checked) {
    Texts texts;
    for (const Finding& finding : checked.findings) {
        texts.push_back(
            std::string(data_check::kDataFileNames[static_cast<std::size_t>(finding.file)]) + ":" +
            std::to_string(finding.place.line) + ":" + std::to_string(finding.place.column) + ": " +
            finding.what + "; " + finding.hint);
    }
    return texts;
}

class DataChecks : public testing::Test {
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
    static std::string Record(
        const Values& values, const std::string& id = "10000", const std::string& kind = "CDCI",
        const std::string& more =
            "<rp210:VideoLineMap><rp210:Element>23</rp210:Element></rp210:VideoLineMap>",
        const std::string& aspect = "types:Numerator='4' types:Denominator='3'") {
        std::string text = "<MediaDescriptorSignature><NivoInfo ResolutionID='" + id +
                           "'/><groups:" + kind + "Descriptor";
        for (const auto& [name, value] : values) {
            text += " " + name + "='" + value + "'";
        }
        return text + "><rp210:AspectRatio " + aspect + "/>" + more + "</groups:" + kind +
               "Descriptor></MediaDescriptorSignature>\n";
    }
    static std::string Row(const std::string& code, const std::string& more) {
        return "<FourCharMapping FourChar='" + code + "' " + more + "/>\n";
    }
    CheckedData CheckFiles(const std::string& mapper, const std::string& infos) {
        folder_.Write("FourCharMapper.xml", mapper);
        folder_.Write("AAFInfo.xml", infos);
        return data_check::CheckData(folder_.path());
    }
    Texts Check(const std::string& records, const std::string& rows = Row("dvc ", "vcid='10000'")) {
        return TextsOf(CheckFiles("<Map>\n" + rows + "</Map>", "<Infos>\n" + records + "</Infos>"));
    }
    const TestFolder folder_;
};

TEST_F(DataChecks, FindNothingInTheShippedFiles) {
    const CheckedData checked = data_check::CheckData(SHIPPED_DATA_FOLDER);
    EXPECT_THAT(TextsOf(checked), IsEmpty());
    EXPECT_EQ(checked.counts.findings, 0u);
    EXPECT_GT(checked.counts.codes, 50u);
    EXPECT_GE(checked.counts.rows, checked.counts.codes);
    EXPECT_GT(checked.counts.ids, 50u);
    EXPECT_GE(checked.counts.records, checked.counts.ids);
}

TEST_F(DataChecks, FindNothingInAGoodPair) {
    EXPECT_THAT(Check(Record(Good())), IsEmpty());
}

TEST_F(DataChecks, TellWhereAMistakeIsAndWhatHelps) {
    EXPECT_THAT(CheckFiles("<Map>\n  <FourCharMapping FourChar='dvc '\n      vcid='0'/>\n</Map>",
                           "<Infos>\n" + Record(Good()) + "</Infos>")
                    .findings.size(),
                1u);
    const Texts texts =
        TextsOf(CheckFiles("<Map>\n  <FourCharMapping FourChar='dvc '\n      vcid='0'/>\n</Map>",
                           "<Infos>\n" + Record(Good()) + "</Infos>"));
    EXPECT_THAT(texts, ElementsAre("FourCharMapper.xml:3:7: vcid can't be \"0\"; give a whole "
                                   "number from 1 to 2147483647, or leave it out"));
}

TEST_F(DataChecks, FindValuesThatAnAafLibraryRefuses) {
    for (const auto& [name, value] :
         std::vector<std::pair<std::string, std::string>>{{"ColorSiting", "5"},
                                                          {"ColorSiting", "256"},
                                                          {"HorizontalSubsampling", "3"},
                                                          {"HorizontalSubsampling", "0"},
                                                          {"VerticalSubsampling", "4"},
                                                          {"FrameLayout", "5"},
                                                          {"StoredHeight", "0"},
                                                          {"DisplayWidth", "0"},
                                                          {"ComponentDepth", "17"},
                                                          {"ColorRange", "x"},
                                                          {"ColorRange", "4294967296"},
                                                          {"ColorRange", "99999999999999999999"},
                                                          {"ColorRange", "+897"},
                                                          {"ColorRange", "00"},
                                                          {"ColorRange", "0x381"},
                                                          {"BlackRefLevel", "-1"}}) {
        EXPECT_THAT(Check(Record(With(name, value))),
                    Contains(HasSubstr("rp210:" + name + " can't be \"" + value + "\"; give ")));
    }
}

TEST_F(DataChecks, AcceptTheRestOfTheirRanges) {
    for (const auto& [name, value] :
         std::vector<std::pair<std::string, std::string>>{{"ColorSiting", "4"},
                                                          {"ColorSiting", "255"},
                                                          {"HorizontalSubsampling", "4"},
                                                          {"VerticalSubsampling", "2"},
                                                          {"FrameLayout", "4"},
                                                          {"ImageStartOffset", "0"},
                                                          {"ImageStartOffset", "4294967295"}}) {
        EXPECT_THAT(Check(Record(With(name, value))), IsEmpty()) << name << value;
    }
}

// The module writes ids as signed numbers when it compares them.
TEST_F(DataChecks, FindIdsThatTheModuleCanNotFind) {
    EXPECT_THAT(Check(Record(Good(), "2147483647"), Row("dvc ", "vcid='2147483647'")), IsEmpty());
    EXPECT_THAT(Check(Record(Good(), "2147483648"), Row("dvc ", "vcid='2147483648'")),
                ElementsAre(HasSubstr("vcid can't be \"2147483648\"; give a whole number from 1 to "
                                      "2147483647"),
                            HasSubstr("ResolutionID can't be \"2147483648\"")));
}

TEST_F(DataChecks, FindEveryValueThatARecordMustHave) {
    for (const auto& value : Good()) {
        Values values = Good();
        values.erase(value.first);
        EXPECT_THAT(Check(Record(values)),
                    Contains(HasSubstr("groups:CDCIDescriptor lacks " + value.first)));
    }
    EXPECT_THAT(Check(Record(Good(), "10000", "CDCI", "")),
                Contains(HasSubstr("lacks rp210:VideoLineMap")));
    EXPECT_THAT(Check(Record(Good(), "10000", "CDCI", "<rp210:VideoLineMap/>")),
                Contains(HasSubstr("rp210:VideoLineMap must have one or two line numbers")));
    EXPECT_THAT(
        Check(Record(Good(), "10000", "MPEG2Video")),
        AllOf(Contains(HasSubstr("lacks rp210:BitRate")), Contains(HasSubstr("lacks rp210:MaxGOP")),
              Contains(HasSubstr("lacks rp210:ProfileAndLevel"))));
    EXPECT_THAT(Check(Record(Good(), "10000", "RGBA")),
                AllOf(Contains(HasSubstr("lacks rp210:ComponentMaxRef")),
                      Contains(HasSubstr("lacks rp210:PixelLayout"))));
    EXPECT_THAT(Check(Record(Good(), "10000", "CDCI", "", "types:Numerator='0'")),
                AllOf(Contains(HasSubstr("types:Numerator can't be \"0\"")),
                      Contains(HasSubstr("rp210:AspectRatio lacks types:Denominator"))));
}

TEST_F(DataChecks, FindLayoutsWithTooManyComponentsAndLongCodes) {
    std::string components;
    for (int i = 0; i < 9; ++i) {
        components += "<rp210:RGBALayout rp210:Code='RG' rp210:Depth='65'/>";
    }
    EXPECT_THAT(Check(Record(Good(), "10000", "RGBA",
                             "<rp210:PixelLayout>" + components + "</rp210:PixelLayout>")),
                AllOf(Contains(HasSubstr("rp210:PixelLayout has 9 components")),
                      Contains(HasSubstr("rp210:Code is more than one letter")),
                      Contains(HasSubstr("rp210:Depth can't be \"65\""))));
}

TEST_F(DataChecks, FindLevelsThatTheDepthHasNoRoomFor) {
    EXPECT_THAT(Check(Record(With("WhiteReflevel", "1024"))),
                ElementsAre(HasSubstr("rp210:WhiteReflevel can't be 1024: components have 10 bits; "
                                      "give 1023 at most")));
    EXPECT_THAT(Check(Record(With("ColorRange", "1024"))),
                ElementsAre(HasSubstr("rp210:ColorRange can't be 1024: ")));
    EXPECT_THAT(Check(Record(With("WhiteReflevel", "1023"))), IsEmpty());
    EXPECT_THAT(Check(Record(With("ComponentDepth", "x"))),
                ElementsAre(HasSubstr("rp210:ComponentDepth can't be \"x\"")));
}

TEST_F(DataChecks, FindABlackLevelThatIsNotBelowWhite) {
    for (const char* const black : {"940", "1000"}) {
        EXPECT_THAT(Check(Record(With("BlackRefLevel", black))),
                    ElementsAre(HasSubstr("rp210:BlackRefLevel can't be " + std::string(black) +
                                          ": rp210:WhiteReflevel is 940; give 939 at most")));
    }
    EXPECT_THAT(Check(Record(With("BlackRefLevel", "939"))), IsEmpty());
}

TEST_F(DataChecks, FindSizesLargerThanWhatIsStored) {
    EXPECT_THAT(Check(Record(With("SampledWidth", "721"))),
                ElementsAre(HasSubstr("rp210:SampledWidth can't be 721: rp210:StoredWidth is 720; "
                                      "give 720 at most, or correct the other value")));
    EXPECT_THAT(Check(Record(With("DisplayWidth", "1440"))),
                ElementsAre(HasSubstr("rp210:DisplayWidth can't be 1440: ")));
    EXPECT_THAT(Check(Record(With("DisplayHeight", "481"))),
                ElementsAre(HasSubstr("rp210:DisplayHeight can't be 481: rp210:StoredHeight is")));
    EXPECT_THAT(
        Check(Record(With("DisplayYOffset", "1"))),
        ElementsAre(HasSubstr("rp210:DisplayYOffset can't be 1: 480 of 480 lines are shown; "
                              "give 0 at most")));
    Values values = With("DisplayHeight", "470");
    values["rp210:DisplayYOffset"] = "10";
    EXPECT_THAT(Check(Record(values)), IsEmpty());
    values["rp210:DisplayYOffset"] = "4294967295";
    EXPECT_THAT(Check(Record(values)), ElementsAre(HasSubstr("give 10 at most")));
}

TEST_F(DataChecks, FindFieldsWithoutALineForEach) {
    EXPECT_THAT(Check(Record(With("FrameLayout", "1"))),
                ElementsAre(HasSubstr("rp210:VideoLineMap has no line for the second field")));
}

// None of the shipped records is of this kind.
class RgbaRecords : public DataChecks {
protected:
    static std::string Component(const std::string& code, const std::string& depth = "8") {
        return "<rp210:RGBALayout rp210:Code='" + code + "' rp210:Depth='" + depth + "'/>";
    }
    Texts CheckRgba(const std::string& components, const std::string& black = "16",
                    const std::string& white = "235") {
        Values values = Good();
        for (const char* const name :
             {"rp210:ComponentDepth", "rp210:HorizontalSubsampling", "rp210:VerticalSubsampling",
              "rp210:ColorSiting", "rp210:ColorRange", "rp210:BlackRefLevel",
              "rp210:WhiteReflevel"}) {
            values.erase(name);
        }
        values["rp210:ComponentMinRef"] = black;
        values["rp210:ComponentMaxRef"] = white;
        return Check(Record(values, "10000", "RGBA",
                            "<rp210:VideoLineMap><rp210:Element>23</rp210:Element>"
                            "</rp210:VideoLineMap><rp210:PixelLayout>" +
                                components + "</rp210:PixelLayout>"));
    }
    const std::string rgb_ = Component("R") + Component("G") + Component("B");
};

TEST_F(RgbaRecords, AreFineWithThreeColoursOrAPalette) {
    EXPECT_THAT(CheckRgba(rgb_), IsEmpty());
    EXPECT_THAT(CheckRgba(rgb_ + Component("F") + Component("A") + Component("F")), IsEmpty());
    EXPECT_THAT(CheckRgba(Component("P")), IsEmpty());
    EXPECT_THAT(CheckRgba(rgb_, "0", "255"), IsEmpty());
}

TEST_F(RgbaRecords, AreToldForLevelsThatTheirComponentsHaveNoRoomFor) {
    EXPECT_THAT(
        CheckRgba(rgb_, "16", "256"),
        ElementsAre(HasSubstr("rp210:ComponentMaxRef can't be 256: components have 8 bits")));
    EXPECT_THAT(CheckRgba(rgb_ + Component("A", "10"), "16", "256"), IsEmpty());
    EXPECT_THAT(
        CheckRgba(rgb_, "235", "235"),
        ElementsAre(HasSubstr("rp210:ComponentMinRef can't be 235: rp210:ComponentMaxRef")));
}

TEST_F(RgbaRecords, AreToldForComponentsThatMakeNoPicture) {
    EXPECT_THAT(CheckRgba(rgb_ + Component("X")),
                ElementsAre(HasSubstr("rp210:Code can't be \"X\"; give R, G, B, A (alpha)")));
    EXPECT_THAT(CheckRgba(rgb_ + Component("G")),
                ElementsAre(HasSubstr("G stands here a second time")));
    EXPECT_THAT(CheckRgba(Component("R") + Component("B")),
                ElementsAre(HasSubstr("rp210:PixelLayout has no G")));
    EXPECT_THAT(CheckRgba(rgb_ + Component("")),
                ElementsAre(HasSubstr("rp210:Code is empty or has blanks around it")));
    EXPECT_THAT(CheckRgba(""), Contains(HasSubstr("rp210:PixelLayout has 0 components")));
}

TEST_F(DataChecks, FindLabelsThatComeOutWrong) {
    for (const char* const label :
         {"{edb35383-6d30-11d3-a036-006094eb75cb}", "060e2b34-0401010d-04010202-030604",
          "060e2b34-0401010d-04010202-0306040g"}) {
        EXPECT_THAT(Check(Record(With("PictureEssenceCoding", label))),
                    Contains(HasSubstr("rp210:PictureEssenceCoding is no universal label")));
    }
    EXPECT_THAT(Check(Record(With("EssenceContainerLabel", "060e2b34-0401010d-04810202-03060400"))),
                Contains(HasSubstr("has a byte of 80h or more in its second half")));
}

TEST_F(DataChecks, FindAProfileThatWouldBePassedOver) {
    for (const char* const profile : {"82", "0x8", "0x8g", "0x821"}) {
        Values values = Good();
        values.insert(
            {{"rp210:BitRate", "1"}, {"rp210:MaxGOP", "1"}, {"rp210:ProfileAndLevel", profile}});
        EXPECT_THAT(Check(Record(values, "10000", "MPEG2Video")),
                    Contains(HasSubstr("rp210:ProfileAndLevel can't be \"" + std::string(profile) +
                                       "\"; write 0x and two digits")));
    }
}

TEST_F(DataChecks, FindNamesThatMeanNothingAndTellTheRightOne) {
    EXPECT_THAT(Check(Record(With("WhiteRefLevel", "940"))),
                Contains(HasSubstr("rp210:WhiteRefLevel means nothing here; write "
                                   "rp210:WhiteReflevel, as the module spells it")));
    EXPECT_THAT(Check(Record(Good()), Row("dvc ", "id='10000'")),
                Contains(HasSubstr("id means nothing here; ")));
    EXPECT_THAT(Check(Record(Good()) + "<MediaDescriptorSignatur/>"),
                Contains(HasSubstr("MediaDescriptorSignatur means nothing here; write "
                                   "MediaDescriptorSignature")));
    EXPECT_THAT(Check(Record(Good(), "10000", "CDCI",
                             "<rp210:VideoLineMap><Line>1</Line><rp210:Element>1</rp210:Element>"
                             "</rp210:VideoLineMap>")),
                Contains(HasSubstr("Line means nothing here")));
}

// The module passes over an element that it does not know, and reads what is in it.
TEST_F(DataChecks, TakeEntriesOutOfElementsAroundThem) {
    EXPECT_THAT(Check("<Group><More>" + Record(Good()) + "</More></Group>",
                      "<DV>" + Row("dvc ", "vcid='10000'") + "</DV>"),
                IsEmpty());
    // One that lacks its end, and so holds the next, is told alone.
    EXPECT_THAT(
        Check(Record(Good()), "<FourCharMapping FourChar='AVxx' vcid='10000'>" +
                                  Row("dvc ", "vcid='10000'") + "</FourCharMapping>"),
        ElementsAre(HasSubstr("FourCharMapper.xml:2:47: FourCharMapping means nothing here")));
    EXPECT_THAT(Check("<Group>\n<x><y/></x>" + Record(Good()) + "</Group>"),
                ElementsAre(HasSubstr("AAFInfo.xml:3:1: x means nothing here")));
}

TEST_F(DataChecks, FindBlanksAroundAValue) {
    EXPECT_THAT(Check(Record(With("ColorSiting", "0 "))),
                ElementsAre(HasSubstr("rp210:ColorSiting is empty or has blanks around it")));
    EXPECT_THAT(Check(Record(With("PictureEssenceCoding", ""))),
                ElementsAre(HasSubstr("PictureEssenceCoding is empty or has blanks around it")));
    EXPECT_THAT(Check(Record(With("StoredWidth", " 720"))),
                ElementsAre(HasSubstr("rp210:StoredWidth is empty or has blanks around it")));
    EXPECT_THAT(Check(Record(Good(), "10000", "CDCI",
                             "<rp210:VideoLineMap><rp210:Element>\n 23</rp210:Element>"
                             "</rp210:VideoLineMap>")),
                ElementsAre(HasSubstr("rp210:Element is empty or has blanks around it")));
    EXPECT_THAT(Check(Record(Good()),
                      "<FourCharMapping FourChar='dvc '><vcid>10000</vcid><Vendor/>"
                      "</FourCharMapping>"),
                ElementsAre(HasSubstr("Vendor is empty or has blanks around it")));
}

TEST_F(DataChecks, FindLinesThatAreNoNumbersByTheirPlaces) {
    EXPECT_THAT(Check(Record(Good(), "10000", "CDCI",
                             "<rp210:VideoLineMap>\n<rp210:Element>x</rp210:Element>"
                             "</rp210:VideoLineMap>")),
                ElementsAre(HasSubstr("AAFInfo.xml:3:1: rp210:Element can't be \"x\"; give a whole "
                                      "number")));
}

// Of an element with an attribute, the module takes that for the value.
TEST_F(DataChecks, FindAttributesOfValues) {
    EXPECT_THAT(Check(Record(Good()),
                      "<FourCharMapping FourChar='dvc '><vcid note='x'>10000</vcid>"
                      "</FourCharMapping>"),
                ElementsAre(HasSubstr("FourCharMapper.xml:2:40: vcid would get the value of note; "
                                      "take the attribute out")));
}

TEST_F(DataChecks, FindWhatStandsThereTwice) {
    EXPECT_THAT(Check(Record(Good(), "10000", "CDCI",
                             "<rp210:FrameLayout>1</rp210:FrameLayout>"
                             "<rp210:VideoLineMap><rp210:Element>1</rp210:Element>"
                             "</rp210:VideoLineMap>")),
                Contains(HasSubstr("rp210:FrameLayout stands here a second time")));
    EXPECT_THAT(Check("<MediaDescriptorSignature><NivoInfo ResolutionID='1'/><NivoInfo "
                      "ResolutionID='2'/><groups:CDCIDescriptor/><groups:RGBADescriptor/>"
                      "</MediaDescriptorSignature>"),
                AllOf(Contains(HasSubstr("NivoInfo stands here a second time")),
                      Contains(HasSubstr("this is a second descriptor"))));
}

TEST_F(DataChecks, FindEntriesWithoutKeyOrDescriptor) {
    EXPECT_THAT(Check("<MediaDescriptorSignature><NivoInfo/></MediaDescriptorSignature>"),
                AllOf(Contains(HasSubstr("NivoInfo lacks ResolutionID")),
                      Contains(HasSubstr("the record has no descriptor"))));
    EXPECT_THAT(Check("<MediaDescriptorSignature/>"),
                Contains(HasSubstr("MediaDescriptorSignature lacks NivoInfo")));
    EXPECT_THAT(Check(Record(Good(), "010000")),
                Contains(HasSubstr("ResolutionID has zeros before its number")));
    EXPECT_THAT(Check(Record(Good()), "<FourCharMapping vcid='1'/>"),
                Contains(HasSubstr("FourCharMapping lacks FourChar")));
    EXPECT_THAT(Check(Record(Good()), Row("dvc", "vcid='1'")),
                Contains(HasSubstr("FourChar must have four characters, not \"dvc\"")));
    EXPECT_THAT(
        Check(Record(Good()), Row("dv\xC3\xA9 ", "vcid='1'")),
        Contains(HasSubstr("not \"dv\xC3\xA9 \"; write the four characters of the code, each "
                           "of one byte")));
    EXPECT_THAT(Check(Record(Good()), Row("dvc ", "vcid='10000' Vendor='applX'")),
                Contains(HasSubstr("of Vendor only \"appl\" counts")));
}

TEST_F(DataChecks, FindAnIdOfOneRecordWhereTheSizeIsNotFixed) {
    const std::string rows = Row("v210", "vcid='10000'");
    EXPECT_THAT(Check(Record(Good()), rows),
                ElementsAre(HasSubstr("AAFInfo.xml:2:1: id 10000 has one record, so a picture of "
                                      "any height gets it; repeat the record")));
    EXPECT_THAT(Check(Record(Good()) + Record(Good()), rows), IsEmpty()) << "a repeat will do";
}

TEST_F(DataChecks, FindARepeatThatServesNothing) {
    EXPECT_THAT(Check(Record(Good()) + Record(Good()) + Record(Good())),
                Contains(AllOf(HasSubstr("AAFInfo.xml:4:1: "), HasSubstr("it is a repeat"))));
}

TEST_F(DataChecks, FindTwoRecordsOfOnePictureThatDiffer) {
    const std::string other = Record(With("ColorSiting", "4"));
    EXPECT_THAT(Check(Record(Good()) + other),
                ElementsAre(AllOf(HasSubstr("AAFInfo.xml:3:1: a picture of 720x480"),
                                  HasSubstr("line 2 instead of this one; make the two alike"))));
    EXPECT_THAT(
        Check(Record(Good()) + Record(Good()) + other),
        ElementsAre(HasSubstr("AAFInfo.xml:3:1: "),
                    AllOf(HasSubstr("AAFInfo.xml:4:1: "), HasSubstr("make the two alike"))));
    // The same in another form is no other record.
    Values values = Good();
    values.erase("rp210:ColorSiting");
    EXPECT_THAT(
        Check(Record(Good()) + Record(values, "10000", "CDCI",
                                      "<rp210:ColorSiting>0</rp210:ColorSiting><rp210:VideoLineMap>"
                                      "<rp210:Element>23</rp210:Element></rp210:VideoLineMap>")),
        IsEmpty());
    EXPECT_THAT(
        Check(Record(Good()) + Record(Good(), "10000", "CDCI",
                                      "<rp210:VideoLineMap><rp210:Element>24</rp210:Element>"
                                      "</rp210:VideoLineMap>")),
        ElementsAre(HasSubstr("make the two alike")));
}

TEST_F(DataChecks, FindRecordsBehindOthers) {
    const auto inLineTwo = HasSubstr("finds the record of id 10000 in line 2 instead of this one");
    // 486 lines pass for 480 by the rule of six lines more.
    EXPECT_THAT(Check(Record(Sized("720", "480")) + Record(Sized("720", "486"))),
                Contains(AllOf(HasSubstr("AAFInfo.xml:3:1: a picture of 720x486"), inLineTwo)));
    EXPECT_THAT(Check(Record(Sized("720", "486")) + Record(Sized("720", "480"))), IsEmpty());
    // Fields pass for frames and the reverse, so no order helps.
    EXPECT_THAT(Check(Record(Sized("1920", "1080")) + Record(Sized("1920", "540"))),
                ElementsAre(AllOf(HasSubstr("1920x540"), inLineTwo, HasSubstr("another id"))));
    EXPECT_THAT(Check(Record(Sized("1920", "540")) + Record(Sized("1920", "1080"))),
                ElementsAre(AllOf(HasSubstr("1920x1080"), inLineTwo, HasSubstr("another id"))));
    EXPECT_THAT(Check(Record(Sized("1440", "540")) + Record(Sized("1920", "540"))), IsEmpty());
}

TEST_F(DataChecks, FindIdsThatNoCodeLeadsTo) {
    EXPECT_THAT(Check(Record(Good()) + Record(Good(), "10001")),
                ElementsAre(HasSubstr("AAFInfo.xml:3:1: no code leads to id 10001; add a row")));
    EXPECT_THAT(Check(Record(Good()) + Record(Good(), "10950") + Record(Good(), "10950")),
                IsEmpty())
        << "movies name these themselves";
}

TEST_F(DataChecks, FindCodesThatLeadNowhere) {
    EXPECT_THAT(
        Check(Record(Good()),
              Row("dvc ", "vcid='10000'") + Row("dvcp", "vcid='10001'") + Row("dvpp", "")),
        ElementsAre(HasSubstr("FourCharMapper.xml:3:1: code \"dvcp\" leads to id 10001, which has "
                              "no record; add a record with ResolutionID 10001"),
                    HasSubstr("FourCharMapper.xml:4:1: code \"dvpp\" leads to no id; give it")));
    EXPECT_THAT(Check(Record(Good()), Row("dvc ", "vcid='10000'") + Row("apch", "")),
                Contains(HasSubstr("code \"apch\" leads to no id; give the code a second row")));
}

TEST_F(DataChecks, LeaveTheIdToTheMovieWhereItsRecordIsThere) {
    const std::string rows = Row("dvc ", "vcid='10000'") + Row("AVxx", "");
    EXPECT_THAT(Check(Record(Good()) + Record(Good(), "10900") + Record(Good(), "10900"), rows),
                IsEmpty());
    EXPECT_THAT(Check(Record(Good()) + Record(Good(), "10999") + Record(Good(), "10999"), rows),
                IsEmpty());
    EXPECT_THAT(Check(Record(Good()) + Record(Good(), "11000"), rows),
                Contains(HasSubstr("code \"AVxx\" leads to no id")));
    EXPECT_THAT(
        Check(Record(Good()), rows),
        ElementsAre(HasSubstr("FourCharMapper.xml:3:1: code \"AVxx\" leads to no id; give it "
                              "a vcid, or AAFInfo.xml a record with an id of those that "
                              "movies name themselves, 10900 to 10999")));
    EXPECT_THAT(Check(Record(Good()) + "<MediaDescriptorSignature/>", rows),
                Not(Contains(HasSubstr("AVxx"))))
        << "the record that is broken may be the one";
}

TEST_F(DataChecks, FindRepeatedRowsWithoutAnId) {
    const std::string records = Record(Good()) + Record(Good(), "10900") + Record(Good(), "10900");
    const std::string dvc = Row("dvc ", "vcid='10000'");
    const auto inLineFour = HasSubstr(
        "FourCharMapper.xml:4:1: this row of \"AVxx\" serves no movie; take it out: one before it "
        "counts");
    EXPECT_THAT(Check(records, dvc + Row("AVxx", "") + Row("AVxx", "")), ElementsAre(inLineFour));
    EXPECT_THAT(Check(records, dvc + Row("AVxx", "Vendor='appl'") + Row("AVxx", "Vendor='appl'")),
                ElementsAre(inLineFour));
    EXPECT_THAT(Check(records, dvc + Row("AVxx", "Vendor='appl' vcid='10000'") +
                                   Row("AVxx", "Vendor='appl'")),
                ElementsAre(inLineFour));
    EXPECT_THAT(Check(records, dvc + Row("AVxx", "") + Row("AVxx", "Vendor='appl'")), IsEmpty());
    EXPECT_THAT(Check(records, dvc + Row("AVxx", "") + Row("AVxx", "vcid='10000'")), IsEmpty());
}

// Two rows are what it takes to have the table asked.
TEST_F(DataChecks, FindAThirdRowOfACodeOfTheModulesTable) {
    const std::string two = Row("apch", "") + Row("apch", "");
    EXPECT_THAT(Check(Record(Good()), two), Not(Contains(HasSubstr("serves no movie"))));
    EXPECT_THAT(
        Check(Record(Good()), two + Row("apch", "")),
        Contains(HasSubstr("FourCharMapper.xml:4:1: this row of \"apch\" serves no movie")));
}

TEST_F(DataChecks, FindRastersOfTheModulesTableWithoutARecord) {
    EXPECT_THAT(
        Check(Record(Good()), Row("dvc ", "vcid='10000'") + Row("apch", "") + Row("apch", "")),
        Contains(HasSubstr("FourCharMapper.xml:4:1: code \"apch\" has no record for "
                           "1920x1080 frames; add one with ResolutionID 3710 and "
                           "FrameLayout 0")));
}

TEST_F(DataChecks, FindRowsThatNoMovieGetsItsIdBy) {
    const std::string records = Record(Good()) + Record(Good());
    EXPECT_THAT(Check(records, Row("v210", "Vendor='appl' vcid='10000'") +
                                   Row("v210", "Vendor='appl' vcid='10000'")),
                ElementsAre(AllOf(HasSubstr("FourCharMapper.xml:3:1: no movie gets id 10000"),
                                  HasSubstr("has the same Vendor"))));
    EXPECT_THAT(Check(records, Row("v210", "vcid='10000'") + Row("v210", "vcid='10000'")),
                ElementsAre(AllOf(HasSubstr("FourCharMapper.xml:2:1: "),
                                  HasSubstr("of rows without Vendor the last counts"))));
    EXPECT_THAT(
        Check(records, Row("dvc ", "vcid='10000'") + Row("apch", "vcid='10000'") + Row("apch", "")),
        Contains(AllOf(HasSubstr("FourCharMapper.xml:3:1: no movie gets id 10000"),
                       HasSubstr("the module's own table"))));
    EXPECT_THAT(
        Check(records, Row("v210", "Vendor='FFMP' vcid='10000'") +
                           Row("v210", "Vendor='appl' vcid='10000'") + Row("v210", "vcid='10000'")),
        IsEmpty());
}

TEST_F(DataChecks, CutLongTextsBetweenCharacters) {
    std::string longText = "x";
    for (int i = 0; i < 100; ++i) {
        longText += "\xC3\xA9";
    }
    const Texts texts =
        Check(Record(With("ColorSiting", longText)) +
                  Record(With("PictureEssenceCoding", longText), "10001"),
              Row("dvc ", "vcid='10000' Vendor='" + longText + "'") + Row(longText, "vcid='1'"));
    ASSERT_GE(texts.size(), 4u);
    std::string start = "x";
    for (int i = 0; i < 29; ++i) {
        start += "\xC3\xA9";
    }
    EXPECT_THAT(texts, Contains(HasSubstr("ColorSiting can't be \"" + start + "...\"")));
    EXPECT_THAT(texts, Contains(HasSubstr("label: \"" + start + "...\"")));
    EXPECT_THAT(texts, Contains(HasSubstr("of Vendor only \"x\xC3\xA9\" counts")));
    EXPECT_THAT(texts, Contains(HasSubstr("characters, not \"" + start + "...\"")));
}

// What is wrong in one file does not make all of the other wrong.
TEST_F(DataChecks, TellNothingThatFollowsFromAnotherMistake) {
    EXPECT_THAT(Check(Record(With("StoredWidth", "x"))),
                ElementsAre(HasSubstr("rp210:StoredWidth can't be \"x\"")));
    EXPECT_THAT(Check(Record(Good()), Row("dvc", "vcid='10000'")),
                ElementsAre(HasSubstr("FourChar must have four characters")));
}

TEST_F(DataChecks, TellAMistypedNameAloneAndNotThatTheRightOneLacks) {
    Values values = Good();
    values.erase("rp210:WhiteReflevel");
    values["rp210:WhiteRefLevel"] = "940";
    EXPECT_THAT(Check(Record(values)),
                ElementsAre(HasSubstr("rp210:WhiteRefLevel means nothing here; write "
                                      "rp210:WhiteReflevel")));
    values = Good();
    values.erase("rp210:StoredWidth");
    values["rp210:StoredWith"] = "720";
    EXPECT_THAT(Check(Record(values)), ElementsAre(HasSubstr("rp210:StoredWith means nothing")));
    EXPECT_THAT(Check(Record(Good(), "10000", "CDCI", "<rp210:VideoLinesMap/>")),
                ElementsAre(HasSubstr("rp210:VideoLinesMap means nothing here; write "
                                      "rp210:VideoLineMap")));
    EXPECT_THAT(Check(Record(Good()), "<FourCharMapping FourChr='dvc ' vcid='10000'/>"),
                ElementsAre(HasSubstr("FourChr means nothing here; write FourChar")));
}

// The other one is still to be told.
TEST_F(DataChecks, TellALackBesideANameThatIsLikeAnother) {
    Values values = Good();
    values.erase("rp210:StoredWidth");
    values["rp210:StoredHeigth"] = "1";
    EXPECT_THAT(Check(Record(values)),
                AllOf(Contains(HasSubstr("rp210:StoredHeigth means nothing here")),
                      Contains(HasSubstr("lacks rp210:StoredWidth"))));
}

TEST_F(DataChecks, TellAnUnknownElementAloneWhereItHoldsWhatARecordNeeds) {
    EXPECT_THAT(Check(Record(Good(), "10000", "CDCI",
                             "<Lines><rp210:VideoLineMap><rp210:Element>23</rp210:Element>"
                             "</rp210:VideoLineMap></Lines>")),
                ElementsAre(HasSubstr("Lines means nothing here; take it out")));
}

// The module finds ids by their letters, and reads other numbers without the zeros.
TEST_F(DataChecks, TellZerosBeforeANumberAsThat) {
    EXPECT_THAT(Check(Record(With("ColorRange", "0897"))),
                ElementsAre(HasSubstr(
                    "rp210:ColorRange has zeros before its number: \"0897\"; write 897")));
    EXPECT_THAT(Check(Record(Good(), "010000")),
                ElementsAre(HasSubstr("ResolutionID has zeros before its number: \"010000\"; "
                                      "write 10000")));
    EXPECT_THAT(Check(Record(With("BlackRefLevel", "00"))),
                ElementsAre(HasSubstr("rp210:BlackRefLevel has zeros before its number")));
}

// A name that the module passes over leaves the rest of its row as it is.
TEST_F(DataChecks, TellWhatIsWrongWithARowBesideAnUnknownName) {
    EXPECT_THAT(Check(Record(Good()), Row("dvc ", "vcid='10001' vendor='x'")),
                AllOf(Contains(HasSubstr("vendor means nothing here")),
                      Contains(HasSubstr("leads to id 10001, which has no record"))));
}

TEST_F(DataChecks, TellWhereAFileIsNotWellFormedAndCheckTheOther) {
    const CheckedData checked =
        CheckFiles("<Map>\n" + Row("dvc ", "vcid='0'") + "</Map>", "<Infos>\n  <a>\n</Infos>");
    EXPECT_THAT(TextsOf(checked),
                ElementsAre(HasSubstr("FourCharMapper.xml:2:34: vcid can't be \"0\""),
                            HasSubstr("AAFInfo.xml:3:3: this is no well-formed XML: mismatched")));
}

TEST_F(DataChecks, TellFilesThatAreNotThere) {
    const CheckedData checked = data_check::CheckData(folder_.path());
    EXPECT_THAT(checked.findings, IsEmpty());
    EXPECT_EQ(checked.unreadable[0], "there is no such file");
    EXPECT_EQ(checked.unreadable[1], "there is no such file");
}

TEST_F(DataChecks, RefuseAFileThatIsTooLong) {
    std::string large = "<Map>";
    large.resize(9u << 20, ' ');
    EXPECT_NE(CheckFiles(large + "</Map>", "<Infos/>").unreadable[0], "");
}

TEST_F(DataChecks, CountWhatTheyDoNotKeepOfAFileOfMistakes) {
    std::string rows;
    for (int i = 0; i < 50'000; ++i) {
        rows += "<x/>";
    }
    const CheckedData checked = CheckFiles("<Map>" + rows + "</Map>", "<Infos/>");
    EXPECT_EQ(checked.findings.size(), 1000u);
    EXPECT_GE(checked.counts.findings, 50'000u);
}

// What is found last, in both files together, may stand first.
TEST_F(DataChecks, KeepTheFindingsThatStandFirst) {
    std::string rows = Row("dvcp", "vcid='10001'");
    for (int i = 0; i < 5000; ++i) {
        rows += Row("dvc ", "vcid='x'");
    }
    const CheckedData checked =
        CheckFiles("<Map>\n" + rows + "</Map>", "<Infos>\n" + Record(Good()) + "</Infos>");
    ASSERT_EQ(checked.findings.size(), 1000u);
    EXPECT_THAT(checked.findings.front().what, HasSubstr("leads to id 10001, which has no record"));
    for (std::size_t i = 1; i < checked.findings.size(); ++i) {
        EXPECT_EQ(checked.findings[i].place.line, i + 2);
    }
    EXPECT_GE(checked.counts.findings, 5001u);
}

TEST_F(DataChecks, TakeManyRowsOfOneCodeAndRecordsOfOneId) {
    std::string rows;
    for (int i = 0; i < 100'000; ++i) {
        rows += "<FourCharMapping FourChar='dvc ' vcid='1'/>";
    }
    std::string records;
    for (int i = 0; i < 3000; ++i) {
        records += Record(Good());
    }
    EXPECT_GT(
        CheckFiles("<Map>" + rows + "</Map>", "<Infos>" + records + "</Infos>").counts.findings,
        100'000u);
}

}  // namespace
