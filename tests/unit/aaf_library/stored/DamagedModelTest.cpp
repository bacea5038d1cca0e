// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/model/ClassDefinition.h"
#include "aaf_library/stored/MetaKinds.h"
#include "aaf_library/stored/MetaPids.h"
#include "aaf_library/stored/MetaRecords.h"
#include "aaf_library/stored/ModelReader.h"
#include "aaf_library/stored/ModelWriter.h"
#include "aaf_library/stored/StoredError.h"
#include "aaf_library/stored/TreeReader.h"
#include "aaf_library/stored/TreeWriter.h"
#include "host_interfaces/aaf/AAFClassIds.h"
#include "host_interfaces/aaf/AAFDefinitionIds.h"
#include "host_interfaces/aaf/AAFTypeIds.h"
#include "tests/unit/aaf_library/stored/Refusal.h"
#include "tests/unit/aaf_library/stored/SampleModel.h"

#include <gtest/gtest.h>
#include <algorithm>
#include <functional>
#include <random>

using namespace aaf;
using namespace aaf::stored;

namespace {

StoredObject SampleTree() {
    const sample::SampleModel sample = sample::WholeModel();
    return TreeOfModel(*sample.model, *sample.header);
}

std::string ModelRefusal(const StoredObject& tree) {
    const RefPtr<Model> model = sample::NewModel();
    std::vector<std::string> notes;
    return RefusalOf([&] { ReadModel(tree, *model, notes); });
}

StoredProperty& property(StoredObject& object, std::uint16_t pid) {
    for (StoredProperty& entry : object.properties) {
        if (entry.pid == pid) {
            return entry;
        }
    }
    throw std::logic_error("no such property");
}

StoredObject& header(StoredObject& tree) {
    return property(tree, 2).objects.front();
}

StoredProperty& mobs(StoredObject& tree) {
    return property(property(header(tree), prop::Header_Content.pid).objects.front(),
                    prop::ContentStorage_Mobs.pid);
}

StoredObject& FirstSlot(StoredObject& tree) {
    return property(mobs(tree).objects.front(), prop::Mob_Slots.pid).objects.front();
}

StoredProperty& types(StoredObject& tree) {
    return property(property(tree, 1).objects.front(), meta::kTypeDefinitions);
}

StoredObject& dictionary(StoredObject& tree) {
    return property(header(tree), prop::Header_Dictionary.pid).objects.front();
}

void Erase(StoredObject& object, std::uint16_t pid) {
    auto& all = object.properties;
    all.erase(std::remove_if(all.begin(), all.end(),
                             [pid](const StoredProperty& entry) { return entry.pid == pid; }),
              all.end());
}

using Notes = std::vector<std::string>;

sample::SampleModel read(const StoredObject& tree) {
    sample::SampleModel sample;
    sample.model = sample::NewModel();
    sample.header = ReadModel(tree, *sample.model, sample.notes);
    return sample;
}

// The place of an element in a set.
std::size_t IndexOf(const StoredProperty& set, const GUID& id) {
    const StoredAuid stored = AuidOf(id);
    const Bytes key(stored.begin(), stored.end());
    const auto at = std::find(set.keys.begin(), set.keys.end(), key);
    if (at == set.keys.end()) {
        throw std::logic_error("no such element");
    }
    return static_cast<std::size_t>(at - set.keys.begin());
}

// The tree as it is after a reader and a writer of objects have had it.
StoredObject passed(const StoredObject& tree) {
    const sample::SampleModel sample = read(tree);
    StoredObject again = TreeOfModel(*sample.model, *sample.header);
    // Through bytes, as a file would go.
    return ReadTree(WriteTree(again, SectorSize::Bytes512));
}

// The value that callers get of a property that was kept.
PropertyValue& shown(Object& object, const PropertyKey& key) {
    PropertyValue* const found = object.values().Find(key.pid);
    if (found == nullptr) {
        throw std::logic_error("no such value");
    }
    return *found;
}

bool IsDefined(PropertyValue& value) {
    aafBoolean_t defined = kAAFTrue;
    EXPECT_GE(value.IsDefinedType(&defined), 0);
    return defined == kAAFTrue;
}

}  // namespace

TEST(DamagedModel, TheSampleItselfIsRead) {
    EXPECT_EQ(read(SampleTree()).notes, Notes());
}

