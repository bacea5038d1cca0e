// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/stored/ModelFile.h"
#include "aaf_library/stored/ModelNames.h"

#include "aaf_library/model/ClassDefinition.h"
#include "aaf_library/model/TypeExtendibleEnumeration.h"
#include "aaf_library/model/TypeRecord.h"
#include "aaf_library/stored/MetaClosure.h"
#include "aaf_library/stored/MetaPids.h"
#include "aaf_library/stored/MetaRecords.h"
#include "aaf_library/stored/ModelReader.h"
#include "aaf_library/stored/ModelWriter.h"
#include "aaf_library/stored/StoredError.h"
#include "aaf_library/stored/StoredNames.h"
#include "aaf_library/stored/TreeReader.h"
#include "aaf_library/stored/TreeWriter.h"
#include "host_interfaces/aaf/AAFClassIds.h"
#include "host_interfaces/aaf/AAFDefinitionIds.h"
#include "host_interfaces/aaf/AAFTypeIds.h"
#include "tests/support/TestFolder.h"
#include "tests/unit/aaf_library/stored/BuiltInRecords.h"
#include "tests/unit/aaf_library/stored/Refusal.h"
#include "tests/unit/aaf_library/stored/SampleModel.h"

#include <gtest/gtest.h>
#include <algorithm>
#include <atomic>
#include <functional>
#include <set>
#include <thread>

using namespace aaf;
using namespace aaf::stored;
namespace fs = std::filesystem;

namespace {

Bytes BytesOf(const sample::SampleModel& sample, SectorSize size = SectorSize::Bytes512) {
    return WriteTree(TreeOfModel(*sample.model, *sample.header), size);
}

sample::SampleModel reread(const Bytes& file) {
    sample::SampleModel sample;
    sample.model = sample::NewModel();
    sample.header = ReadModel(ReadTree(file), *sample.model, sample.notes);
    return sample;
}

const StoredObject& child(const StoredObject& object, std::uint16_t pid, std::size_t index = 0) {
    const StoredProperty* property = object.Find(pid);
    if (property == nullptr || property->objects.size() <= index) {
        throw std::logic_error("no such object");
    }
    return property->objects[index];
}

std::string WritingRefusal(const sample::SampleModel& sample) {
    return RefusalOf([&] { TreeOfModel(*sample.model, *sample.header); });
}

std::set<std::wstring> StoredClasses(const StoredObject& root) {
    std::set<std::wstring> names;
    for (const MetaClass& entry : ReadMetaDictionary(child(root, 1)).classes) {
        names.insert(entry.name);
    }
    return names;
}

// A file of all built-in definitions alone.
Bytes BytesToSave(const sample::SampleModel& sample, SectorSize size = SectorSize::Bytes512) {
    return WriteTree(TreeToWrite(*sample.model, *sample.header), size);
}

}  // namespace

TEST(ModelFile, WhatIsLaidOutOnceGivesTheSameBytes) {
    for (const SectorSize size : {SectorSize::Bytes512, SectorSize::Bytes4096}) {
        for (const sample::SampleModel& sample : {sample::WholeModel(), sample::EmptyModel()}) {
            const Bytes whole = BytesOf(sample, size);
            EXPECT_EQ(BytesToSave(sample, size), whole);
            EXPECT_EQ(BytesToSave(sample, size), whole) << "the second time";
        }
    }
}

TEST(ModelFile, FilesShareTheBytesOfTheirDefinitions) {
    const sample::SampleModel sample = sample::WholeModel();
    const auto pieces = [&] {
        return WriteTreeInPieces(TreeToWrite(*sample.model, *sample.header), SectorSize::Bytes512);
    };
    const std::vector<Piece> first = pieces();
    const std::vector<Piece> second = pieces();
    ASSERT_EQ(first.size(), second.size());
    std::size_t all = 0;
    std::size_t shared = 0;
    for (std::size_t i = 0; i < first.size(); ++i) {
        all += first[i].size;
        shared += first[i].data == second[i].data ? first[i].size : 0;
    }
    EXPECT_GT(shared, all / 2);
}

// A name that was set makes the writer look at the definitions themselves.
TEST(ModelFile, TheBuiltInTablesSayWhatTheDefinitionsSay) {
    const RefPtr<Model> renamed = sample::NewModel();
    for (const BuiltInClass& entry : BuiltInClasses()) {
        ClassDefinition& definition = *renamed->FindClass(entry.id);
        definition.SetName(std::wstring(definition.name()).c_str());
        EXPECT_FALSE(renamed->HasAsBuiltIn(entry));
    }
    for (const BuiltInType& entry : BuiltInTypes()) {
        TypeDefinition& definition = *renamed->FindType(entry.id);
        definition.SetName(std::wstring(definition.name()).c_str());
        EXPECT_FALSE(renamed->HasAsBuiltIn(entry));
    }
    const RefPtr<Model> untouched = sample::NewModel();
    const Bytes byDefinitions = sample::FileOfDefinitions(*renamed, StoredMetaDictionary);
    EXPECT_EQ(sample::FileOfDefinitions(*untouched, StoredMetaDictionary), byDefinitions);
    EXPECT_EQ(sample::FileOfDefinitions(*untouched, LaidOutMetaDictionary), byDefinitions);
}

