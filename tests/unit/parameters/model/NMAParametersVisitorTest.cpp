// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/parameters/model/NMAParametersVisitor.h"

#include "tests/unit/parameters/model/FakeParametersXML.h"
#include "tests/unit/parameters/model/ParamTest.h"

namespace {

using namespace NMA::XMLUtils;
using Lines = std::vector<std::string>;

const char kDescription[] = "<ncfComponents><component id=\"" ID_B "\"/></ncfComponents>";
// One parameter of each kind, all of one id in sets of their own.
const char kValues[] =
    "<ncfComponents><component id=\"" ID_A
    "\"><track number=\"0\">"
    "<parameterSet id=\"00000000-0000-0000-0000-000000000000\"><parameter id=\"" ID_C
    "\"><valueDiscrete>256</valueDiscrete></parameter></parameterSet>"
    "<parameterSet id=\"00000001-0000-0000-0000-000000000000\"><parameter id=\"" ID_C
    "\"><valueSInt32>-1</valueSInt32></parameter></parameterSet>"
    "<parameterSet id=\"00000002-0000-0000-0000-000000000000\"><parameter id=\"" ID_C
    "\"><valueUInt64>2</valueUInt64></parameter></parameterSet>"
    "<parameterSet id=\"00000003-0000-0000-0000-000000000000\"><parameter id=\"" ID_C
    "\"><valueSInt64>-3</valueSInt64></parameter></parameterSet>"
    "<parameterSet id=\"00000004-0000-0000-0000-000000000000\"><parameter id=\"" ID_C
    "\"><valueDouble>1.5</valueDouble></parameter></parameterSet>"
    "<parameterSet id=\"00000005-0000-0000-0000-000000000000\"><parameter id=\"" ID_C
    "\"><valueRational>5/6</valueRational></parameter></parameterSet>"
    "<parameterSet id=\"00000006-0000-0000-0000-000000000000\"><parameter id=\"" ID_C
    "\"><valueString>seven</valueString></parameter></parameterSet>"
    "<parameterSet id=\"00000007-0000-0000-0000-000000000000\"><parameter id=\"" ID_C
    "\"><valueBoolean>true</valueBoolean></parameter></parameterSet>"
    "</track></component></ncfComponents>";

GUID SetNumber(ncfUInt32 number) {
    GUID id{};
    id.Data1 = number;
    return id;
}

class ParametersVisitor : public ParamTest {
protected:
    ParametersVisitor() {
        object->values = kValues;
        object->description = kDescription;
    }
    ~ParametersVisitor() override {
        visitor.reset();
        EXPECT_EQ(object->Release(), 0u) << "the visitor kept a reference";
    }
    void attach() {
        visitor->Attach(object);
        journal.clear();
    }
    NCFRESULT get(ncfUInt32& out) { return visitor->GetUInt32(kIdA, 0, SetNumber(0), kIdC, out); }
    NCFRESULT set(ncfUInt32 number) {
        return visitor->SetUInt32(kIdA, 0, SetNumber(0), kIdC, number);
    }

