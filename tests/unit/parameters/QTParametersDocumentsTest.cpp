// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// The three documents: what the suite is told and in which order, and what
// becomes of its refusals.

#include "tests/unit/parameters/QTParametersFixture.h"

namespace {

using QTParametersDocuments = QTParametersFixture;

const Lines kOpening = {"create suite", "suite.SetComponentId mapping", "suite.Prepare 0"};

Lines Description(const char* defaultOrder) {
    const auto choice = [&](const std::string& text, const char* value) {
        return "suite.AddValueChoice '" + text + "' " + value +
               (std::string(value) == defaultOrder ? " default" : "");
    };
    Lines lines = {
        "suite.BeginDescription 1.0",
        "suite.AddGroup group '' 0 1",
        "suite.AddParameter ordering 'Field Ordering In File' 'Field Ordering' 0 choice",
        choice("Progressive", "256"),
        choice("Interlaced - Odd (upper field first) ordered", "512"),
        choice("Interlaced - Even (lower field first) ordered", "4096"),
        "create factory",
        "factory.CreateValue",
    };
    const std::pair<const char*, const char*> kDependencies[] = {
        {"512", "1"}, {"4096", "1"}, {"256", "2"}, {"8192", "1"}};
    for (const auto& [order, kind] : kDependencies) {
        lines.push_back("value.Clear");
        lines.push_back(std::string("value.SetData UInt32 ") + order + " 4 0");
        lines.push_back(std::string("suite.AddDependency ") + kind + " layout " + order + " 1");
    }
    return lines + Lines{
                       "suite.AddParameter layout 'Field Layout' 'Field Layout' 0 choice",
                       "suite.AddValueChoice 'Merged' 2 default",
                       "suite.AddValueChoice 'Split' 3",
                       "suite.AddParameter levels 'Level Remapping' 'GFX-Video Level' 0 choice",
                       "suite.AddValueChoice 'Do not modify levels' 16 default",
                       "suite.AddValueChoice 'Expand video levels to graphic levels' 1",
                       "suite.AddValueChoice 'Compress graphic levels to video levels' 2",
                       "suite.EndDescription",
                   };
}

TEST_F(QTParametersDocuments, HoldTheDefaultsThatTheFileSays) {
    Record().detectedFieldOrder = 512;
    Attach();
    Record() = {4096, 2, 3, 512};
    EXPECT_EQ(parameters->GetDefaultValuesXML(xml.inArg()), NCF_OK);
    EXPECT_EQ(journal.lines(),
              kOpening + WrittenSet("set:default 'Default Settings' 0 1.0 1", 512, 1, 16) +
                  Lines{"suite.WriteXML"});
    EXPECT_EQ(TextOf(xml.inArg()), "<suite/>");
}

TEST_F(QTParametersDocuments, HoldAnUndeterminedOrderAsTheDefaultOfAFileWithoutOne) {
    Attach();
    EXPECT_EQ(parameters->GetDefaultValuesXML(xml.inArg()), NCF_OK);
    EXPECT_EQ(journal.count("suite.AddParamValue ordering 8192"), 1);
    journal.clear();
    EXPECT_EQ(parameters->GetParameterDescriptionXML(xml.inArg()), NCF_OK);
    EXPECT_EQ(journal.startingWith("suite.AddValueChoice").size(), 8u);
    EXPECT_EQ(Lines(journal.lines().begin() + 3, journal.lines().begin() + 31),
              Description("none"));
}

TEST_F(QTParametersDocuments, HoldThePresentValuesInTheDefaultSetRightAfterAttaching) {
    Record() = {4096, 2, 3, 512};
    Attach();
    EXPECT_EQ(parameters->GetParameterValuesXML(xml.inArg()), NCF_OK);
    EXPECT_EQ(journal.lines(),
              kOpening + WrittenSet("set:default 'Default Settings' 0 1.0 1", 4096, 3, 2) +
                  Lines{"suite.WriteXML"});
    EXPECT_EQ(TextOf(xml.inArg()), "<suite/>");
}

TEST_F(QTParametersDocuments, DescribeTheParametersThenHoldThePresentValues) {
    for (const char* const order : {"256", "512", "4096"}) {
        SCOPED_TRACE(order);
        Record() = {8192, 16, 1, static_cast<ncfUInt32>(std::stoul(order))};
        if (!parameters) {
            Attach();
        }
        ASSERT_EQ(object().AttachToQTSampleProvider(*mapping), NCF_OK);
        journal.clear();
        EXPECT_EQ(parameters->GetParameterDescriptionXML(xml.inArg()), NCF_OK);
        EXPECT_EQ(journal.lines(),
                  kOpening + Description(order) +
                      WrittenSet("set:default 'Default Settings' 0 1.0 1", 8192, 1, 16) +
                      Lines{"suite.WriteXML"});
        EXPECT_EQ(TextOf(xml.inArg()), "<suite/>");
    }
}

TEST_F(QTParametersDocuments, MarkTheOrderThatIsDetectedNowNotAtAttaching) {
    Record().detectedFieldOrder = 512;
    Attach();
    Record().detectedFieldOrder = 256;
    EXPECT_EQ(parameters->GetParameterDescriptionXML(xml.inArg()), NCF_OK);
    EXPECT_EQ(journal.count("suite.AddValueChoice 'Progressive' 256 default"), 1);
}

TEST_F(QTParametersDocuments, MarkTheDefaultsWhateverIsChosen) {
    Record() = {4096, 16, 1, 512};
    Attach();
    Record() = {4096, 2, 3, 512};
    EXPECT_EQ(parameters->GetParameterDescriptionXML(xml.inArg()), NCF_OK);
    EXPECT_EQ(Lines(journal.lines().begin() + 3, journal.lines().begin() + 31), Description("512"));
}

TEST_F(QTParametersDocuments, HoldTheDefaultsInTheDefaultSetWhateverSetIsCurrent) {
    Record().detectedFieldOrder = 512;
    Attach();
    EXPECT_EQ(Set({}), NCF_OK);
    journal.clear();
    EXPECT_EQ(parameters->GetDefaultValuesXML(xml.inArg()), NCF_OK);
    EXPECT_EQ(journal.lines(),
              kOpening + WrittenSet("set:default 'Default Settings' 0 1.0 1", 512, 1, 16) +
                  Lines{"suite.WriteXML"});
}

TEST_F(QTParametersDocuments, NameTheSetAsTheLastDocumentDid) {
    Attach();
    EXPECT_EQ(Set({}), NCF_OK);
    EXPECT_EQ(CurrentSet(), "11111111 'My set' 0 1.0 0");
    EXPECT_EQ(parameters->GetParameterDescriptionXML(xml.inArg()), NCF_OK);
    EXPECT_EQ(journal.count("suite.AddParamSet 11111111 'My set' 0 1.0 0"), 2);
}

TEST_F(QTParametersDocuments, NameASetWithoutNameCustom) {
    Attach();
    Told told;
    told.name = "";
    EXPECT_EQ(Set(told), NCF_OK);
    EXPECT_EQ(CurrentSet(), "11111111 'Custom' 0 1.0 0");
    told.name = nullptr;
    EXPECT_EQ(Set(told), NCF_OK);
    EXPECT_EQ(CurrentSet(), "11111111 'Custom' 0 1.0 0");
}

TEST_F(QTParametersDocuments, ReplaceAnyNameThatTheDefaultSetIsGiven) {
    Attach();
    Told told;
    told.set = kParamSetDefault;
    told.name = "Mine all the same";
    EXPECT_EQ(Set(told), NCF_OK);
    EXPECT_EQ(CurrentSet(), "set:default 'Default Settings' 0 1.0 1");
}

TEST_F(QTParametersDocuments, TakeANameInAnyEncodingAndWriteItInUtf8) {
    Attach();
    for (const ncfUInt32 encoding : {kNCFUTF8, kNCFUTF16, kNCFUTF32, kNCFWCHAR}) {
        NCFSmartPtr<INCFString> name;
        name.attach(MakeHostString("Schnürsenkel 靴"));
        ASSERT_EQ(name->ConvertTo(encoding), NCF_OK);
        EXPECT_EQ(object().BeginParamSet(kCustom, name.inArg(), 1.0f, 2), NCF_OK);
        EXPECT_EQ(CurrentSet(), "11111111 'Schnürsenkel 靴' 0 1.0 0");
        EXPECT_EQ(name->GetEncoding(), encoding) << "the reader's string is left alone";
    }
}

TEST_F(QTParametersDocuments, FailOverANameThatHasNoPlaceInUtf8) {
    Attach();
    const ncfUTF16 lone[] = {0xD800, 0};
    NCFSmartPtr<INCFString> name;
    name.attach(MakeHostString(""));
    ASSERT_EQ(name->AssignUTF16(kNCFUTF16, lone, kNCFZeroTerminated), NCF_OK);
    EXPECT_EQ(object().BeginParamSet(kCustom, name.inArg(), 1.0f, 1), NCF_OK);
    EXPECT_EQ(parameters->GetParameterValuesXML(xml.inArg()), NCF_E_FAIL);
    EXPECT_EQ(TextOf(xml.inArg()), "unchanged");
}

TEST_F(QTParametersDocuments, HoldNoValuesForASetWhoseIdentifierIsZero) {
    Attach();
    Told told;
    told.set = GUID{};
    EXPECT_EQ(Set(told), NCF_OK);
    journal.clear();
    EXPECT_EQ(parameters->GetParameterValuesXML(xml.inArg()), NMA_E_NOTINITIALIZED);
    EXPECT_TRUE(journal.lines().empty());
    EXPECT_EQ(parameters->GetParameterDescriptionXML(xml.inArg()), NCF_OK);
    EXPECT_EQ(parameters->GetDefaultValuesXML(xml.inArg()), NCF_OK);
}

// --- refusals --------------------------------------------------------------------------

struct Refused {
    const char* operation;
    bool inValues;
    bool inDescription;
};

TEST_F(QTParametersDocuments, GiveEachRefusalOfTheSuiteAndStopThere) {
    Attach();
    const Refused kOperations[] = {
        {"SetComponentId", true, true},  {"Prepare", true, true},
        {"AddParamSet", true, true},     {"AddParamValue", true, true},
        {"WriteXML", true, true},        {"BeginDescription", false, true},
        {"AddGroup", false, true},       {"AddParameter", false, true},
        {"AddValueChoice", false, true}, {"AddDependency", false, true},
        {"EndDescription", false, true},
    };
    for (const Refused& refused : kOperations) {
        SCOPED_TRACE(refused.operation);
        suite->results[refused.operation] = NCF_E_ACCESSDENIED;
        const NCFRESULT values = refused.inValues ? NCF_E_ACCESSDENIED : NCF_OK;
        EXPECT_EQ(parameters->GetParameterValuesXML(xml.inArg()), values);
        EXPECT_EQ(parameters->GetDefaultValuesXML(xml.inArg()), values);
        journal.clear();
        EXPECT_EQ(parameters->GetParameterDescriptionXML(xml.inArg()), NCF_E_ACCESSDENIED);
        EXPECT_EQ(journal.lines().back().find(std::string("suite.") + refused.operation), 0u);
        suite->results.clear();
    }
    EXPECT_TRUE(log->records().empty()) << "failures are thrown, not logged";
}

TEST_F(QTParametersDocuments, GiveEachRefusalOfEachParameter) {
    Attach();
    for (const char* const call :
         {"AddParameter layout 'Field Layout' 'Field Layout' 0 choice",
          "AddParameter levels 'Level Remapping' 'GFX-Video Level' 0 choice",
          "AddValueChoice 'Split' 3", "AddValueChoice 'Compress graphic levels to video levels' 2",
          "AddParamValue layout 1", "AddParamValue levels 16", "AddDependency 1 layout 8192 1"}) {
        suite->results[call] = NCF_E_HANDLE;
        EXPECT_EQ(parameters->GetParameterDescriptionXML(xml.inArg()), NCF_E_HANDLE) << call;
        suite->results.clear();
    }
}

TEST_F(QTParametersDocuments, GiveTheRefusalsOfCreationAndValues) {
    Attach();
    for (const GUID& component : {CompID_ParameterSuite, kValueTypeUInt32}) {
        host->refuseCreation(component, NCF_E_OUTOFMEMORY);
        EXPECT_EQ(parameters->GetParameterValuesXML(xml.inArg()), NCF_E_OUTOFMEMORY);
        EXPECT_EQ(parameters->GetParameterDescriptionXML(xml.inArg()), NCF_E_OUTOFMEMORY);
        EXPECT_EQ(parameters->GetDefaultValuesXML(xml.inArg()), NCF_E_OUTOFMEMORY);
        host->clearRefusals();
    }
    factory->results["CreateValue"] = NCF_E_ABORT;
    EXPECT_EQ(parameters->GetDefaultValuesXML(xml.inArg()), NCF_E_ABORT);
    factory->results.clear();
    for (const char* const operation : {"Clear", "SetData"}) {
        value->results[operation] = NCF_E_HANDLE;
        EXPECT_EQ(parameters->GetDefaultValuesXML(xml.inArg()), NCF_E_HANDLE) << operation;
        value->results.clear();
    }
}

TEST_F(QTParametersDocuments, TurnAnythingElseThatIsThrownIntoUnexpected) {
    Attach();
    host->maker(CompID_ParameterSuite, [](const GUID&, void**) -> NCFRESULT { throw "no result"; });
    EXPECT_EQ(parameters->GetParameterValuesXML(xml.inArg()), NCF_E_UNEXPECTED);
    EXPECT_EQ(parameters->GetParameterDescriptionXML(xml.inArg()), NCF_E_UNEXPECTED);
    EXPECT_EQ(parameters->GetDefaultValuesXML(xml.inArg()), NCF_E_UNEXPECTED);
    host->maker(CompID_ParametersReader,
                [](const GUID&, void**) -> NCFRESULT { throw "no result"; });
    EXPECT_EQ(parameters->SetParameterValuesXML(xml.inArg()), NCF_E_UNEXPECTED);
}

}  // namespace
