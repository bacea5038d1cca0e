// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/parameters/model/NMAParameter.h"

#include <functional>
#include <limits>

#include "tests/unit/parameters/model/ParamTest.h"

namespace {

using namespace NMA::XMLUtils;

class Parameter : public ParamTest {
protected:
    NMAParameter load(const std::string& content) {
        return rootOf<NMAParameter>("<parameter id=\"" ID_A "\">" + content + "</parameter>");
    }
    void expectContent(const std::string& content) {
        EXPECT_EQ(saved(), "<parameter id=\"" ID_A "\">" + content + "</parameter>");
    }

    ncfSInt32 s32 = 5;
    ncfUInt32 u32 = 5;
    ncfSInt64 s64 = 5;
    ncfUInt64 u64 = 5;
    double real = 5;
    NMAParamRational ratio{5, 5};
    bool flag = true;
    NMAString text = S("kept");
};

TEST_F(Parameter, ReadsIdAndSilence) {
    GUID id{};
    NMAParameter parameter = load("");
    EXPECT_EQ(parameter.GetID(id), NCF_OK);
    EXPECT_EQ(id, kIdA);
    EXPECT_EQ(Thrown([&] { parameter.IsSilent(); }), NMA_E_NODATA);
    EXPECT_EQ(parameter.SetSilent(true), NCF_OK);
    EXPECT_TRUE(parameter.IsSilent());
    parameter.SetSilent(false);
    EXPECT_FALSE(parameter.IsSilent());
    EXPECT_EQ(saved(), "<parameter id=\"" ID_A "\" silent=\"false\"/>");
}

TEST_F(Parameter, ReadsAndWritesEachKind) {
    NMAParameter parameter = load("<valueSInt32>-7</valueSInt32>");
    EXPECT_EQ(parameter.GetSInt32(s32), NCF_OK);
    EXPECT_EQ(s32, -7);
    EXPECT_EQ(parameter.SetSInt32(-8), NCF_OK);
    expectContent("<valueSInt32>-8</valueSInt32>");

    parameter = load("<valueUInt32>4294967295</valueUInt32>");
    EXPECT_EQ(parameter.GetUInt32(u32), NCF_OK);
    EXPECT_EQ(u32, 4294967295u);
    EXPECT_EQ(parameter.SetUInt32(1), NCF_OK);
    expectContent("<valueUInt32>1</valueUInt32>");

    parameter = load("<valueSInt64>-5000000000</valueSInt64>");
    EXPECT_EQ(parameter.GetSInt64(s64), NCF_OK);
    EXPECT_EQ(s64, -5000000000);
    EXPECT_EQ(parameter.SetSInt64(2), NCF_OK);
    expectContent("<valueSInt64>2</valueSInt64>");

    parameter = load("<valueUInt64>18446744073709551615</valueUInt64>");
    EXPECT_EQ(parameter.GetUInt64(u64), NCF_OK);
    EXPECT_EQ(u64, std::numeric_limits<ncfUInt64>::max());
    EXPECT_EQ(parameter.SetUInt64(3), NCF_OK);
    expectContent("<valueUInt64>3</valueUInt64>");

    parameter = load("<valueRational>24000/1001</valueRational>");
    EXPECT_EQ(parameter.GetRational(ratio), NCF_OK);
    EXPECT_EQ(ratio, (NMAParamRational{24000, 1001}));
    EXPECT_EQ(parameter.SetRational({25, 1}), NCF_OK);
    expectContent("<valueRational>25/1</valueRational>");

    parameter = load("<valueBoolean>false</valueBoolean>");
    EXPECT_EQ(parameter.GetBoolean(flag), NCF_OK);
    EXPECT_FALSE(flag);
    EXPECT_EQ(parameter.SetBoolean(true), NCF_OK);
    expectContent("<valueBoolean>true</valueBoolean>");
    parameter.GetBoolean(flag);
    EXPECT_TRUE(flag);
    parameter.SetBoolean(false);
    expectContent("<valueBoolean>false</valueBoolean>");

    parameter = load("<valueString> a &amp; b </valueString>");
    EXPECT_EQ(parameter.GetString(text), NCF_OK);
    EXPECT_EQ(text, S(" a & b ")) << "as it stands";
    EXPECT_EQ(parameter.SetString(S("<\xC3\xA4>")), NCF_OK);
    expectContent("<valueString>&lt;\xC3\xA4&gt;</valueString>");
}

TEST_F(Parameter, ADoubleDoesNotSurvive) {
    NMAParameter parameter = load("<valueDouble/>");
    EXPECT_EQ(parameter.SetDouble(1.5), NCF_OK);
    expectContent("<valueDouble>1.500000</valueDouble>");
    EXPECT_EQ(parameter.GetDouble(real), NCF_OK);
    EXPECT_GT(real, 5.2e-315);
    EXPECT_LT(real, 5.4e-315);
}

TEST_F(Parameter, DiscreteValuesAreReadAndWrittenAsUInt32) {
    NMAParameter parameter = load("<valueDiscrete>512</valueDiscrete>");
    EXPECT_EQ(parameter.GetUInt32(u32), NCF_OK);
    EXPECT_EQ(u32, 512u);
    EXPECT_EQ(parameter.SetUInt32(4096), NCF_OK);
    expectContent("<valueDiscrete>4096</valueDiscrete>");
    EXPECT_EQ(Thrown([&] { parameter.GetSInt32(s32); }), NCF_E_UNEXPECTED);
}

TEST_F(Parameter, AUInt32GoesBeforeADiscreteValue) {
    NMAParameter parameter = load("<valueDiscrete>1</valueDiscrete><valueUInt32>2</valueUInt32>");
    parameter.GetUInt32(u32);
    EXPECT_EQ(u32, 2u);
    parameter.SetUInt32(3);
    expectContent("<valueDiscrete>1</valueDiscrete><valueUInt32>3</valueUInt32>");
}

TEST_F(Parameter, AnotherKindIsUnexpectedAndChangesNothing) {
    NMAParameter parameter = load("<valueLabel>x</valueLabel><valueOpaque>y</valueOpaque>");
    const std::function<void()> kCalls[] = {
        [&] { parameter.GetSInt32(s32); },     [&] { parameter.SetSInt32(1); },
        [&] { parameter.GetUInt32(u32); },     [&] { parameter.SetUInt32(1); },
        [&] { parameter.GetSInt64(s64); },     [&] { parameter.SetSInt64(1); },
        [&] { parameter.GetUInt64(u64); },     [&] { parameter.SetUInt64(1); },
        [&] { parameter.GetDouble(real); },    [&] { parameter.SetDouble(1); },
        [&] { parameter.GetRational(ratio); }, [&] { parameter.SetRational({1, 1}); },
        [&] { parameter.GetBoolean(flag); },   [&] { parameter.SetBoolean(true); },
        [&] { parameter.GetString(text); },    [&] { parameter.SetString(S("z")); },
    };
    for (const auto& call : kCalls) {
        EXPECT_EQ(Thrown(call), NCF_E_UNEXPECTED);
    }
    EXPECT_EQ(s32, 5);
    EXPECT_EQ(u32, 5u);
    EXPECT_EQ(s64, 5);
    EXPECT_EQ(u64, 5u);
    EXPECT_EQ(real, 5);
    EXPECT_EQ(ratio, (NMAParamRational{5, 5}));
    EXPECT_TRUE(flag);
    EXPECT_EQ(text, S("kept"));
    expectContent("<valueLabel>x</valueLabel><valueOpaque>y</valueOpaque>");
}

TEST_F(Parameter, ValuesThatAreNoNumbersAreUnexpected) {
    for (const char* const content : {"", "many", "<![CDATA[7]]>"}) {
        const auto element = [&](const char* name) {
            return std::string("<") + name + ">" + content + "</" + name + ">";
        };
        NMAParameter parameter =
            load(element("valueSInt32") + element("valueUInt32") + element("valueSInt64") +
                 element("valueUInt64") + element("valueDouble") + element("valueRational"));
        EXPECT_EQ(Thrown([&] { parameter.GetSInt32(s32); }), NCF_E_UNEXPECTED) << content;
        EXPECT_EQ(Thrown([&] { parameter.GetUInt32(u32); }), NCF_E_UNEXPECTED) << content;
        EXPECT_EQ(Thrown([&] { parameter.GetSInt64(s64); }), NCF_E_UNEXPECTED) << content;
        EXPECT_EQ(Thrown([&] { parameter.GetUInt64(u64); }), NCF_E_UNEXPECTED) << content;
        EXPECT_EQ(Thrown([&] { parameter.GetDouble(real); }), NCF_E_UNEXPECTED) << content;
        EXPECT_EQ(Thrown([&] { parameter.GetRational(ratio); }), NCF_E_UNEXPECTED) << content;
    }
}

TEST_F(Parameter, ATextSplitByChildrenIsReadAsOne) {
    NMAParameter parameter = load("<valueUInt32>1<x/>2</valueUInt32>");
    parameter.GetUInt32(u32);
    EXPECT_EQ(u32, 12u);
    parameter.SetUInt32(3);
    parameter.GetUInt32(u32);
    EXPECT_EQ(u32, 3u);
}

TEST_F(Parameter, AnEmptyStringIsAValue) {
    NMAParameter parameter = load("<valueString/>");
    EXPECT_EQ(parameter.GetString(text), NCF_OK);
    EXPECT_TRUE(text.IsEmpty());
}

}  // namespace
