// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// What the host's suite writes the views read, and what the visitor writes the
// host's reader tells: live parameters of a mapping over a fake clip, with the
// host's own components for documents and XML.

#include "host_interfaces/media/PluginComponents.h"
#include "host_interfaces/parameters/ParameterIds.h"
#include "host_interfaces/parameters/ParametersReader.h"
#include "reference_host/parameters/ParameterSuite.h"
#include "reference_host/parameters/ParameterValue.h"
#include "reference_host/parameters/ParametersReader.h"
#include "source/parameters/QTParameters.h"
#include "source/parameters/model/NMAParametersVisitor.h"
#include "tests/support/fakes/HostXml.h"
#include "tests/unit/essence/support/MappingFixture.h"

namespace {

using namespace NMA::XMLUtils;

constexpr GUID kComponent = NMA::CompID_QuickTimeSampleMapping;
constexpr GUID kMine = ncfGuid("11111111-2222-3333-4444-5555AAAABBBB");

class ParametersRoundTrip : public MappingFixture {
protected:
    ParametersRoundTrip() {
        UseHostXml(*host);
        serve(CompID_ParameterSuite, [] { return host::MakeRef<host::ParameterSuite>(); });
        serve(CompID_ParametersReader,
              [] { return host::MakeRef<host::ParametersReader>(host::Ref<INCFConsole>()); });
        serve(kValueTypeUInt32, [] { return host::MakeRef<host::ValueFactory>(); });
        host->maker(NMA::CompID_QTParameters, [this](const GUID& iid, void** out) {
            return CreateInstanceOf<NMA::Impl::QTParameters>(host->unknown(), nullptr, iid, out);
        });
        AddVideo(1);
        record() = {512, 16, 2, 512};
        Bind();
        void* out = nullptr;
        EXPECT_EQ(mapping->QueryInterface(IID_INCFParametersXML, &out), NCF_OK);
        parameters.attach(static_cast<INCFParametersXML*>(out));
    }
    ~ParametersRoundTrip() override {
        visitor.reset();
        parameters = nullptr;
    }

    ClipParams& record() { return *clip->GetClipParams(); }
    NMAParametersVisitor& attached() {
        visitor = std::make_unique<NMAParametersVisitor>(host->factory(), parameters.inArg());
        return *visitor;
    }
    ncfUInt32 read(const GUID& parameter, const GUID& set = kParamSetDefault) {
        ncfUInt32 value = 0;
        EXPECT_EQ(visitor->GetUInt32(kComponent, 0, set, parameter, value), NCF_OK);
        return value;
    }
    // The values document, to be changed by hand; its one track and set.
    struct Values {
        explicit Values(INCFComponentFactory* factory) : suite(factory) {}
        NMAParameterSuite suite;
        NMAParamTrack track;
        NMAParamSet set;
    };
    std::unique_ptr<Values> values() {
        auto loaded = std::make_unique<Values>(host->factory());
        loaded->suite.LoadFromString(NMAString(valuesText().c_str()));
        NMAParamComponent component;
        loaded->suite.GetComponent(kComponent, component);
        component.GetTrack(0, loaded->track);
        loaded->track.GetParameterSetAt(0, loaded->set);
        return loaded;
    }
    static void write(Values& changed, const GUID& parameter, ncfUInt32 number) {
        NMAParameter found;
        changed.set.GetParameter(parameter, found);
        found.SetUInt32(number);
    }
    NCFRESULT apply(Values& changed) {
        NMAString text;
        changed.suite.SaveToString(text);
        return parameters->SetParameterValuesXML(text.InArg());
    }
    NCFRESULT apply(const std::string& document) {
        return parameters->SetParameterValuesXML(NMAString(document.c_str()).InArg());
    }
    std::string valuesText() { return written(&INCFParametersXML::GetParameterValuesXML); }
    std::string descriptionText() {
        return written(&INCFParametersXML::GetParameterDescriptionXML);
    }
    static std::string shortNameOf(const NMAParamInfoParam& param) {
        NMAString text;
        param.GetShortName(text);
        return text.GetUTF8String();
    }

