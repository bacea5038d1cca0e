// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/parameters/model/NMAParamComponent.h"

#include "tests/unit/parameters/model/ParamTest.h"

namespace {

using namespace NMA::XMLUtils;

class ParamComponent : public ParamTest {
protected:
    NMAParamComponent load(const char* xml) { return rootOf<NMAParamComponent>(xml); }
    NMAParamTrack track;
};

TEST_F(ParamComponent, ReadsItsId) {
    GUID id{};
    EXPECT_EQ(load("<component id=\"" ID_A_LOWER "\"/>").GetID(id), NCF_OK);
    EXPECT_EQ(id, kIdA);
    NMAParamComponent nameless = load("<component ID=\"" ID_A "\"/>");
    EXPECT_EQ(Thrown([&] { nameless.GetID(id); }), NMA_E_NODATA);
    NMAParamComponent odd = load("<component id=\"first\"/>");
    EXPECT_EQ(Thrown([&] { odd.GetID(id); }), NCF_E_UNEXPECTED);
    EXPECT_EQ(id, kIdA) << "stays as it was";
}

TEST_F(ParamComponent, ReadsAndReplacesItsTexts) {
    NMAParamComponent component =
        load("<component><version>1.0</version><shortName>a &lt; b</shortName></component>");
    EXPECT_EQ(textOf([&](NMAString& out) { return component.GetVersion(out); }), "1.0");
    EXPECT_EQ(textOf([&](NMAString& out) { return component.GetShortName(out); }), "a < b");
    EXPECT_EQ(component.SetVersion(S("2.0")), NCF_OK);
    EXPECT_EQ(component.SetShortName(S("")), NCF_OK);
    EXPECT_EQ(textOf([&](NMAString& out) { return component.GetVersion(out); }), "2.0");
    EXPECT_EQ(textOf([&](NMAString& out) { return component.GetShortName(out); }), "");
    EXPECT_NE(saved().find("<version>2.0</version>"), std::string::npos);
}

TEST_F(ParamComponent, MakesTextsThatAreAbsentAtTheEnd) {
    NMAParamComponent component = load("<component><track number=\"0\"/></component>");
    NMAString text = S("kept");
    EXPECT_EQ(Thrown([&] { component.GetVersion(text); }), NMA_E_NODATA);
    EXPECT_EQ(Thrown([&] { component.GetShortName(text); }), NMA_E_NODATA);
    EXPECT_EQ(text, S("kept"));
    component.SetShortName(S("name"));
    component.SetVersion(S("1"));
    EXPECT_EQ(saved(),
              "<component><track number=\"0\"/><shortName>name</shortName>"
              "<version>1</version></component>");
}

TEST_F(ParamComponent, FindsTracksByIndexAndByNumber) {
    NMAParamComponent component =
        load("<component><track number=\"7\"/><track number=\"0\"/></component>");
    EXPECT_EQ(component.GetTrackCount(), 2u);
    ncfUInt32 number = 0;
    ASSERT_EQ(component.GetTrackAt(0, track), NCF_OK);
    track.GetNumber(number);
    EXPECT_EQ(number, 7u);
    ASSERT_EQ(component.GetTrack(0, track), NCF_OK);
    track.GetNumber(number);
    EXPECT_EQ(number, 0u);
    EXPECT_EQ(Thrown([&] { component.GetTrackAt(2, track); }), NMA_E_NODATA);
    EXPECT_EQ(Thrown([&] { component.GetTrack(1, track); }), NMA_E_NODATA);
}

TEST_F(ParamComponent, ComparesNumbersAsTexts) {
    NMAParamComponent component = load("<component><track number=\"07\"/></component>");
    EXPECT_EQ(Thrown([&] { component.GetTrack(7, track); }), NMA_E_NODATA);
}

TEST_F(ParamComponent, OfTwoTracksOfOneNumberTheFirstIsFound) {
    NMAParamComponent component = load("<component><track number=\"1\"><activeSet>" ID_A
                                       "</activeSet></track><track number=\"1\"/></component>");
    GUID id{};
    component.GetTrack(1, track);
    EXPECT_EQ(track.GetActiveSet(id), NCF_OK);
    EXPECT_EQ(id, kIdA);
    component.RemoveTrack(1);
    component.GetTrack(1, track);
    EXPECT_EQ(Thrown([&] { track.GetActiveSet(id); }), NMA_E_NODATA);
}

TEST_F(ParamComponent, AddsAndRemovesTracks) {
    NMAParamComponent component = load("<component><track number=\"0\"/></component>");
    EXPECT_EQ(Thrown([&] { component.AddTrack(0, track); }), NCF_E_ABORT);
    ASSERT_EQ(component.AddTrack(4294967295u, track), NCF_OK);
    ncfUInt32 number = 0;
    EXPECT_EQ(track.GetNumber(number), NCF_OK);
    EXPECT_EQ(number, 4294967295u);
    EXPECT_EQ(component.RemoveTrack(0), NCF_OK);
    EXPECT_EQ(Thrown([&] { component.RemoveTrack(0); }), NMA_E_NODATA);
    EXPECT_EQ(saved(), "<component><track number=\"4294967295\"/></component>");
}

}  // namespace
