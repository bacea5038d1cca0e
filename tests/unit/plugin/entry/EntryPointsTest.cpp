// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// The six functions against a host of fakes, with a stand-in for the end of the
// retriever.

#include <gtest/gtest.h>

#include <cstring>
#include <filesystem>

#include "host_interfaces/framework/PluginEntry.h"
#include "host_interfaces/media/PluginComponents.h"
#include "host_interfaces/util/NMAString.h"
#include "host_interfaces/util/NMAUtil.h"
#include "reference_host/system/SharedLibrary.h"
#include "source/plugin/PluginFolder.h"
#include "source/plugin/PluginLogSink.h"
#include "source/plugin/PluginLogger.h"
#include "source/plugin/entry/ComponentTable.h"
#include "tests/support/fakes/FakeLock.h"
#include "tests/support/fakes/Journal.h"
#include "tests/support/fakes/RecordingLogger.h"

extern "C" {
NCFRESULT NCFRegisterPlugin(INCFUnknown* host, INCFPluginDefinition** outDefinition);
NCFRESULT NCFRegisterComponent(INCFUnknown* host, ncfUInt32 index,
                               INCFComponentDefinition** outDefinition);
NCFRESULT NCFGetClassFactory(INCFUnknown* host, const GUID& classId, const GUID& interfaceId,
                             void** outFactory);
NCFRESULT NCFCanUnloadNow(INCFUnknown* host);
NCFRESULT NCFStartup(INCFUnknown* host);
NCFRESULT NCFShutdown(INCFUnknown* host);
}

namespace {
Journal* stubJournal = nullptr;
}

void ShutDownInfoRetriever() {
    if (stubJournal) {
        stubJournal->add(GetPluginFolder() ? "retriever down, folder set"
                                           : "retriever down, folder cleared");
    }
}