TEST(ModelFile, ABuiltInDefinitionThatACallerChangedIsSavedAsItIs) {
    const auto change = [](const std::function<void(Model&)>& make) {
        const sample::SampleModel sample = sample::WholeModel();
        const Bytes before = BytesToSave(sample);
        make(*sample.model);
        const Bytes after = BytesToSave(sample);
        EXPECT_NE(after, before);
        EXPECT_EQ(after, BytesOf(sample));
        EXPECT_EQ(BytesToSave(sample::WholeModel()), before) << "the next file has it unchanged";
    };
    change([](Model& model) { model.FindClass(AUID_AAFSourceClip)->SetName(L"Clip"); });
    change([](Model& model) {
        model.FindClass(AUID_AAFSourceClip)
            ->FindProperty(prop::SourceReference_SourceID.id)
            ->SetName(L"Source");
    });
    change([](Model& model) { model.FindType(kAAFTypeID_MobIDType)->SetName(L"Number"); });
    change([](Model& model) {
        ClassDefinition& definition = *model.FindClass(AUID_AAFSourceClip);
        definition.AddProperty(ncfGuid("9D2C1F10-4F5A-4C77-8A01-5B1E2C3D4E77"), L"More",
                               kAAFTypeID_UInt8, true, false);
    });
    change([](Model& model) {
        auto& type =
            dynamic_cast<TypeExtendibleEnumeration&>(*model.FindType(kAAFTypeID_UsageType));
        type.AppendElement(ncfGuid("9D2C1F10-4F5A-4C77-8A01-5B1E2C3D4E78"), L"Usage_More");
    });
}

// A usage of its own makes the definitions of a file those of no other.
sample::SampleModel ModelWithUsage(std::uint8_t number) {
    sample::SampleModel sample = sample::WholeModel();
    GUID id = ncfGuid("9D2C1F10-4F5A-4C77-8A01-5B1E2C3D4E80");
    id.Data4[7] = number;
    auto& type =
        dynamic_cast<TypeExtendibleEnumeration&>(*sample.model->FindType(kAAFTypeID_UsageType));
    type.AppendElement(id, (L"Usage_" + std::to_wstring(number)).c_str());
    return sample;
}

TEST(ModelFile, MoreKindsOfDefinitionsThanAreKeptGiveTheSameBytes) {
    for (int turn = 0; turn < 2; ++turn) {
        for (std::uint8_t number = 0; number < 10; ++number) {
            const sample::SampleModel sample = ModelWithUsage(number);
            const Bytes saved = BytesToSave(sample);
            EXPECT_EQ(saved, BytesOf(sample)) << turn << ' ' << int{number};
            EXPECT_EQ(BytesToSave(ModelWithUsage(0)), BytesOf(ModelWithUsage(0)));
        }
    }
}

TEST(ModelFile, SeveralThreadsSaveAtOnce) {
    std::vector<Bytes> wanted;
    for (std::uint8_t number = 0; number < 3; ++number) {
        wanted.push_back(BytesOf(ModelWithUsage(number)));
    }
    std::vector<std::thread> threads;
    std::atomic<int> wrong{0};
    for (int i = 0; i < 4; ++i) {
        threads.emplace_back([&, i] {
            for (int turn = 0; turn < 6; ++turn) {
                const auto number = static_cast<std::uint8_t>((i + turn) % 3);
                wrong += BytesToSave(ModelWithUsage(number)) != wanted[number] ? 1 : 0;
            }
        });
    }
    for (std::thread& thread : threads) {
        thread.join();
    }
    EXPECT_EQ(wrong, 0);
}

TEST(ModelFile, ADefinitionThatIsTooLongIsToldWithItsPlace) {
    const sample::SampleModel sample = sample::WholeModel();
    auto& type =
        dynamic_cast<TypeExtendibleEnumeration&>(*sample.model->FindType(kAAFTypeID_UsageType));
    GUID id = ncfGuid("9D2C1F10-4F5A-4C77-8A01-5B1E2C3D4E80");
    for (int i = 0; i < 1200; ++i) {
        id.Data1 = static_cast<std::uint32_t>(i);
        type.AppendElement(id, (L"Usage_of_quite_a_long_name_" + std::to_wstring(i)).c_str());
    }
    const std::string whole = RefusalOf([&] { BytesOf(sample); });
    EXPECT_EQ(whole.find("MetaDictionary-1: TypeDefinitions-4{"), 0u) << whole;
    EXPECT_EQ(RefusalOf([&] { BytesToSave(sample); }), whole);
}