    NCFSmartPtr<INCFParametersXML> parameters;
    std::unique_ptr<NMAParametersVisitor> visitor;

private:
    std::string written(NCFRESULT (INCFParametersXML::*operation)(INCFString*)) {
        NCFSmartPtr<INCFString> text;
        text.attach(MakeHostString(""));
        EXPECT_EQ((parameters.inArg()->*operation)(text.inArg()), NCF_OK);
        return TextOf(text.inArg());
    }
    template <class Make>
    void serve(const GUID& component, Make make) {
        host->maker(component, [make](const GUID& iid, void** out) {
            return make()->QueryInterface(iid, out);
        });
    }
};

// --- what the suite writes -----------------------------------------------------

TEST_F(ParametersRoundTrip, TheViewsReadTheDescription) {
    NMAParamComponent component;
    NMAParamTrack track;
    NMAParamInfos infos;
    NMAParamInfoGroup group;
    ASSERT_EQ(attached().GetSuite()->GetComponentCount(), 1u);
    ASSERT_EQ(visitor->GetSuite()->GetComponent(kComponent, component), NCF_OK);
    ASSERT_EQ(component.GetTrackCount(), 1u);
    ASSERT_EQ(component.GetTrack(0, track), NCF_OK);
    ASSERT_EQ(track.GetParameterInfos(infos), NCF_OK);
    EXPECT_EQ(infos.GetGroupCount(), 1u);
    ASSERT_EQ(infos.GetGroup(kParamGroup, group), NCF_OK);
    EXPECT_EQ(group.GetParameterCount(), 3u);
    struct {
        GUID id;
        const char* name;
        const char* label;
        std::vector<ncfUInt32> choices;
        ncfUInt32 defaultValue;
    } const kWanted[] = {
        {kParamFieldOrdering, "Field Ordering In File", "Field Ordering", {256, 512, 4096}, 512},
        {kParamFieldLayout, "Field Layout", "Field Layout", {2, 3}, 2},
        {kParamLevelRemapping, "Level Remapping", "GFX-Video Level", {16, 1, 2}, 16},
    };
    for (const auto& wanted : kWanted) {
        NMAParamInfoParam param;
        NMAParamValueInfo info;
        NMAString label;
        ASSERT_EQ(infos.GetParameter(wanted.id, param), NCF_OK) << wanted.name;
        EXPECT_EQ(shortNameOf(param), wanted.name);
        param.GetDescription(label);
        EXPECT_EQ(label, NMAString(wanted.label));
        ASSERT_EQ(param.GetValueInfo(info), NCF_OK);
        EXPECT_EQ(info.GetKind(), NMA::kParamKindDiscrete);
        ncfUInt32* choices = nullptr;
        ncfUInt32 count = 0;
        ncfUInt32 defaultValue = 0;
        ASSERT_EQ(info.GetDiscreteInfo(&choices, &count, &defaultValue), NCF_OK);
        const std::unique_ptr<ncfUInt32[]> owned(choices);
        EXPECT_EQ(std::vector<ncfUInt32>(choices, choices + count), wanted.choices);
        EXPECT_EQ(defaultValue, wanted.defaultValue);
    }
}

TEST_F(ParametersRoundTrip, TheDescriptionHoldsTheSetInUseToo) {
    NMAParamComponent component;
    NMAParamTrack track;
    NMAParamSet set;
    NMAString name;
    GUID active{};
    attached().GetSuite()->GetComponent(kComponent, component);
    component.GetTrack(0, track);
    EXPECT_EQ(track.GetActiveSet(active), NCF_OK);
    EXPECT_EQ(active, kParamSetDefault);
    ASSERT_EQ(track.GetParameterSet(active, set), NCF_OK);
    set.GetName(name);
    EXPECT_EQ(name, NMAString("Default Settings"));
    EXPECT_EQ(set.GetParameterCount(), 3u);
}

TEST_F(ParametersRoundTrip, AFileWithoutAnOrderHasNoDefaultOrder) {
    record().detectedFieldOrder = 8192;
    host::ParameterDocument document;
    std::string problem;
    ASSERT_EQ(host::ReadParameterDocument(descriptionText(), document, problem), NCF_OK);
    const auto& described = document.components.at(0).tracks.at(0).groups.at(0).parameters;
    EXPECT_FALSE(described.at(0).defaultValue);
    EXPECT_EQ(described.at(1).defaultValue, 2u);
}

TEST_F(ParametersRoundTrip, TheVisitorReadsWhatHolds) {
    record() = {4096, 2, 3, 512};
    EXPECT_EQ(attached().HasParameterSet(kComponent, 0, kParamSetDefault), 1);
    EXPECT_EQ(read(kParamFieldOrdering), 4096u);
    EXPECT_EQ(read(kParamFieldLayout), 3u);
    EXPECT_EQ(read(kParamLevelRemapping), 2u);
}

// --- and back ------------------------------------------------------------------

TEST_F(ParametersRoundTrip, AWriteReachesTheClipAndTheMapping) {
    attached();
    journal.clear();
    EXPECT_EQ(visitor->SetUInt32(kComponent, 0, kParamSetDefault, kParamLevelRemapping, 1), NCF_OK);
    EXPECT_EQ(journal.count("lock"), 1) << "one refresh";
    EXPECT_EQ(record().levelRemap, 1u);
    EXPECT_EQ(mapping->levelRemap_, 1u) << "the mapping followed";
    EXPECT_EQ(record().fieldOrderInFile, 512u);
    EXPECT_EQ(record().fieldLayout, 2u);
    EXPECT_EQ(read(kParamLevelRemapping), 1u);
}

TEST_F(ParametersRoundTrip, EveryParameterGoesThereAndBack) {
    attached();
    visitor->SetUInt32(kComponent, 0, kParamSetDefault, kParamFieldOrdering, 4096);
    visitor->SetUInt32(kComponent, 0, kParamSetDefault, kParamFieldLayout, 3);
    visitor->SetUInt32(kComponent, 0, kParamSetDefault, kParamLevelRemapping, 2);
    EXPECT_EQ(record().fieldOrderInFile, 4096u);
    EXPECT_EQ(record().fieldLayout, 3u);
    EXPECT_EQ(record().levelRemap, 2u);
    EXPECT_EQ(record().detectedFieldOrder, 512u);
    EXPECT_EQ(read(kParamFieldOrdering), 4096u);
    EXPECT_EQ(read(kParamFieldLayout), 3u);
    EXPECT_EQ(read(kParamLevelRemapping), 2u);
}

TEST_F(ParametersRoundTrip, AnUpdateWithoutChangeChangesNothing) {
    const std::string before = valuesText();
    attached().BeginUpdate();
    EXPECT_EQ(visitor->EndUpdate(), NCF_OK);
    EXPECT_EQ(valuesText(), before);
    EXPECT_EQ(record().fieldOrderInFile, 512u);
}

TEST_F(ParametersRoundTrip, AValueOfNoChoiceIsKeptAsItComes) {
    attached();
    visitor->SetUInt32(kComponent, 0, kParamSetDefault, kParamLevelRemapping, 7);
    EXPECT_EQ(record().levelRemap, 7u);
    EXPECT_EQ(read(kParamLevelRemapping), 7u);
}

TEST_F(ParametersRoundTrip, WhatIsNotInTheDocumentIsNoData) {
    attached();
    EXPECT_THROW(visitor->SetUInt32(kComponent, 1, kParamSetDefault, kParamLevelRemapping, 1),
                 NCFRESULT);
    EXPECT_THROW(visitor->SetUInt32(kComponent, 0, kMine, kParamLevelRemapping, 1), NCFRESULT);
    EXPECT_THROW(visitor->SetSInt32(kComponent, 0, kParamSetDefault, kParamLevelRemapping, 1),
                 NCFRESULT)
        << "of another kind";
    EXPECT_EQ(record().levelRemap, 16u);
}

TEST_F(ParametersRoundTrip, ValuesOfOneClipAreTakenByAnother) {
    record() = {4096, 1, 2, 512};
    const std::string saved = valuesText();
    record() = {};
    EXPECT_EQ(apply(saved), NCF_OK);
    EXPECT_EQ(record().fieldOrderInFile, 4096u);
    EXPECT_EQ(record().levelRemap, 1u);
    EXPECT_EQ(record().fieldLayout, 2u);
    EXPECT_EQ(record().detectedFieldOrder, 8192u) << "that is not in documents";
    EXPECT_EQ(valuesText(), saved);
}

TEST_F(ParametersRoundTrip, ADescriptionIsADocumentOfValuesToo) {
    record().fieldLayout = 3;
    const std::string saved = descriptionText();
    record().fieldLayout = 1;
    EXPECT_EQ(apply(saved), NCF_OK);
    EXPECT_EQ(record().fieldLayout, 3u);
}

TEST_F(ParametersRoundTrip, AResetIsSeenByTheNextUpdate) {
    attached();
    visitor->SetUInt32(kComponent, 0, kParamSetDefault, kParamLevelRemapping, 1);
    EXPECT_EQ(parameters->ResetParameters(), NCF_OK);
    EXPECT_EQ(read(kParamLevelRemapping), 16u);
    EXPECT_EQ(read(kParamFieldOrdering), 512u);
    EXPECT_EQ(read(kParamFieldLayout), 1u);
}

// --- documents changed by hand -------------------------------------------------

// A value that the host's reader doesn't carry holds nothing.
TEST_F(ParametersRoundTrip, AValueOfAnotherKindEndsTheReadingWhereItStands) {
    journal.clear();
    EXPECT_EQ(
        apply("<ncfComponents><component id='0E74B673-0CA8-403B-A142-986D79508637'>"
              "<track number='0'><parameterSet id='11111111-2222-3333-4444-5555AAAABBBB'>"
              "<parameter id='76320B7E-5BF9-4E30-BF04-2BE7D48D4C69'><valueUInt32>3</valueUInt32>"
              "</parameter><parameter id='6CAEDE80-2DE0-4E2F-9F5D-904B7A2C2F4A'>"
              "<valueString>Progressive</valueString></parameter></parameterSet></track>"
              "</component></ncfComponents>"),
        NCF_E_FAIL);
    EXPECT_EQ(record().fieldLayout, 3u) << "what came before stays";
    EXPECT_EQ(record().fieldOrderInFile, 512u);
    EXPECT_EQ(journal.count("lock"), 0) << "no refresh";
}

TEST_F(ParametersRoundTrip, ASetThatIsNotInUseIsNotTaken) {
    auto changed = values();
    write(*changed, kParamLevelRemapping, 1);
    changed->set.SetName(NMAString("Other"));
    changed->track.SetActiveSet(kMine);
    EXPECT_EQ(apply(*changed), NCF_OK);
    EXPECT_EQ(record().levelRemap, 16u);
}

TEST_F(ParametersRoundTrip, AReadOnlySetIsNamedButItsValuesAreNotTaken) {
    auto changed = values();
    changed->set.SetReadOnly(true);
    changed->set.SetName(NMAString("Locked"));
    write(*changed, kParamLevelRemapping, 1);
    changed->suite.GetRoot()
        ->FindChild(NMAString("component"), 0)
        ->FindChild(NMAString("track"), 0)
        ->FindChild(NMAString("parameterSet"), 0)
        ->SetAttribute(NMAString("id"), NMAString("11111111-2222-3333-4444-5555AAAABBBB"));
    changed->track.SetActiveSet(kMine);
    EXPECT_EQ(apply(*changed), NCF_OK);
    EXPECT_EQ(record().levelRemap, 16u);
    NMAString name;
    auto after = values();
    after->set.GetName(name);
    EXPECT_EQ(name, NMAString("Locked"));
    EXPECT_EQ(attached().HasParameterSet(kComponent, 0, kMine), 1);
}

TEST_F(ParametersRoundTrip, ANewSetNeedsItsIdBeforeTheHostTakesIt) {
    attached();
    NMAParamComponent component;
    NMAParamTrack described;
    NMAParamInfos infos;
    NMAParamInfoParam levels;
    visitor->GetSuite()->GetComponent(kComponent, component);
    component.GetTrack(0, described);
    described.GetParameterInfos(infos);
    ASSERT_EQ(infos.GetParameter(kParamLevelRemapping, levels), NCF_OK);

    auto changed = values();
    NMAParamSet mine;
    NMAParameter parameter;
    changed->track.RemoveParameterSet(kParamSetDefault);
    changed->track.AddParameterSet(kMine, mine);
    mine.SetName(NMAString("Mine"));
    mine.AddParameter(levels, parameter);
    parameter.SetUInt32(2);
    changed->track.SetActiveSet(kMine);
    EXPECT_EQ(apply(*changed), NCF_E_INVALIDARG) << "no id was written";
    EXPECT_EQ(record().levelRemap, 16u);

    NMAXmlElement* const set = changed->suite.GetRoot()
                                   ->FindChild(NMAString("component"), 0)
                                   ->FindChild(NMAString("track"), 0)
                                   ->FindChild(NMAString("parameterSet"), 0);
    set->SetAttribute(NMAString("id"), NMAString("11111111-2222-3333-4444-5555AAAABBBB"));
    set->FindChild(NMAString("parameter"), 0)
        ->SetAttribute(NMAString("id"), NMAString("322655D5-0A56-46CA-9260-D006F719B8A4"));
    EXPECT_EQ(apply(*changed), NCF_OK);
    EXPECT_EQ(record().levelRemap, 2u) << "a discrete value, as the description says";
    NMAString name;
    auto after = values();
    after->set.GetName(name);
    EXPECT_EQ(name, NMAString("Mine"));
    EXPECT_EQ(read(kParamLevelRemapping, kMine), 2u);
}

TEST_F(ParametersRoundTrip, OtherComponentsAndParametersArePassedOver) {
    auto changed = values();
    NMAParamComponent other;
    NMAParamTrack track;
    changed->suite.AddComponent(kMine, other);
    other.AddTrack(0, track);
    write(*changed, kParamLevelRemapping, 1);
    changed->suite.GetRoot()
        ->FindChild(NMAString("component"), 0)
        ->FindChild(NMAString("track"), 0)
        ->FindChild(NMAString("parameterSet"), 0)
        ->FindChild(NMAString("parameter"), 0)
        ->SetAttribute(NMAString("id"), NMAString("11111111-2222-3333-4444-5555AAAABBBB"));
    EXPECT_EQ(apply(*changed), NCF_OK);
    EXPECT_EQ(record().levelRemap, 1u);
    EXPECT_EQ(record().fieldOrderInFile, 512u) << "its parameter has another id now";
    EXPECT_EQ(attached().GetSuite()->GetComponentCount(), 1u);
}

}  // namespace