TEST(DamagedModel, WithoutItsMainPartsIsRefused) {
    EXPECT_EQ(ModelRefusal(StoredObject()), "has no meta-dictionary");
    StoredObject tree = SampleTree();
    property(tree, 2).pid = 7;
    EXPECT_EQ(ModelRefusal(tree), "has no header");
    tree = SampleTree();
    property(header(tree), prop::Header_Dictionary.pid).pid = 0x7001;
    EXPECT_EQ(ModelRefusal(tree), "has no dictionary");
    tree = SampleTree();
    property(header(tree), prop::Header_Content.pid).pid = 0x7001;
    EXPECT_EQ(ModelRefusal(tree), "has no content");
}

TEST(DamagedModel, WithAHeaderOfAnotherClassIsRefused) {
    StoredObject tree = SampleTree();
    header(tree).classId = AuidOf(AUID_AAFFiller);
    EXPECT_EQ(ModelRefusal(tree), "an object of the class Filler in a place for others");
}

TEST(DamagedModel, AnObjectThatDoesNotFitIsKeptWithAllThatStandsBesideIt) {
    const StoredAuid changed = AuidOf(ncfGuid("9D2C1F10-4F5A-4C77-8A01-5B1E2C3D4EFF"));
    const std::pair<StoredAuid, std::string> others[] = {
        {changed, "an object of a class that is not defined"},
        {AuidOf(AUID_AAFFiller), "an object of the class Filler in a place for others"},
        {AuidOf(AUID_AAFClassDef), "an object of a class that is not defined"},
    };
    for (const auto& [classId, problem] : others) {
        StoredObject tree = SampleTree();
        FirstSlot(tree).classId = classId;
        const sample::SampleModel sample = read(tree);
        EXPECT_EQ(sample.notes,
                  Notes{"Content: Mobs: Slots: " + problem + "; it is kept as it stands"});
        Object& mob = sample::mob(*sample.header, 0);
        EXPECT_EQ(mob.CountObjects(prop::Mob_Slots), 0u);
        EXPECT_FALSE(IsDefined(shown(mob, prop::Mob_Slots)));
        StoredObject again = passed(tree);
        EXPECT_EQ(property(mobs(again).objects.front(), prop::Mob_Slots.pid),
                  property(mobs(tree).objects.front(), prop::Mob_Slots.pid));
        StoredObject before = ReadTree(WriteTree(tree, SectorSize::Bytes512));
        EXPECT_EQ(mobs(again), mobs(before));
    }
}

TEST(DamagedModel, AValueOfTheWrongSizeIsKeptAsItStands) {
    StoredObject tree = SampleTree();
    property(FirstSlot(tree), prop::TimelineMobSlot_EditRate.pid).bytes.pop_back();
    property(FirstSlot(tree), prop::MobSlot_SlotName.pid).bytes = {'a', 0, 'b'};
    const sample::SampleModel sample = read(tree);
    EXPECT_EQ(sample.notes, (Notes{"Content: Mobs: Slots: SlotName: 3 bytes are no value of its "
                                   "type; it is kept as it stands",
                                   "Content: Mobs: Slots: EditRate: 7 bytes are no value of its "
                                   "type; it is kept as it stands"}));
    Object& slot = sample::slot(sample::mob(*sample.header, 0), 0);
    aafRational_t rate{};
    EXPECT_EQ(slot.ReadStruct(prop::TimelineMobSlot_EditRate, &rate), AAFRESULT_PROP_NOT_PRESENT);
    PropertyValue& value = shown(slot, prop::MobSlot_SlotName);
    EXPECT_FALSE(IsDefined(value));
    EXPECT_EQ(value.bytes(), (Bytes{'a', 0, 'b'}));
    EXPECT_EQ(value.type().id(), kAAFTypeID_UInt8Array);
    EXPECT_EQ(passed(tree), ReadTree(WriteTree(tree, SectorSize::Bytes512)));
    // Whoever sets the property has it.
    EXPECT_GE(slot.PutString(prop::MobSlot_SlotName, L"new"), 0);
    EXPECT_EQ(slot.StringOr(prop::MobSlot_SlotName, L""), L"new");
    EXPECT_TRUE(IsDefined(shown(slot, prop::MobSlot_SlotName)));
}

