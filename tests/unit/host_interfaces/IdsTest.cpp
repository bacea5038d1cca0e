// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// Every interface, component and value id of host_interfaces/ but those of AAF,
// written down once more: built modules know them by value.

#include <gtest/gtest.h>

#include <cstdio>
#include <optional>
#include <set>
#include <string>

#include "host_interfaces/framework/AVBuffer.h"
#include "host_interfaces/framework/Buffer.h"
#include "host_interfaces/framework/Capability.h"
#include "host_interfaces/framework/ComponentFactory.h"
#include "host_interfaces/framework/Console.h"
#include "host_interfaces/framework/Definitions.h"
#include "host_interfaces/framework/EditorSettings.h"
#include "host_interfaces/framework/HostSettings.h"
#include "host_interfaces/framework/Lock.h"
#include "host_interfaces/framework/String.h"
#include "host_interfaces/framework/Unknown.h"
#include "host_interfaces/header_parser/QTParser.h"
#include "host_interfaces/header_parser/SampleDescription.h"
#include "host_interfaces/header_parser/SampleTable.h"
#include "host_interfaces/header_parser/TrackInfo.h"
#include "host_interfaces/media/AAFClips.h"
#include "host_interfaces/media/MediaContainer.h"
#include "host_interfaces/media/MediaVolume.h"
#include "host_interfaces/media/PluginComponents.h"
#include "host_interfaces/media/SampleMapping.h"
#include "host_interfaces/media/Sequences.h"
#include "host_interfaces/parameters/ParameterIds.h"
#include "host_interfaces/parameters/ParameterSuite.h"
#include "host_interfaces/parameters/ParameterValue.h"
#include "host_interfaces/parameters/ParametersReader.h"
#include "host_interfaces/parameters/ParametersXML.h"
#include "host_interfaces/quicktime/QuickTimeProperty.h"
#include "host_interfaces/quicktime/QuickTimeWrapper.h"
#include "host_interfaces/quicktime/Readers.h"
#include "host_interfaces/quicktime/SampleTable.h"
#include "host_interfaces/xml/SaxParser.h"
#include "host_interfaces/xml/XmlDocument.h"
#include "host_interfaces/xml/XmlWriter.h"

