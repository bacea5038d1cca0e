// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// Documents of values: which of them reach the clip, and what follows a change.

#include "tests/unit/parameters/QTParametersFixture.h"

namespace {

class QTParametersEvents : public QTParametersFixture {
protected:
    NCFRESULT SetValues(std::vector<std::pair<GUID, ncfUInt32>> values) {
        Told told;
        told.values = std::move(values);
        return Set(told);
    }
    // Told that a set in use begins.
    static void BeginSet(QTParameters& events) {
        events.BeginComponent(NMA::CompID_QuickTimeSampleMapping);
        events.BeginParamSet(kCustom, nullptr, 1.0f, 1);
    }
    // Attached and within a set, with a value of 3.
    QTParameters& EventsInASet() {
        Attach();
        value->hold(3);
        BeginSet(object());
        return object();
    }
};

TEST_F(QTParametersEvents, ReadTheDocumentThenRefreshTheMapping) {
    Attach();
    EXPECT_EQ(Set({}), NCF_OK);
    const Lines& lines = journal.lines();
    ASSERT_GE(lines.size(), 5u);
    EXPECT_EQ(Lines(lines.begin(), lines.begin() + 4),
              (Lines{"create reader", "reader.SetHandler", "reader.Parse unchanged", "lock"}));
    EXPECT_EQ(lines.back(), "unlock");
    EXPECT_EQ(lines[lines.size() - 2], "clip.SetFieldLayoutDetails");
}

TEST_F(QTParametersEvents, TakeTheThreeValuesOfTheSetInUse) {
    Attach();
    EXPECT_EQ(
        SetValues({{kParamFieldOrdering, 4096}, {kParamFieldLayout, 3}, {kParamLevelRemapping, 2}}),
        NCF_OK);
    EXPECT_EQ(Record().fieldOrderInFile, 4096u);
    EXPECT_EQ(Record().fieldLayout, 3u);
    EXPECT_EQ(Record().levelRemap, 2u);
    EXPECT_EQ(Record().detectedFieldOrder, 8192u) << "no document says what was detected";
    EXPECT_EQ(mapping->levelRemap_, 2u) << "the mapping follows";
}

TEST_F(QTParametersEvents, TakeNumbersThatAreNoChoices) {
    Attach();
    EXPECT_EQ(SetValues({{kParamLevelRemapping, 7}, {kParamFieldLayout, 0xFFFFFFFF}}), NCF_OK);
    EXPECT_EQ(Record().levelRemap, 7u);
    EXPECT_EQ(Record().fieldLayout, 0xFFFFFFFFu);
    EXPECT_EQ(Offered(0), (Lines{"8/4/2/1/1 <- NVZ2"})) << "any level but the default adds this";
}

TEST_F(QTParametersEvents, PassOverParametersThatAreNotTheirs) {
    Attach();
    EXPECT_EQ(SetValues({{kParamGroup, 99}, {kCustom, 98}, {kParamFieldLayout, 3}}), NCF_OK);
    EXPECT_EQ(Record().fieldLayout, 3u) << "what follows is read";
    EXPECT_EQ(Record().fieldOrderInFile, 8192u);
    EXPECT_EQ(Record().levelRemap, 16u);
}

TEST_F(QTParametersEvents, LeaveTheClipAloneForAnotherComponent) {
    Attach();
    Told told;
    told.component = NMA::CompID_QTParameters;
    told.values = {{kParamFieldLayout, 3}};
    EXPECT_EQ(Set(told), NCF_OK);
    EXPECT_EQ(Record().fieldLayout, 1u);
}

// The name is that of the set told of last, whoever's it is; only values ask for
// the component.
TEST_F(QTParametersEvents, TakeNameAndIdentifierOfASetOfAnotherComponent) {
    Attach();
    Told told;
    told.component = NMA::CompID_QTParameters;
    EXPECT_EQ(Set(told), NCF_OK);
    EXPECT_EQ(CurrentSet(), "11111111 'My set' 0 1.0 0");
}

TEST_F(QTParametersEvents, LeaveEverythingAloneForASetThatIsNotInUse) {
    Attach();
    Told told;
    told.state = 0;
    told.values = {{kParamFieldLayout, 3}};
    EXPECT_EQ(Set(told), NCF_OK);
    EXPECT_EQ(Record().fieldLayout, 1u);
    EXPECT_EQ(CurrentSet(), "set:default 'Default Settings' 0 1.0 1");
}

TEST_F(QTParametersEvents, TakeOnlyNameAndIdentifierOfASetInStateTwo) {
    Attach();
    for (const ncfUInt32 state : {2u, 3u, 0xFFFFFFFFu}) {
        Told told;
        told.state = state;
        told.values = {{kParamFieldLayout, 3}};
        EXPECT_EQ(Set(told), NCF_OK);
        EXPECT_EQ(Record().fieldLayout, 1u);
        EXPECT_EQ(CurrentSet(), "11111111 'My set' 0 1.0 0");
        ASSERT_EQ(object().AttachToQTSampleProvider(*mapping), NCF_OK);
    }
}

TEST_F(QTParametersEvents, StopTakingValuesAtTheNextSetThatIsNotInUse) {
    Attach();
    QTParameters& events = object();
    value->hold(3);
    EXPECT_EQ(events.BeginDocument(), NCF_OK);
    EXPECT_EQ(events.BeginComponent(NMA::CompID_QuickTimeSampleMapping), NCF_OK);
    EXPECT_EQ(events.ParamValue(kParamFieldLayout, value), NCF_OK);
    EXPECT_EQ(Record().fieldLayout, 1u) << "before a set";
    EXPECT_EQ(events.BeginParamSet(kCustom, nullptr, 1.0f, 1), NCF_OK);
    EXPECT_EQ(events.BeginParamSet(kCustom, nullptr, 1.0f, 0), NCF_OK);
    EXPECT_EQ(events.ParamValue(kParamFieldLayout, value), NCF_OK);
    EXPECT_EQ(Record().fieldLayout, 1u) << "in a set that is not in use";
}

TEST_F(QTParametersEvents, AComponentLeavesTheSetBeforeIt) {
    QTParameters& events = EventsInASet();
    events.BeginComponent(NMA::CompID_QuickTimeSampleMapping);
    EXPECT_EQ(events.ParamValue(kParamFieldLayout, value), NCF_OK);
    EXPECT_EQ(Record().fieldLayout, 1u);
}

TEST_F(QTParametersEvents, AnEndOfAComponentCountsOnlyWithItsFlag) {
    QTParameters& events = EventsInASet();
    EXPECT_EQ(events.EndComponent(1), NCF_OK);
    EXPECT_EQ(events.ParamValue(kParamFieldLayout, value), NCF_OK);
    EXPECT_EQ(Record().fieldLayout, 1u);
    events.BeginParamSet(kCustom, nullptr, 1.0f, 1);
    events.ParamValue(kParamFieldLayout, value);
    EXPECT_EQ(Record().fieldLayout, 1u) << "the component is over too";
    BeginSet(events);
    EXPECT_EQ(events.EndComponent(0), NCF_OK);
    EXPECT_EQ(events.ParamValue(kParamFieldLayout, value), NCF_OK);
    EXPECT_EQ(Record().fieldLayout, 3u);
}

TEST_F(QTParametersEvents, TheEndOfADocumentEndsSetAndComponent) {
    QTParameters& events = EventsInASet();
    EXPECT_EQ(events.EndDocument(), NCF_OK);
    events.ParamValue(kParamFieldLayout, value);
    events.BeginParamSet(kCustom, nullptr, 1.0f, 1);
    events.ParamValue(kParamFieldLayout, value);
    EXPECT_EQ(Record().fieldLayout, 1u);
}

// A new document begins outside any component; the set is left by the component
// that comes next.
TEST_F(QTParametersEvents, TheBeginningOfADocumentEndsTheComponent) {
    QTParameters& events = EventsInASet();
    EXPECT_EQ(events.BeginDocument(), NCF_OK);
    events.ParamValue(kParamFieldLayout, value);
    EXPECT_EQ(Record().fieldLayout, 1u);
}

// --- failures ---------------------------------------------------------------------------

TEST_F(QTParametersEvents, GiveTheFailureOfAValueThatHoldsTooLittle) {
    QTParameters& events = EventsInASet();
    for (const std::size_t size : {0, 1, 3}) {
        value->bytes.assign(size, 0x55);
        EXPECT_EQ(events.ParamValue(kParamLevelRemapping, value), NCF_E_FAIL) << size;
        EXPECT_EQ(events.ParamValue(kParamFieldOrdering, value), NCF_E_FAIL) << size;
    }
    EXPECT_EQ(Record().levelRemap, 16u);
    EXPECT_EQ(Record().fieldOrderInFile, 8192u);
    EXPECT_EQ(events.ParamValue(kParamGroup, value), NCF_OK) << "another's value is not asked";
    EXPECT_EQ(events.ParamValue(kParamLevelRemapping, nullptr), NCF_E_POINTER);
}

TEST_F(QTParametersEvents, KeepWhatWasTakenBeforeAFailureAndDontRefresh) {
    Attach();
    reader->script = [this](NMA::IParametersHandler& handler) {
        handler.BeginDocument();
        handler.BeginComponent(NMA::CompID_QuickTimeSampleMapping);
        handler.BeginParamSet(kCustom, nullptr, 1.0f, 1);
        value->hold(3);
        handler.ParamValue(kParamFieldLayout, value);
        return NCF_E_ABORT;
    };
    EXPECT_EQ(parameters->SetParameterValuesXML(xml.inArg()), NCF_E_ABORT);
    EXPECT_EQ(Record().fieldLayout, 3u);
    EXPECT_EQ(journal.count("lock"), 0);
    EXPECT_EQ(CurrentSet(), "11111111 'Custom' 0 1.0 0");
}

TEST_F(QTParametersEvents, GiveTheRefusalsOfTheReader) {
    Attach();
    for (const char* const operation : {"SetHandler", "Parse"}) {
        reader->results[operation] = NCF_E_HANDLE;
        EXPECT_EQ(parameters->SetParameterValuesXML(xml.inArg()), NCF_E_HANDLE) << operation;
        reader->results.clear();
    }
    host->refuseCreation(CompID_ParametersReader, NCF_E_OUTOFMEMORY);
    EXPECT_EQ(parameters->SetParameterValuesXML(xml.inArg()), NCF_E_OUTOFMEMORY);
    EXPECT_EQ(journal.count("lock"), 0) << "no refresh after a failure";
    EXPECT_TRUE(log->records().empty());
}

TEST_F(QTParametersEvents, SucceedWhateverTheRefreshGives) {
    Attach();
    clip->results["SetFieldLayoutDetails"] = NCF_E_HANDLE;
    EXPECT_EQ(SetValues({{kParamFieldLayout, 3}}), NCF_OK);
    EXPECT_EQ(journal.count("clip.SetFieldLayoutDetails"), 1);
    EXPECT_EQ(Record().fieldLayout, 3u);
}

TEST_F(QTParametersEvents, TwoObjectsOfOneMappingShareTheClipAndNotTheSet) {
    Attach();
    void* out = nullptr;
    ASSERT_EQ(mapping->QueryInterface(IID_INCFParametersXML, &out), NCF_OK);
    NCFSmartPtr<INCFParametersXML> second;
    second.attach(static_cast<INCFParametersXML*>(out));
    ASSERT_NE(second.inArg(), parameters.inArg());
    EXPECT_EQ(SetValues({{kParamLevelRemapping, 1}}), NCF_OK);
    std::swap(second, parameters);
    EXPECT_EQ(CurrentSet(), "set:default 'Default Settings' 0 1.0 1");
    EXPECT_EQ(journal.count("suite.AddParamValue levels 1"), 1);
}

}  // namespace