TEST(DamagedModel, AValueInAnotherFormIsKeptAsItStands) {
    for (const StoredForm form : {StoredForm::Stream, StoredForm(0x40), StoredForm(0x86)}) {
        StoredObject tree = SampleTree();
        StoredProperty& name = property(FirstSlot(tree), prop::MobSlot_SlotName.pid);
        name.form = form;
        name.name = form == StoredForm::Stream ? u"SlotName" : u"";
        const sample::SampleModel sample = read(tree);
        EXPECT_EQ(sample.notes, Notes{"Content: Mobs: Slots: SlotName: is stored in another form "
                                      "than its type has; it is kept as it stands"});
        EXPECT_EQ(passed(tree), ReadTree(WriteTree(tree, SectorSize::Bytes512)));
    }
}

// Objects of the file's own classes, with the file's own numbers, where a text should be.
TEST(DamagedModel, ObjectsInThePlaceOfAValueAreKept) {
    StoredObject tree = SampleTree();
    StoredObject& descriptor =
        property(mobs(tree).objects.front(), prop::SourceMob_EssenceDescription.pid)
            .objects.front();
    const StoredProperty* locators = descriptor.Find(prop::EssenceDescriptor_Locator.pid);
    ASSERT_NE(locators, nullptr);
    StoredProperty odd = *locators;
    odd.pid = prop::MobSlot_SlotName.pid;
    odd.name = u"SlotName";
    property(FirstSlot(tree), prop::MobSlot_SlotName.pid) = odd;
    const StoredObject before = ReadTree(WriteTree(tree, SectorSize::Bytes512));
    const auto other = [](std::uint16_t pid) {
        return static_cast<std::uint16_t>(pid < 0x8000 ? pid : pid - 0x1000);
    };
    const std::function<void(StoredObject&)> renumber = [&](StoredObject& object) {
        for (StoredProperty& entry : object.properties) {
            entry.pid = other(entry.pid);
            if (entry.pid == meta::kLocalIdentification && entry.bytes[1] >= 0x80) {
                entry.bytes[1] = static_cast<std::uint8_t>(entry.bytes[1] - 0x10);
            }
            for (StoredObject& contained : entry.objects) {
                renumber(contained);
            }
        }
    };
    renumber(tree);
    EXPECT_EQ(passed(tree), before);
}

TEST(DamagedModel, AWeakReferenceToNothingIsKeptAsItStands) {
    StoredObject tree = SampleTree();
    StoredObject& segment = property(FirstSlot(tree), prop::MobSlot_Segment.pid).objects.front();
    property(segment, prop::Component_DataDefinition.pid).keys.front()[0] ^= 0xFF;
    const sample::SampleModel sample = read(tree);
    EXPECT_EQ(sample.notes,
              Notes{"Content: Mobs: Slots: Segment: DataDefinition: a weak reference to what the "
                    "file does not have; it is kept as it stands"});
    StoredObject again = passed(tree);
    EXPECT_EQ(property(FirstSlot(again), prop::MobSlot_Segment.pid),
              property(FirstSlot(tree), prop::MobSlot_Segment.pid));
}

TEST(DamagedModel, AnElementsOwnKeyCounts) {
    StoredObject tree = SampleTree();
    const StoredObject before = ReadTree(WriteTree(tree, SectorSize::Bytes512));
    mobs(tree).keys.front()[31] ^= 0xFF;
    EXPECT_EQ(read(tree).notes, Notes{"Content: Mobs: an element whose key differs from that in "
                                      "the index; its own counts"});
    EXPECT_EQ(passed(tree), before);
}

TEST(DamagedModel, TheKeyInTheIndexCountsForAnElementWithout) {
    StoredObject tree = SampleTree();
    const StoredObject before = ReadTree(WriteTree(tree, SectorSize::Bytes512));
    StoredObject& mob = mobs(tree).objects.front();
    mob.properties.erase(
        std::find_if(mob.properties.begin(), mob.properties.end(),
                     [](const StoredProperty& at) { return at.pid == prop::Mob_MobID.pid; }));
    EXPECT_EQ(read(tree).notes,
              Notes{"Content: Mobs: an element without a key; that in the index counts"});
    EXPECT_EQ(passed(tree), before);
}

