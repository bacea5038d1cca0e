// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/parameters/model/NMAParamInfos.h"

#include "tests/unit/parameters/model/ParamTest.h"

namespace {

using namespace NMA::XMLUtils;

class ParamInfos : public ParamTest {
protected:
    NMAParamInfos load(const char* xml) { return rootOf<NMAParamInfos>(xml); }
    std::string shortNameOf(const NMAParamInfoParam& from) {
        return textOf([&](NMAString& out) { return from.GetShortName(out); });
    }
    NMAParamInfoParam param;
    NMAParamInfoGroup group;
    NMAString extension = S("kept");
    NMAString shortName = S("kept");
    NMAString description = S("kept");
};

TEST_F(ParamInfos, ReadsAndWritesTheVersion) {
    NMAParamInfos infos = load("<parameterInfos/>");
    NMAString text;
    EXPECT_EQ(Thrown([&] { infos.GetVersion(text); }), NMA_E_NODATA);
    EXPECT_EQ(infos.SetVersion(S("1.0")), NCF_OK);
    EXPECT_EQ(textOf([&](NMAString& out) { return infos.GetVersion(out); }), "1.0");
}

// --- kinds of files ------------------------------------------------------------

TEST_F(ParamInfos, FindsExternalsByIndexAndByExtension) {
    NMAParamInfos infos = load(
        "<parameterInfos><external><fileNameExtension>cube</fileNameExtension><shortName>Cube"
        "</shortName><description>A cube.</description></external><external><fileNameExtension>lut"
        "</fileNameExtension><shortName>Table</shortName><description>A table.</description>"
        "</external></parameterInfos>");
    EXPECT_EQ(infos.GetExternalCount(), 2u);
    EXPECT_EQ(infos.GetExternalAt(1, extension, shortName, description), NCF_OK);
    EXPECT_EQ(extension, S("lut"));
    EXPECT_EQ(shortName, S("Table"));
    EXPECT_EQ(description, S("A table."));
    EXPECT_EQ(infos.GetExternal(S("CUBE"), shortName, description), NCF_OK);
    EXPECT_EQ(shortName, S("Cube"));
    EXPECT_EQ(description, S("A cube."));
}

TEST_F(ParamInfos, AbsentExternalsThrowAndLeaveTheOutputs) {
    NMAParamInfos infos = load(
        "<parameterInfos><external><fileNameExtension>a</fileNameExtension><shortName>b"
        "</shortName></external><external><shortName>c</shortName></external></parameterInfos>");
    EXPECT_EQ(Thrown([&] { infos.GetExternalAt(2, extension, shortName, description); }),
              NMA_E_NODATA);
    EXPECT_EQ(Thrown([&] { infos.GetExternal(S("x"), shortName, description); }), NMA_E_NODATA);
    EXPECT_EQ(Thrown([&] { infos.GetExternalAt(0, extension, shortName, description); }),
              NMA_E_NODATA)
        << "without description";
    EXPECT_EQ(Thrown([&] { infos.GetExternalAt(1, extension, shortName, description); }),
              NMA_E_NODATA)
        << "without extension";
    for (const NMAString* const output : {&extension, &shortName, &description}) {
        EXPECT_EQ(*output, S("kept"));
    }
}

TEST_F(ParamInfos, AddsAndRemovesExternals) {
    NMAParamInfos infos = load("<parameterInfos/>");
    EXPECT_EQ(infos.AddExternal(S("cube"), S("Cube"), S("A cube.")), NCF_OK);
    EXPECT_EQ(Thrown([&] { infos.AddExternal(S("Cube"), S(""), S("")); }), NCF_E_ABORT);
    EXPECT_EQ(saved(),
              "<parameterInfos><external><fileNameExtension>cube</fileNameExtension><shortName>"
              "Cube</shortName><description>A cube.</description></external></parameterInfos>");
    EXPECT_EQ(infos.RemoveExternal(S("cube")), NCF_OK);
    EXPECT_EQ(Thrown([&] { infos.RemoveExternal(S("cube")); }), NMA_E_NODATA);
    EXPECT_EQ(infos.GetExternalCount(), 0u);
}

// --- parameters ----------------------------------------------------------------

const char kGrouped[] =
    "<parameterInfos>"
    "<parameterGroup id=\"" ID_A "\"><parameter id=\"" ID_A
    "\"><shortName>first group</shortName></parameter></parameterGroup>"
    "<parameterGroup id=\"" ID_B "\"><parameter id=\"" ID_C
    "\"><shortName>second group</shortName></parameter><parameterGroup id=\"" ID_C
    "\"><parameter id=\"" ID_D
    "\"/></parameterGroup></parameterGroup>"
    "<parameter id=\"" ID_B
    "\"><shortName>direct</shortName></parameter>"
    "<parameter id=\"" ID_A
    "\"><shortName>direct too</shortName></parameter>"
    "</parameterInfos>";

TEST_F(ParamInfos, FindsAParameterInTheSecondGroup) {
    NMAParamInfos infos = load(kGrouped);
    ASSERT_EQ(infos.GetParameter(kIdC, param), NCF_OK);
    EXPECT_EQ(shortNameOf(param), "second group");
}

TEST_F(ParamInfos, PrefersDirectParametersToThoseInGroups) {
    NMAParamInfos infos = load(kGrouped);
    ASSERT_EQ(infos.GetParameter(kIdA, param), NCF_OK);
    EXPECT_EQ(shortNameOf(param), "direct too");
}

TEST_F(ParamInfos, DoesNotLookIntoGroupsOfGroups) {
    NMAParamInfos infos = load(kGrouped);
    NCFRESULT returned = NCF_OK;
    EXPECT_EQ(Thrown([&] { returned = infos.GetParameter(kIdD, param); }), NCF_OK);
    EXPECT_EQ(returned, NMA_E_NODATA) << "returned, not thrown";
}

TEST_F(ParamInfos, CountsAndIndexesDirectParametersOnly) {
    NMAParamInfos infos = load(kGrouped);
    EXPECT_EQ(infos.GetParameterCount(), 2u);
    ASSERT_EQ(infos.GetParameterAt(0, param), NCF_OK);
    EXPECT_EQ(shortNameOf(param), "direct");
    EXPECT_EQ(Thrown([&] { infos.GetParameterAt(2, param); }), NMA_E_NODATA);
}

TEST_F(ParamInfos, AddsAndRemovesDirectParametersOnly) {
    NMAParamInfos infos = load(kGrouped);
    EXPECT_EQ(Thrown([&] { infos.RemoveParameter(kIdC); }), NMA_E_NODATA) << "in a group";
    EXPECT_EQ(Thrown([&] { infos.AddParameter(kIdB, param); }), NCF_E_ABORT);
    ASSERT_EQ(infos.AddParameter(kIdC, param), NCF_OK) << "taken in a group alone";
    param.SetShortName(S("new"));
    infos.GetParameter(kIdC, param);
    EXPECT_EQ(shortNameOf(param), "new");
    EXPECT_EQ(infos.RemoveParameter(kIdC), NCF_OK);
    infos.GetParameter(kIdC, param);
    EXPECT_EQ(shortNameOf(param), "second group");
}

// --- groups --------------------------------------------------------------------

TEST_F(ParamInfos, FindsAddsAndRemovesGroups) {
    NMAParamInfos infos = load(kGrouped);
    GUID id{};
    EXPECT_EQ(infos.GetGroupCount(), 2u);
    infos.GetGroupAt(1, group);
    group.GetID(id);
    EXPECT_EQ(id, kIdB);
    EXPECT_EQ(infos.GetGroup(kIdA, group), NCF_OK);
    EXPECT_EQ(Thrown([&] { infos.GetGroup(kIdC, group); }), NMA_E_NODATA) << "a level down";
    EXPECT_EQ(Thrown([&] { infos.GetGroupAt(2, group); }), NMA_E_NODATA);
    EXPECT_EQ(Thrown([&] { infos.AddGroup(kIdA, group); }), NCF_E_ABORT);
    ASSERT_EQ(infos.AddGroup(kIdD, group), NCF_OK);
    group.GetID(id);
    EXPECT_EQ(id, kIdD);
    EXPECT_EQ(infos.RemoveGroup(kIdB), NCF_OK);
    EXPECT_EQ(Thrown([&] { infos.RemoveGroup(kIdB); }), NMA_E_NODATA);
    EXPECT_EQ(infos.GetGroupCount(), 2u);
    EXPECT_EQ(infos.GetParameter(kIdC, param), NMA_E_NODATA) << "gone with its group";
}

}  // namespace
