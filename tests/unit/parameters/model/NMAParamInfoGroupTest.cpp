// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/parameters/model/NMAParamInfoGroup.h"

#include "tests/unit/parameters/model/ParamTest.h"

namespace {

using namespace NMA::XMLUtils;

class ParamInfoGroup : public ParamTest {
protected:
    NMAParamInfoGroup load(const char* xml) { return rootOf<NMAParamInfoGroup>(xml); }
    NMAParamInfoParam param;
    NMAParamInfoGroup inner;
    NMAString text = S("kept");
    GUID id{};
};

const char kNested[] = "<parameterGroup id=\"" ID_A "\" displayState=\"open\"><parameter id=\"" ID_B
                       "\"/><parameterGroup id=\"" ID_C "\"><parameter id=\"" ID_D
                       "\"/></parameterGroup></parameterGroup>";

TEST_F(ParamInfoGroup, ReadsIdAndDisplayState) {
    NMAParamInfoGroup group = load(kNested);
    EXPECT_EQ(group.GetID(id), NCF_OK);
    EXPECT_EQ(id, kIdA);
    EXPECT_EQ(group.GetDisplayState(text), NCF_OK);
    EXPECT_EQ(text, S("open"));
    EXPECT_EQ(group.SetDisplayState(S("anything at all")), NCF_OK);
    group.GetDisplayState(text);
    EXPECT_EQ(text, S("anything at all"));
    EXPECT_NE(saved().find("displayState=\"anything at all\""), std::string::npos);
}

TEST_F(ParamInfoGroup, AbsentAttributesAndTextsAreNoData) {
    NMAParamInfoGroup group = load("<parameterGroup/>");
    EXPECT_EQ(Thrown([&] { group.GetID(id); }), NMA_E_NODATA);
    EXPECT_EQ(Thrown([&] { group.GetDisplayState(text); }), NMA_E_NODATA);
    EXPECT_EQ(Thrown([&] { group.GetShortName(text); }), NMA_E_NODATA);
    EXPECT_EQ(Thrown([&] { group.GetDescription(text); }), NMA_E_NODATA);
    EXPECT_EQ(text, S("kept"));
}

TEST_F(ParamInfoGroup, WritesItsTexts) {
    NMAParamInfoGroup group = load("<parameterGroup/>");
    group.SetShortName(S("short"));
    group.SetDescription(S("long"));
    EXPECT_EQ(textOf([&](NMAString& out) { return group.GetShortName(out); }), "short");
    EXPECT_EQ(textOf([&](NMAString& out) { return group.GetDescription(out); }), "long");
    EXPECT_EQ(saved(),
              "<parameterGroup><shortName>short</shortName><description>long</description>"
              "</parameterGroup>");
}

TEST_F(ParamInfoGroup, SearchesItsOwnLevelAlone) {
    NMAParamInfoGroup group = load(kNested);
    EXPECT_EQ(group.GetParameterCount(), 1u);
    EXPECT_EQ(group.GetParameterAt(0, param), NCF_OK);
    EXPECT_EQ(group.GetParameter(kIdB, param), NCF_OK);
    EXPECT_EQ(Thrown([&] { group.GetParameter(kIdD, param); }), NMA_E_NODATA) << "thrown here";
    EXPECT_EQ(Thrown([&] { group.GetParameterAt(1, param); }), NMA_E_NODATA);
}

TEST_F(ParamInfoGroup, ReachesGroupsOfAnyDepthStepByStep) {
    NMAParamInfoGroup group = load(kNested);
    EXPECT_EQ(group.GetGroupCount(), 1u);
    ASSERT_EQ(group.GetGroup(kIdC, inner), NCF_OK);
    ASSERT_EQ(group.GetGroupAt(0, inner), NCF_OK);
    EXPECT_EQ(inner.GetParameter(kIdD, param), NCF_OK);
    EXPECT_EQ(Thrown([&] { group.GetGroup(kIdA, inner); }), NMA_E_NODATA);
    EXPECT_EQ(Thrown([&] { group.GetGroupAt(1, inner); }), NMA_E_NODATA);
}

TEST_F(ParamInfoGroup, AddsAndRemovesParametersAndGroups) {
    NMAParamInfoGroup group = load(kNested);
    EXPECT_EQ(Thrown([&] { group.AddParameter(kIdB, param); }), NCF_E_ABORT);
    EXPECT_EQ(Thrown([&] { group.AddGroup(kIdC, inner); }), NCF_E_ABORT);
    ASSERT_EQ(group.AddParameter(kIdC, param), NCF_OK) << "ids of groups are others";
    ASSERT_EQ(group.AddGroup(kIdB, inner), NCF_OK);
    param.GetID(id);
    EXPECT_EQ(id, kIdC);
    inner.GetID(id);
    EXPECT_EQ(id, kIdB);
    EXPECT_EQ(group.RemoveParameter(kIdB), NCF_OK);
    EXPECT_EQ(group.RemoveGroup(kIdC), NCF_OK);
    EXPECT_EQ(Thrown([&] { group.RemoveParameter(kIdB); }), NMA_E_NODATA);
    EXPECT_EQ(Thrown([&] { group.RemoveGroup(kIdC); }), NMA_E_NODATA);
    EXPECT_EQ(saved(), "<parameterGroup id=\"" ID_A "\" displayState=\"open\"><parameter id=\"" ID_C
                       "\"/><parameterGroup id=\"" ID_B "\"/></parameterGroup>");
}

}  // namespace