TEST(DamagedModel, TwoElementsOfOneKeyAreKeptAsTheyStand) {
    StoredObject tree = SampleTree();
    StoredProperty& set = mobs(tree);
    property(set.objects[1], prop::Mob_MobID.pid).bytes = set.keys[0];
    const sample::SampleModel sample = read(tree);
    EXPECT_EQ(sample.notes.back(),
              "Content: Mobs: two elements have one key; it is kept as it stands");
    StoredObject again = passed(tree);
    EXPECT_EQ(mobs(again).objects, set.objects);
    EXPECT_EQ(mobs(again).keys, set.keys);
}

TEST(DamagedModel, ADefinitionThatDoesNotFitIsLeftOutAlone) {
    StoredObject tree = SampleTree();
    StoredObject& dictionary = property(header(tree), prop::Header_Dictionary.pid).objects.front();
    StoredProperty& containers = property(dictionary, prop::Dictionary_ContainerDefinitions.pid);
    const std::size_t own = IndexOf(containers, sample::kOwnDefinitionId);
    containers.objects.at(own).classId = AuidOf(AUID_AAFFiller);
    const sample::SampleModel sample = read(tree);
    ASSERT_FALSE(sample.notes.empty());
    EXPECT_EQ(sample.notes.front(),
              "ContainerDefinitions: an object of the class Filler in a "
              "place for others; it is left out");
    EXPECT_EQ(sample.model->FindTarget(AUID_AAFContainerDef, sample::kOwnDefinitionId), nullptr);
}

TEST(DamagedModel, AValueThatNothingDescribesIsLeftOut) {
    StoredObject tree = SampleTree();
    const StoredObject before = ReadTree(WriteTree(tree, SectorSize::Bytes512));
    StoredProperty odd;
    odd.pid = 0x9000;
    odd.bytes = {1, 2, 3};
    FirstSlot(tree).properties.push_back(odd);
    EXPECT_EQ(read(tree).notes, Notes{"Content: Mobs: Slots: TimelineMobSlot: property 9000 is "
                                      "defined nowhere; it is left out"});
    EXPECT_EQ(passed(tree), before);
}

TEST(DamagedModel, APropertyThatComesTwiceCountsOnce) {
    StoredObject tree = SampleTree();
    const StoredObject before = ReadTree(WriteTree(tree, SectorSize::Bytes512));
    StoredProperty twice = property(FirstSlot(tree), prop::MobSlot_SlotID.pid);
    twice.problem = "occurs twice";
    FirstSlot(tree).properties.push_back(twice);
    EXPECT_EQ(read(tree).notes,
              Notes{"Content: Mobs: Slots: SlotID: occurs twice; it is left out"});
    EXPECT_EQ(passed(tree), before);
}

TEST(DamagedModel, NotesOfOneFileAreLimited) {
    StoredObject tree = SampleTree();
    for (std::uint16_t i = 0; i < 150; ++i) {
        StoredProperty odd;
        odd.pid = static_cast<std::uint16_t>(0x9000 + i);
        odd.bytes = {1};
        FirstSlot(tree).properties.push_back(odd);
    }
    const Notes notes = read(tree).notes;
    ASSERT_EQ(notes.size(), 101u);
    EXPECT_EQ(notes.back(), "and 50 more of the kind");
}

// One definition that makes no sense costs no more than itself.
TEST(DamagedModel, ADefinitionWithoutANameIsLeftOut) {
    StoredObject tree = SampleTree();
    const auto erase = [](StoredProperty& set, const GUID& id, std::uint16_t pid) {
        StoredObject& object = set.objects.at(IndexOf(set, id));
        object.properties.erase(
            std::find_if(object.properties.begin(), object.properties.end(),
                         [pid](const StoredProperty& at) { return at.pid == pid; }));
    };
    erase(types(tree), kAAFTypeID_Rational, meta::kName);
    erase(property(property(tree, 1).objects.front(), meta::kClassDefinitions),
          AUID_AAFTimelineMobSlot, meta::kName);
    const sample::SampleModel sample = read(tree);
    EXPECT_EQ(sample.notes,
              (Notes{"meta-dictionary: a class is left out: property 0006 is missing",
                     "meta-dictionary: a type is left out: property 0006 is missing"}));
}