namespace {

struct IdRow {
    const char* name;
    GUID id;
    const char* text;
    std::optional<GUID> ofInterface = {};  // none for a component or a value
};

template <class Interface>
GUID IdOf() {
    return ncfIdOf(static_cast<const Interface*>(nullptr));
}

// clang-format off
const IdRow kIds[] = {
    {"IID_INCFAVBuffer", IID_INCFAVBuffer, "8D47F0B2-1C5A-4E39-B6A8-27E90C4D5F13"},
    {"IID_INCFBuffer", IID_INCFBuffer, "5B0C2A94-6E1F-4D6C-9C0B-6E0D5C3B7A11", IdOf<INCFBuffer>()},
    {"CompID_Capability", CompID_Capability, "93EE46B2-9EFD-4B41-808A-C96061F0F4EC"},
    {"IID_INCFCapability", IID_INCFCapability, "6A0C2371-128B-40AF-89D6-7247D691A66D", IdOf<INCFCapability>()},
    {"IID_INCFComponentFactory", IID_INCFComponentFactory, "382B6A96-7FD0-11D6-BCFE-00306542A024", IdOf<INCFComponentFactory>()},
    {"IID_INCFClassFactory", IID_INCFClassFactory, "80996EEE-7FCF-11D6-ACA8-00306542A024", IdOf<INCFClassFactory>()},
    {"IID_INCFHostUnknown", IID_INCFHostUnknown, "E51741F1-7FCF-11D6-AAC3-00306542A024"},
    {"IID_INCFConsole", IID_INCFConsole, "908C3A6B-F119-11D6-AD24-00039383008C", IdOf<INCFConsole>()},
    {"CompID_PluginDefinition", CompID_PluginDefinition, "6F8508AE-7295-11D6-8952-0030658A6504"},
    {"IID_INCFPluginDefinition", IID_INCFPluginDefinition, "00EEF015-7FD0-11D6-8485-00306542A024", IdOf<INCFPluginDefinition>()},
    {"CompID_ComponentDefinition", CompID_ComponentDefinition, "6C422BFA-70E5-11D6-8CDD-0030658A6504"},
    {"IID_INCFComponentDefinition", IID_INCFComponentDefinition, "1718A226-7FD0-11D6-BD1D-00306542A024", IdOf<INCFComponentDefinition>()},
    {"kNCFValueTypeText", kNCFValueTypeText, "40C6B9BA-7103-11D6-BB30-0030658A6504"},
    {"kNCFValueTypeUInt32", kNCFValueTypeUInt32, "4EB1A950-7103-11D6-A663-0030658A6504"},
    {"kNCFValueTypeFourBytes", kNCFValueTypeFourBytes, "27A179D8-7103-11D6-94F7-0030658A6504"},
    {"IID_INCFNMAEditorSettings", IID_INCFNMAEditorSettings, "69A8F0F3-C6E4-4666-A3DD-8F24F50FC1E4", IdOf<INCFNMAEditorSettings>()},
    {"IID_IHostSettings", NMA::IID_IHostSettings, "71C45980-1345-419D-AB91-E40C80377330", IdOf<NMA::IHostSettings>()},
    {"NMAHostSetting_IgnoreAlpha", NMA::NMAHostSetting_IgnoreAlpha, "535F13B4-D9DF-4C6B-A3D1-89163A534900"},
    {"CompID_HostSettings", NMA::Impl::CompID_HostSettings, "BF17159D-1581-453E-83BD-9E0E4AF57B40"},
    {"CompID_LockComponent", CompID_LockComponent, "A416643C-06F8-4FD3-9D31-D7BDC4D42422"},
    {"IID_LockComponent", IID_LockComponent, "39F783E7-5279-4E3E-96B8-C786A4E65DF9", IdOf<INCFLock>()},
    {"IID_INCFString", IID_INCFString, "3D11F1B5-C5D5-4A0D-8347-57BD8525B6DE", IdOf<INCFString>()},
    {"NCFCompID_NCFString", NCFCompID_NCFString, "6920B1B9-0A9F-40DB-8DEA-6BD845CF8AD2"},
    {"IID_INCFUnknown", IID_INCFUnknown, "00000000-0000-0000-C000-000000000046", IdOf<INCFUnknown>()},
    {"NCFCompID_QTParser", NCFCompID_QTParser, "40558D46-6475-4E06-9205-162807DB9B7D"},
    {"IID_IQTParser", IID_IQTParser, "EA8F868F-6685-49F0-B014-E3D1BB96AD2A", IdOf<IQTParser>()},
    {"IID_IQTParserColor", IID_IQTParserColor, "98280716-4567-4664-B096-4DC66278A762", IdOf<IQTParserColor>()},
    {"IID_IVideoSampleDescription", IID_IVideoSampleDescription, "2B7A6E90-4D5C-4F1B-A3C8-5F0B9E7D1402", IdOf<IVideoSampleDescription>()},
    {"IID_IAudioSampleDescription", IID_IAudioSampleDescription, "61E0C7F4-2A93-4E58-9B0D-C4A7183F5D03", IdOf<IAudioSampleDescription>()},
    {"IID_IQTSampleTable", IID_IQTSampleTable, "9D3C1A52-70B4-4C0E-8B8F-27F6C2D1E901", IdOf<IQTSampleTable>()},
    {"IID_ITrackInfo", IID_ITrackInfo, "C85E31D0-98A7-4B7C-8E26-0D4F6B92A304", IdOf<ITrackInfo>()},
    {"IID_IVideoTrackInfo", IID_IVideoTrackInfo, "A16AAEB0-03D3-449C-9A03-98C0E02B6BE2", IdOf<IVideoTrackInfo>()},
    {"IID_IAudioTrackInfo", IID_IAudioTrackInfo, "A7DB9BCE-1716-4991-96A7-2F90763C618E", IdOf<IAudioTrackInfo>()},
    {"IID_IAAFClips", NMA::IID_IAAFClips, "CC4FD2EB-C226-48B5-BAAF-E3FBF99CB797", IdOf<NMA::IAAFClips>()},
    {"IID_IMediaContainer", NMA::IID_IMediaContainer, "51092B47-F81C-46E3-B9AB-376705C79F12", IdOf<NMA::IMediaContainer>()},
    {"IID_IMediaContainer2", NMA::IID_IMediaContainer2, "5FEB3C83-08DF-4CCC-A9F4-083EEA2A1DAB", IdOf<NMA::IMediaContainer2>()},
    {"IID_IMediaContainer3", NMA::IID_IMediaContainer3, "13B79A3E-6A3E-45E3-B9F6-E516CA4DF372", IdOf<NMA::IMediaContainer3>()},
    {"IID_ISampleMapping", NMA::IID_ISampleMapping, "E0D63190-0469-4807-92CE-5C22152F84EB"},
    {"IID_ISampleProvider", NMA::IID_ISampleProvider, "933EEA30-24C0-4733-B51D-E37A811DFFE5"},
    {"IID_IUncompressedImageProvider", NMA::IID_IUncompressedImageProvider, "1E1675DC-95E7-45CB-A9F0-7D6326273E70"},
    {"IID_IUncompressedAudioProvider", NMA::IID_IUncompressedAudioProvider, "6F2EAEF7-2DFD-47B8-AA14-38E4DF57982E"},
    {"IID_IVolumeInfo", NMA::IID_IVolumeInfo, "50DC91ED-F177-4C09-A1A3-DAC626AC27FE", IdOf<NMA::IVolumeInfo>()},
    {"IID_IVolumeInfo2", NMA::IID_IVolumeInfo2, "E8DB7522-4A6B-45CE-ACD5-3DF3D6D5FDF4", IdOf<NMA::IVolumeInfo2>()},
    {"IID_IMediaFormat", NMA::IID_IMediaFormat, "BE697E45-A0CD-4EBC-A21C-FA3652220D60", IdOf<NMA::IMediaFormat>()},
    {"IID_IMediaVolume", NMA::IID_IMediaVolume, "41400962-A89C-4BBD-8EFC-F0CC0744AFF4", IdOf<NMA::IMediaVolume>()},
    {"CompID_QuickTimeMediaVolume", NMA::CompID_QuickTimeMediaVolume, "A0529DD3-C63D-45EA-AF2A-D962C0DFB5B5"},
    {"CompID_QuickTimeMediaFormat", NMA::CompID_QuickTimeMediaFormat, "7B2BF59F-CA0E-4F0D-9FAE-6037B1137D3A"},
    {"CompID_QuickTimeMasterClips", NMA::CompID_QuickTimeMasterClips, "32909CEE-3D47-4A8E-914E-006EFBAECDAC"},
    {"CompID_QuickTimeVolumeInfo", NMA::CompID_QuickTimeVolumeInfo, "A720F6DD-D6DD-4E45-AE7A-A6FEA37065D8"},
    {"CompID_QuickTimeContainer", NMA::CompID_QuickTimeContainer, "781F84B7-B989-4534-8A07-C595CB9A6FB8"},
    {"CompID_QuickTimeSampleMapping", NMA::CompID_QuickTimeSampleMapping, "0E74B673-0CA8-403B-A142-986D79508637"},
    {"CompID_QuickTimeClips", NMA::CompID_QuickTimeClips, "C7D2D55A-0A1A-44B3-A7D3-5D78EC80FAD8"},
    {"CompID_QTParameters", NMA::CompID_QTParameters, "E01FB758-46AA-479F-BADA-1FB47C8D522C"},
    {"kCLSID_GenericDocHandler", kCLSID_GenericDocHandler, "4E40C813-86AD-4275-92CC-3AAB04EB1689"},
    {"IID_ISequences", NMA::IID_ISequences, "0D6E5A31-7C42-4B8E-9A57-4F83B1C0E206", IdOf<NMA::ISequences>()},
    {"IID_IAAFSequences", NMA::IID_IAAFSequences, "84C2F1B7-5E0D-4A36-B1F8-6D20A79C3E07", IdOf<NMA::IAAFSequences>()},
    {"kParamSetDefault", kParamSetDefault, "9F9FC555-4014-11C5-8FDE-5ED45EED7C03"},
    {"kParamGroup", kParamGroup, "A1CE72A4-FA19-40E3-9E83-266DAF8AF5BB"},
    {"kParamFieldOrdering", kParamFieldOrdering, "6CAEDE80-2DE0-4E2F-9F5D-904B7A2C2F4A"},
    {"kParamFieldLayout", kParamFieldLayout, "76320B7E-5BF9-4E30-BF04-2BE7D48D4C69"},
    {"kParamLevelRemapping", kParamLevelRemapping, "322655D5-0A56-46CA-9260-D006F719B8A4"},
    {"kParamTypeChoice", kParamTypeChoice, "4AA0FBA6-F8E2-400F-A4A1-E8575B6EF887"},
    {"CompID_ParameterSuite", CompID_ParameterSuite, "24AC2A8F-0577-4A6E-ACFE-44E10B9B01F3"},
    {"IID_ParameterSuite", IID_ParameterSuite, "D53181F5-E685-4DD7-8480-3AE8304437D4", IdOf<IParameterSuite>()},
    {"CompID_ParametersReader", CompID_ParametersReader, "55F676BA-5A00-4786-A682-BEF1FCAEE168"},
    {"IID_ParametersReader", IID_ParametersReader, "0D182F2A-352A-4052-8940-FFBC4371318E", IdOf<IParametersReader>()},
    {"IID_IParametersHandler", NMA::IID_IParametersHandler, "30F807D9-A27E-4376-BA48-10E3514B2B4B", IdOf<NMA::IParametersHandler>()},
    {"IID_IParameterValue", IID_IParameterValue, "5D0E7B34-93C1-4F6A-8A27-1C4F60B7D20C", IdOf<IParameterValue>()},
    {"IID_ValueFactory", IID_ValueFactory, "F9EA0EB0-7FD3-11D6-BEF9-00306542A024", IdOf<IValueFactory>()},
    {"IID_INCFParametersXML", IID_INCFParametersXML, "45FFBAE6-E8F4-48E9-A4A9-1C85BD8D063A", IdOf<INCFParametersXML>()},
    {"CompID_QuickTimeProperty", QuickTime::CompID_QuickTimeProperty, "962000B9-686A-4AB8-B7B3-C4DE54843FDC"},
    {"IID_IQuickTimeProperty", QuickTime::IID_IQuickTimeProperty, "B353C798-86C5-4DBF-8C46-FA9310EB5B2E", IdOf<QuickTime::IQuickTimeProperty>()},
    {"CompID_QuickTimeWrapper", QTWrapper::CompID_QuickTimeWrapper, "0B4C3D37-C23C-48D8-9A8F-BD71C3544465"},
    {"IID_IQuickTimeWrapper", QTWrapper::IID_IQuickTimeWrapper, "024F29AE-2898-4EE8-80D8-D4D54DFAC861", IdOf<QTWrapper::IQuickTimeWrapper>()},
    {"IID_IQTVideoReader", QTWrapper::IID_IQTVideoReader, "A5B2D8E1-36F7-4C90-8A14-E7C05F2D6B09", IdOf<QTWrapper::IQTVideoReader>()},
    {"IID_IQTAudioReader", QTWrapper::IID_IQTAudioReader, "D92C4F73-81AE-4B05-9E6D-530BA8C1F70A", IdOf<QTWrapper::IQTAudioReader>()},
    {"IID_IQTWSampleTable", QTWrapper::IID_IQTWSampleTable, "7C1E94A6-0B5D-4E2F-93D8-1A6F0C7B5E08", IdOf<QTWrapper::IQTWSampleTable>()},
    {"kIID_SaxDocumentHandler", kIID_SaxDocumentHandler, "76573EBA-0E3A-4EBA-B9B5-C8A594ACD9E1", IdOf<UTIL::INCFSaxDocumentHandler>()},
    {"kIID_SaxErrorHandler", kIID_SaxErrorHandler, "66A7051E-3559-41B9-94F5-5BD4541BA366", IdOf<UTIL::INCFSaxErrorHandler>()},
    {"kCLSID_SaxParser", kCLSID_SaxParser, "0D3A449D-DDB3-4AE0-97D2-A3611EE0DEAC"},
    {"kIID_SaxParser", kIID_SaxParser, "FE52EACA-428B-4045-81C4-D6A86AE0090D", IdOf<INCFSaxParser>()},
    {"kCLSID_XmlDocument", kCLSID_XmlDocument, "56542293-7981-4D89-8347-22AD21542DB3"},
    {"kIID_XmlDocument", kIID_XmlDocument, "02BAE621-8A36-4C17-87DD-A57F43B0C503", IdOf<IXmlDocument>()},
    {"kIID_XmlNode", kIID_XmlNode, "EE7F1BE7-CEF3-4EE9-B68A-ED96D484EEAB", IdOf<IXmlNode>()},
    {"kIID_XmlAttributeList", kIID_XmlAttributeList, "3F0A7B6D-12C4-4E9B-8D55-90E1C6A2B705", IdOf<IXmlAttributeList>()},
    {"kIID_XmlElement", kIID_XmlElement, "9A93A6D5-798D-43F5-ADA1-F18A6D07454E", IdOf<IXmlElement>()},
    {"kIID_XmlAttribute", kIID_XmlAttribute, "72AF0713-70D9-4992-B3C7-E83FFE18EBB7", IdOf<IXmlAttribute>()},
    {"kCLSID_XmlWriter", kCLSID_XmlWriter, "B2DF3638-109F-4C00-8BD5-F3117B79B583"},
    {"kIID_XmlWriter", kIID_XmlWriter, "93B7F857-263B-463E-9EF9-9C66AC80C51C", IdOf<IXmlWriter>()},
};
// clang-format on

std::string TextOf(const GUID& id) {
    char text[40];
    std::snprintf(text, sizeof text, "%08X-%04X-%04X-%02X%02X-%02X%02X%02X%02X%02X%02X",
                  static_cast<unsigned>(id.Data1), id.Data2, id.Data3, id.Data4[0], id.Data4[1],
                  id.Data4[2], id.Data4[3], id.Data4[4], id.Data4[5], id.Data4[6], id.Data4[7]);
    return text;
}

TEST(Ids, AreAsPublished) {
    for (const IdRow& row : kIds) {
        EXPECT_EQ(TextOf(row.id), row.text) << row.name;
    }
}

TEST(Ids, AreDifferent) {
    std::set<std::string> texts;
    for (const IdRow& row : kIds) {
        EXPECT_TRUE(texts.insert(row.text).second) << row.name;
    }
}

// The host's settings for the editor come from the component that keeps the
// other settings: one object, two interfaces.
TEST(Ids, OfBothSettingsComponentsAreOne) {
    EXPECT_EQ(TextOf(COMPID_INCFNMAEditorSettings), TextOf(NMA::Impl::CompID_HostSettings));
}

// An interface is asked for by its type: type and id belong together.
TEST(Ids, AreThoseOfTheirInterfaces) {
    for (const IdRow& row : kIds) {
        EXPECT_EQ(TextOf(row.ofInterface.value_or(row.id)), row.text) << row.name;
    }
}

// The factory of numbers goes by the type of what it makes.
TEST(Ids, OfTheFactoryOfNumbersIsTheirType) {
    EXPECT_EQ(TextOf(kValueTypeUInt32), "4EB1A950-7103-11D6-A663-0030658A6504");
}

}  // namespace
