// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// The clip's parameters through the reference host's own components, and the
// typed views over what comes of it: what one side writes, the other reads.

#include "reference_host/parameters/ParameterSuite.h"
#include "reference_host/parameters/ParameterValue.h"
#include "reference_host/parameters/ParametersReader.h"
#include "source/parameters/NMAParametersVisitor.h"
#include "tests/support/fakes/HostXml.h"
#include "tests/unit/parameters/QTParametersFixture.h"

namespace {

using namespace NMA::XMLUtils;

class QTParametersRoundTrip : public QTParametersFixture {
protected:
    QTParametersRoundTrip() {
        UseHostXml(*host);
        host->maker(CompID_ParameterSuite, [](const GUID& iid, void** out) {
            return host::MakeRef<host::ParameterSuite>()->QueryInterface(iid, out);
        });
        host->maker(CompID_ParametersReader, [](const GUID& iid, void** out) {
            return host::MakeRef<host::ParametersReader>(host::Ref<INCFConsole>())
                ->QueryInterface(iid, out);
        });
        host->maker(kValueTypeUInt32, [](const GUID& iid, void** out) {
            return host::MakeRef<host::ValueFactory>()->QueryInterface(iid, out);
        });
        Record().detectedFieldOrder = 512;
    }
    ncfUInt32 Value(NMAParametersVisitor& visitor, const GUID& set, const GUID& parameter) {
        ncfUInt32 number = 0xDEADBEEF;
        EXPECT_EQ(visitor.GetUInt32(kMapping, 0, set, parameter, number), NCF_OK);
        return number;
    }