TEST(ModelFile, EverythingComesBackFromTheFile) {
    const sample::SampleModel sample = sample::WholeModel();
    const sample::SampleModel read = reread(BytesOf(sample));
    EXPECT_EQ(TreeOfModel(*read.model, *read.header), TreeOfModel(*sample.model, *sample.header));
}

TEST(ModelFile, TheHeaderRefersToItsDictionary) {
    const sample::SampleModel read = reread(BytesOf(sample::WholeModel()));
    EXPECT_EQ(read.header->ObjectAt(prop::Header_Dictionary), &read.model->dictionary());
    EXPECT_EQ(read.model->dictionary().owner(), read.header.get());
}

TEST(ModelFile, TheSameContentGivesTheSameBytes) {
    const sample::SampleModel sample = sample::WholeModel();
    const Bytes first = BytesOf(sample);
    EXPECT_EQ(BytesOf(sample), first);
    EXPECT_EQ(BytesOf(sample::WholeModel()), first);
    EXPECT_EQ(BytesOf(reread(first)), first);
}

TEST(ModelFile, ValuesCanBeReadAfterwards) {
    const sample::SampleModel read = reread(BytesOf(sample::WholeModel(), SectorSize::Bytes4096));
    ASSERT_EQ(read.header->ObjectAt(prop::Header_Content)->CountObjects(prop::ContentStorage_Mobs),
              3u);
    Object& file = sample::mob(*read.header, 0);
    Object& import = sample::mob(*read.header, 1);
    Object& master = sample::mob(*read.header, 2);

    aafMobID_t id{};
    ASSERT_GE(file.ReadStruct(prop::Mob_MobID, &id), 0);
    EXPECT_EQ(id.material.Data4[7], 5);
    EXPECT_EQ(master.classId(), AUID_AAFMasterMob);
    EXPECT_EQ(master.StringOr(prop::Mob_Name, L""), L"clip \xE4 \x4E2D");
    EXPECT_EQ(sample::slot(master, 1).StringOr(prop::MobSlot_SlotName, L"absent"), L"");

    Object* second = master.ObjectAt(prop::Mob_UserComments, 1);
    ASSERT_NE(second, nullptr);
    EXPECT_EQ(second->StringOr(prop::TaggedValue_Name, L"absent"), L"");
    wchar_t text[16] = {};
    ASSERT_GE(second->ReadIndirect(prop::TaggedValue_Value, text, sizeof text), 0);
    EXPECT_EQ(std::wstring(text), L"two \U0001F3AC");

    Object* timecode = sample::slot(import, 0).ObjectAt(prop::MobSlot_Segment);
    ASSERT_NE(timecode, nullptr);
    EXPECT_EQ(timecode->IntegerOr(prop::Timecode_Start, 0), 86400);
    auto* kind = dynamic_cast<Object*>(timecode->WeakTarget(prop::Component_DataDefinition));
    ASSERT_NE(kind, nullptr);
    EXPECT_EQ(kind->StringOr(prop::DefinitionObject_Name, L""), L"DataDef_Timecode");
}

TEST(ModelFile, ExtensionsAreKnownAndReadableAfterwards) {
    const sample::SampleModel read = reread(BytesOf(sample::WholeModel()));
    auto* quad = dynamic_cast<TypeRecord*>(read.model->FindType(sample::kQuadTypeId));
    ASSERT_NE(quad, nullptr);
    ASSERT_EQ(quad->members().size(), 4u);
    EXPECT_EQ(quad->members()[3].name, L"Bottom");
    EXPECT_EQ(quad->StoredSize(), 32u);

    PropertyDefinition* area = read.model->FindProperty(sample::kQuadPropertyId);
    ASSERT_NE(area, nullptr);
    EXPECT_TRUE(area->IsOptional());
    EXPECT_EQ(area->owner().id(), AUID_AAFDigitalImageDescriptor);
    Object* descriptor = sample::mob(*read.header, 0).ObjectAt(prop::SourceMob_EssenceDescription);
    Object* picture = descriptor->ObjectAt(prop::MultipleDescriptor_FileDescriptors, 0);
    PropertyValue* value = picture->FindValue(area->key());
    ASSERT_NE(value, nullptr);
    EXPECT_EQ(value->bytes()[16], 128);

    Object* own = descriptor->ObjectAt(prop::EssenceDescriptor_Locator, 1);
    EXPECT_EQ(own->classId(), sample::kOwnClassId);
    EXPECT_EQ(own->classDefinition().parent()->id(), AUID_AAFLocator);
    PropertyDefinition* place = read.model->FindProperty(sample::kOwnPropertyId);
    ASSERT_NE(place, nullptr);
    EXPECT_EQ(own->FindValue(place->key())->bytes(), Bytes(24, 3));
    EXPECT_NE(read.model->FindTarget(AUID_AAFContainerDef, sample::kOwnDefinitionId), nullptr);
}