namespace {

std::string TextOfGuid(const GUID& id) {
    char text[40];
    std::snprintf(text, sizeof text, "%08X-%04X-%04X-%02X%02X-%02X%02X%02X%02X%02X%02X",
                  static_cast<unsigned>(id.Data1), id.Data2, id.Data3, id.Data4[0], id.Data4[1],
                  id.Data4[2], id.Data4[3], id.Data4[4], id.Data4[5], id.Data4[6], id.Data4[7]);
    return text;
}

std::string AttributeLine(const GUID& attribute, const GUID& valueType, const void* value,
                          ncfUInt32 bytes) {
    std::string line = "attribute " + TextOfGuid(attribute) + " " + TextOfGuid(valueType) + " ";
    if (bytes == 0xFFFFFFFFu) {
        return line + "text " + static_cast<const char*>(value);
    }
    ncfUInt32 number = 0;
    std::memcpy(&number, value, sizeof number);
    return line + std::to_string(bytes) + " " + std::to_string(number);
}

// Definition objects that write what they are told; the n-th call may fail.
class FakePluginDefinition : public FakeObject<INCFPluginDefinition> {
public:
    FakePluginDefinition(Journal& journal, int failAt) : journal_(journal), failAt_(failAt) {}
    NCFRESULT SetAttribute(const GUID& attribute, const GUID& valueType, const void* value,
                           ncfUInt32 bytes) override {
        journal_.add(AttributeLine(attribute, valueType, value, bytes));
        return --failAt_ == 0 ? NCF_E_ACCESSDENIED : NCF_OK;
    }
    NCFRESULT Define(const GUID& id, ncfUInt32 major, ncfUInt32 minor, const char* name,
                     const GUID& secondId, const char* vendor, ncfUInt32 count,
                     ncfUInt32 last) override {
        journal_.add("define " + TextOfGuid(id) + " " + std::to_string(major) + "." +
                     std::to_string(minor) + " " + name + " " + TextOfGuid(secondId) + " " +
                     vendor + " " + std::to_string(count) + " " + std::to_string(last));
        return --failAt_ == 0 ? NCF_E_ACCESSDENIED : NCF_OK;
    }

private:
    Journal& journal_;
    int failAt_;
};

class FakeComponentDefinition : public FakeObject<INCFComponentDefinition> {
public:
    FakeComponentDefinition(Journal& journal, int failAt) : journal_(journal), failAt_(failAt) {}
    NCFRESULT SetAttribute(const GUID& attribute, const GUID& valueType, const void* value,
                           ncfUInt32 bytes) override {
        journal_.add(AttributeLine(attribute, valueType, value, bytes));
        return --failAt_ == 0 ? NCF_E_ACCESSDENIED : NCF_OK;
    }
    NCFRESULT Define(const GUID& id, const GUID& type, ncfUInt32 major, ncfUInt32 minor,
                     const GUID& classId, const char* name) override {
        journal_.add("define " + TextOfGuid(id) + " " + TextOfGuid(type) + " " +
                     std::to_string(major) + "." + std::to_string(minor) + " " +
                     TextOfGuid(classId) + " " + name);
        return --failAt_ == 0 ? NCF_E_ACCESSDENIED : NCF_OK;
    }

private:
    Journal& journal_;
    int failAt_;
};

constexpr char kText[] = "40C6B9BA-7103-11D6-BB30-0030658A6504";
constexpr char kUInt32[] = "4EB1A950-7103-11D6-A663-0030658A6504";
constexpr char kFourBytes[] = "27A179D8-7103-11D6-94F7-0030658A6504";

class EntryPoints : public ::testing::Test {
protected:
    EntryPoints() {
        host.maker(CompID_PluginDefinition, [this](const GUID& iid, void** out) {
            EXPECT_TRUE(iid == IID_INCFPluginDefinition);
            *out = static_cast<INCFPluginDefinition*>(
                new FakePluginDefinition(journal, failDefinitionAt));
            return NCF_OK;
        });
        host.maker(CompID_ComponentDefinition, [this](const GUID& iid, void** out) {
            EXPECT_TRUE(iid == IID_INCFComponentDefinition);
            *out = static_cast<INCFComponentDefinition*>(
                new FakeComponentDefinition(journal, failDefinitionAt));
            return NCF_OK;
        });
        host.maker(CompID_LockComponent, [](const GUID&, void** out) {
            *out = static_cast<INCFLock*>(new FakeLock);
            return NCF_OK;
        });
        stubJournal = &journal;
    }
    ~EntryPoints() override {
        NCFShutdown(host.unknown());
        stubJournal = nullptr;
        EXPECT_EQ(LiveFakes(), 2) << "only host and console are left";
        EXPECT_EQ(GetObjectCount(), 0u);
    }