    static constexpr GUID kMapping = NMA::CompID_QuickTimeSampleMapping;
};

TEST_F(QTParametersRoundTrip, TheViewsReadTheDescription) {
    Attach();
    NMAParametersVisitor visitor(host->factory(), parameters.inArg());
    NMAParamComponent component;
    NMAParamTrack track;
    NMAParamInfos infos;
    visitor.GetSuite()->GetComponent(kMapping, component);
    component.GetTrack(0, track);
    track.GetParameterInfos(infos);
    EXPECT_EQ(infos.GetGroupCount(), 1u);
    const struct {
        GUID id;
        const char* name;
        const char* label;
        std::vector<ncfUInt32> values;
        ncfUInt32 defaultValue;
    } kExpected[] = {
        {kParamFieldOrdering, "Field Ordering In File", "Field Ordering", {256, 512, 4096}, 512},
        {kParamFieldLayout, "Field Layout", "Field Layout", {2, 3}, 2},
        {kParamLevelRemapping, "Level Remapping", "GFX-Video Level", {16, 1, 2}, 16},
    };
    for (const auto& expected : kExpected) {
        SCOPED_TRACE(expected.name);
        NMAParamInfoParam parameter;
        ASSERT_EQ(infos.GetParameter(expected.id, parameter), NCF_OK) << "it lies in a group";
        NMAString text;
        parameter.GetShortName(text);
        EXPECT_STREQ(text.GetUTF8String(), expected.name);
        parameter.GetDescription(text);
        EXPECT_STREQ(text.GetUTF8String(), expected.label);
        NMAParamValueInfo info;
        parameter.GetValueInfo(info);
        EXPECT_EQ(info.GetKind(), 5u) << "one of a list";
        ncfUInt32* values = nullptr;
        ncfUInt32 count = 0;
        ncfUInt32 defaultValue = 0;
        ASSERT_EQ(info.GetDiscreteInfo(&values, &count, &defaultValue), NCF_OK);
        const std::unique_ptr<ncfUInt32[]> owned(values);
        EXPECT_EQ(std::vector<ncfUInt32>(values, values + count), expected.values);
        EXPECT_EQ(defaultValue, expected.defaultValue);
    }
}

TEST_F(QTParametersRoundTrip, TheViewsReadTheValuesOfTheDefaultSet) {
    Record() = {4096, 2, 3, 512};
    Attach();
    NMAParametersVisitor visitor(host->factory(), parameters.inArg());
    EXPECT_EQ(Value(visitor, kParamSetDefault, kParamFieldOrdering), 4096u);
    EXPECT_EQ(Value(visitor, kParamSetDefault, kParamFieldLayout), 3u);
    EXPECT_EQ(Value(visitor, kParamSetDefault, kParamLevelRemapping), 2u);
}

TEST_F(QTParametersRoundTrip, AValueSetThroughTheViewsReachesTheClipAndComesBack) {
    Attach();
    NMAParametersVisitor visitor(host->factory(), parameters.inArg());
    EXPECT_EQ(visitor.SetUInt32(kMapping, 0, kParamSetDefault, kParamLevelRemapping, 1), NCF_OK);
    EXPECT_EQ(Record().levelRemap, 1u);
    EXPECT_EQ(mapping->_levelRemap, 1u) << "the mapping followed";
    EXPECT_EQ(visitor.SetUInt32(kMapping, 0, kParamSetDefault, kParamFieldOrdering, 4096), NCF_OK);
    EXPECT_EQ(visitor.SetUInt32(kMapping, 0, kParamSetDefault, kParamFieldLayout, 3), NCF_OK);
    EXPECT_EQ(Record().fieldOrderInFile, 4096u);
    EXPECT_EQ(Record().fieldLayout, 3u);
    EXPECT_EQ(Record().levelRemap, 1u) << "each time all values are handed over";
    EXPECT_EQ(Value(visitor, kParamSetDefault, kParamLevelRemapping), 1u);
    EXPECT_EQ(Value(visitor, kParamSetDefault, kParamFieldOrdering), 4096u);
}

TEST_F(QTParametersRoundTrip, ValuesOfOneClipAreTakenByAnother) {
    Attach();
    Record() = {4096, 1, 2, 512};
    ASSERT_EQ(parameters->GetParameterValuesXML(xml.inArg()), NCF_OK);
    const std::string saved = TextOf(xml.inArg());
    Record() = {};
    NCFSmartPtr<INCFString> copy;
    copy.attach(MakeHostString(saved));
    EXPECT_EQ(parameters->SetParameterValuesXML(copy.inArg()), NCF_OK);
    EXPECT_EQ(Record().fieldOrderInFile, 4096u);
    EXPECT_EQ(Record().levelRemap, 1u);
    EXPECT_EQ(Record().fieldLayout, 2u);
    EXPECT_EQ(Record().detectedFieldOrder, 8192u) << "that is not in documents";
    ASSERT_EQ(parameters->GetParameterValuesXML(xml.inArg()), NCF_OK);
    EXPECT_EQ(TextOf(xml.inArg()), saved);
}

TEST_F(QTParametersRoundTrip, ADescriptionIsADocumentOfValuesToo) {
    Attach();
    Record().fieldLayout = 3;
    ASSERT_EQ(parameters->GetParameterDescriptionXML(xml.inArg()), NCF_OK);
    Record().fieldLayout = 1;
    EXPECT_EQ(parameters->SetParameterValuesXML(xml.inArg()), NCF_OK);
    EXPECT_EQ(Record().fieldLayout, 3u);
}

TEST_F(QTParametersRoundTrip, AFileWithoutAnOrderHasNoDefaultOrder) {
    Record().detectedFieldOrder = 8192;
    Attach();
    ASSERT_EQ(parameters->GetParameterDescriptionXML(xml.inArg()), NCF_OK);
    host::ParameterDocument document;
    std::string problem;
    ASSERT_EQ(host::ReadParameterDocument(TextOf(xml.inArg()), document, problem), NCF_OK);
    const auto& parametersOfGroup = document.components.at(0).tracks.at(0).groups.at(0).parameters;
    EXPECT_FALSE(parametersOfGroup.at(0).defaultValue);
    EXPECT_EQ(parametersOfGroup.at(1).defaultValue, 2u);
}

// A value that the host's reader doesn't carry holds nothing.
TEST_F(QTParametersRoundTrip, AValueOfAnotherKindEndsTheReadingWhereItStands) {
    Attach();
    NCFSmartPtr<INCFString> text;
    text.attach(MakeHostString(
        "<ncfComponents><component id='0E74B673-0CA8-403B-A142-986D79508637'><track number='0'>"
        "<parameterSet id='11111111-2222-3333-4444-555555555555'>"
        "<parameter id='76320B7E-5BF9-4E30-BF04-2BE7D48D4C69'><valueUInt32>3</valueUInt32>"
        "</parameter><parameter id='6CAEDE80-2DE0-4E2F-9F5D-904B7A2C2F4A'>"
        "<valueString>Progressive</valueString></parameter></parameterSet></track></component>"
        "</ncfComponents>"));
    EXPECT_EQ(parameters->SetParameterValuesXML(text.inArg()), NCF_E_FAIL);
    EXPECT_EQ(Record().fieldLayout, 3u) << "what came before stays";
    EXPECT_EQ(Record().fieldOrderInFile, 8192u);
    EXPECT_EQ(journal.count("lock"), 0) << "no refresh";
}

}  // namespace