TEST(DamagedModel, APropertyWithoutATypeIsTakenAsBytes) {
    StoredObject tree = SampleTree();
    StoredProperty& set = types(tree);
    const auto at = static_cast<std::ptrdiff_t>(IndexOf(set, sample::kQuadTypeId));
    set.objects.erase(set.objects.begin() + at);
    set.keys.erase(set.keys.begin() + at);
    const sample::SampleModel sample = read(tree);
    ASSERT_EQ(sample.notes.size(), 1u);
    EXPECT_NE(sample.notes[0].find("has no type and is taken as bytes"), std::string::npos);
    const PropertyDefinition* area = sample.model->FindProperty(sample::kQuadPropertyId);
    ASSERT_NE(area, nullptr);
    EXPECT_EQ(area->typeId(), kAAFTypeID_UInt8Array);
    Object* descriptor =
        sample::mob(*sample.header, 0).ObjectAt(prop::SourceMob_EssenceDescription);
    Object* picture = descriptor->ObjectAt(prop::MultipleDescriptor_FileDescriptors, 0);
    EXPECT_EQ(picture->FindValue(area->key())->bytes().size(), 32u);
    EXPECT_NO_THROW(passed(tree));
}

TEST(DamagedModel, TypesThatAreMadeOfThemselvesAreLeftOut) {
    StoredObject tree = SampleTree();
    MetaRecords records;
    for (std::uint8_t i = 0; i < 3; ++i) {
        TypeFacts type;
        type.id = ncfGuid("11111111-0000-0000-0000-000000000000");
        type.id.Data4[7] = i;
        type.name = L"Circle";
        type.kind = TypeKind::Rename;
        type.target = type.id;
        type.target.Data4[7] = static_cast<std::uint8_t>((i + 1) % 3);
        records.types.push_back(type);
    }
    const StoredObject circle = StoredMetaDictionary(records);
    const StoredProperty& added = *circle.Find(meta::kTypeDefinitions);
    StoredProperty& set = types(tree);
    set.objects.insert(set.objects.end(), added.objects.begin(), added.objects.end());
    set.keys.insert(set.keys.end(), added.keys.begin(), added.keys.end());
    EXPECT_EQ(ModelRefusal(tree), "");
}

TEST(DamagedModel, ALongLineOfTypesIsRefused) {
    StoredObject tree = SampleTree();
    MetaRecords records;
    for (std::uint32_t i = 0; i < 5000; ++i) {
        TypeFacts type;
        type.id = ncfGuid("11111111-0000-0000-0000-000000000000");
        type.id.Data1 = 0x20000000 + i;
        type.name = L"Line";
        type.kind = TypeKind::Rename;
        type.target = type.id;
        ++type.target.Data1;
        records.types.push_back(type);
    }
    const StoredObject line = StoredMetaDictionary(records);
    const StoredProperty& added = *line.Find(meta::kTypeDefinitions);
    StoredProperty& set = types(tree);
    set.objects.insert(set.objects.end(), added.objects.begin(), added.objects.end());
    set.keys.insert(set.keys.end(), added.keys.begin(), added.keys.end());
    EXPECT_EQ(ModelRefusal(tree), "definitions that are made of one another without end");
}

TEST(DamagedModel, AnArrayTypeLargerThanAnyValueIsLeftOut) {
    MetaRecords records;
    TypeFacts type;
    type.id = ncfGuid("11111111-0000-0000-0000-000000000000");
    type.name = L"Huge";
    type.kind = TypeKind::FixedArray;
    type.target = ncfGuid("01010300-0000-0000-060E-2B3401040101");
    type.size = 0xFFFFFFFF;
    records.types.push_back(type);
    StoredObject tree = SampleTree();
    const StoredObject huge = StoredMetaDictionary(records);
    StoredProperty& set = types(tree);
    set.objects.push_back(huge.Find(meta::kTypeDefinitions)->objects.front());
    set.keys.push_back(huge.Find(meta::kTypeDefinitions)->keys.front());
    const sample::SampleModel model = read(tree);
    EXPECT_EQ(model.model->FindType(type.id), nullptr);
    EXPECT_EQ(model.notes, Notes{"the type Huge makes no sense and is left out"});
}

