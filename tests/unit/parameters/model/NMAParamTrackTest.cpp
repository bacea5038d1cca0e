// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/parameters/model/NMAParamTrack.h"

#include "tests/unit/parameters/model/ParamTest.h"

namespace {

using namespace NMA::XMLUtils;

class ParamTrack : public ParamTest {
protected:
    NMAParamTrack load(const char* xml) { return rootOf<NMAParamTrack>(xml); }
    NMAParamSet set;
    GUID id{};
};

TEST_F(ParamTrack, ReadsItsNumber) {
    ncfUInt32 number = 9;
    EXPECT_EQ(load("<track number=\"12\"/>").GetNumber(number), NCF_OK);
    EXPECT_EQ(number, 12u);
    NMAParamTrack none = load("<track/>");
    EXPECT_EQ(Thrown([&] { none.GetNumber(number); }), NMA_E_NODATA);
    NMAParamTrack odd = load("<track number=\"first\"/>");
    EXPECT_EQ(Thrown([&] { odd.GetNumber(number); }), NCF_E_UNEXPECTED);
    EXPECT_EQ(number, 12u);
}

TEST_F(ParamTrack, HandsOutItsParameterInfos) {
    NMAParamInfos infos;
    NMAParamTrack track =
        load("<track><parameterInfos><version>3</version></parameterInfos></track>");
    ASSERT_EQ(track.GetParameterInfos(infos), NCF_OK);
    EXPECT_EQ(textOf([&](NMAString& out) { return infos.GetVersion(out); }), "3");
    NMAParamTrack none = load("<track/>");
    EXPECT_EQ(Thrown([&] { none.GetParameterInfos(infos); }), NMA_E_NODATA);
}

TEST_F(ParamTrack, ReadsAndWritesTheSetInUse) {
    NMAParamTrack track = load("<track><activeSet>" ID_A_LOWER "</activeSet></track>");
    EXPECT_EQ(track.GetActiveSet(id), NCF_OK);
    EXPECT_EQ(id, kIdA);
    EXPECT_EQ(track.SetActiveSet(kIdB), NCF_OK);
    track.GetActiveSet(id);
    EXPECT_EQ(id, kIdB);
    EXPECT_EQ(saved(), "<track><activeSet>" ID_B "</activeSet></track>");
}

TEST_F(ParamTrack, MakesTheSetInUseWhenAbsent) {
    NMAParamTrack track = load("<track/>");
    EXPECT_EQ(Thrown([&] { track.GetActiveSet(id); }), NMA_E_NODATA);
    track.SetActiveSet(kIdA);
    EXPECT_EQ(saved(), "<track><activeSet>" ID_A "</activeSet></track>");
}

TEST_F(ParamTrack, ASetInUseThatIsNoIdIsUnexpected) {
    NMAParamTrack track = load("<track><activeSet><![CDATA[" ID_A "]]></activeSet></track>");
    EXPECT_EQ(Thrown([&] { track.GetActiveSet(id); }), NCF_E_UNEXPECTED) << "no text at all";
}

TEST_F(ParamTrack, FindsAndRemovesSets) {
    NMAParamTrack track =
        load("<track><parameterSet id=\"" ID_A "\"/><parameterSet id=\"" ID_B "\"/></track>");
    EXPECT_EQ(track.GetParameterSetCount(), 2u);
    track.GetParameterSetAt(1, set);
    set.GetID(id);
    EXPECT_EQ(id, kIdB);
    track.GetParameterSet(kIdA, set);
    set.GetID(id);
    EXPECT_EQ(id, kIdA);
    EXPECT_EQ(Thrown([&] { track.GetParameterSetAt(2, set); }), NMA_E_NODATA);
    EXPECT_EQ(Thrown([&] { track.GetParameterSet(kIdC, set); }), NMA_E_NODATA);
    EXPECT_EQ(track.RemoveParameterSet(kIdA), NCF_OK);
    EXPECT_EQ(Thrown([&] { track.RemoveParameterSet(kIdA); }), NMA_E_NODATA);
    EXPECT_EQ(saved(), "<track><parameterSet id=\"" ID_B "\"/></track>");
}

TEST_F(ParamTrack, ANewSetCarriesNoId) {
    NMAParamTrack track = load("<track/>");
    ASSERT_EQ(track.AddParameterSet(kIdA, set), NCF_OK);
    EXPECT_EQ(Thrown([&] { set.GetID(id); }), NMA_E_NODATA);
    EXPECT_EQ(Thrown([&] { track.GetParameterSet(kIdA, set); }), NMA_E_NODATA);
    EXPECT_EQ(Thrown([&] { track.RemoveParameterSet(kIdA); }), NMA_E_NODATA);
    EXPECT_EQ(track.GetParameterSetAt(0, set), NCF_OK) << "found by index";
    EXPECT_EQ(saved(), "<track><parameterSet/></track>");
    EXPECT_EQ(track.AddParameterSet(kIdA, set), NCF_OK) << "the key was never taken";
    EXPECT_EQ(track.GetParameterSetCount(), 2u);
}

TEST_F(ParamTrack, RefusesASetWhoseIdStands) {
    NMAParamTrack track = load("<track><parameterSet id=\"" ID_A_LOWER "\"/></track>");
    EXPECT_EQ(Thrown([&] { track.AddParameterSet(kIdA, set); }), NCF_E_ABORT);
    EXPECT_EQ(track.GetParameterSetCount(), 1u);
}

TEST_F(ParamTrack, ANewSetIsFoundOnceItsIdIsWrittenIntoTheElement) {
    NMAParamTrack track = load("<track/>");
    track.AddParameterSet(kIdA, set);
    suite.GetRoot()->FindChild(S("parameterSet"), 0)->SetAttribute(S("id"), S(ID_A));
    EXPECT_EQ(track.GetParameterSet(kIdA, set), NCF_OK);
}

}  // namespace