// Another writer numbers its extensions as it likes.
TEST(ModelFile, LocalNumbersOfAnotherWriterAreTranslated) {
    StoredObject tree = [] {
        const sample::SampleModel sample = sample::WholeModel();
        return TreeOfModel(*sample.model, *sample.header);
    }();
    const StoredObject original = tree;
    const auto other = [](std::uint16_t pid) {
        return static_cast<std::uint16_t>(pid < 0x8000 ? pid : pid - 0x1000);
    };
    const std::function<void(StoredObject&)> renumber = [&](StoredObject& object) {
        for (StoredProperty& property : object.properties) {
            property.pid = other(property.pid);
            if (property.pid == meta::kLocalIdentification && property.bytes[1] >= 0x80) {
                property.bytes[1] = static_cast<std::uint8_t>(property.bytes[1] - 0x10);
            }
            for (StoredObject& contained : property.objects) {
                renumber(contained);
            }
        }
    };
    renumber(tree);
    ASSERT_NE(tree, original);
    sample::SampleModel read;
    read.model = sample::NewModel();
    read.header = ReadModel(tree, *read.model, read.notes);
    EXPECT_EQ(TreeOfModel(*read.model, *read.header), original);
}

// Some built-in properties have local numbers too.
TEST(ModelFile, BuiltInPropertiesWithLocalNumbersAreTranslated) {
    const sample::SampleModel sample = sample::WholeModel();
    Object* descriptor =
        sample::mob(*sample.header, 0).ObjectAt(prop::SourceMob_EssenceDescription);
    const RefPtr<Object> mpeg =
        sample.model->CreateObject(*sample.model->FindClass(AUID_AAFMPEGVideoDescriptor));
    ASSERT_GE(mpeg->PutInteger(prop::MPEGVideoDescriptor_BitRate, 50000000), 0);
    ASSERT_GE(descriptor->AppendObject(prop::MultipleDescriptor_FileDescriptors, mpeg->Identity()),
              0);
    const Bytes file = BytesOf(sample);
    const sample::SampleModel read = reread(file);
    descriptor = sample::mob(*read.header, 0).ObjectAt(prop::SourceMob_EssenceDescription);
    const Object* again = descriptor->ObjectAt(prop::MultipleDescriptor_FileDescriptors, 1);
    ASSERT_NE(again, nullptr);
    EXPECT_EQ(again->IntegerOr(prop::MPEGVideoDescriptor_BitRate, 0), 50000000);
    // The numbers did differ, or nothing was tried.
    EXPECT_NE(read.model->FindProperty(prop::MPEGVideoDescriptor_BitRate.id)->pid(),
              sample.model->FindProperty(prop::MPEGVideoDescriptor_BitRate.id)->pid());
    EXPECT_NE(read.model->FindProperty(sample::kQuadPropertyId), nullptr);
}

TEST(ModelFile, EssenceIsKeptAsAStream) {
    const sample::SampleModel sample = sample::WholeModel();
    const RefPtr<Object> essence =
        sample.model->CreateObject(*sample.model->FindClass(AUID_AAFEssenceData));
    ASSERT_GE(essence->PutStruct(prop::EssenceData_MobID, sample::MobId(5)), 0);
    essence->RequireValue(prop::EssenceData_Data)->BytesToChange() = Bytes(700000, 0x2E);
    Object* content = sample.header->ObjectAt(prop::Header_Content);
    ASSERT_GE(content->AddToSet(prop::ContentStorage_EssenceData, essence->Identity()), 0);
    for (SectorSize size : {SectorSize::Bytes512, SectorSize::Bytes4096}) {
        const sample::SampleModel read = reread(BytesOf(sample, size));
        const Object* again = read.header->ObjectAt(prop::Header_Content)
                                  ->ObjectAt(prop::ContentStorage_EssenceData, 0);
        ASSERT_NE(again, nullptr);
        EXPECT_EQ(again->FindValue(prop::EssenceData_Data)->bytes(), Bytes(700000, 0x2E));
    }
}

TEST(ModelFile, DefinitionsOfDataAreStoredAndThoseThatAreReferredToOrOwn) {
    const sample::SampleModel sample = sample::WholeModel();
    const StoredObject tree = TreeOfModel(*sample.model, *sample.header);
    const StoredObject& dictionary = child(child(tree, 2), prop::Header_Dictionary.pid);
    EXPECT_EQ(dictionary.Find(prop::Dictionary_DataDefinitions.pid)->objects.size(), 11u);
    EXPECT_EQ(dictionary.Find(prop::Dictionary_ContainerDefinitions.pid)->objects.size(), 2u);
    EXPECT_EQ(dictionary.Find(prop::Dictionary_OperationDefinitions.pid), nullptr);
}