// Odd references within definitions name built-in ones that nobody has looked up: those join the
// sets that are being written.
TEST(DamagedModel, WhatADefinitionRefersToIsMadeWhenItIsWritten) {
    StoredObject tree = SampleTree();
    StoredProperty odd;
    odd.pid = prop::DefinitionObject_Description.pid;
    odd.form = StoredForm::WeakReference;
    odd.targetPath = {meta::kRootHeader, prop::Header_Dictionary.pid,
                      prop::Dictionary_DataDefinitions.pid};
    odd.keyPid = prop::DefinitionObject_Identification.pid;
    const StoredAuid edgecode = AuidOf(kAAFDataDef_Edgecode);
    odd.keys = {Bytes(edgecode.begin(), edgecode.end())};
    StoredProperty& containers =
        property(dictionary(tree), prop::Dictionary_ContainerDefinitions.pid);
    StoredObject& own = containers.objects.at(IndexOf(containers, sample::kOwnDefinitionId));
    Erase(own, odd.pid);
    own.properties.push_back(odd);
    Erase(dictionary(tree), prop::Dictionary_DataDefinitions.pid);
    StoredProperty& set = mobs(tree);
    set.objects.clear();
    set.keys.clear();
    set.localKeys.clear();

    const sample::SampleModel sample = read(tree);
    // As many sets as one more makes move.
    for (const GUID& classId : {AUID_AAFInterpolationDefinition, AUID_AAFKLVDataDefinition,
                                AUID_AAFTaggedValueDefinition}) {
        const RefPtr<Object> more = sample.model->CreateObject(*sample.model->FindClass(classId));
        ASSERT_GE(more->PutStruct(prop::DefinitionObject_Identification, sample::kOwnClassId), 0);
        ASSERT_GE(more->PutString(prop::DefinitionObject_Name, L"More"), 0);
        ASSERT_GE(sample.model->dictionary().AddDefinition(classId, more.get()), 0);
    }
    ASSERT_EQ(sample.model->dictionary().MadeValues().size(), 4u);
    StoredObject saved =
        ReadTree(WriteTree(TreeOfModel(*sample.model, *sample.header), SectorSize::Bytes512));
    StoredProperty& again = property(dictionary(saved), prop::Dictionary_ContainerDefinitions.pid);
    StoredObject& ownAgain = again.objects.at(IndexOf(again, sample::kOwnDefinitionId));
    EXPECT_EQ(property(ownAgain, odd.pid).keys, odd.keys);
    // Each set that is there, and the one that came in between.
    EXPECT_EQ(sample.model->dictionary().MadeValues().size(), 5u);
}

TEST(DamagedModel, AVectorOfDefinitionsIsReadAsASet) {
    StoredObject tree = SampleTree();
    const StoredObject before = ReadTree(WriteTree(tree, SectorSize::Bytes512));
    for (const PropertyKey& key :
         {prop::Dictionary_DataDefinitions, prop::Dictionary_ContainerDefinitions}) {
        StoredProperty& set = property(dictionary(tree), key.pid);
        set.form = StoredForm::StrongVector;
        set.keys.clear();
        set.localKeys.clear();
    }
    EXPECT_EQ(read(tree).notes, Notes());
    EXPECT_EQ(passed(tree), before);
    StoredProperty& containers =
        property(dictionary(tree), prop::Dictionary_ContainerDefinitions.pid);
    containers.objects.push_back(containers.objects.front());
    Erase(containers.objects.back(), prop::DefinitionObject_Identification.pid);
    EXPECT_EQ(read(tree).notes,
              Notes{"ContainerDefinitions: a definition without a key; it is left out"});
    EXPECT_EQ(passed(tree), before);
}

// Built-in ones come into being in their place, so nothing else can be kept there.
TEST(DamagedModel, DefinitionsInAnotherFormAreLeftOutAndThatIsTold) {
    StoredObject tree = SampleTree();
    StoredObject before = ReadTree(WriteTree(tree, SectorSize::Bytes512));
    StoredProperty odd;
    odd.pid = prop::Dictionary_DataDefinitions.pid;
    odd.bytes = {1, 2, 3};
    property(dictionary(tree), odd.pid) = odd;
    EXPECT_EQ(read(tree).notes, Notes{"DataDefinitions: is stored in another form than its type "
                                      "has; it is left out"});
    EXPECT_EQ(passed(tree), before);
    // No operation is built in.
    odd.pid = prop::Dictionary_OperationDefinitions.pid;
    dictionary(tree) = dictionary(before);
    dictionary(tree).properties.push_back(odd);
    EXPECT_EQ(read(tree).notes, Notes{"OperationDefinitions: is stored in another form than its "
                                      "type has; it is kept as it stands"});
    StoredObject again = passed(tree);
    EXPECT_EQ(property(dictionary(again), odd.pid).bytes, odd.bytes);
}

