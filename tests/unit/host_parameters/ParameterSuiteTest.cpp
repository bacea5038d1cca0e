// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/parameters/ParameterSuite.h"

#include <gtest/gtest.h>

#include <limits>

#include "reference_host/framework/String.h"
#include "reference_host/parameters/ParameterValue.h"
#include "reference_host/util/text/HostText.h"

namespace {

using host::MakeRef;
using host::ParameterValue;

constexpr GUID kOwner = ncfGuid("0E74B673-0CA8-403B-A142-986D79508637");
constexpr GUID kSet = ncfGuid("11111111-2222-3333-4444-555555555555");
constexpr GUID kSecondSet = ncfGuid("22222222-2222-3333-4444-555555555555");

class ParameterSuite : public testing::Test {
protected:
    NCFRESULT Prepare() {
        const NCFRESULT named = suite->SetComponentId(kOwner);
        return named < 0 ? named : suite->Prepare(0);
    }
    NCFRESULT Describe() {
        const NCFRESULT prepared = Prepare();
        return prepared < 0 ? prepared : suite->BeginDescription(1.0f);
    }
    NCFRESULT AddParameter(const GUID& id, const char* name = "Name") {
        return suite->AddParameter(id, name, "Label", 0, kParamTypeChoice);
    }
    NCFRESULT AddValue(const GUID& id, ncfUInt32 number) {
        return suite->AddParamValue(id, MakeRef<ParameterValue>(number).get());
    }
    NCFRESULT Depend(ncfUInt32 kind, const GUID& id, ncfUInt32 number) {
        return suite->AddDependency(kind, id, MakeRef<ParameterValue>(number).get(), 1);
    }
    // The document, read back; its one track.
    host::ParameterTrack Track() {
        host::ParameterDocument document;
        std::string problem;
        EXPECT_EQ(host::ReadParameterDocument(Xml(), document, problem), NCF_OK) << problem;
        EXPECT_EQ(document.components.size(), 1u);
        EXPECT_EQ(document.components.at(0).id, kOwner);
        EXPECT_EQ(document.components.at(0).tracks.size(), 1u);
        return document.components.at(0).tracks.at(0);
    }
    std::string Xml() {
        const auto text = host::MakeString("before");
        EXPECT_EQ(suite->WriteXML(text.get()), NCF_OK);
        return host::text::ReadUtf8(text.get());
    }

