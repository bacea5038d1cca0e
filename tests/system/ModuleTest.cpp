// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// The module's file, what it registers, and the components that the host makes
// of it.

#include <memory>

#include "host_interfaces/media/MediaContainer.h"
#include "host_interfaces/media/MediaVolume.h"
#include "host_interfaces/media/PluginComponents.h"
#include "host_interfaces/media/SampleMapping.h"
#include "reference_host/util/text/HostText.h"
#include "tests/system/Command.h"
#include "tests/system/SystemTest.h"

namespace {

TEST(ModuleFile, ExportsSixFunctionsAndNothingElse) {
    const auto file = ProgramFolder() / "plugins" / "QuickTimePlugin.nvx";
    EXPECT_EQ(
        RunCommand("nm -D --defined-only --format=just-symbols " + Quoted(file) + " | sort").out,
        "NCFCanUnloadNow\n"
        "NCFGetClassFactory\n"
        "NCFRegisterComponent\n"
        "NCFRegisterPlugin\n"
        "NCFShutdown\n"
        "NCFStartup\n");
}

class Module : public SystemTest {};

TEST_F(Module, RegistersThePlugin) {
    const host::PluginFacts& plugin = session().plugin().plugin();
    EXPECT_EQ(plugin.id, ncfGuid("3E245FDC-8520-4428-BB4B-F3F939BF51E2"));
    EXPECT_EQ(plugin.secondId, ncfGuid("DE75C3CF-E649-4F97-A0B4-859BEAEB15A0"));
    EXPECT_EQ(plugin.name, "QuickTime Plug-In");
    EXPECT_EQ(plugin.vendor, "Cliphost");
    EXPECT_EQ(plugin.major, 1u);
    EXPECT_EQ(plugin.minor, 3u);
    EXPECT_EQ(plugin.componentCount, 9u);
    EXPECT_EQ(plugin.last, 1u);
    ASSERT_EQ(plugin.attributes.size(), 3u);
    EXPECT_EQ(plugin.attributes[0].id, ncfGuid("3C099C4A-7FD2-11D6-9AEF-00306542A024"));
    EXPECT_EQ(plugin.attributes[0].valueType, ncfGuid("40C6B9BA-7103-11D6-BB30-0030658A6504"));
    EXPECT_EQ(plugin.attributes[0].Text(),
              "QuickTime * Media Volume & Media Stream Plug-in (MVP & MSP)");
    EXPECT_EQ(plugin.attributes[1].id, ncfGuid("7709BE44-1BCF-11E3-B718-001F2903051E"));
    EXPECT_EQ(plugin.attributes[1].Number(), 2u);
    EXPECT_EQ(plugin.attributes[2].id, ncfGuid("7709BE45-1BCF-11E3-B718-001F2903051E"));
    EXPECT_EQ(plugin.attributes[2].Number(), 6720u);
}

struct ComponentRow {
    const char* name;
    GUID id;
    GUID classId;
    ncfUInt32 minor;
    bool hasFactory;
};

// Registered clips have no factory.
constexpr ComponentRow kComponents[] = {
    {"QuickTimeMediaVolume", ncfGuid("A0529DD3-C63D-45EA-AF2A-D962C0DFB5B5"),
     ncfGuid("2C839849-53E5-428A-8669-ED79FE70299B"), 3, true},
    {"QuickTimeMediaFormat", ncfGuid("7B2BF59F-CA0E-4F0D-9FAE-6037B1137D3A"),
     ncfGuid("BF41FAED-6DE6-440C-80CA-2FAF8AA5BD5C"), 3, true},
    {"QuickTimeMasterClips", ncfGuid("32909CEE-3D47-4A8E-914E-006EFBAECDAC"),
     ncfGuid("E08DA5CC-5C36-45D6-86F2-F0379C56C755"), 3, true},
    {"QuickTimeVolumeInfo", ncfGuid("A720F6DD-D6DD-4E45-AE7A-A6FEA37065D8"),
     ncfGuid("B7D3689E-DC96-41F2-AC77-DCC8990AA9D5"), 1, true},
    {"QuickTimeMediaContainer", ncfGuid("781F84B7-B989-4534-8A07-C595CB9A6FB8"),
     ncfGuid("058B2AEF-CC2F-4652-B8A0-28D773A8DFB1"), 3, true},
    {"QuickTimeSampleMapping", ncfGuid("0E74B673-0CA8-403B-A142-986D79508637"),
     ncfGuid("109B6222-FDAE-42AB-9E1C-A547123901A0"), 3, true},
    {"QuickTimeClips", ncfGuid("C7D2D55A-0A1A-44B3-A7D3-5D78EC80FAD8"),
     ncfGuid("C5D1D369-62EF-46F8-84B8-1700F1153100"), 3, false},
    {"GenericDocumentHandler", ncfGuid("4E40C813-86AD-4275-92CC-3AAB04EB1689"),
     ncfGuid("A235C6D4-35F8-4A18-8CD1-7E96A8EBF842"), 3, true},
    {"QTParameters", ncfGuid("E01FB758-46AA-479F-BADA-1FB47C8D522C"),
     ncfGuid("5ECB2244-6B8F-41FD-9E36-71EAE5501230"), 3, true},
};

TEST_F(Module, RegistersNineComponents) {
    const auto& components = session().plugin().components();
    ASSERT_EQ(components.size(), 9u);
    for (std::size_t i = 0; i < 9; ++i) {
        SCOPED_TRACE(kComponents[i].name);
        EXPECT_EQ(components[i].name, kComponents[i].name);
        EXPECT_EQ(components[i].id, kComponents[i].id);
        EXPECT_EQ(components[i].classId, kComponents[i].classId);
        EXPECT_EQ(components[i].type, ncfGuid("D5906204-709B-11D6-91B2-0030658A6504"));
        EXPECT_EQ(components[i].major, 1u);
        EXPECT_EQ(components[i].minor, kComponents[i].minor);
        EXPECT_EQ(components[i].hasFactory, kComponents[i].hasFactory);
        ASSERT_EQ(components[i].attributes.size(), 5u);
        EXPECT_EQ(components[i].attributes[0].id, ncfGuid("2111CE92-6699-4398-BCDD-86820FD47FAC"));
        EXPECT_EQ(components[i].attributes[0].Number(), 1u);
        EXPECT_EQ(components[i].attributes[1].id, ncfGuid("52AB377D-36AF-4FED-B5E0-2DE6B3432477"));
        EXPECT_EQ(components[i].attributes[1].Number(), 0u);
        EXPECT_EQ(components[i].attributes[2].id, ncfGuid("19D46FB3-CA72-43FC-9A38-445A7FAFD3FF"));
        EXPECT_EQ(components[i].attributes[2].Number(), 1u);
    }
}

// A mapping hands its providers out before it prepares them. Without a movie the
// preparation fails, and what was handed out must not keep the module.
TEST_F(Module, AProviderThatCannotBePreparedLeavesNothingBehind) {
    for (const GUID& provider :
         {NMA::IID_IUncompressedImageProvider, NMA::IID_IUncompressedAudioProvider}) {
        void* made = this;
        EXPECT_LT(session().host().factory().CreateComponent(NMA::CompID_QuickTimeSampleMapping,
                                                             nullptr, provider, &made),
                  0);
        EXPECT_EQ(made, nullptr);
        EXPECT_TRUE(ModuleIsIdle());
    }
}

TEST_F(Module, MakesTheComponentsThatHaveAFactory) {
    for (const ComponentRow& row : kComponents) {
        void* made = nullptr;
        const NCFRESULT result =
            session().host().factory().CreateComponent(row.id, nullptr, IID_INCFUnknown, &made);
        EXPECT_EQ(result >= 0, row.hasFactory) << row.name;
        EXPECT_EQ(made != nullptr, row.hasFactory) << row.name;
        if (made != nullptr) {
            EXPECT_FALSE(ModuleIsIdle()) << row.name;
            static_cast<INCFUnknown*>(made)->Release();
        }
        EXPECT_TRUE(ModuleIsIdle()) << row.name;
    }
}

TEST_F(Module, MakesAComponentInsideAnotherByItsRootAlone) {
    INCFUnknown* const outer = session().host().unknown();
    host::ComponentFactory& factory = session().host().factory();
    void* made = &made;
    EXPECT_EQ(factory.CreateComponent(NMA::CompID_QuickTimeContainer, outer,
                                      NMA::IID_IMediaContainer3, &made),
              NCF_CLASS_E_NOAGGREGATION);
    EXPECT_EQ(made, nullptr);
    ASSERT_EQ(
        factory.CreateComponent(NMA::CompID_QuickTimeContainer, outer, IID_INCFUnknown, &made),
        NCF_OK);
    auto* const inner = static_cast<INCFUnknown*>(made);
    EXPECT_FALSE(ModuleIsIdle());
    EXPECT_EQ(inner->Release(), 0u);
    EXPECT_TRUE(ModuleIsIdle());
}

TEST_F(Module, ClaimsThirtyFourFileTypes) {
    static constexpr const char* kExtensions[] = {
        "MOV", "MP4", "M4V",  "MPG",  "MPE", "MPEG", "M2T",  "3GP", "3G2", "QT",  "MOOV", "MOVIE",
        "AVI", "TXT", "MP2",  "MP3",  "M4A", "WAV",  "AIFF", "AIF", "AU",  "AAC", "MID",  "MPA",
        "GIF", "JPG", "JPEG", "JFIF", "TIF", "TIFF", "PNG",  "BMP", "PSD", "DV"};
    host::Ref<NMA::IMediaContainer3> container;
    ASSERT_EQ(session().host().Create(NMA::CompID_QuickTimeContainer, container), NCF_OK);
    ASSERT_EQ(container->GetFileTypeCount(), 34u);
    for (ncfUInt32 i = 0; i < 34; ++i) {
        host::Ref<INCFString> extension, description, group;
        ASSERT_EQ(container->GetFileType(i, extension.Out(), description.Out(), group.Out()),
                  NCF_OK);
        EXPECT_EQ(host::text::ReadUtf8(extension.get()), kExtensions[i]);
        EXPECT_EQ(host::text::ReadUtf8(description.get()), std::string(kExtensions[i]) + " Files");
        EXPECT_EQ(host::text::ReadUtf8(group.get()), "QuickTime Media Files");
    }
    EXPECT_LT(container->GetFileType(34, nullptr, nullptr, nullptr), 0);
}

TEST_F(Module, IsLoadedAndUnloadedAgainAndAgain) {
    for (int i = 0; i < 5; ++i) {
        Start();
        EXPECT_EQ(session().plugin().components().size(), 9u);
        Describe(MadeMovie("png.mov"));
    }
}

TEST_F(Module, ServesASampleMappingOfAMovie) {
    host::Ref<NMA::IMediaContainer3> container;
    ASSERT_EQ(session().host().Create(NMA::CompID_QuickTimeContainer, container), NCF_OK);
    const auto path = cliphost::PathForModule(MadeMovie("png.mov"));
    ASSERT_EQ(container->SetFilePath(path.get()), NCF_OK);
    host::Ref<NMA::ISampleMapping> mapping;
    EXPECT_EQ(container->GetSampleMapping(mapping.Out()), NCF_OK);
    EXPECT_TRUE(mapping);
}

}  // namespace