// A tag that the file does not have may be one of the next file's.
TEST(DamagedModel, AReferenceWithAnUnknownTagNeverLeadsSomewhere) {
    for (const bool isVector : {false, true}) {
        StoredObject tree = SampleTree();
        StoredObject& segment = property(FirstSlot(tree), prop::MobSlot_Segment.pid).objects[0];
        StoredProperty& reference = property(segment, prop::Component_DataDefinition.pid);
        const Bytes key = reference.keys.front();
        reference.keys.clear();
        reference.targetPath.clear();
        reference.bytes = {1, 0, 0x01, 0x1B, 16};
        reference.bytes.insert(reference.bytes.end(), key.begin(), key.end());
        if (isVector) {
            reference.form = StoredForm::WeakVector;
            reference.name = u"DataDefinition";
            reference.bytes.insert(reference.bytes.begin(), {1, 0, 0, 0});
        }
        reference.problem = "a weak reference has tag 1, the file has 0 paths";
        const sample::SampleModel sample = read(tree);
        ASSERT_EQ(sample.notes.size(), 1u);
        const sample::SampleModel again = read(
            ReadTree(WriteTree(TreeOfModel(*sample.model, *sample.header), SectorSize::Bytes512)));
        ASSERT_EQ(again.notes.size(), 1u);
        EXPECT_NE(again.notes[0].find("a weak reference has tag 65535"), std::string::npos)
            << again.notes[0];
    }
}

// A record is as long as its members are now.
TEST(DamagedModel, ARecordFollowsTheWidthOfItsMembers) {
    const sample::SampleModel made = sample::WholeModel();
    const aafProductVersion_t version{1, 2, 3, 4, kAAFVersionReleased};
    const auto identification = [](const sample::SampleModel& sample) -> Object& {
        return *sample.header->ObjectAt(prop::Header_IdentificationList, 0);
    };
    ASSERT_GE(identification(made).PutStruct(prop::Identification_ProductVersion, version), 0);
    StoredObject tree = TreeOfModel(*made.model, *made.header);
    StoredObject& release =
        types(tree).objects.at(IndexOf(types(tree), kAAFTypeID_ProductReleaseType));
    const StoredAuid wide = AuidOf(kAAFTypeID_UInt64);
    property(release, TargetPidOf(TypeKind::Enumeration)).keys.at(0) =
        Bytes(wide.begin(), wide.end());

    const sample::SampleModel sample = read(tree);
    EXPECT_EQ(sample.notes, Notes{"IdentificationList: ProductVersion: 9 bytes are no value of its "
                                  "type; it is kept as it stands"});
    EXPECT_EQ(sample.model->FindType(kAAFTypeID_ProductVersion)->StoredSize(), 16u);
    aafProductVersion_t got{};
    EXPECT_EQ(identification(sample).ReadStruct(prop::Identification_ProductVersion, &got),
              AAFRESULT_PROP_NOT_PRESENT);
    ASSERT_GE(identification(sample).PutStruct(prop::Identification_ProductVersion, version), 0);
    const sample::SampleModel again = read(TreeOfModel(*sample.model, *sample.header));
    EXPECT_EQ(again.notes, Notes());
    ASSERT_GE(identification(again).ReadStruct(prop::Identification_ProductVersion, &got), 0);
    EXPECT_EQ(got.type, kAAFVersionReleased);
    EXPECT_EQ(got.patchLevel, 4);
}

// A set of definitions that a file adds to those of the dictionary.
TEST(DamagedModel, ASetOfItsOwnInTheDictionaryKeepsItsElements) {
    const sample::SampleModel made = sample::WholeModel();
    constexpr GUID ownSet = ncfGuid("9D2C1F10-4F5A-4C77-8A01-5B1E2C3D4E92");
    const PropertyDefinition& more =
        made.model->FindClass(AUID_AAFDictionary)
            ->AddProperty(ownSet, L"MoreContainers",
                          kAAFTypeID_ContainerDefinitionStrongReferenceSet, true, false);
    // The second has the id of one that is built in elsewhere.
    for (const GUID& id : {sample::kOwnClassId, BuiltInContainerDefinitions().begin()->id}) {
        const RefPtr<Object> element =
            made.model->CreateObject(*made.model->FindClass(AUID_AAFContainerDefinition));
        ASSERT_GE(element->PutStruct(prop::DefinitionObject_Identification, id), 0);
        ASSERT_GE(element->PutString(prop::DefinitionObject_Name, L"More"), 0);
        ASSERT_GE(made.model->dictionary().AddToSet(more.key(), element->Identity()), 0);
    }
    StoredObject tree = TreeOfModel(*made.model, *made.header);
    ASSERT_EQ(property(dictionary(tree), more.pid()).objects.size(), 2u);
    EXPECT_EQ(read(tree).notes, Notes());
    EXPECT_EQ(passed(tree), ReadTree(WriteTree(tree, SectorSize::Bytes512)));
}