    host::Ref<host::ParameterSuite> suite = MakeRef<host::ParameterSuite>();
};

TEST_F(ParameterSuite, WritesWhatItWasTold) {
    ASSERT_EQ(Describe(), NCF_OK);
    EXPECT_EQ(suite->AddGroup(kParamGroup, "", 0, 1), NCF_OK);
    EXPECT_EQ(AddParameter(kParamFieldOrdering, "Order"), NCF_OK);
    EXPECT_EQ(suite->AddValueChoice("One", 1, 0), NCF_OK);
    EXPECT_EQ(suite->AddValueChoice("Two", 2, 1), NCF_OK);
    EXPECT_EQ(suite->EndDescription(), NCF_OK);
    EXPECT_EQ(suite->AddParamSet(kSet, "Mine", 0, 1.0f, 0), NCF_OK);
    EXPECT_EQ(AddValue(kParamFieldOrdering, 2), NCF_OK);
    const host::ParameterTrack track = Track();
    EXPECT_EQ(track.number, 0u);
    EXPECT_EQ(track.descriptionVersion, 1.0f);
    ASSERT_EQ(track.groups.size(), 1u);
    EXPECT_TRUE(track.groups[0].isShown);
    ASSERT_EQ(track.groups[0].parameters.size(), 1u);
    EXPECT_EQ(track.groups[0].parameters[0].name, "Order");
    EXPECT_EQ(track.groups[0].parameters[0].label, "Label");
    EXPECT_EQ(track.groups[0].parameters[0].defaultValue, 2u);
    EXPECT_EQ(track.groups[0].parameters[0].choices[0].text, "One");
    ASSERT_EQ(track.sets.size(), 1u);
    EXPECT_EQ(track.sets[0].name, "Mine");
    EXPECT_FALSE(track.sets[0].isDefault);
    EXPECT_EQ(track.sets[0].settings[0].value, 2u);
    EXPECT_EQ(track.SetInUse(), &track.sets[0]);
}

TEST_F(ParameterSuite, WritesADocumentWithoutADescription) {
    ASSERT_EQ(Prepare(), NCF_OK);
    EXPECT_EQ(suite->AddParamSet(kParamSetDefault, "Default Settings", 0, 1.0f, 1), NCF_OK);
    const host::ParameterTrack track = Track();
    EXPECT_FALSE(track.descriptionVersion);
    EXPECT_TRUE(track.sets[0].isDefault);
    EXPECT_FALSE(track.sets[0].isReadOnly) << "its values are for taking";
}

TEST_F(ParameterSuite, PutsTheLastSetIntoUse) {
    ASSERT_EQ(Prepare(), NCF_OK);
    EXPECT_EQ(suite->AddParamSet(kSet, "A", 0, 1.0f, 0), NCF_OK);
    EXPECT_EQ(suite->AddParamSet(kSecondSet, "B", 0, 1.0f, 0), NCF_OK);
    const host::ParameterTrack track = Track();
    EXPECT_EQ(track.SetInUse(), &track.sets[1]);
}

TEST_F(ParameterSuite, WritesRulesAtTheParameterThatTheyAreFor) {
    ASSERT_EQ(Describe(), NCF_OK);
    EXPECT_EQ(AddParameter(kParamFieldOrdering), NCF_OK);
    EXPECT_EQ(Depend(1, kParamFieldLayout, 512), NCF_OK) << "it follows later";
    EXPECT_EQ(Depend(2, kParamFieldLayout, 256), NCF_OK);
    EXPECT_EQ(AddParameter(kParamFieldLayout), NCF_OK);
    EXPECT_EQ(suite->EndDescription(), NCF_OK);
    const std::string xml = Xml();
    const std::size_t layout = xml.find("<parameter id=\"76320B7E");
    const std::size_t rules = xml.find("<displayRuleSet>");
    ASSERT_NE(rules, std::string::npos);
    EXPECT_LT(layout, rules);
    EXPECT_EQ(xml.find("<displayRuleSet>", rules + 1), std::string::npos);
    EXPECT_NE(xml.find("<ifCondition id=\"6CAEDE80-2DE0-4E2F-9F5D-904B7A2C2F4A\"><ifValue>512"
                       "</ifValue></ifCondition><operation>enable</operation>"),
              std::string::npos);
    EXPECT_NE(xml.find("<ifValue>256</ifValue></ifCondition><operation>disable</operation>"),
              std::string::npos);
}

TEST_F(ParameterSuite, KeepsADescriptionOpenThatNamesAMissingParameter) {
    ASSERT_EQ(Describe(), NCF_OK);
    EXPECT_EQ(AddParameter(kParamFieldOrdering), NCF_OK);
    EXPECT_EQ(Depend(1, kParamFieldLayout, 512), NCF_OK);
    EXPECT_EQ(suite->EndDescription(), NCF_E_NOTFOUND);
    EXPECT_EQ(AddParameter(kParamFieldLayout), NCF_OK);
    EXPECT_EQ(suite->EndDescription(), NCF_OK);
}

TEST_F(ParameterSuite, RefusesWhatIsOutOfOrder) {
    const auto text = host::MakeString("before");
    const auto value = MakeRef<ParameterValue>(ncfUInt32{1});
    const auto expectNoDescription = [&] {
        EXPECT_EQ(suite->AddGroup(kParamGroup, "", 0, 1), NCF_E_FAIL);
        EXPECT_EQ(AddParameter(kParamFieldLayout), NCF_E_FAIL);
        EXPECT_EQ(suite->AddValueChoice("One", 1, 0), NCF_E_FAIL);
        EXPECT_EQ(suite->AddDependency(1, kParamFieldLayout, value.get(), 1), NCF_E_FAIL);
        EXPECT_EQ(suite->EndDescription(), NCF_E_FAIL);
    };
    const auto expectNoSet = [&] {
        EXPECT_EQ(suite->AddParamValue(kParamFieldLayout, value.get()), NCF_E_FAIL);
    };
    EXPECT_EQ(suite->Prepare(0), NCF_E_FAIL) << "no component";
    for (int i = 0; i < 2; ++i) {
        EXPECT_EQ(suite->WriteXML(text.get()), NCF_E_FAIL);
        EXPECT_EQ(suite->BeginDescription(1.0f), NCF_E_FAIL);
        EXPECT_EQ(suite->AddParamSet(kSet, "", 0, 1.0f, 0), NCF_E_FAIL);
        expectNoDescription();
        expectNoSet();
        EXPECT_EQ(suite->SetComponentId(kOwner), NCF_OK);
    }
    EXPECT_EQ(suite->Prepare(0), NCF_OK);
    expectNoDescription();
    expectNoSet();
    EXPECT_EQ(suite->BeginDescription(1.0f), NCF_OK);
    EXPECT_EQ(suite->BeginDescription(1.0f), NCF_E_FAIL) << "it is open";
    EXPECT_EQ(suite->WriteXML(text.get()), NCF_E_FAIL);
    EXPECT_EQ(suite->AddParamSet(kSet, "", 0, 1.0f, 0), NCF_E_FAIL);
    EXPECT_EQ(suite->AddValueChoice("One", 1, 0), NCF_E_FAIL) << "no parameter yet";
    EXPECT_EQ(suite->AddDependency(1, kParamFieldLayout, value.get(), 1), NCF_E_FAIL);
    EXPECT_EQ(suite->EndDescription(), NCF_OK);
    EXPECT_EQ(suite->BeginDescription(1.0f), NCF_E_FAIL) << "one is enough";
    expectNoDescription();
    expectNoSet();
    EXPECT_EQ(host::text::ReadUtf8(text.get()), "before");
}

TEST_F(ParameterSuite, AParameterBelongsToTheGroupBeforeIt) {
    ASSERT_EQ(Describe(), NCF_OK);
    EXPECT_EQ(AddParameter(kParamFieldOrdering), NCF_OK);
    EXPECT_EQ(suite->AddGroup(kParamGroup, "Group", 0, 0), NCF_OK);
    EXPECT_EQ(suite->AddValueChoice("One", 1, 0), NCF_E_FAIL)
        << "nothing of this group to choose for";
    EXPECT_EQ(AddParameter(kParamFieldLayout), NCF_OK);
    EXPECT_EQ(suite->EndDescription(), NCF_OK);
    const host::ParameterTrack track = Track();
    ASSERT_EQ(track.parameters.size(), 1u);
    EXPECT_EQ(track.parameters[0].id, kParamFieldOrdering);
    ASSERT_EQ(track.groups.size(), 1u);
    EXPECT_EQ(track.groups[0].name, "Group");
    EXPECT_FALSE(track.groups[0].isShown);
    EXPECT_EQ(track.groups[0].parameters.at(0).id, kParamFieldLayout);
}

TEST_F(ParameterSuite, RefusesWhatStandsAlready) {
    ASSERT_EQ(Describe(), NCF_OK);
    EXPECT_EQ(AddParameter(kParamFieldOrdering), NCF_OK);
    EXPECT_EQ(suite->AddGroup(kParamGroup, "", 0, 1), NCF_OK);
    EXPECT_EQ(suite->AddGroup(kParamGroup, "", 0, 1), NMA_E_ALREADYSET);
    EXPECT_EQ(AddParameter(kParamFieldOrdering), NMA_E_ALREADYSET) << "in another group too";
    EXPECT_EQ(AddParameter(kParamFieldLayout), NCF_OK);
    EXPECT_EQ(suite->AddValueChoice("One", 1, 1), NCF_OK);
    EXPECT_EQ(suite->AddValueChoice("Uno", 1, 0), NMA_E_ALREADYSET);
    EXPECT_EQ(suite->AddValueChoice("Two", 2, 1), NMA_E_ALREADYSET) << "a second default";
    EXPECT_EQ(suite->EndDescription(), NCF_OK);
    EXPECT_EQ(suite->AddParamSet(kSet, "", 0, 1.0f, 0), NCF_OK);
    EXPECT_EQ(suite->AddParamSet(kSet, "", 0, 1.0f, 0), NMA_E_ALREADYSET);
    EXPECT_EQ(AddValue(kParamFieldLayout, 1), NCF_OK);
    EXPECT_EQ(AddValue(kParamFieldLayout, 2), NMA_E_ALREADYSET);
    const host::ParameterTrack track = Track();
    EXPECT_EQ(track.groups[0].parameters[0].choices.size(), 1u);
    EXPECT_EQ(track.sets[0].settings.at(0).value, 1u);
}

TEST_F(ParameterSuite, RefusesTextsAndNumbersThatCannotStandInADocument) {
    ASSERT_EQ(Describe(), NCF_OK);
    const std::string huge(5000, 'n');
    for (const char* const text : {"a\x01z", "\xFF", "\xED\xA0\x80", huge.c_str()}) {
        EXPECT_EQ(suite->AddGroup(kParamGroup, text, 0, 1), NCF_E_INVALIDARG);
        EXPECT_EQ(AddParameter(kParamFieldLayout, text), NCF_E_INVALIDARG);
        EXPECT_EQ(suite->AddParameter(kParamFieldLayout, "", text, 0, kParamTypeChoice),
                  NCF_E_INVALIDARG);
    }
    EXPECT_EQ(AddParameter(kParamFieldLayout, nullptr), NCF_OK) << "null is empty";
    EXPECT_EQ(suite->AddValueChoice("\x02", 1, 0), NCF_E_INVALIDARG);
    EXPECT_EQ(suite->AddParameter(kParamFieldOrdering, "", "", 0, kValueTypeUInt32),
              NCF_E_NOTSUPPORTED);
    EXPECT_EQ(suite->EndDescription(), NCF_OK);
    for (const float version :
         {std::numeric_limits<float>::infinity(), std::numeric_limits<float>::quiet_NaN()}) {
        EXPECT_EQ(suite->AddParamSet(kSet, "", 0, version, 0), NCF_E_INVALIDARG);
        EXPECT_EQ(Prepare(), NCF_OK);
        EXPECT_EQ(suite->BeginDescription(version), NCF_E_INVALIDARG);
    }
    EXPECT_EQ(suite->AddParamSet(kSet, "\x02", 0, 1.0f, 0), NCF_E_INVALIDARG);
    EXPECT_TRUE(Track().sets.empty());
}

TEST_F(ParameterSuite, GivesTheAnswerOfAValueThatHoldsNothing) {
    ASSERT_EQ(Describe(), NCF_OK);
    const auto empty = MakeRef<ParameterValue>();
    EXPECT_EQ(AddParameter(kParamFieldOrdering), NCF_OK);
    EXPECT_EQ(suite->AddDependency(1, kParamFieldOrdering, empty.get(), 1), NCF_E_FAIL);
    EXPECT_EQ(suite->AddDependency(1, kParamFieldOrdering, nullptr, 1), NCF_E_POINTER);
    EXPECT_EQ(Depend(0, kParamFieldOrdering, 1), NCF_E_INVALIDARG);
    EXPECT_EQ(Depend(3, kParamFieldOrdering, 1), NCF_E_INVALIDARG);
    EXPECT_EQ(suite->EndDescription(), NCF_OK);
    EXPECT_EQ(suite->AddParamSet(kSet, nullptr, 0, 1.0f, 0), NCF_OK);
    EXPECT_EQ(suite->AddParamValue(kParamFieldOrdering, empty.get()), NCF_E_FAIL);
    EXPECT_EQ(suite->AddParamValue(kParamFieldOrdering, nullptr), NCF_E_POINTER);
    EXPECT_EQ(suite->WriteXML(nullptr), NCF_E_POINTER);
    EXPECT_TRUE(Track().sets[0].settings.empty());
    EXPECT_EQ(Xml().find("displayRule"), std::string::npos);
}

TEST_F(ParameterSuite, StartsAfreshWhenItIsPreparedAgain) {
    ASSERT_EQ(Describe(), NCF_OK);
    EXPECT_EQ(AddParameter(kParamFieldOrdering), NCF_OK);
    EXPECT_EQ(Depend(1, kParamFieldLayout, 1), NCF_OK);
    EXPECT_EQ(suite->Prepare(5), NCF_OK);
    EXPECT_EQ(Track().number, 5u);
    EXPECT_FALSE(Track().descriptionVersion);
    EXPECT_EQ(suite->BeginDescription(2.0f), NCF_OK);
    EXPECT_EQ(suite->EndDescription(), NCF_OK) << "the dependency is forgotten";
}

}  // namespace
