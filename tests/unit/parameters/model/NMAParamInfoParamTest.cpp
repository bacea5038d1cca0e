// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/parameters/model/NMAParamInfoParam.h"

#include "tests/unit/parameters/model/ParamTest.h"

namespace {

using namespace NMA::XMLUtils;

class ParamInfoParam : public ParamTest {
protected:
    NMAParamInfoParam load(const char* xml) { return rootOf<NMAParamInfoParam>(xml); }
    NMAParamValueInfo info;
    NMAString text;
    GUID id{};
};

TEST_F(ParamInfoParam, ReadsIdTextsAndValueInfo) {
    NMAParamInfoParam param =
        load("<parameter id=\"" ID_C
             "\"><shortName>Order</shortName><description>Of fields.</description>"
             "<valueInfo><valueInfoString/></valueInfo></parameter>");
    EXPECT_EQ(param.GetID(id), NCF_OK);
    EXPECT_EQ(id, kIdC);
    EXPECT_EQ(textOf([&](NMAString& out) { return param.GetShortName(out); }), "Order");
    EXPECT_EQ(textOf([&](NMAString& out) { return param.GetDescription(out); }), "Of fields.");
    ASSERT_EQ(param.GetValueInfo(info), NCF_OK);
    EXPECT_EQ(info.GetKind(), 9u);
}

TEST_F(ParamInfoParam, WhatIsAbsentIsNoData) {
    NMAParamInfoParam param = load("<parameter/>");
    EXPECT_EQ(Thrown([&] { param.GetID(id); }), NMA_E_NODATA);
    EXPECT_EQ(Thrown([&] { param.GetShortName(text); }), NMA_E_NODATA);
    EXPECT_EQ(Thrown([&] { param.GetDescription(text); }), NMA_E_NODATA);
    EXPECT_EQ(Thrown([&] { param.GetValueInfo(info); }), NMA_E_NODATA);
}

TEST_F(ParamInfoParam, WritesItsTexts) {
    NMAParamInfoParam param = load("<parameter><description>old</description></parameter>");
    param.SetShortName(S("short"));
    param.SetDescription(S("new"));
    EXPECT_EQ(saved(),
              "<parameter><description>new</description><shortName>short</shortName></parameter>");
}

}  // namespace