// Programs that extend a file look for any of them.
TEST(ModelFile, AllDefinitionsOfDataAreStoredWhetherLookedUpOrNot) {
    for (const bool isLookedUp : {false, true}) {
        const sample::SampleModel sample = sample::EmptyModel();
        if (isLookedUp) {
            EXPECT_EQ(sample.model->dictionary().CountObjects(prop::Dictionary_DataDefinitions),
                      11u);
        }
        const StoredObject tree = ReadTree(BytesToSave(sample));
        const StoredObject& dictionary = child(child(tree, 2), prop::Header_Dictionary.pid);
        const StoredProperty& set = *dictionary.Find(prop::Dictionary_DataDefinitions.pid);
        std::size_t at = 0;
        std::vector<BuiltInDefinition> sorted(BuiltInDataDefinitions().begin(),
                                              BuiltInDataDefinitions().end());
        std::sort(sorted.begin(), sorted.end(),
                  [](const auto& a, const auto& b) { return AuidOf(a.id) < AuidOf(b.id); });
        ASSERT_EQ(set.objects.size(), sorted.size());
        for (const BuiltInDefinition& entry : sorted) {
            EXPECT_EQ(set.objects[at], StoredDataDefinition(entry)) << entry.name;
            ++at;
        }
        EXPECT_EQ(tree, ReadTree(BytesOf(sample)));
        EXPECT_EQ(StoredClasses(tree).count(L"DataDefinition"), 1u);
    }
}

TEST(ModelFile, TheMetaDictionaryHoldsWhatIsUsedAndIsClosed) {
    const sample::SampleModel sample = sample::WholeModel();
    const StoredObject tree = TreeOfModel(*sample.model, *sample.header);
    const MetaRecords records = ReadMetaDictionary(child(tree, 1));
    const std::set<std::wstring> names = StoredClasses(tree);
    for (const wchar_t* name : {L"SourceMob", L"CDCIDescriptor", L"ExampleLocator", L"Timecode",
                                L"ClassDefinition", L"TypeDefinitionRecord", L"MetaDictionary",
                                L"PropertyDefinition", L"Header", L"DataDefinition"}) {
        EXPECT_EQ(names.count(name), 1u) << ToUtf8(name);
    }
    EXPECT_EQ(names.count(L"RGBADescriptor"), 0u);
    EXPECT_EQ(names.count(L"MPEGVideoDescriptor"), 0u);

    std::set<StoredAuid> classes;
    std::set<StoredAuid> types;
    for (const MetaClass& entry : records.classes) {
        classes.insert(AuidOf(entry.id));
    }
    for (const TypeFacts& entry : records.types) {
        types.insert(AuidOf(entry.id));
    }
    for (const MetaClass& entry : records.classes) {
        EXPECT_EQ(classes.count(AuidOf(entry.parent)), 1u) << ToUtf8(entry.name);
        for (const MetaProperty& property : entry.properties) {
            EXPECT_EQ(types.count(AuidOf(property.type)), 1u) << ToUtf8(property.name);
        }
    }
    for (const TypeFacts& entry : records.types) {
        const bool isReference =
            entry.kind == TypeKind::StrongReference || entry.kind == TypeKind::WeakReference;
        if (entry.target != GUID{}) {
            EXPECT_EQ((isReference ? classes : types).count(AuidOf(entry.target)), 1u)
                << ToUtf8(entry.name);
        }
        for (const TypeMember& member : entry.members) {
            if (entry.kind == TypeKind::Record) {
                EXPECT_EQ(types.count(AuidOf(member.id)), 1u) << ToUtf8(entry.name);
            }
        }
    }
}

TEST(ModelFile, RequiredCollectionsAreStoredEmpty) {
    const sample::SampleModel sample = sample::EmptyModel();
    const StoredObject tree = TreeOfModel(*sample.model, *sample.header);
    const StoredObject& content = child(child(tree, 2), prop::Header_Content.pid);
    for (const PropertyKey& key : {prop::ContentStorage_Mobs, prop::ContentStorage_EssenceData}) {
        const StoredProperty* set = content.Find(key.pid);
        ASSERT_NE(set, nullptr);
        EXPECT_TRUE(set->objects.empty());
        EXPECT_EQ(set->keySize, 32);
    }
    EXPECT_EQ(content.Find(prop::ContentStorage_Mobs.pid)->keyPid, prop::Mob_MobID.pid);
    EXPECT_EQ(content.Find(prop::ContentStorage_EssenceData.pid)->keyPid,
              prop::EssenceData_MobID.pid);
}