    Journal journal;
    FakeParametersXML* object = new FakeParametersXML(journal);
    std::unique_ptr<NMAParametersVisitor> visitor =
        std::make_unique<NMAParametersVisitor>(host.factory());
    NMAParameter parameter;
    ncfUInt32 value = 5;
};

// --- attaching -----------------------------------------------------------------

TEST_F(ParametersVisitor, NothingWorksBeforeAnObjectIsAttached) {
    EXPECT_EQ(Thrown([&] { visitor->GetSuite(); }), NMA_E_NOTINITIALIZED);
    EXPECT_EQ(Thrown([&] { visitor->BeginUpdate(); }), NMA_E_NOTINITIALIZED);
    EXPECT_EQ(Thrown([&] { visitor->EndUpdate(); }), NMA_E_NOTINITIALIZED) << "thrown";
    EXPECT_EQ(Thrown([&] { visitor->HasParameterSet(kIdA, 0, SetNumber(0)); }),
              NMA_E_NOTINITIALIZED);
    EXPECT_EQ(Thrown([&] { visitor->FindParameter(kIdA, 0, kIdB, kIdC, parameter); }),
              NMA_E_NOTINITIALIZED);
    EXPECT_EQ(Thrown([&] { get(value); }), NMA_E_NOTINITIALIZED);
    EXPECT_EQ(Thrown([&] { set(1); }), NMA_E_NOTINITIALIZED);
    EXPECT_EQ(Thrown([&] { visitor->Attach(nullptr); }), NCF_E_INVALIDARG);
}

TEST_F(ParametersVisitor, AttachLoadsTheDescription) {
    EXPECT_EQ(visitor->Attach(object), NCF_OK);
    EXPECT_EQ(journal.lines(), (Lines{"GetParameterDescriptionXML"}));
    EXPECT_EQ(object->references(), 2u);
    NMAParamComponent component;
    EXPECT_EQ(visitor->GetSuite()->GetComponent(kIdB, component), NCF_OK);
}

TEST_F(ParametersVisitor, AVisitorMadeWithAnObjectIsAttached) {
    NMAParametersVisitor made(host.factory(), object);
    EXPECT_EQ(made.GetSuite()->GetComponentCount(), 1u);
    EXPECT_EQ(Thrown([&] { NMAParametersVisitor bad(host.factory(), nullptr); }), NCF_E_INVALIDARG);
    object->refusals["GetParameterDescriptionXML"] = NCF_E_ACCESSDENIED;
    EXPECT_EQ(Thrown([&] { NMAParametersVisitor bad(host.factory(), object); }),
              NCF_E_ACCESSDENIED);
    EXPECT_EQ(object->references(), 2u) << "the failed one let go";
}

TEST_F(ParametersVisitor, AttachReplacesTheDocumentToLookAt) {
    attach();
    object->description = "<ncfComponents/>";
    visitor->Attach(object);
    EXPECT_EQ(visitor->GetSuite()->GetComponentCount(), 0u);
    EXPECT_EQ(object->references(), 2u);
}

TEST_F(ParametersVisitor, AFailedAttachDropsTheOldDocument) {
    attach();
    object->description = "<ncfComponents>";
    EXPECT_LT(Thrown([&] { visitor->Attach(object); }), 0);
    EXPECT_EQ(Thrown([&] { visitor->GetSuite(); }), NMA_E_NOTINITIALIZED);
    object->refusals["GetParameterDescriptionXML"] = NCF_E_FAIL;
    EXPECT_EQ(Thrown([&] { visitor->Attach(object); }), NCF_E_FAIL);
    EXPECT_EQ(get(value), NCF_OK) << "the object is attached all the same";
}

TEST_F(ParametersVisitor, AttachingNothingKeepsWhatWasThere) {
    attach();
    EXPECT_EQ(Thrown([&] { visitor->Attach(nullptr); }), NCF_E_INVALIDARG);
    EXPECT_EQ(visitor->GetSuite()->GetComponentCount(), 1u);
}

TEST_F(ParametersVisitor, AttachLeavesAnUpdateInProgress) {
    attach();
    visitor->BeginUpdate();
    visitor->Attach(object);
    journal.clear();
    EXPECT_EQ(get(value), NCF_OK);
    EXPECT_TRUE(journal.lines().empty());
}

TEST_F(ParametersVisitor, WithoutFactoryNothingLoads) {
    NMAParametersVisitor bare(nullptr);
    EXPECT_EQ(Thrown([&] { bare.Attach(object); }), NMA_E_NOTINITIALIZED);
}

TEST_F(ParametersVisitor, ARefusedXmlComponentIsThrown) {
    host.refuseCreation(kCLSID_XmlDocument, NCF_E_ACCESSDENIED);
    EXPECT_EQ(Thrown([&] { visitor->Attach(object); }), NCF_E_ACCESSDENIED);
    host.clearRefusals();
    attach();
    visitor->BeginUpdate();
    host.refuseCreation(kCLSID_XmlWriter, NCF_E_ABORT);
    EXPECT_EQ(Thrown([&] { visitor->EndUpdate(); }), NCF_E_ABORT);
    EXPECT_EQ(journal.count("SetParameterValuesXML"), 0);
    host.clearRefusals();
    EXPECT_EQ(visitor->EndUpdate(), NCF_OK) << "the update was kept";
}

// --- the update ----------------------------------------------------------------

TEST_F(ParametersVisitor, AnUpdateIsLoadedOnceAndHandedBackOnce) {
    attach();
    EXPECT_EQ(visitor->BeginUpdate(), NCF_OK);
    EXPECT_EQ(visitor->BeginUpdate(), NCF_OK);
    EXPECT_EQ(visitor->EndUpdate(), NCF_OK);
    EXPECT_EQ(journal.lines(), (Lines{"GetParameterValuesXML", "SetParameterValuesXML"}));
}

TEST_F(ParametersVisitor, AnUpdateWithoutChangeHandsTheSameTextBack) {
    attach();
    visitor->BeginUpdate();
    visitor->EndUpdate();
    EXPECT_EQ(object->values.substr(object->values.find('\n') + 1), kValues);
}

TEST_F(ParametersVisitor, EndingNoUpdateReturnsNotInitialized) {
    attach();
    NCFRESULT returned = NCF_OK;
    EXPECT_EQ(Thrown([&] { returned = visitor->EndUpdate(); }), NCF_OK);
    EXPECT_EQ(returned, NMA_E_NOTINITIALIZED);
    EXPECT_TRUE(journal.lines().empty());
}

TEST_F(ParametersVisitor, FindParameterNeedsAnUpdate) {
    attach();
    EXPECT_EQ(Thrown([&] { visitor->FindParameter(kIdA, 0, SetNumber(0), kIdC, parameter); }),
              NMA_E_NOTINITIALIZED);
    visitor->BeginUpdate();
    ASSERT_EQ(visitor->FindParameter(kIdA, 0, SetNumber(0), kIdC, parameter), NCF_OK);
    EXPECT_EQ(parameter.GetUInt32(value), NCF_OK);
    EXPECT_EQ(value, 256u);
}

TEST_F(ParametersVisitor, EachMissingStepOfAnAddressIsNoData) {
    attach();
    visitor->BeginUpdate();
    EXPECT_EQ(Thrown([&] { visitor->FindParameter(kIdB, 0, SetNumber(0), kIdC, parameter); }),
              NMA_E_NODATA);
    EXPECT_EQ(Thrown([&] { visitor->FindParameter(kIdA, 1, SetNumber(0), kIdC, parameter); }),
              NMA_E_NODATA);
    EXPECT_EQ(Thrown([&] { visitor->FindParameter(kIdA, 0, SetNumber(9), kIdC, parameter); }),
              NMA_E_NODATA);
    EXPECT_EQ(Thrown([&] { visitor->FindParameter(kIdA, 0, SetNumber(0), kIdD, parameter); }),
              NMA_E_NODATA);
}

TEST_F(ParametersVisitor, HasParameterSetAnswersOneAndThrowsWhatIsMissing) {
    attach();
    EXPECT_EQ(visitor->HasParameterSet(kIdA, 0, SetNumber(7)), 1);
    EXPECT_EQ(journal.lines(), (Lines{"GetParameterValuesXML"}));
    EXPECT_EQ(Thrown([&] { visitor->HasParameterSet(kIdB, 0, SetNumber(0)); }), NMA_E_NODATA);
    EXPECT_EQ(Thrown([&] { visitor->HasParameterSet(kIdA, 1, SetNumber(0)); }), NMA_E_NODATA);
    EXPECT_EQ(Thrown([&] { visitor->HasParameterSet(kIdA, 0, SetNumber(8)); }), NMA_E_NODATA);
    EXPECT_EQ(journal.lines().size(), 1u) << "one document serves them all";
}

TEST_F(ParametersVisitor, ARefusedLoadLeavesNoUpdateBehind) {
    attach();
    object->refusals["GetParameterValuesXML"] = NCF_E_ACCESSDENIED;
    EXPECT_EQ(Thrown([&] { visitor->BeginUpdate(); }), NCF_E_ACCESSDENIED);
    EXPECT_EQ(visitor->EndUpdate(), NMA_E_NOTINITIALIZED);
    object->refusals.clear();
    object->values = "no document";
    EXPECT_LT(Thrown([&] { get(value); }), 0);
    EXPECT_EQ(visitor->EndUpdate(), NMA_E_NOTINITIALIZED);
    object->values = kValues;
    EXPECT_EQ(get(value), NCF_OK);
}

// --- values --------------------------------------------------------------------

TEST_F(ParametersVisitor, ReadsEachKind) {
    attach();
    ncfSInt32 s32 = 0;
    ncfUInt64 u64 = 0;
    ncfSInt64 s64 = 0;
    double real = 0;
    NMAParamRational ratio;
    NMAString text;
    bool flag = false;
    EXPECT_EQ(visitor->GetUInt32(kIdA, 0, SetNumber(0), kIdC, value), NCF_OK);
    EXPECT_EQ(visitor->GetSInt32(kIdA, 0, SetNumber(1), kIdC, s32), NCF_OK);
    EXPECT_EQ(visitor->GetUInt64(kIdA, 0, SetNumber(2), kIdC, u64), NCF_OK);
    EXPECT_EQ(visitor->GetSInt64(kIdA, 0, SetNumber(3), kIdC, s64), NCF_OK);
    EXPECT_EQ(visitor->GetDouble(kIdA, 0, SetNumber(4), kIdC, real), NCF_OK);
    EXPECT_EQ(visitor->GetRational(kIdA, 0, SetNumber(5), kIdC, ratio), NCF_OK);
    EXPECT_EQ(visitor->GetString(kIdA, 0, SetNumber(6), kIdC, text), NCF_OK);
    EXPECT_EQ(visitor->GetBoolean(kIdA, 0, SetNumber(7), kIdC, flag), NCF_OK);
    EXPECT_EQ(value, 256u);
    EXPECT_EQ(s32, -1);
    EXPECT_EQ(u64, 2u);
    EXPECT_EQ(s64, -3);
    EXPECT_GT(real, 0.0);
    EXPECT_LT(real, 1e-300) << "no 1.5";
    EXPECT_EQ(ratio, (NMAParamRational{5, 6}));
    EXPECT_EQ(text, S("seven"));
    EXPECT_TRUE(flag);
    EXPECT_EQ(journal.lines(), (Lines{"GetParameterValuesXML"})) << "one document serves them all";
}

TEST_F(ParametersVisitor, WritesEachKind) {
    attach();
    EXPECT_EQ(visitor->SetUInt32(kIdA, 0, SetNumber(0), kIdC, 512), NCF_OK);
    EXPECT_EQ(visitor->SetSInt32(kIdA, 0, SetNumber(1), kIdC, -11), NCF_OK);
    EXPECT_EQ(visitor->SetUInt64(kIdA, 0, SetNumber(2), kIdC, 12), NCF_OK);
    EXPECT_EQ(visitor->SetSInt64(kIdA, 0, SetNumber(3), kIdC, -13), NCF_OK);
    EXPECT_EQ(visitor->SetDouble(kIdA, 0, SetNumber(4), kIdC, 2.5), NCF_OK);
    EXPECT_EQ(visitor->SetRational(kIdA, 0, SetNumber(5), kIdC, {7, 8}), NCF_OK);
    EXPECT_EQ(visitor->SetString(kIdA, 0, SetNumber(6), kIdC, S("eight")), NCF_OK);
    EXPECT_EQ(visitor->SetBoolean(kIdA, 0, SetNumber(7), kIdC, false), NCF_OK);
    EXPECT_EQ(journal.count("SetParameterValuesXML"), 8);
    for (const char* const piece :
         {"<valueDiscrete>512<", "<valueSInt32>-11<", "<valueUInt64>12<", "<valueSInt64>-13<",
          "<valueDouble>2.500000<", "<valueRational>7/8<", "<valueString>eight<",
          "<valueBoolean>false<"}) {
        EXPECT_NE(object->values.find(piece), std::string::npos) << piece;
    }
}

TEST_F(ParametersVisitor, EachWriteIsAWholeHandover) {
    attach();
    set(512);
    set(4096);
    EXPECT_EQ(journal.lines(), (Lines{"GetParameterValuesXML", "SetParameterValuesXML",
                                      "GetParameterValuesXML", "SetParameterValuesXML"}));
}

TEST_F(ParametersVisitor, AReadAfterAWriteLoadsAfresh) {
    attach();
    set(512);
    journal.clear();
    EXPECT_EQ(get(value), NCF_OK);
    EXPECT_EQ(value, 512u);
    EXPECT_EQ(journal.lines(), (Lines{"GetParameterValuesXML"}));
}

TEST_F(ParametersVisitor, AReadAfterAReadSeesTheSameDocument) {
    attach();
    get(value);
    object->values = "<changed/>";
    EXPECT_EQ(get(value), NCF_OK);
    EXPECT_EQ(value, 256u);
}

TEST_F(ParametersVisitor, AWriteAfterAReadWritesTheDocumentThatWasRead) {
    attach();
    get(value);
    journal.clear();
    set(512);
    EXPECT_EQ(journal.lines(), (Lines{"SetParameterValuesXML"}));
}

TEST_F(ParametersVisitor, AFailedWriteHandsNothingOverAndKeepsTheUpdate) {
    attach();
    EXPECT_EQ(Thrown([&] { visitor->SetSInt32(kIdA, 0, SetNumber(0), kIdC, 1); }),
              NCF_E_UNEXPECTED);
    EXPECT_EQ(Thrown([&] { visitor->SetUInt32(kIdA, 0, SetNumber(0), kIdD, 1); }), NMA_E_NODATA);
    EXPECT_EQ(journal.lines(), (Lines{"GetParameterValuesXML"}));
    EXPECT_EQ(visitor->EndUpdate(), NCF_OK);
}

TEST_F(ParametersVisitor, ARefusedHandoverIsThrownAndMayBeTriedAgain) {
    attach();
    object->refusals["SetParameterValuesXML"] = NCF_E_ACCESSDENIED;
    EXPECT_EQ(Thrown([&] { set(512); }), NCF_E_ACCESSDENIED);
    EXPECT_EQ(object->values, kValues);
    object->refusals.clear();
    journal.clear();
    EXPECT_EQ(visitor->EndUpdate(), NCF_OK);
    EXPECT_EQ(journal.lines(), (Lines{"SetParameterValuesXML"}));
    EXPECT_EQ(get(value), NCF_OK);
    EXPECT_EQ(value, 512u);
}

TEST_F(ParametersVisitor, BothDocumentsDieWithIt) {
    attach();
    visitor->BeginUpdate();
    visitor.reset();
    EXPECT_EQ(object->references(), 1u);
    EXPECT_EQ(journal.count("SetParameterValuesXML"), 0) << "an open update is dropped";
}

}  // namespace
