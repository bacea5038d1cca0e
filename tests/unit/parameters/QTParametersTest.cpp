// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// Creation, interfaces, the clip that parameters belong to, and what they answer
// without one.

#include "tests/unit/parameters/QTParametersFixture.h"

namespace {

using QTParametersObject = QTParametersFixture;

TEST_F(QTParametersObject, TakesTheFactoryFromTheHostThenMakesAString) {
    void* out = this;
    const auto create = [&](INCFUnknown* unknown) {
        return CreateInstanceOf<NMA::Impl::QTParameters>(unknown, nullptr, IID_INCFParametersXML,
                                                         &out);
    };
    EXPECT_EQ(create(nullptr), NCF_E_POINTER);
    EXPECT_EQ(out, nullptr);
    host->refuseCreation(NCFCompID_NCFString, NCF_E_OUTOFMEMORY);
    EXPECT_EQ(create(host->unknown()), NCF_E_OUTOFMEMORY);
    EXPECT_EQ(out, nullptr);
    host->refuseQuery(IID_INCFComponentFactory, NCF_E_HANDLE);
    EXPECT_EQ(create(host->unknown()), NCF_E_HANDLE) << "the factory comes first";
    host->clearRefusals();
    journal.clear();
    EXPECT_EQ(create(host->unknown()), NCF_OK);
    EXPECT_EQ(journal.lines(), Lines{"create string"});
    static_cast<INCFParametersXML*>(out)->Release();
}

TEST_F(QTParametersObject, ListsItsInterfacesInOrder) {
    MakeUnattached();
    QTParameters& made = object();
    auto* const first = reinterpret_cast<ncfUInt8*>(static_cast<INCFParametersXML*>(&made));
    EXPECT_EQ(static_cast<void*>(first), static_cast<void*>(&made));
    EXPECT_EQ(reinterpret_cast<ncfUInt8*>(static_cast<NMA::IParametersHandler*>(&made)),
              first + sizeof(void*));
    EXPECT_EQ(reinterpret_cast<ncfUInt8*>(static_cast<CNCFUnknown*>(&made)),
              first + 2 * sizeof(void*));
}

TEST_F(QTParametersObject, AnswersBothInterfacesAndNoOther) {
    MakeUnattached();
    EXPECT_EQ(object().InternalQueryInterface(IID_INCFParametersXML, nullptr), NCF_E_INVALIDARG);
    void* out = nullptr;
    ASSERT_EQ(parameters->QueryInterface(NMA::IID_IParametersHandler, &out), NCF_OK);
    auto* const handler = static_cast<NMA::IParametersHandler*>(out);
    EXPECT_EQ(handler, static_cast<NMA::IParametersHandler*>(&object()));
    ASSERT_EQ(handler->QueryInterface(IID_INCFParametersXML, &out), NCF_OK);
    EXPECT_EQ(static_cast<INCFParametersXML*>(out), parameters.inArg());
    EXPECT_EQ(static_cast<INCFParametersXML*>(out)->Release(), 2u);
    EXPECT_EQ(handler->Release(), 1u);
    out = this;
    EXPECT_EQ(parameters->QueryInterface(NMA::IID_ISampleMapping, &out), NCF_E_NOINTERFACE);
    EXPECT_EQ(out, nullptr);
}

TEST_F(QTParametersObject, RefusesAllWorkBeforeItIsAttached) {
    MakeUnattached();
    EXPECT_EQ(parameters->GetParameterValuesXML(xml.inArg()), NMA_E_NOTINITIALIZED);
    EXPECT_EQ(parameters->GetParameterDescriptionXML(xml.inArg()), NMA_E_NOTINITIALIZED);
    EXPECT_EQ(parameters->GetDefaultValuesXML(xml.inArg()), NMA_E_NOTINITIALIZED);
    EXPECT_EQ(parameters->SetParameterValuesXML(xml.inArg()), NMA_E_NOTINITIALIZED);
    EXPECT_EQ(parameters->ResetParameters(), NMA_E_NOTINITIALIZED);
    EXPECT_TRUE(journal.lines().empty()) << "no host component is asked";
    EXPECT_EQ(TextOf(xml.inArg()), "unchanged");
}

TEST_F(QTParametersObject, FindsANullDocumentBeforeAMissingClip) {
    MakeUnattached();
    EXPECT_EQ(parameters->GetParameterValuesXML(nullptr), NCF_E_INVALIDARG);
    EXPECT_EQ(parameters->GetParameterDescriptionXML(nullptr), NCF_E_INVALIDARG);
    EXPECT_EQ(parameters->GetDefaultValuesXML(nullptr), NCF_E_INVALIDARG);
    EXPECT_EQ(parameters->SetParameterValuesXML(nullptr), NCF_E_INVALIDARG);
}

TEST_F(QTParametersObject, IgnoresValuesBeforeItIsAttached) {
    MakeUnattached();
    QTParameters& events = object();
    EXPECT_EQ(events.BeginComponent(NMA::CompID_QuickTimeSampleMapping), NCF_OK);
    EXPECT_EQ(events.BeginParamSet(kCustom, nullptr, 1.0f, 1), NCF_OK);
    EXPECT_EQ(events.ParamValue(kParamFieldLayout, value), NCF_OK) << "the value is not asked";
}

TEST_F(QTParametersObject, RefusesOneOperationSilently) {
    Attach();
    EXPECT_EQ(parameters->ParametersUnsupportedOperation(this), NCF_E_NOTIMPL);
    EXPECT_TRUE(log->records().empty());
    EXPECT_TRUE(journal.lines().empty());
}

// --- attaching ---------------------------------------------------------------------------

TEST_F(QTParametersObject, CannotBelongToAMappingWithoutAClip) {
    MakeUnattached();
    EXPECT_EQ(object().AttachToQTSampleProvider(*mapping), NCF_E_FAIL);
    EXPECT_TRUE(
        log->once("NCFASSERT( sampleProvider.GetMediaClip() )"
                  "NMA::Impl::QTParameters::AttachToQTSampleProvider"));
    EXPECT_EQ(parameters->GetDefaultValuesXML(xml.inArg()), NMA_E_NOTINITIALIZED);
    EXPECT_EQ(static_cast<NMA::ISampleMapping*>(mapping)->AddRef(), 3u)
        << "the reference was taken before the clip was missed";
    static_cast<NMA::ISampleMapping*>(mapping)->Release();
}

TEST_F(QTParametersObject, ForgetsAFormerClipWhenTheNextMappingHasNone) {
    Attach();
    void* other = nullptr;
    FakeLock* const ours = lock;
    ASSERT_EQ(
        CreateInstanceOf<OpenMapping>(host->unknown(), nullptr, NMA::IID_ISampleMapping, &other),
        NCF_OK);
    EXPECT_EQ(object().AttachToQTSampleProvider(
                  dynamic_cast<OpenMapping&>(*static_cast<NMA::ISampleMapping*>(other))),
              NCF_E_FAIL);
    EXPECT_EQ(parameters->GetDefaultValuesXML(xml.inArg()), NMA_E_NOTINITIALIZED)
        << "the former clip may be gone";
    parameters = nullptr;
    static_cast<NMA::ISampleMapping*>(other)->Release();
    lock = ours;
}

TEST_F(QTParametersObject, KeepsItsMappingAlive) {
    Attach();
    void* other = nullptr;
    FakeLock* const ours = lock;
    ASSERT_EQ(
        CreateInstanceOf<OpenMapping>(host->unknown(), nullptr, NMA::IID_ISampleMapping, &other),
        NCF_OK);
    auto* const second = static_cast<NMA::ISampleMapping*>(other);
    ASSERT_EQ(object().AttachToQTSampleProvider(dynamic_cast<OpenMapping&>(*second)), NCF_E_FAIL);
    ASSERT_EQ(dynamic_cast<OpenMapping&>(*second).SetMediaContainer(clip), NCF_OK);
    ASSERT_EQ(object().AttachToQTSampleProvider(dynamic_cast<OpenMapping&>(*second)), NCF_OK);
    EXPECT_EQ(second->Release(), 1u) << "the parameters' is left";
    EXPECT_EQ(GetObjectCount(), 3u);
    EXPECT_EQ(parameters->GetDefaultValuesXML(xml.inArg()), NCF_OK);
    parameters = nullptr;
    EXPECT_EQ(GetObjectCount(), 1u) << "the mapping went with them";
    lock = ours;
}

TEST_F(QTParametersObject, LeavesTheClipAsItIs) {
    Record() = {4096, 2, 3, 512};
    Attach();
    EXPECT_EQ(Record().fieldOrderInFile, 4096u);
    EXPECT_EQ(Record().levelRemap, 2u);
    EXPECT_EQ(Record().fieldLayout, 3u);
    EXPECT_EQ(Record().detectedFieldOrder, 512u);
}

// --- back to the defaults ------------------------------------------------------------------

TEST_F(QTParametersObject, ResetCopiesAllFourFieldsAndTellsNobody) {
    Record().detectedFieldOrder = 512;
    Attach();
    Record() = {4096, 2, 3, 512};
    EXPECT_EQ(parameters->ResetParameters(), NCF_OK);
    EXPECT_EQ(Record().fieldOrderInFile, 512u);
    EXPECT_EQ(Record().levelRemap, 16u);
    EXPECT_EQ(Record().fieldLayout, 1u);
    EXPECT_EQ(Record().detectedFieldOrder, 8192u) << "the clip forgets what it detected";
    EXPECT_TRUE(journal.lines().empty()) << "no refresh";
}

TEST_F(QTParametersObject, AfterAResetNoFieldOrderIsMarkedAndTheNextDefaultsHave8192) {
    Record().detectedFieldOrder = 512;
    Attach();
    EXPECT_EQ(parameters->ResetParameters(), NCF_OK);
    EXPECT_EQ(parameters->GetParameterDescriptionXML(xml.inArg()), NCF_OK);
    for (const std::string& line : journal.startingWith("suite.AddValueChoice 'Interlaced")) {
        EXPECT_EQ(line.find("default"), std::string::npos) << line;
    }
    EXPECT_EQ(journal.count("suite.AddValueChoice 'Progressive' 256"), 1);
    journal.clear();
    EXPECT_EQ(parameters->GetDefaultValuesXML(xml.inArg()), NCF_OK);
    EXPECT_EQ(journal.count("suite.AddParamValue ordering 512"), 1) << "this object's stand";
    ASSERT_EQ(object().AttachToQTSampleProvider(*mapping), NCF_OK);
    journal.clear();
    EXPECT_EQ(parameters->GetDefaultValuesXML(xml.inArg()), NCF_OK);
    EXPECT_EQ(journal.count("suite.AddParamValue ordering 8192"), 1);
}

TEST_F(QTParametersObject, ResetRenamesTheSetAndKeepsItsIdentifier) {
    Attach();
    EXPECT_EQ(Set({}), NCF_OK);
    EXPECT_EQ(CurrentSet(), "11111111 'My set' 0 1.0 0");
    EXPECT_EQ(parameters->ResetParameters(), NCF_OK);
    EXPECT_EQ(CurrentSet(), "11111111 'Default Settings' 0 1.0 0");
}

// The name belongs to this object: the reader's string is never written.
TEST_F(QTParametersObject, ResetLeavesTheReadersNameAlone) {
    Attach();
    NCFSmartPtr<INCFString> name;
    name.attach(MakeHostString("My set"));
    EXPECT_EQ(object().BeginParamSet(kCustom, name.inArg(), 1.0f, 1), NCF_OK);
    EXPECT_EQ(parameters->ResetParameters(), NCF_OK);
    EXPECT_EQ(TextOf(name.inArg()), "My set");
    EXPECT_EQ(object().BeginParamSet(kCustom, name.inArg(), 1.0f, 1), NCF_OK);
    name->AssignUTF8(kNCFUTF8, "Changed", kNCFZeroTerminated);
    EXPECT_EQ(CurrentSet(), "11111111 'My set' 0 1.0 0");
}

}  // namespace