TEST(ModelFile, ASlotWithoutSegmentIsRefused) {
    const sample::SampleModel sample = sample::WholeModel();
    Object& slot = sample::slot(sample::mob(*sample.header, 0), 0);
    ASSERT_GE(slot.RemoveValue(prop::MobSlot_Segment), 0);
    EXPECT_EQ(WritingRefusal(sample), "Content: Mobs: Slots: TimelineMobSlot has no Segment");
}

TEST(ModelFile, ASourceMobWithoutDescriptorIsRefused) {
    const sample::SampleModel sample = sample::WholeModel();
    ASSERT_GE(sample::mob(*sample.header, 0).RemoveValue(prop::SourceMob_EssenceDescription), 0);
    EXPECT_EQ(WritingRefusal(sample), "Content: Mobs: SourceMob has no EssenceDescription");
}

TEST(ModelFile, ADefinitionThatTheDictionaryLacksIsRefused) {
    const sample::SampleModel sample = sample::WholeModel();
    Object& import = sample::mob(*sample.header, 1);
    Object* timecode = sample::slot(import, 0).ObjectAt(prop::MobSlot_Segment);
    timecode->FindValue(prop::Component_DataDefinition)->BytesToChange()[0] ^= 0xFF;
    EXPECT_EQ(WritingRefusal(sample),
              "a definition that is referred to is not in the dictionary (property 2605)");
}

TEST(ModelFile, ABuiltInDefinitionThatNobodyLookedUpIsStoredWhereItIsReferredTo) {
    const sample::SampleModel sample = sample::WholeModel();
    Object& import = sample::mob(*sample.header, 1);
    Object* timecode = sample::slot(import, 0).ObjectAt(prop::MobSlot_Segment);
    Bytes& target = timecode->FindValue(prop::Component_DataDefinition)->BytesToChange();
    const StoredAuid edgecode = AuidOf(kAAFDataDef_Edgecode);
    target.assign(edgecode.begin(), edgecode.end());
    EXPECT_EQ(WritingRefusal(sample), "");
    const StoredObject tree = TreeOfModel(*sample.model, *sample.header);
    const StoredObject& dictionary = child(child(tree, 2), prop::Header_Dictionary.pid);
    const std::vector<Bytes>& keys = dictionary.Find(prop::Dictionary_DataDefinitions.pid)->keys;
    EXPECT_EQ(std::count(keys.begin(), keys.end(), target), 1);
}

TEST(ModelFile, AFileKeepsWhatItSaysOfABuiltInDefinition) {
    const sample::SampleModel sample = sample::WholeModel();
    auto* picture =
        dynamic_cast<Object*>(sample.model->FindTarget(AUID_AAFDataDef, kAAFDataDef_Picture));
    ASSERT_GE(picture->PutString(prop::DefinitionObject_Description, L"moving"), 0);
    const sample::SampleModel read = reread(BytesOf(sample));
    auto* again =
        dynamic_cast<Object*>(read.model->FindTarget(AUID_AAFDataDef, kAAFDataDef_Picture));
    EXPECT_EQ(again->StringOr(prop::DefinitionObject_Description, L""), L"moving");
    EXPECT_EQ(read.model->dictionary().CountObjects(prop::Dictionary_DataDefinitions), 11u);
}

TEST(ModelFile, SavesAndLoadsByPathAndNamesThePathInErrors) {
    const TestFolder folder;
    const sample::SampleModel sample = sample::WholeModel();
    for (SectorSize size : {SectorSize::Bytes512, SectorSize::Bytes4096}) {
        const FileResult saved = SaveModel(*sample.model, *sample.header, folder / "a.aaf", size);
        ASSERT_TRUE(saved) << saved.message;
        const RefPtr<Model> model = sample::NewModel();
        RefPtr<Object> header;
        const FileResult loaded = LoadModel(folder / "a.aaf", *model, header);
        ASSERT_TRUE(loaded) << loaded.message;
        ASSERT_TRUE(header);
    }
    ASSERT_GE(sample::mob(*sample.header, 0).RemoveValue(prop::SourceMob_EssenceDescription), 0);
    const FileResult refused =
        SaveModel(*sample.model, *sample.header, folder / "b.aaf", SectorSize::Bytes512);
    EXPECT_EQ(refused.failure, FileFailure::NotStorable);
    EXPECT_EQ(refused.message, (folder / "b.aaf").u8string() +
                                   ": Content: Mobs: SourceMob has no EssenceDescription");
    EXPECT_FALSE(fs::exists(folder / "b.aaf"));

    const RefPtr<Model> model = sample::NewModel();
    RefPtr<Object> header;
    EXPECT_EQ(LoadModel(folder / "absent.aaf", *model, header).failure, FileFailure::NotThere);
    EXPECT_FALSE(header);
}

