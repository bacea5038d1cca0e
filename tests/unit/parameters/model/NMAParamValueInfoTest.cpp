// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/parameters/model/NMAParamValueInfo.h"

#include <memory>
#include <vector>

#include "tests/unit/parameters/model/ParamTest.h"

namespace {

using namespace NMA::XMLUtils;

// The element of each kind, by its number.
const char* const kInfoElements[] = {"valueInfoSInt32",   "valueInfoUInt32",  "valueInfoSInt64",
                                     "valueInfoUInt64",   "valueInfoDouble",  "valueInfoDiscrete",
                                     "valueInfoRational", "valueInfoBoolean", "valueInfoOpaque",
                                     "valueInfoString",   "valueInfoLabel"};

class ParamValueInfo : public ParamTest {
protected:
    NMAParamValueInfo load(const std::string& content) {
        return rootOf<NMAParamValueInfo>("<valueInfo>" + content + "</valueInfo>");
    }
    NMAParamValueInfo ofKind(ncfUInt32 kind) {
        NMAParamValueInfo info = load("");
        info.SetKind(kind);
        return info;
    }
    // Discrete values as a list; the caller frees them.
    std::vector<ncfUInt32> discrete(const NMAParamValueInfo& info) {
        ncfUInt32* values = nullptr;
        ncfUInt32 count = 0;
        EXPECT_EQ(info.GetDiscreteInfo(&values, &count, &discreteDefault), NCF_OK);
        const std::unique_ptr<ncfUInt32[]> owned(values);
        return std::vector<ncfUInt32>(values, values + count);
    }
    ncfUInt32 discreteDefault = 0;
};

// --- kinds ---------------------------------------------------------------------

TEST_F(ParamValueInfo, EmptyReadsAsOpaque) {
    EXPECT_EQ(load("").GetKind(), 8u);
    EXPECT_EQ(load("text<other/>").GetKind(), 8u);
}

TEST_F(ParamValueInfo, KindIsThatOfTheElement) {
    for (ncfUInt32 kind = 0; kind <= 10; ++kind) {
        EXPECT_EQ(load(std::string("<") + kInfoElements[kind] + "/>").GetKind(), kind);
    }
}

TEST_F(ParamValueInfo, OfSeveralElementsTheLowestKindCounts) {
    EXPECT_EQ(load("<valueInfoLabel/><valueInfoBoolean/><valueInfoUInt32/>").GetKind(), 1u);
}

TEST_F(ParamValueInfo, SetKindMakesTheElement) {
    for (ncfUInt32 kind = 0; kind <= 10; ++kind) {
        NMAParamValueInfo info = load("");
        EXPECT_EQ(info.SetKind(kind), NCF_OK);
        EXPECT_EQ(info.GetKind(), kind);
        EXPECT_EQ(saved(), std::string("<valueInfo><") + kInfoElements[kind] + "/></valueInfo>");
    }
}

TEST_F(ParamValueInfo, SetKindDeletesAnElementMadeInMemoryAtOnce) {
    NMAParamValueInfo info = load("<unit/>");
    info.SetKind(0);
    info.SetSInt32Info(3, 1, 2);
    info.SetKind(9);
    EXPECT_EQ(info.GetKind(), 9u);
    EXPECT_EQ(saved(), "<valueInfo><unit/><valueInfoString/></valueInfo>");
}

TEST_F(ParamValueInfo, SetKindMarksAnElementOfTheTextAndItStaysVisibleUntilSaved) {
    NMAParamValueInfo info = load("<valueInfoSInt32 max=\"3\" min=\"1\" default=\"2\"/>");
    info.SetKind(1);
    EXPECT_EQ(info.GetKind(), 0u) << "the marked element has the lower number";
    EXPECT_EQ(info.SetUInt32Info(9, 8, 7), NCF_OK);
    const std::string text = saved();
    EXPECT_EQ(text, "<valueInfo><valueInfoUInt32 max=\"9\" min=\"8\" default=\"7\"/></valueInfo>");
    EXPECT_EQ(rootOf<NMAParamValueInfo>(text).GetKind(), 1u);
}

TEST_F(ParamValueInfo, AMarkedElementComesBackWhenItsAttributesAreSet) {
    NMAParamValueInfo info = load("<valueInfoSInt32 max=\"3\" min=\"1\" default=\"2\"/>");
    info.SetKind(0);
    EXPECT_EQ(info.SetSInt32Info(9, 8, 7), NCF_OK);
    EXPECT_EQ(saved(),
              "<valueInfo><valueInfoSInt32 max=\"9\" min=\"8\" default=\"7\"/>"
              "<valueInfoSInt32/></valueInfo>")
        << "the first of its kind is the one that was marked";
    ncfSInt32 max = 0, min = 0, def = 0;
    EXPECT_EQ(rootOf<NMAParamValueInfo>(saved()).GetSInt32Info(max, min, def), NCF_OK);
    EXPECT_EQ(max, 9);
}

TEST_F(ParamValueInfo, AMarkedElementIsTheFirstFoundByAFurtherSetKind) {
    NMAParamValueInfo info = load("<valueInfoSInt32/>");
    info.SetKind(1);
    info.SetKind(2);
    EXPECT_EQ(saved(), "<valueInfo><valueInfoUInt32/><valueInfoSInt64/></valueInfo>");
}

TEST_F(ParamValueInfo, SetKindToALowerNumberIsSeenAtOnce) {
    NMAParamValueInfo info = load("<valueInfoString/>");
    info.SetKind(7);
    EXPECT_EQ(info.GetKind(), 7u);
}

TEST_F(ParamValueInfo, SetKindRemovesTheFirstElementAlone) {
    NMAParamValueInfo info = load("<valueInfoString/><valueInfoBoolean/>");
    info.SetKind(10);
    EXPECT_EQ(saved(), "<valueInfo><valueInfoString/><valueInfoLabel/></valueInfo>");
}

TEST_F(ParamValueInfo, ANumberThatIsNoKindLeavesANamelessElement) {
    NMAParamValueInfo info = load("<valueInfoString/>");
    EXPECT_EQ(info.SetKind(11), NCF_OK);
    std::vector<Element*> all;
    suite.GetRoot()->CollectChildren(S(""), all);
    ASSERT_EQ(all.size(), 2u);
    EXPECT_EQ(TagOf(all[1]), "");
    EXPECT_EQ(Thrown([&] { Saved(suite); }), NCF_E_INVALIDARG) << "the writer takes no such name";
}

// --- ranges --------------------------------------------------------------------

TEST_F(ParamValueInfo, RangesGoThereAndBack) {
    {
        ncfSInt32 max = 0, min = 0, def = 0;
        NMAParamValueInfo info = ofKind(0);
        EXPECT_EQ(info.SetSInt32Info(2147483647, -2147483647 - 1, -1), NCF_OK);
        EXPECT_EQ(info.GetSInt32Info(max, min, def), NCF_OK);
        EXPECT_EQ(max, 2147483647);
        EXPECT_EQ(min, -2147483647 - 1);
        EXPECT_EQ(def, -1);
        EXPECT_EQ(saved(),
                  "<valueInfo><valueInfoSInt32 max=\"2147483647\" min=\"-2147483648\" "
                  "default=\"-1\"/></valueInfo>");
    }
    {
        ncfUInt32 max = 0, min = 0, def = 0;
        NMAParamValueInfo info = ofKind(1);
        info.SetUInt32Info(4294967295u, 1, 2);
        info.GetUInt32Info(max, min, def);
        EXPECT_EQ(max, 4294967295u);
        EXPECT_EQ(min, 1u);
        EXPECT_EQ(def, 2u);
    }
    {
        ncfSInt64 max = 0, min = 0, def = 0;
        NMAParamValueInfo info = ofKind(2);
        info.SetSInt64Info(5000000000, -5000000000, 7);
        info.GetSInt64Info(max, min, def);
        EXPECT_EQ(max, 5000000000);
        EXPECT_EQ(min, -5000000000);
        EXPECT_EQ(def, 7);
    }
    {
        ncfUInt64 max = 0, min = 0, def = 0;
        NMAParamValueInfo info = ofKind(3);
        info.SetUInt64Info(18446744073709551615u, 1, 2);
        info.GetUInt64Info(max, min, def);
        EXPECT_EQ(max, 18446744073709551615u);
        EXPECT_EQ(min, 1u);
        EXPECT_EQ(def, 2u);
    }
    {
        NMAParamRational max, min, def;
        NMAParamValueInfo info = ofKind(6);
        info.SetRationalInfo({60, 1}, {-1, 2}, {30000, 1001});
        info.GetRationalInfo(max, min, def);
        EXPECT_EQ(max, (NMAParamRational{60, 1}));
        EXPECT_EQ(min, (NMAParamRational{-1, 2}));
        EXPECT_EQ(def, (NMAParamRational{30000, 1001}));
    }
}

TEST_F(ParamValueInfo, DoublesAreWrittenWellAndReadNearZero) {
    NMAParamValueInfo info = ofKind(4);
    info.SetDoubleInfo(2.5, -1, 0.25);
    EXPECT_EQ(saved(),
              "<valueInfo><valueInfoDouble max=\"2.500000\" min=\"-1.000000\" "
              "default=\"0.250000\"/></valueInfo>");
    double max = 9, min = 9, def = 9;
    EXPECT_EQ(info.GetDoubleInfo(max, min, def), NCF_OK);
    for (const double value : {max, min, def}) {
        EXPECT_GT(value, 0.0);
        EXPECT_LT(value, 1e-300);
    }
}

TEST_F(ParamValueInfo, AnotherKindIsUnexpected) {
    ncfSInt32 s32 = 5;
    ncfUInt32 u32 = 5;
    ncfSInt64 s64 = 5;
    ncfUInt64 u64 = 5;
    double real = 5;
    NMAParamRational ratio;
    bool flag = true;
    NMAString text;
    ncfUInt32* values = nullptr;
    NMAParamValueInfo info = load("<valueInfoString/>");
    EXPECT_EQ(Thrown([&] { info.GetSInt32Info(s32, s32, s32); }), NCF_E_UNEXPECTED);
    EXPECT_EQ(Thrown([&] { info.SetSInt32Info(0, 0, 0); }), NCF_E_UNEXPECTED);
    EXPECT_EQ(Thrown([&] { info.GetUInt32Info(u32, u32, u32); }), NCF_E_UNEXPECTED);
    EXPECT_EQ(Thrown([&] { info.SetUInt32Info(0, 0, 0); }), NCF_E_UNEXPECTED);
    EXPECT_EQ(Thrown([&] { info.GetSInt64Info(s64, s64, s64); }), NCF_E_UNEXPECTED);
    EXPECT_EQ(Thrown([&] { info.SetSInt64Info(0, 0, 0); }), NCF_E_UNEXPECTED);
    EXPECT_EQ(Thrown([&] { info.GetUInt64Info(u64, u64, u64); }), NCF_E_UNEXPECTED);
    EXPECT_EQ(Thrown([&] { info.SetUInt64Info(0, 0, 0); }), NCF_E_UNEXPECTED);
    EXPECT_EQ(Thrown([&] { info.GetDoubleInfo(real, real, real); }), NCF_E_UNEXPECTED);
    EXPECT_EQ(Thrown([&] { info.SetDoubleInfo(0, 0, 0); }), NCF_E_UNEXPECTED);
    EXPECT_EQ(Thrown([&] { info.GetRationalInfo(ratio, ratio, ratio); }), NCF_E_UNEXPECTED);
    EXPECT_EQ(Thrown([&] { info.SetRationalInfo(ratio, ratio, ratio); }), NCF_E_UNEXPECTED);
    EXPECT_EQ(Thrown([&] { info.GetBooleanInfo(flag, text, text); }), NCF_E_UNEXPECTED);
    EXPECT_EQ(Thrown([&] { info.SetBooleanInfo(flag, text, text); }), NCF_E_UNEXPECTED);
    EXPECT_EQ(Thrown([&] { info.GetDiscreteInfo(&values, &u32, &u32); }), NCF_E_UNEXPECTED);
    EXPECT_EQ(Thrown([&] { info.SetDiscreteInfo(&u32, 1, 0); }), NCF_E_UNEXPECTED);
    EXPECT_EQ(s32, 5);
    EXPECT_EQ(u32, 5u);
    EXPECT_EQ(values, nullptr);
    EXPECT_EQ(saved(), "<valueInfo><valueInfoString/></valueInfo>");
}

TEST_F(ParamValueInfo, AttributesAreReadInOrderAndTheFirstTroubleCounts) {
    struct {
        const char* attributes;
        NCFRESULT failure;
    } const kCases[] = {
        {"min=\"x\" default=\"x\"", NMA_E_NODATA},
        {"max=\"x\"", NCF_E_UNEXPECTED},
        {"max=\"1\" default=\"x\"", NMA_E_NODATA},
        {"max=\"1\" min=\"x\"", NCF_E_UNEXPECTED},
        {"max=\"1\" min=\"1\"", NMA_E_NODATA},
        {"max=\"1\" min=\"1\" default=\"\"", NCF_E_UNEXPECTED},
    };
    for (const auto& each : kCases) {
        NMAParamValueInfo info = load(std::string("<valueInfoUInt32 ") + each.attributes + "/>");
        ncfUInt32 max = 7, min = 7, def = 7;
        EXPECT_EQ(Thrown([&] { info.GetUInt32Info(max, min, def); }), each.failure)
            << each.attributes;
        EXPECT_EQ(max + min + def, 21u) << "outputs stay as they were";
    }
}

// --- two words -----------------------------------------------------------------

TEST_F(ParamValueInfo, BooleansHaveWords) {
    NMAParamValueInfo info = ofKind(7);
    EXPECT_EQ(info.SetBooleanInfo(true, S("On"), S("Off")), NCF_OK);
    EXPECT_EQ(saved(),
              "<valueInfo><valueInfoBoolean default=\"true\" trueString=\"On\" "
              "falseString=\"Off\"/></valueInfo>");
    bool def = false;
    NMAString yes;
    NMAString no;
    EXPECT_EQ(info.GetBooleanInfo(def, yes, no), NCF_OK);
    EXPECT_TRUE(def);
    EXPECT_EQ(yes, S("On"));
    EXPECT_EQ(no, S("Off"));
    info.SetBooleanInfo(false, S("a"), S("b"));
    info.GetBooleanInfo(def, yes, no);
    EXPECT_FALSE(def);
}

TEST_F(ParamValueInfo, EveryAttributeOfABooleanIsNeeded) {
    bool def = true;
    NMAString yes;
    NMAString no;
    for (const char* const attributes :
         {"trueString=\"a\" falseString=\"b\"", "default=\"true\" falseString=\"b\"",
          "default=\"true\" trueString=\"a\""}) {
        NMAParamValueInfo info = load(std::string("<valueInfoBoolean ") + attributes + "/>");
        EXPECT_EQ(Thrown([&] { info.GetBooleanInfo(def, yes, no); }), NMA_E_NODATA) << attributes;
    }
    EXPECT_TRUE(def);
    EXPECT_TRUE(yes.IsEmpty());
    NMAParamValueInfo odd =
        load("<valueInfoBoolean default=\"TRUE\" trueString=\"a\" falseString=\"b\"/>");
    odd.GetBooleanInfo(def, yes, no);
    EXPECT_FALSE(def) << "any other word";
}

// --- lists ---------------------------------------------------------------------

TEST_F(ParamValueInfo, DiscreteValuesStandAsAttributeAndAsText) {
    NMAParamValueInfo info = ofKind(5);
    const ncfUInt32 values[] = {256, 512, 4294967295u};
    EXPECT_EQ(info.SetDiscreteInfo(values, 3, 512), NCF_OK);
    EXPECT_EQ(saved(),
              "<valueInfo><valueInfoDiscrete default=\"512\"><discrete value=\"256\">256"
              "</discrete><discrete value=\"512\">512</discrete><discrete value=\"4294967295\">"
              "4294967295</discrete></valueInfoDiscrete></valueInfo>");
    EXPECT_EQ(discrete(info), (std::vector<ncfUInt32>{256, 512, 4294967295u}));
    EXPECT_EQ(discreteDefault, 512u);
}

TEST_F(ParamValueInfo, DiscreteValuesAreReadFromTheAttributesInOrder) {
    NMAParamValueInfo info = load(
        "<valueInfoDiscrete default=\"7\"><discrete value=\"3\">Three</discrete><other/>"
        "<discrete value=\"1\"/></valueInfoDiscrete>");
    EXPECT_EQ(discrete(info), (std::vector<ncfUInt32>{3, 1}));
    EXPECT_EQ(discreteDefault, 7u) << "need not be one of them";
}

TEST_F(ParamValueInfo, ANewListReplacesOneMadeInMemory) {
    NMAParamValueInfo info = ofKind(5);
    const ncfUInt32 first[] = {1, 2, 3};
    const ncfUInt32 second[] = {9};
    info.SetDiscreteInfo(first, 3, 1);
    info.SetDiscreteInfo(second, 1, 9);
    EXPECT_EQ(discrete(info), (std::vector<ncfUInt32>{9}));
}

TEST_F(ParamValueInfo, ANewListReplacesOneOfTheTextWhenSaved) {
    NMAParamValueInfo info = load(
        "<valueInfoDiscrete default=\"1\"><discrete value=\"1\">1</discrete></valueInfoDiscrete>");
    const ncfUInt32 values[] = {9};
    info.SetDiscreteInfo(values, 1, 9);
    // The old one is marked and still met, but it can't be read any more.
    EXPECT_EQ(suite.GetRoot()->FindChild(S("valueInfoDiscrete"), 0)->CountChildren(S("discrete")),
              2u);
    EXPECT_EQ(Thrown([&] { discrete(info); }), NMA_E_NODATA);
    const std::string text = saved();
    EXPECT_EQ(text,
              "<valueInfo><valueInfoDiscrete default=\"9\"><discrete value=\"9\">9</discrete>"
              "</valueInfoDiscrete></valueInfo>");
    EXPECT_EQ(discrete(rootOf<NMAParamValueInfo>(text)), (std::vector<ncfUInt32>{9}));
}

TEST_F(ParamValueInfo, ANewListStandsBehindOneThatWasReadUntilSaved) {
    NMAParamValueInfo info = load(
        "<valueInfoDiscrete default=\"1\"><discrete value=\"1\">1</discrete></valueInfoDiscrete>");
    EXPECT_EQ(discrete(info), (std::vector<ncfUInt32>{1}));
    const ncfUInt32 values[] = {9, 8};
    info.SetDiscreteInfo(values, 2, 9);
    EXPECT_EQ(discrete(info), (std::vector<ncfUInt32>{1, 9, 8}));
    EXPECT_EQ(discreteDefault, 9u);
    EXPECT_EQ(discrete(rootOf<NMAParamValueInfo>(saved())), (std::vector<ncfUInt32>{9, 8}));
}

TEST_F(ParamValueInfo, DiscreteInfoThatCannotBeReadLeavesTheOutputs) {
    struct {
        const char* content;
        NCFRESULT failure;
    } const kCases[] = {
        {"<valueInfoDiscrete default=\"1\"/>", NCF_E_UNEXPECTED},
        {"<valueInfoDiscrete/>", NMA_E_NODATA},
        {"<valueInfoDiscrete><discrete value=\"1\"/></valueInfoDiscrete>", NMA_E_NODATA},
        {"<valueInfoDiscrete default=\"x\"><discrete value=\"1\"/></valueInfoDiscrete>",
         NCF_E_UNEXPECTED},
        {"<valueInfoDiscrete default=\"1\"><discrete value=\"1\"/><discrete>2</discrete>"
         "</valueInfoDiscrete>",
         NMA_E_NODATA},
        {"<valueInfoDiscrete default=\"1\"><discrete value=\"\"/></valueInfoDiscrete>",
         NCF_E_UNEXPECTED},
    };
    for (const auto& each : kCases) {
        NMAParamValueInfo info = load(each.content);
        ncfUInt32 kept = 5;
        ncfUInt32* values = &kept;
        ncfUInt32 count = 5;
        ncfUInt32 def = 5;
        EXPECT_EQ(Thrown([&] { info.GetDiscreteInfo(&values, &count, &def); }), each.failure)
            << each.content;
        EXPECT_EQ(values, &kept);
        EXPECT_EQ(count, 5u);
        EXPECT_EQ(def, 5u);
    }
}

TEST_F(ParamValueInfo, AListOfNoneCanBeWrittenButNotRead) {
    NMAParamValueInfo info = ofKind(5);
    EXPECT_EQ(info.SetDiscreteInfo(nullptr, 0, 4), NCF_OK);
    EXPECT_EQ(saved(), "<valueInfo><valueInfoDiscrete default=\"4\"/></valueInfo>");
    EXPECT_EQ(Thrown([&] { discrete(info); }), NCF_E_UNEXPECTED);
    EXPECT_EQ(Thrown([&] { info.SetDiscreteInfo(nullptr, 1, 5); }), NCF_E_INVALIDARG);
    EXPECT_EQ(saved(), "<valueInfo><valueInfoDiscrete default=\"4\"/></valueInfo>");
}

}  // namespace