// Looks at everything in an object in every way that its operations do.
void LookAt(const Object& object) {
    for (const auto& [pid, value] : object.values()) {
        const PropertyKey key = object.classDefinition().FindProperty(pid)->key();
        std::vector<std::uint8_t> buffer(64);
        for (const std::size_t bytes : {1, 2, 4, 8, 16, 32, 40}) {
            object.ReadNative(key, buffer.data(), bytes);
        }
        aafUInt32 size = 0;
        if (object.ReadNativeSize(key, &size) >= 0) {
            buffer.resize(std::max<std::size_t>(size, 1));
            object.ReadNative(key, buffer.data(), size);
        }
        if (object.ReadIndirectSize(key, &size) >= 0) {
            buffer.resize(std::max<std::size_t>(size, 1));
            object.ReadIndirect(key, buffer.data(), size);
        }
        aafInt64 number = 0;
        object.ReadInteger(key, &number);
        object.StringOr(key, L"");
        object.WeakTargetAt(key, 0);
        object.WeakTargetAt(key, 1);
        for (const RefPtr<Object>& contained : value->objects()) {
            EXPECT_EQ(contained->owner(), &object);
            LookAt(*contained);
        }
    }
    object.UniqueKey();
}

// What a data definition that every model has says of itself counts less than a file's own words,
// also when they make no sense.
TEST(DamagedModel, OddPropertiesOfBuiltInDefinitionsAreKept) {
    StoredObject tree = SampleTree();
    StoredProperty& set = property(dictionary(tree), prop::Dictionary_DataDefinitions.pid);
    StoredObject& edgecode = set.objects.at(IndexOf(set, kAAFDataDef_Edgecode));
    property(edgecode, prop::DefinitionObject_Description.pid).bytes = {'o', 0, 'd'};
    const Bytes id = property(edgecode, prop::DefinitionObject_Identification.pid).bytes;
    const sample::SampleModel sample = read(tree);
    ASSERT_EQ(sample.notes.size(), 1u);
    EXPECT_NE(sample.notes[0].find("; it is kept as it stands"), std::string::npos);
    EXPECT_EQ(passed(tree), ReadTree(WriteTree(tree, SectorSize::Bytes512)));
    // Without its id it would not be found.
    property(edgecode, prop::DefinitionObject_Identification.pid).bytes.pop_back();
    StoredObject saved = passed(tree);
    StoredProperty& again = property(dictionary(saved), prop::Dictionary_DataDefinitions.pid);
    StoredObject& found = again.objects.at(IndexOf(again, kAAFDataDef_Edgecode));
    EXPECT_EQ(property(found, prop::DefinitionObject_Identification.pid).bytes, id);
}

// Every number, key, name and value of the tree changed in turn.
TEST(DamagedModel, WithARandomChangeIsReadOrRefusedButNeverHarms) {
    const unsigned seed = std::random_device()();
    SCOPED_TRACE("seed " + std::to_string(seed));
    std::mt19937 random(seed);
    const Bytes file = WriteTree(SampleTree(), SectorSize::Bytes512);
    int refused = 0;
    int odd = 0;
    for (int round = 0; round < 300; ++round) {
        Bytes damaged = file;
        for (int i = 0; i < 8; ++i) {
            damaged[512 + random() % (damaged.size() - 512)] = static_cast<std::uint8_t>(random());
        }
        try {
            const sample::SampleModel sample = read(ReadTree(damaged));
            odd += sample.notes.empty() ? 0 : 1;
            LookAt(*sample.header);
            // What was read can be written and read again.
            read(ReadTree(
                WriteTree(TreeOfModel(*sample.model, *sample.header), SectorSize::Bytes512)));
        } catch (const StoredError&) {
            ++refused;
        }
    }
    EXPECT_GT(refused, 5);
    EXPECT_GT(odd, 0);  // some ten, but by chance
}
