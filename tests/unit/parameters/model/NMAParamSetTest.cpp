// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/parameters/model/NMAParamSet.h"

#include "tests/unit/parameters/model/ParamTest.h"

namespace {

using namespace NMA::XMLUtils;

const char* const kKinds[] = {"SInt32",   "UInt32",  "SInt64", "UInt64", "Double", "Discrete",
                              "Rational", "Boolean", "Opaque", "String", "Label"};

class ParamSet : public ParamTest {
protected:
    NMAParamSet load(const char* xml) { return rootOf<NMAParamSet>(xml); }
    // A description in a document of its own.
    NMAParamInfoParam describe(const std::string& text) {
        described.LoadFromString(S(text.c_str()));
        NMAParamInfoParam param;
        param.SetElement(described.GetRoot());
        return param;
    }
    Suite described{host.factory()};
    NMAParameter parameter;
    GUID id{};
};

TEST_F(ParamSet, ReadsAndWritesIdAndTexts) {
    NMAParamSet set = load("<parameterSet id=\"" ID_B
                           "\"><version>1.0</version><name>Custom</name></parameterSet>");
    EXPECT_EQ(set.GetID(id), NCF_OK);
    EXPECT_EQ(id, kIdB);
    EXPECT_EQ(textOf([&](NMAString& out) { return set.GetVersion(out); }), "1.0");
    EXPECT_EQ(textOf([&](NMAString& out) { return set.GetName(out); }), "Custom");
    set.SetVersion(S("2.0"));
    set.SetName(S("Mine"));
    EXPECT_EQ(saved(), "<parameterSet id=\"" ID_B
                       "\"><version>2.0</version><name>Mine</name></parameterSet>");
}

TEST_F(ParamSet, WhatIsAbsentIsNoDataAndIsMadeWhenSet) {
    NMAParamSet set = load("<parameterSet/>");
    NMAString text;
    EXPECT_EQ(Thrown([&] { set.GetID(id); }), NMA_E_NODATA);
    EXPECT_EQ(Thrown([&] { set.IsReadOnly(); }), NMA_E_NODATA);
    EXPECT_EQ(Thrown([&] { set.GetVersion(text); }), NMA_E_NODATA);
    EXPECT_EQ(Thrown([&] { set.GetName(text); }), NMA_E_NODATA);
    set.SetReadOnly(true);
    set.SetName(S("n"));
    set.SetVersion(S("v"));
    EXPECT_EQ(saved(),
              "<parameterSet readOnly=\"true\"><name>n</name><version>v</version></parameterSet>");
}

TEST_F(ParamSet, IsReadOnlyForTheWordTrueAlone) {
    EXPECT_TRUE(load("<parameterSet readOnly=\"true\"/>").IsReadOnly());
    EXPECT_FALSE(load("<parameterSet readOnly=\"false\"/>").IsReadOnly());
    EXPECT_FALSE(load("<parameterSet readOnly=\"1\"/>").IsReadOnly());
    EXPECT_FALSE(load("<parameterSet readOnly=\"\"/>").IsReadOnly());
    NMAParamSet set = load("<parameterSet readOnly=\"true\"/>");
    set.SetReadOnly(false);
    EXPECT_FALSE(set.IsReadOnly());
    EXPECT_EQ(saved(), "<parameterSet readOnly=\"false\"/>");
}

TEST_F(ParamSet, FindsCountsAndRemovesParameters) {
    NMAParamSet set = load("<parameterSet><parameter id=\"" ID_A "\"/><parameter id=\"" ID_C
                           "\"><valueSInt32>1</valueSInt32></parameter><parameter id=\"" ID_C
                           "\"/></parameterSet>");
    EXPECT_EQ(set.GetParameterCount(), 3u);
    EXPECT_EQ(set.CountParameters(kIdA), 1u);
    EXPECT_EQ(set.CountParameters(kIdC), 2u);
    EXPECT_EQ(set.CountParameters(kIdD), 0u);
    ncfSInt32 value = 0;
    ASSERT_EQ(set.GetParameter(kIdC, parameter), NCF_OK);
    EXPECT_EQ(parameter.GetSInt32(value), NCF_OK) << "the first of that id";
    set.GetParameterAt(0, parameter);
    parameter.GetID(id);
    EXPECT_EQ(id, kIdA);
    EXPECT_EQ(Thrown([&] { set.GetParameterAt(3, parameter); }), NMA_E_NODATA);
    EXPECT_EQ(Thrown([&] { set.GetParameter(kIdD, parameter); }), NMA_E_NODATA);
    EXPECT_EQ(set.RemoveParameter(kIdC), NCF_OK);
    EXPECT_EQ(set.CountParameters(kIdC), 1u);
    EXPECT_EQ(set.RemoveParameter(kIdC), NCF_OK);
    EXPECT_EQ(Thrown([&] { set.RemoveParameter(kIdC); }), NMA_E_NODATA);
    EXPECT_EQ(saved(), "<parameterSet><parameter id=\"" ID_A "\"/></parameterSet>");
}

TEST_F(ParamSet, ANewParameterHasTheKindThatIsDescribedAndNoId) {
    for (const char* const kind : kKinds) {
        NMAParamSet set = load("<parameterSet/>");
        const NMAParamInfoParam param =
            describe(std::string("<parameter id=\"" ID_C "\"><valueInfo><valueInfo") + kind +
                     "/></valueInfo></parameter>");
        ASSERT_EQ(set.AddParameter(param, parameter), NCF_OK);
        EXPECT_EQ(saved(), std::string("<parameterSet><parameter><value") + kind +
                               "/></parameter></parameterSet>");
        EXPECT_EQ(Thrown([&] { parameter.GetID(id); }), NMA_E_NODATA);
        EXPECT_EQ(Thrown([&] { set.GetParameter(kIdC, parameter); }), NMA_E_NODATA);
        EXPECT_EQ(set.GetParameterAt(0, parameter), NCF_OK);
    }
}

TEST_F(ParamSet, AnEmptyValueInfoMakesAnOpaqueParameter) {
    NMAParamSet set = load("<parameterSet/>");
    set.AddParameter(describe("<parameter id=\"" ID_C "\"><valueInfo/></parameter>"), parameter);
    EXPECT_EQ(saved(), "<parameterSet><parameter><valueOpaque/></parameter></parameterSet>");
}

TEST_F(ParamSet, ANewParameterTakesItsFirstValue) {
    NMAParamSet set = load("<parameterSet/>");
    set.AddParameter(describe("<parameter id=\"" ID_C
                              "\"><valueInfo><valueInfoDiscrete/></valueInfo></parameter>"),
                     parameter);
    ncfUInt32 value = 0;
    EXPECT_EQ(Thrown([&] { parameter.GetUInt32(value); }), NCF_E_UNEXPECTED) << "empty";
    parameter.SetUInt32(512);
    EXPECT_EQ(parameter.GetUInt32(value), NCF_OK);
    EXPECT_EQ(value, 512u);
}

TEST_F(ParamSet, RefusesAParameterWhoseIdStands) {
    NMAParamSet set = load("<parameterSet><parameter id=\"" ID_C "\"/></parameterSet>");
    const NMAParamInfoParam param = describe("<parameter id=\"" ID_C "\"><valueInfo/></parameter>");
    EXPECT_EQ(Thrown([&] { set.AddParameter(param, parameter); }), NCF_E_ABORT);
    EXPECT_EQ(set.GetParameterCount(), 1u);
}

TEST_F(ParamSet, ADescriptionWithoutIdAddsNothing) {
    NMAParamSet set = load("<parameterSet/>");
    for (const char* const text :
         {"<parameter><valueInfo/></parameter>", "<parameter id=\"x\"><valueInfo/></parameter>"}) {
        const NMAParamInfoParam param = describe(text);
        EXPECT_NE(Thrown([&] { set.AddParameter(param, parameter); }), NCF_OK) << text;
    }
    EXPECT_EQ(set.GetParameterCount(), 0u);
    EXPECT_EQ(Thrown([&] { set.AddParameter(NMAParamInfoParam(), parameter); }),
              NMA_E_NOTINITIALIZED);
}

TEST_F(ParamSet, ADescriptionWithoutValueInfoLeavesAParameterWithoutValue) {
    NMAParamSet set = load("<parameterSet/>");
    const NMAParamInfoParam param = describe("<parameter id=\"" ID_C "\"/>");
    EXPECT_EQ(Thrown([&] { set.AddParameter(param, parameter); }), NMA_E_NODATA);
    EXPECT_EQ(saved(), "<parameterSet><parameter/></parameterSet>") << "nothing is rolled back";
}

}  // namespace
