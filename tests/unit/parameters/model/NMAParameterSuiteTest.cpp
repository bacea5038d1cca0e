// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/parameters/model/NMAParameterSuite.h"

#include "tests/unit/parameters/model/ParamTest.h"

namespace {

using namespace NMA::XMLUtils;

class ParameterSuite : public ParamTest {
protected:
    void load(const char* text) { suite.LoadFromString(S(text)); }
    NMAParamComponent component;
};

TEST_F(ParameterSuite, ThrowsBeforeADocumentIsThere) {
    EXPECT_EQ(Thrown([&] { suite.GetComponentCount(); }), NMA_E_NOTINITIALIZED);
    EXPECT_EQ(Thrown([&] { suite.GetComponentAt(0, component); }), NMA_E_NOTINITIALIZED);
    EXPECT_EQ(Thrown([&] { suite.GetComponent(kIdA, component); }), NMA_E_NOTINITIALIZED);
    EXPECT_EQ(Thrown([&] { suite.AddComponent(kIdA, component); }), NMA_E_NOTINITIALIZED);
    EXPECT_EQ(Thrown([&] { suite.RemoveComponent(kIdA); }), NMA_E_NOTINITIALIZED);
}

TEST_F(ParameterSuite, DoesNotLookAtTheRootsName) {
    load("<anything><component id=\"" ID_A "\"/></anything>");
    EXPECT_EQ(suite.GetComponentCount(), 1u);
    EXPECT_EQ(suite.GetComponent(kIdA, component), NCF_OK);
}

TEST_F(ParameterSuite, FindsComponentsByIndexAndById) {
    load("<ncfComponents><component id=\"" ID_A "\"/><other/><component id=\"" ID_B
         "\"/><Component id=\"" ID_C "\"/></ncfComponents>");
    EXPECT_EQ(suite.GetComponentCount(), 2u) << "names count with their case";
    GUID id{};
    ASSERT_EQ(suite.GetComponentAt(1, component), NCF_OK);
    EXPECT_EQ(component.GetID(id), NCF_OK);
    EXPECT_EQ(id, kIdB);
    ASSERT_EQ(suite.GetComponent(kIdA, component), NCF_OK);
    component.GetID(id);
    EXPECT_EQ(id, kIdA);
    EXPECT_EQ(Thrown([&] { suite.GetComponentAt(2, component); }), NMA_E_NODATA);
    EXPECT_EQ(Thrown([&] { suite.GetComponent(kIdC, component); }), NMA_E_NODATA);
}

TEST_F(ParameterSuite, IdsThatDifferInCaseAreTheSameKey) {
    load("<ncfComponents><component id=\"" ID_A_LOWER "\"/></ncfComponents>");
    EXPECT_EQ(suite.GetComponent(kIdA, component), NCF_OK);
    EXPECT_EQ(Thrown([&] { suite.AddComponent(kIdA, component); }), NCF_E_ABORT);
}

TEST_F(ParameterSuite, BuildsADocumentFromNothing) {
    ASSERT_EQ(suite.CreateRoot(S("ncfComponents")), NCF_OK);
    EXPECT_EQ(suite.GetComponentCount(), 0u);
    ASSERT_EQ(suite.AddComponent(kIdA, component), NCF_OK);
    component.SetShortName(S("first"));
    ASSERT_EQ(suite.AddComponent(kIdB, component), NCF_OK);
    EXPECT_EQ(saved(), "<ncfComponents><component id=\"" ID_A
                       "\"><shortName>first</shortName></component><component id=\"" ID_B
                       "\"/></ncfComponents>");
}

TEST_F(ParameterSuite, AddsAComponentOnce) {
    load("<ncfComponents/>");
    ASSERT_EQ(suite.AddComponent(kIdA, component), NCF_OK);
    EXPECT_EQ(Thrown([&] { suite.AddComponent(kIdA, component); }), NCF_E_ABORT);
    EXPECT_EQ(suite.GetComponentCount(), 1u);
}

TEST_F(ParameterSuite, RemovesAComponentForGoodWhereverItCameFrom) {
    load("<ncfComponents><component id=\"" ID_A "\"><x/></component></ncfComponents>");
    suite.AddComponent(kIdB, component);
    EXPECT_EQ(suite.RemoveComponent(kIdA), NCF_OK);
    EXPECT_EQ(suite.GetComponentCount(), 1u);
    EXPECT_EQ(suite.RemoveComponent(kIdB), NCF_OK);
    EXPECT_EQ(suite.GetComponentCount(), 0u);
    EXPECT_EQ(Thrown([&] { suite.RemoveComponent(kIdA); }), NMA_E_NODATA);
    EXPECT_EQ(saved(), "<ncfComponents/>");
    EXPECT_EQ(suite.AddComponent(kIdA, component), NCF_OK) << "the key is free again";
}

TEST_F(ParameterSuite, PassesNamesThroughThatNobodyReads) {
    const char kText[] =
        "<ncfComponents><component id=\"" ID_A
        "\" modifiedDateTime=\"x\"><displayRuleSet><displayRule operation=\"show\"><ifCondition>"
        "<ifValue>1</ifValue></ifCondition><always/></displayRule></displayRuleSet>"
        "<unitName>frames</unitName></component></ncfComponents>";
    load(kText);
    ASSERT_EQ(suite.GetComponent(kIdA, component), NCF_OK);
    EXPECT_EQ(saved(), kText);
}

}  // namespace