    Journal journal;
    FakeHost host;
    int failDefinitionAt = 0;
};

// --- the plug-in's definition --------------------------------------------------

TEST_F(EntryPoints, RegisterThePluginWithDefinitionFirstAndAttributesInOrder) {
    INCFPluginDefinition* definition = nullptr;
    ASSERT_EQ(NCFRegisterPlugin(host.unknown(), &definition), NCF_OK);
    EXPECT_EQ(
        journal.lines(),
        (std::vector<std::string>{
            "define 3E245FDC-8520-4428-BB4B-F3F939BF51E2 1.3 QuickTime Plug-In "
            "DE75C3CF-E649-4F97-A0B4-859BEAEB15A0 Cliphost 9 1",
            std::string("attribute 3C099C4A-7FD2-11D6-9AEF-00306542A024 ") + kText +
                " text QuickTime * Media Volume & Media Stream Plug-in (MVP & MSP)",
            std::string("attribute 7709BE44-1BCF-11E3-B718-001F2903051E ") + kUInt32 + " 4 2",
            std::string("attribute 7709BE45-1BCF-11E3-B718-001F2903051E ") + kUInt32 + " 4 6720",
        }));
    EXPECT_EQ(definition->Release(), 0u) << "one reference, the caller's";
}

TEST_F(EntryPoints, RegisterPluginNeedsAHostAndAnOutput) {
    INCFPluginDefinition* definition = reinterpret_cast<INCFPluginDefinition*>(&host);
    EXPECT_EQ(NCFRegisterPlugin(nullptr, &definition), NCF_E_POINTER);
    EXPECT_EQ(NCFRegisterPlugin(host.unknown(), nullptr), NCF_E_POINTER);
}

TEST_F(EntryPoints, RegisterPluginGivesTheRefusalOfEachServiceAndANullOutput) {
    const auto refused = [&](NCFRESULT code) {
        INCFPluginDefinition* definition = reinterpret_cast<INCFPluginDefinition*>(&host);
        EXPECT_EQ(NCFRegisterPlugin(host.unknown(), &definition), code);
        EXPECT_EQ(definition, nullptr);
        host.clearRefusals();
    };
    host.refuseQuery(IID_INCFHostUnknown, NCF_E_NOINTERFACE);
    refused(NCF_E_NOINTERFACE);
    host.refuseQuery(IID_INCFComponentFactory, NCF_E_ACCESSDENIED);
    refused(NCF_E_ACCESSDENIED);
    host.refuseCreation(CompID_PluginDefinition, NCF_E_OUTOFMEMORY);
    refused(NCF_E_OUTOFMEMORY);
    for (failDefinitionAt = 1; failDefinitionAt <= 4; ++failDefinitionAt) {
        refused(NCF_E_ACCESSDENIED);
    }
}

TEST_F(EntryPoints, RegisterPluginAsksForTheMarkOfAHostFirst) {
    host.refuseQuery(IID_INCFComponentFactory, NCF_E_ACCESSDENIED);
    host.refuseQuery(IID_INCFHostUnknown, NCF_E_HANDLE);
    INCFPluginDefinition* definition = nullptr;
    EXPECT_EQ(NCFRegisterPlugin(host.unknown(), &definition), NCF_E_HANDLE);
    EXPECT_EQ(host.creations(CompID_PluginDefinition), 0);
}

TEST_F(EntryPoints, RegisterNothingWithoutADefinitionObject) {
    const auto nothing = [](const GUID&, void**) { return NCF_OK; };
    host.maker(CompID_PluginDefinition, nothing);
    host.maker(CompID_ComponentDefinition, nothing);
    INCFPluginDefinition* plugin = nullptr;
    INCFComponentDefinition* component = nullptr;
    EXPECT_EQ(NCFRegisterPlugin(host.unknown(), &plugin), NCF_E_POINTER);
    EXPECT_EQ(NCFRegisterComponent(host.unknown(), 0, &component), NCF_E_POINTER);
}

// --- the components' definitions -----------------------------------------------

struct ExpectedComponent {
    const char* name;
    const char* componentId;
    const char* classId;
    const char* version;
    bool hasFactory;
};
constexpr ExpectedComponent kExpected[] = {
    {"QuickTimeMediaVolume", "A0529DD3-C63D-45EA-AF2A-D962C0DFB5B5",
     "2C839849-53E5-428A-8669-ED79FE70299B", "1.3", true},
    {"QuickTimeMediaFormat", "7B2BF59F-CA0E-4F0D-9FAE-6037B1137D3A",
     "BF41FAED-6DE6-440C-80CA-2FAF8AA5BD5C", "1.3", true},
    {"QuickTimeMasterClips", "32909CEE-3D47-4A8E-914E-006EFBAECDAC",
     "E08DA5CC-5C36-45D6-86F2-F0379C56C755", "1.3", true},
    {"QuickTimeVolumeInfo", "A720F6DD-D6DD-4E45-AE7A-A6FEA37065D8",
     "B7D3689E-DC96-41F2-AC77-DCC8990AA9D5", "1.1", true},
    {"QuickTimeMediaContainer", "781F84B7-B989-4534-8A07-C595CB9A6FB8",
     "058B2AEF-CC2F-4652-B8A0-28D773A8DFB1", "1.3", true},
    {"QuickTimeSampleMapping", "0E74B673-0CA8-403B-A142-986D79508637",
     "109B6222-FDAE-42AB-9E1C-A547123901A0", "1.3", true},
    {"QuickTimeClips", "C7D2D55A-0A1A-44B3-A7D3-5D78EC80FAD8",
     "C5D1D369-62EF-46F8-84B8-1700F1153100", "1.3", false},
    {"GenericDocumentHandler", "4E40C813-86AD-4275-92CC-3AAB04EB1689",
     "A235C6D4-35F8-4A18-8CD1-7E96A8EBF842", "1.3", true},
    {"QTParameters", "E01FB758-46AA-479F-BADA-1FB47C8D522C", "5ECB2244-6B8F-41FD-9E36-71EAE5501230",
     "1.3", true},
};

TEST_F(EntryPoints, RegisterEveryComponentWithItsRowBetweenTheAttributes) {
    for (ncfUInt32 index = 0; index < kComponentCount; ++index) {
        journal.clear();
        INCFComponentDefinition* definition = nullptr;
        ASSERT_EQ(NCFRegisterComponent(host.unknown(), index, &definition), NCF_OK);
        const ExpectedComponent& row = kExpected[index];
        EXPECT_EQ(
            journal.lines(),
            (std::vector<std::string>{
                std::string("attribute 2111CE92-6699-4398-BCDD-86820FD47FAC ") + kFourBytes +
                    " 4 1",
                std::string("attribute 52AB377D-36AF-4FED-B5E0-2DE6B3432477 ") + kFourBytes +
                    " 4 0",
                std::string("attribute 19D46FB3-CA72-43FC-9A38-445A7FAFD3FF ") + kFourBytes +
                    " 4 1",
                std::string("define ") + row.componentId +
                    " D5906204-709B-11D6-91B2-0030658A6504 " + row.version + " " + row.classId +
                    " " + row.name,
                std::string("attribute 7709BE44-1BCF-11E3-B718-001F2903051E ") + kUInt32 + " 4 2",
                std::string("attribute 7709BE45-1BCF-11E3-B718-001F2903051E ") + kUInt32 +
                    " 4 6720",
            }));
        EXPECT_EQ(definition->Release(), 0u);
    }
}

TEST_F(EntryPoints, RegisterComponentRefusesTheTenth) {
    INCFComponentDefinition* definition = nullptr;
    EXPECT_EQ(NCFRegisterComponent(host.unknown(), 9, &definition), NCF_E_INVALIDARG);
    EXPECT_EQ(NCFRegisterComponent(host.unknown(), 0xFFFFFFFF, &definition), NCF_E_INVALIDARG);
}

TEST_F(EntryPoints, RegisterComponentNeedsAHostAndAnOutput) {
    INCFComponentDefinition* definition = nullptr;
    EXPECT_EQ(NCFRegisterComponent(nullptr, 0, &definition), NCF_E_POINTER);
    EXPECT_EQ(NCFRegisterComponent(host.unknown(), 0, nullptr), NCF_E_POINTER);
}

TEST_F(EntryPoints, RegisterComponentGivesEachRefusalAndANullOutput) {
    const auto refused = [&](NCFRESULT code) {
        INCFComponentDefinition* definition = reinterpret_cast<INCFComponentDefinition*>(&host);
        EXPECT_EQ(NCFRegisterComponent(host.unknown(), 0, &definition), code);
        EXPECT_EQ(definition, nullptr);
        host.clearRefusals();
    };
    host.refuseQuery(IID_INCFComponentFactory, NCF_E_NOINTERFACE);
    refused(NCF_E_NOINTERFACE);
    host.refuseCreation(CompID_ComponentDefinition, NCF_E_HANDLE);
    refused(NCF_E_HANDLE);
    for (failDefinitionAt = 1; failDefinitionAt <= 6; ++failDefinitionAt) {
        refused(NCF_E_ACCESSDENIED);
    }
}

TEST_F(EntryPoints, RegisterWithoutStartup) {
    INCFPluginDefinition* definition = nullptr;
    EXPECT_EQ(NCFRegisterPlugin(host.unknown(), &definition), NCF_OK);
    definition->Release();
    EXPECT_EQ(GetPluginFolder(), nullptr);
}

TEST_F(EntryPoints, TurnAnythingElseThatIsThrownIntoUnexpected) {
    host.maker(CompID_PluginDefinition,
               [](const GUID&, void**) -> NCFRESULT { throw "no result"; });
    INCFPluginDefinition* definition = nullptr;
    EXPECT_EQ(NCFRegisterPlugin(host.unknown(), &definition), NCF_E_UNEXPECTED);
    EXPECT_EQ(definition, nullptr);
    host.maker(CompID_ComponentDefinition,
               [](const GUID&, void**) -> NCFRESULT { throw "no result"; });
    INCFComponentDefinition* component = nullptr;
    EXPECT_EQ(NCFRegisterComponent(host.unknown(), 0, &component), NCF_E_UNEXPECTED);
    EXPECT_EQ(component, nullptr);
    host.maker(CompID_LockComponent, [](const GUID&, void**) -> NCFRESULT { throw "no result"; });
    EXPECT_EQ(NCFStartup(host.unknown()), NCF_E_UNEXPECTED);
}

// --- class factories -------------------------------------------------------------

// Whether the object behind an unknown is of the class; the interface is one of its own.
template <class Component, class Interface>
bool IsA(INCFUnknown* object) {
    void* out = nullptr;
    if (object->QueryInterface(ncfIdOf(static_cast<Interface*>(nullptr)), &out) < 0) {
        return false;
    }
    auto* const answer = static_cast<Interface*>(out);
    const bool is = dynamic_cast<Component*>(answer) != nullptr;
    answer->Release();
    return is;
}

TEST_F(EntryPoints, GiveAClassFactoryForEveryClassThatIsServed) {
    using namespace NMA::Impl;
    bool (*const classes[])(INCFUnknown*) = {&IsA<QuickTimeMediaVolume, NMA::IMediaVolume>,
                                             &IsA<QuickTimeMediaFormat, NMA::IMediaFormat>,
                                             &IsA<QuickTimeMasterClips, NMA::IAAFClips>,
                                             &IsA<QuickTimeVolumeInfo, NMA::IVolumeInfo2>,
                                             &IsA<QuickTimeContainer, NMA::IMediaContainer3>,
                                             &IsA<QuickTimeSampleMapping, NMA::ISampleMapping>,
                                             nullptr,
                                             &IsA<GenericDocHandler, UTIL::INCFSaxDocumentHandler>,
                                             &IsA<QTParameters, INCFParametersXML>};
    for (ncfUInt32 index = 0; index < kComponentCount; ++index) {
        void* out = reinterpret_cast<void*>(&host);
        const NCFRESULT result = NCFGetClassFactory(host.unknown(), kComponents[index].classId,
                                                    IID_INCFClassFactory, &out);
        if (!classes[index]) {
            EXPECT_EQ(result, NCF_CLASS_E_CLASSNOTAVAILABLE) << kExpected[index].name;
            EXPECT_EQ(out, nullptr);
            continue;
        }
        ASSERT_EQ(result, NCF_OK) << kExpected[index].name;
        auto* const factory = static_cast<INCFClassFactory*>(out);
        void* object = nullptr;
        ASSERT_EQ(factory->CreateInstance(host.unknown(), nullptr, IID_INCFUnknown, &object),
                  NCF_OK)
            << kExpected[index].name;
        EXPECT_TRUE(classes[index](static_cast<INCFUnknown*>(object))) << kExpected[index].name;
        static_cast<INCFUnknown*>(object)->Release();
        factory->Release();
    }
}

// Container and sample mapping are what hosts ask for most.
TEST_F(EntryPoints, CompareClassIdsInOneOrder) {
    std::vector<std::string> names(kComponentCount);
    for (const ComponentRow& row : kComponents) {
        ASSERT_LT(row.lookUp, kComponentCount);
        EXPECT_EQ(names[row.lookUp], "");
        names[row.lookUp] = row.displayName;
    }
    EXPECT_EQ(names, (std::vector<std::string>{
                         "QuickTimeClips", "QuickTimeMediaContainer", "QuickTimeSampleMapping",
                         "QuickTimeMediaVolume", "QuickTimeMediaFormat", "QuickTimeMasterClips",
                         "QuickTimeVolumeInfo", "GenericDocumentHandler", "QTParameters"}));
}

TEST_F(EntryPoints, HaveNoClassFactoryForRegisteredClips) {
    void* out = nullptr;
    EXPECT_EQ(NCFGetClassFactory(host.unknown(), ncfGuid("C5D1D369-62EF-46F8-84B8-1700F1153100"),
                                 IID_INCFClassFactory, &out),
              NCF_CLASS_E_CLASSNOTAVAILABLE);
}

TEST_F(EntryPoints, GiveAFreshClassFactoryAtEachRequest) {
    void* one = nullptr;
    void* other = nullptr;
    NCFGetClassFactory(host.unknown(), kComponents[0].classId, IID_INCFClassFactory, &one);
    NCFGetClassFactory(host.unknown(), kComponents[0].classId, IID_INCFClassFactory, &other);
    EXPECT_NE(one, other);
    static_cast<INCFClassFactory*>(one)->Release();
    static_cast<INCFClassFactory*>(other)->Release();
}

TEST_F(EntryPoints, GetClassFactoryNeedsAHostAndAnOutput) {
    void* out = nullptr;
    EXPECT_EQ(NCFGetClassFactory(nullptr, kComponents[0].classId, IID_INCFClassFactory, &out),
              NCF_E_INVALIDARG);
    EXPECT_EQ(
        NCFGetClassFactory(host.unknown(), kComponents[0].classId, IID_INCFClassFactory, nullptr),
        NCF_E_INVALIDARG);
}

TEST_F(EntryPoints, ClassFactoryThatLacksTheInterfaceIsDestroyed) {
    void* out = reinterpret_cast<void*>(&host);
    EXPECT_EQ(NCFGetClassFactory(host.unknown(), kComponents[0].classId, IID_INCFBuffer, &out),
              NCF_E_NOINTERFACE);
    EXPECT_EQ(out, nullptr);
    EXPECT_EQ(GetObjectCount(), 0u);
}

// --- unloading ----------------------------------------------------------------------

TEST_F(EntryPoints, RefuseUnloadingWhileAnObjectOrAFactoryLives) {
    EXPECT_EQ(NCFCanUnloadNow(host.unknown()), NCF_OK);
    void* out = nullptr;
    NCFGetClassFactory(host.unknown(), kComponents[0].classId, IID_INCFClassFactory, &out);
    EXPECT_EQ(NCFCanUnloadNow(host.unknown()), NCF_E_FAIL);
    void* object = nullptr;
    static_cast<INCFClassFactory*>(out)->CreateInstance(host.unknown(), nullptr, IID_INCFUnknown,
                                                        &object);
    static_cast<INCFClassFactory*>(out)->Release();
    EXPECT_EQ(NCFCanUnloadNow(host.unknown()), NCF_E_FAIL);
    static_cast<INCFUnknown*>(object)->Release();
    EXPECT_EQ(NCFCanUnloadNow(host.unknown()), NCF_OK);
}

TEST_F(EntryPoints, CanUnloadNowNeedsAHost) {
    EXPECT_EQ(NCFCanUnloadNow(nullptr), NCF_E_INVALIDARG);
}

// --- start and stop -------------------------------------------------------------------

TEST_F(EntryPoints, StartupKeepsTheModulesFolderAndLogsTheVersion) {
    RecordingNMALog log;
    ASSERT_EQ(NCFStartup(host.unknown()), NCF_OK);
    ASSERT_NE(GetPluginFolder(), nullptr);
    const std::string folder = TextOf(GetPluginFolder());
    EXPECT_TRUE(folder.back() == '/' || folder.back() == '\\') << folder;
    const auto program = host::system::FileOfCode(reinterpret_cast<const void*>(&GetPluginFolder));
    EXPECT_EQ(std::filesystem::weakly_canonical(std::filesystem::u8path(folder).parent_path()),
              std::filesystem::weakly_canonical(program.parent_path()));
    ASSERT_FALSE(log.lines().empty());
    EXPECT_EQ(log.lines().front().name, "QuickTime Plug-In");
    EXPECT_TRUE(log.contains(program.filename().u8string()));
}

TEST_F(EntryPoints, StartupGivesTheRefusalOfTheFactoryOrTheLock) {
    host.refuseQuery(IID_INCFComponentFactory, NCF_E_NOINTERFACE);
    EXPECT_EQ(NCFStartup(host.unknown()), NCF_E_NOINTERFACE);
    host.clearRefusals();
    host.refuseCreation(CompID_LockComponent, NCF_E_ACCESSDENIED);
    EXPECT_EQ(NCFStartup(host.unknown()), NCF_E_ACCESSDENIED);
    EXPECT_EQ(GetPluginFolder(), nullptr);
}

TEST_F(EntryPoints, StartupGivesTheRefusalOfItsFolderString) {
    host.refuseCreation(NCFCompID_NCFString, NCF_E_ACCESSDENIED);
    EXPECT_EQ(NCFStartup(host.unknown()), NCF_E_ACCESSDENIED);
    EXPECT_EQ(GetPluginFolder(), nullptr);
    EXPECT_EQ(NCFShutdown(host.unknown()), NCF_OK);
    EXPECT_EQ(NCFShutdown(host.unknown()), NCF_OK);
    host.clearRefusals();
    EXPECT_EQ(NCFStartup(host.unknown()), NCF_OK) << "and it starts again";
    EXPECT_NE(GetPluginFolder(), nullptr);
}

// The string is made here, but takes no text.
TEST_F(EntryPoints, StartupGivesTheRefusalOfTheFoldersText) {
    NMATerminate();
    const NMAString withoutAHost("text");
    INCFString* const refusing = withoutAHost.InArg();
    ASSERT_EQ(refusing->AssignUTF16(kNCFWCHAR, u"", 0), NMA_E_NOTINITIALIZED);
    host.maker(NCFCompID_NCFString,
               [&](const GUID& iid, void** out) { return refusing->QueryInterface(iid, out); });
    EXPECT_EQ(NCFStartup(host.unknown()), NMA_E_NOTINITIALIZED);
    EXPECT_EQ(GetPluginFolder(), nullptr);
    EXPECT_EQ(NCFShutdown(host.unknown()), NCF_OK);
}

TEST_F(EntryPoints, ARefusedFolderStringLeavesTheFolderOfAStartBefore) {
    ASSERT_EQ(NCFStartup(host.unknown()), NCF_OK);
    INCFString* const before = GetPluginFolder();
    host.refuseCreation(NCFCompID_NCFString, NCF_E_OUTOFMEMORY);
    EXPECT_EQ(NCFStartup(host.unknown()), NCF_E_OUTOFMEMORY);
    EXPECT_EQ(GetPluginFolder(), before);
}

TEST_F(EntryPoints, StartupNeedsAHost) {
    EXPECT_EQ(NCFStartup(nullptr), NCF_E_POINTER);
}

// The lock comes after the utility library and the logger's name, and before
// the version line; what was begun ends with the shutdown alone.
TEST_F(EntryPoints, FailedStartupKeepsHowFarItCameUntilShutdown) {
    RecordingNMALog log;
    NCFShutdown(nullptr);
    PluginLogger().SetName("");
    host.refuseCreation(CompID_LockComponent, NCF_E_ACCESSDENIED);
    ASSERT_EQ(NCFStartup(host.unknown()), NCF_E_ACCESSDENIED);
    EXPECT_GT(host.references(), 1u) << "the utility library holds the factory";
    ASSERT_EQ(log.lines().size(), 1u) << "the shutdown's line, no version";
    PluginLogger().Write(1, "%s", "hello");
    EXPECT_EQ(log.lines().back().name, "QuickTime Plug-In");
    EXPECT_EQ(NCFShutdown(host.unknown()), NCF_OK);
    EXPECT_EQ(host.references(), 1u);
}

TEST_F(EntryPoints, SecondStartupStoresTheFolderAgainAndKeepsTheSink) {
    ASSERT_EQ(NCFStartup(host.unknown()), NCF_OK);
    SetPluginFolder(nullptr);
    ASSERT_EQ(NCFStartup(host.unknown()), NCF_OK);
    EXPECT_NE(GetPluginFolder(), nullptr);
    EXPECT_EQ(host.creations(CompID_LockComponent), 1);
}

TEST_F(EntryPoints, ShutdownClearsTheFolderThenTheRetrieverThenSaysUnloaded) {
    ASSERT_EQ(NCFStartup(host.unknown()), NCF_OK);
    journal.clear();
    RecordingNMALog log(8, &journal);
    EXPECT_EQ(NCFShutdown(host.unknown()), NCF_OK);
    EXPECT_EQ(journal.lines(), (std::vector<std::string>{"retriever down, folder cleared",
                                                         "log 4: QuickTime Plug-In Unloaded"}));
    EXPECT_EQ(GetPluginFolder(), nullptr);
}

// A lock that looks, when it goes, whether the utility library still holds the
// factory.
class LastLook : public FakeLock {
public:
    LastLook(FakeHost& host, ncfUInt32& references) : host_(host), references_(references) {}
    ~LastLook() override { references_ = host_.references(); }

private:
    FakeHost& host_;
    ncfUInt32& references_;
};

TEST_F(EntryPoints, ShutdownStopsTheSinkBeforeTheUtilityLibrary) {
    ncfUInt32 references = 0;
    host.maker(CompID_LockComponent, [&](const GUID&, void** out) {
        *out = static_cast<INCFLock*>(new LastLook(host, references));
        return NCF_OK;
    });
    ASSERT_EQ(NCFStartup(host.unknown()), NCF_OK);
    const ncfUInt32 started = host.references();
    EXPECT_EQ(NCFShutdown(host.unknown()), NCF_OK);
    EXPECT_EQ(references, started) << "the sink's lock goes while the library is at work";
    EXPECT_LT(host.references(), started);
}

TEST_F(EntryPoints, ShutdownIsHarmlessBeforeStartupAndTwice) {
    EXPECT_EQ(NCFShutdown(host.unknown()), NCF_OK);
    ASSERT_EQ(NCFStartup(host.unknown()), NCF_OK);
    EXPECT_EQ(NCFShutdown(host.unknown()), NCF_OK);
    EXPECT_EQ(NCFShutdown(nullptr), NCF_OK);
}

TEST_F(EntryPoints, StartAgainAfterShutdown) {
    ASSERT_EQ(NCFStartup(host.unknown()), NCF_OK);
    NCFShutdown(host.unknown());
    ASSERT_EQ(NCFStartup(host.unknown()), NCF_OK);
    EXPECT_NE(GetPluginFolder(), nullptr);
    EXPECT_EQ(host.creations(CompID_LockComponent), 2);
}

}  // namespace