namespace {

// Changes what a stored file says of a definition in one of the sets of its meta-dictionary.
StoredObject& definition(StoredObject& root, std::uint16_t set, const GUID& id) {
    for (StoredProperty& property : root.properties.at(0).objects.at(0).properties) {
        if (property.pid != set) {
            continue;
        }
        const StoredAuid key = AuidOf(id);
        for (std::size_t i = 0; i < property.keys.size(); ++i) {
            if (std::equal(key.begin(), key.end(), property.keys[i].begin())) {
                return property.objects[i];
            }
        }
    }
    throw std::logic_error("no such definition");
}

StoredProperty& changed(StoredObject& object, std::uint16_t pid) {
    for (StoredProperty& property : object.properties) {
        if (property.pid == pid) {
            return property;
        }
    }
    throw std::logic_error("no such property");
}

void AppendName(Bytes& names, const std::u16string& name) {
    for (char16_t unit : name + u'\0') {
        names.push_back(static_cast<std::uint8_t>(unit));
        names.push_back(static_cast<std::uint8_t>(unit >> 8));
    }
}

Bytes StoredNameOf(const std::u16string& name) {
    Bytes bytes;
    AppendName(bytes, name);
    return bytes;
}

sample::SampleModel fromTree(const StoredObject& tree) {
    sample::SampleModel sample;
    sample.model = sample::NewModel();
    sample.header = ReadModel(tree, *sample.model, sample.notes);
    return sample;
}

}  // namespace

// Most programs store the parameters of an effect so, whatever their type says.
TEST(ModelFile, AVectorTakesASetOfObjects) {
    const sample::SampleModel sample = sample::WholeModel();
    const StoredObject original = TreeOfModel(*sample.model, *sample.header);
    StoredObject tree = original;
    std::size_t found = 0;
    const std::function<void(StoredObject&)> change = [&](StoredObject& object) {
        for (StoredProperty& property : object.properties) {
            for (StoredObject& contained : property.objects) {
                change(contained);
            }
            if (property.form == StoredForm::StrongVector && !property.objects.empty()) {
                ++found;
                property.form = StoredForm::StrongSet;
                property.keyPid = 0x4C01;
                for (std::size_t i = 0; i < property.objects.size(); ++i) {
                    property.keys.emplace_back(16, static_cast<std::uint8_t>(i));
                }
            }
        }
    };
    change(tree);
    EXPECT_GT(found, 5u);
    const sample::SampleModel read = fromTree(tree);
    EXPECT_EQ(read.notes, std::vector<std::string>());
    EXPECT_EQ(TreeOfModel(*read.model, *read.header), original);
}

TEST(ModelFile, ParametersAreStoredAsASetOfTheirDefinitions) {
    const auto parametersOf = [](std::vector<GUID> definitions) {
        const sample::SampleModel sample = sample::WholeModel();
        const auto make = [&](const GUID& classId) {
            return sample.model->CreateObject(*sample.model->FindClass(classId));
        };
        const RefPtr<Object> group = make(AUID_AAFOperationGroup);
        for (const GUID& id : definitions) {
            const RefPtr<Object> parameter = make(AUID_AAFConstantValue);
            if (!(id == GUID{})) {
                EXPECT_GE(parameter->PutStruct(prop::Parameter_Definition, id), 0);
            }
            EXPECT_GE(group->AppendObject(prop::OperationGroup_Parameters, parameter->Identity()),
                      0);
        }
        Object& slot = sample::slot(sample::mob(*sample.header, 2), 0);
        EXPECT_GE(slot.PutObject(prop::MobSlot_Segment, group->Identity()), 0);
        const sample::SampleModel read = reread(BytesOf(sample));
        EXPECT_EQ(read.notes, std::vector<std::string>());
        Object* again =
            sample::slot(sample::mob(*read.header, 2), 0).ObjectAt(prop::MobSlot_Segment);
        EXPECT_EQ(again->CountObjects(prop::OperationGroup_Parameters), definitions.size());
        const StoredObject tree = TreeOfModel(*read.model, *read.header);
        const StoredObject& content = child(child(tree, 2), prop::Header_Content.pid);
        const StoredObject& stored =
            child(child(child(content, prop::ContentStorage_Mobs.pid, 2), prop::Mob_Slots.pid),
                  prop::MobSlot_Segment.pid);
        return *stored.Find(prop::OperationGroup_Parameters.pid);
    };
    const StoredProperty set = parametersOf({sample::kQuadTypeId, sample::kOwnClassId});
    EXPECT_EQ(set.form, StoredForm::StrongSet);
    EXPECT_EQ(set.keyPid, prop::Parameter_Definition.pid);
    EXPECT_EQ(set.keys.size(), 2u);
    EXPECT_EQ(parametersOf({sample::kQuadTypeId, sample::kQuadTypeId}).form,
              StoredForm::StrongVector);
    EXPECT_EQ(parametersOf({sample::kQuadTypeId, GUID{}}).form, StoredForm::StrongVector);
}

TEST(ModelFile, AFilesOwnNamesOfTypesCount) {
    const sample::SampleModel sample = sample::WholeModel();
    StoredObject tree = TreeOfModel(*sample.model, *sample.header);
    changed(definition(tree, meta::kTypeDefinitions, kAAFTypeID_Int64), meta::kName).bytes =
        StoredNameOf(u"Int64");
    const sample::SampleModel read = fromTree(tree);
    EXPECT_EQ(read.notes, std::vector<std::string>());
    EXPECT_EQ(read.model->FindType(kAAFTypeID_Int64)->name(), L"Int64");
    EXPECT_EQ(BytesOf(read), WriteTree(tree, SectorSize::Bytes512));
    EXPECT_EQ(reread(BytesToSave(read)).model->FindType(kAAFTypeID_Int64)->name(), L"Int64");
    EXPECT_NE(sample::NewModel()->FindType(kAAFTypeID_Int64)->name(), L"Int64");
}

TEST(ModelFile, AFilesOwnMembersOfEnumerationsCount) {
    const sample::SampleModel sample = sample::WholeModel();
    StoredObject tree = TreeOfModel(*sample.model, *sample.header);
    StoredObject& release = definition(tree, meta::kTypeDefinitions, kAAFTypeID_ProductReleaseType);
    StoredProperty& names = changed(release, meta::kEnumerationNames);
    StoredProperty& values = changed(release, meta::kEnumerationValues);
    AppendName(names.bytes, u"VersionRumoured");
    values.bytes.insert(values.bytes.end(), {9, 0, 0, 0, 0, 0, 0, 0});
    StoredObject& usage = definition(tree, meta::kTypeDefinitions, kAAFTypeID_UsageType);
    AppendName(changed(usage, meta::kExtendibleNames).bytes, u"Usage_Other");
    const StoredAuid other = AuidOf(sample::kOwnPropertyId);
    Bytes& ids = changed(usage, meta::kExtendibleValues).bytes;
    ids.insert(ids.end(), other.begin(), other.end());

    const sample::SampleModel read = fromTree(tree);
    EXPECT_EQ(read.notes, std::vector<std::string>());
    aafCharacter text[40] = {};
    auto& enumeration =
        dynamic_cast<IAAFTypeDefEnum&>(*read.model->FindType(kAAFTypeID_ProductReleaseType));
    EXPECT_GE(enumeration.GetNameFromInteger(9, text, sizeof text), 0);
    EXPECT_EQ(std::wstring(text), L"VersionRumoured");
    EXPECT_GE(enumeration.GetNameFromInteger(4, text, sizeof text), 0);
    EXPECT_EQ(std::wstring(text), L"VersionBeta");
    auto& extendible =
        dynamic_cast<IAAFTypeDefExtEnum&>(*read.model->FindType(kAAFTypeID_UsageType));
    EXPECT_GE(extendible.GetNameFromAUID(sample::kOwnPropertyId, text, sizeof text), 0);
    EXPECT_EQ(std::wstring(text), L"Usage_Other");
    EXPECT_EQ(BytesOf(read), WriteTree(tree, SectorSize::Bytes512));
    EXPECT_EQ(BytesToSave(read), WriteTree(tree, SectorSize::Bytes512));
}

TEST(ModelFile, WhatAFileRenamesCounts) {
    const sample::SampleModel sample = sample::WholeModel();
    StoredObject tree = TreeOfModel(*sample.model, *sample.header);
    StoredObject& position = definition(tree, meta::kTypeDefinitions, kAAFTypeID_PositionType);
    const StoredAuid shorter = AuidOf(kAAFTypeID_Int32);
    changed(position, meta::kRenamedType).keys.at(0) = Bytes(shorter.begin(), shorter.end());
    const sample::SampleModel read = fromTree(tree);
    EXPECT_EQ(read.model->FindType(kAAFTypeID_PositionType)->StoredSize(), 4u);
    // What the file has of the longer kind no longer fits, and stays.
    EXPECT_FALSE(read.notes.empty());
    const StoredObject again = TreeOfModel(*read.model, *read.header);
    EXPECT_EQ(child(again, 2), child(tree, 2));

    changed(position, meta::kRenamedType).keys.at(0)[0] ^= 0xFF;
    EXPECT_EQ(fromTree(tree).model->FindType(kAAFTypeID_PositionType)->StoredSize(), 8u);
}
