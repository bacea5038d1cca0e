// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// The numbers of definitions in a file, and what a program does to the file that gives its own
// definitions the numbers that they have in the published library.

#include "aaf_library/stored/CreationOrder.h"

#include "aaf_library/model/ClassDefinition.h"
#include "aaf_library/stored/MetaClosure.h"
#include "aaf_library/stored/MetaPids.h"
#include "aaf_library/stored/ModelNames.h"
#include "aaf_library/stored/ModelReader.h"
#include "aaf_library/stored/ModelWriter.h"
#include "aaf_library/stored/TreeReader.h"
#include "aaf_library/stored/TreeWriter.h"
#include "host_interfaces/aaf/AAFClassIds.h"
#include "host_interfaces/aaf/AAFTypeIds.h"
#include "tests/unit/aaf_library/stored/BuiltInRecords.h"
#include "tests/unit/aaf_library/stored/SampleModel.h"

#include <gtest/gtest.h>
#include <algorithm>
#include <iterator>
#include <map>
#include <set>
#include <sstream>

using namespace aaf;
using namespace aaf::stored;

namespace {

constexpr GUID kMobAttributeListId = ncfGuid("60958183-47B1-11D4-A01C-0004AC969F50");

struct NumberedClass {
    const char* name;
    const char* properties;
};

// The place in the list is the number.
constexpr NumberedClass kClassesInOrder[] = {
    {"MetaDefinition", "Identification Name Description"},
    {"ClassDefinition", "ParentClass Properties IsConcrete"},
    {"PropertyDefinition", "Type IsOptional LocalIdentification IsUniqueIdentifier"},
    {"InterchangeObject", "ObjClass Generation"},
    {"Header",
     "ByteOrder LastModified Content Dictionary Version IdentificationList ObjectModelVersion "
     "OperationalPattern EssenceContainers DescriptiveSchemes"},
    {"Identification",
     "CompanyName ProductName ProductVersion ProductVersionString ProductID Date ToolkitVersion "
     "Platform GenerationAUID"},
    {"ContentStorage", "Mobs EssenceData"},
    {"TypeDefinition", ""},
    {"TypeDefinitionInteger", "Size IsSigned"},
    {"TypeDefinitionStrongObjectReference", "ReferencedType"},
    {"TypeDefinitionWeakObjectReference", "ReferencedType TargetSet"},
    {"TypeDefinitionEnumeration", "ElementType ElementNames ElementValues"},
    {"TypeDefinitionFixedArray", "ElementType ElementCount"},
    {"TypeDefinitionVariableArray", "ElementType"},
    {"TypeDefinitionSet", "ElementType"},
    {"TypeDefinitionString", "ElementType"},
    {"TypeDefinitionStream", ""},
    {"TypeDefinitionRecord", "MemberTypes MemberNames"},
    {"TypeDefinitionIndirect", ""},
    {"TypeDefinitionOpaque", ""},
    {"TypeDefinitionCharacter", ""},
    {"MetaDictionary", "ClassDefinitions TypeDefinitions"},
    {"Dictionary",
     "OperationDefinitions ParameterDefinitions DataDefinitions PluginDefinitions CodecDefinitions "
     "ContainerDefinitions InterpolationDefinitions KLVDataDefinitions TaggedValueDefinitions"},
    {"DefinitionObject", "Identification Name Description"},
    {"DataDefinition", ""},
    {"ContainerDefinition", "EssenceIsIdentified"},
    {"Mob",
     "MobID Name Slots LastModified CreationTime UserComments KLVData Attributes UsageCode "
     "MobAttributeList"},
    {"TaggedValue", "Name Value"},
    {"MobSlot", "SlotID SlotName Segment PhysicalTrackNumber"},
    {"Component", "DataDefinition Length KLVData UserComments Attributes"},
    {"TypeDefinitionRename", "RenamedType"},
    {"KLVData", "Value"},
    {"Segment", ""},
    {"TypeDefinitionExtendibleEnumeration", "ElementNames ElementValues"},
    {"EssenceData", "MobID Data SampleIndex"},
    {"OperationDefinition",
     "DataDefinition IsTimeWarp DegradeTo OperationCategory NumberInputs Bypass ParametersDefined"},
    {"ParameterDefinition", "Type DisplayUnits"},
    {"PluginDefinition",
     "PluginCategory VersionNumber VersionString Manufacturer ManufacturerInfo ManufacturerID "
     "Platform MinPlatformVersion MaxPlatformVersion Engine MinEngineVersion MaxEngineVersion "
     "PluginAPI MinPluginAPI MaxPluginAPI SoftwareOnly Accelerator Locators Authentication "
     "DefinitionObject"},
    {"Locator", ""},
    {"NetworkLocator", "URLString"},
    {"CodecDefinition", "FileDescriptorClass DataDefinitions"},
    {"InterpolationDefinition", ""},
    {"KLVDataDefinition", "KLVDataType"},
    {"TaggedValueDefinition", ""},
};

constexpr const char* kTypesInOrder[] = {
    "aafUInt8",
    "aafUInt32",
    "aafUInt16",
    "aafUInt8Array8",
    "ClassDefinitionWeakReference",
    "AUID",
    "Boolean",
    "kAAFTypeID_ClassDefinitionStrongReferenceSet",
    "aafCharacter",
    "kAAFTypeID_TypeDefinitionWeakReferenceVector",
    "aafString",
    "Stream",
    "aafIndirect",
    "aafInt64Array",
    "aafOpaque",
    "aafInt8",
    "aafInt16",
    "aafAUIDArray",
    "aafInt32",
    "aafInt64",
    "TypeDefinitionWeakReference",
    "kAAFTypeID_ClassDefinitionStrongReference",
    "kAAFTypeID_PropertyDefinitionStrongReferenceSet",
    "kAAFTypeID_TypeDefinitionStrongReferenceSet",
    "kAAFTypeID_PropertyDefinitionStrongReference",
    "kAAFTypeID_TypeDefinitionStrongReference",
    "kAAFTypeID_TaggedValueStrongReference",
    "kAAFTypeID_TaggedValueStrongReferenceVector",
    "DataDefinitionWeakReference",
    "aafLengthType",
    "kAAFTypeID_KLVDataStrongReference",
    "kAAFTypeID_KLVDataStrongReferenceVector",
    "kAAFTypeID_SegmentStrongReference",
    "kAAFTypeID_MobSlotStrongReference",
    "kAAFTypeID_MobSlotStrongReferenceVector",
    "UsageType",
    "DateStruct",
    "TimeStruct",
    "TimeStamp",
    "aafUInt8Array12",
    "MobIDType",
    "kAAFTypeID_MobStrongReference",
    "kAAFTypeID_MobStrongReferenceSet",
    "kAAFTypeID_EssenceDataStrongReference",
    "kAAFTypeID_EssenceDataStrongReferenceSet",
    "OperationDefinitionWeakReference",
    "kAAFTypeID_OperationDefinitionWeakReferenceVector",
    "ParameterDefinitionWeakReference",
    "kAAFTypeID_ParameterDefinitionWeakReferenceSet",
    "OperationCategoryType",
    "kAAFTypeID_OperationDefinitionStrongReference",
    "kAAFTypeID_OperationDefinitionStrongReferenceSet",
    "kAAFTypeID_ParameterDefinitionStrongReference",
    "kAAFTypeID_ParameterDefinitionStrongReferenceSet",
    "kAAFTypeID_DataDefinitionStrongReference",
    "kAAFTypeID_DataDefinitionStrongReferenceSet",
    "VersionType",
    "PluginCategoryType",
    "kAAFTypeID_NetworkLocatorStrongReference",
    "kAAFTypeID_LocatorStrongReference",
    "kAAFTypeID_LocatorStrongReferenceVector",
    "kAAFTypeID_PluginDefinitionStrongReference",
    "kAAFTypeID_PluginDefinitionStrongReferenceSet",
    "kAAFTypeID_DataDefinitionWeakReferenceVector",
    "kAAFTypeID_CodecDefinitionStrongReference",
    "kAAFTypeID_CodecDefinitionStrongReferenceSet",
    "kAAFTypeID_ContainerDefinitionStrongReference",
    "kAAFTypeID_ContainerDefinitionStrongReferenceSet",
    "kAAFTypeID_InterpolationDefinitionStrongReference",
    "kAAFTypeID_InterpolationDefinitionStrongReferenceSet",
    "kAAFTypeID_KLVDataDefinitionStrongReference",
    "kAAFTypeID_KLVDataDefinitionStrongReferenceSet",
    "kAAFTypeID_TaggedValueDefinitionStrongReference",
    "kAAFTypeID_TaggedValueDefinitionStrongReferenceSet",
    "kAAFTypeID_ContentStorageStrongReference",
    "kAAFTypeID_DictionaryStrongReference",
    "ProductReleaseType",
    "ProductVersion",
    "kAAFTypeID_IdentificationStrongReference",
    "kAAFTypeID_IdentificationStrongReferenceVector",
};

using Storages = std::map<std::uint32_t, StoredObject>;

// A set as it lies in the file: where the index says that each element is, and what is there.
struct Placed {
    std::map<Bytes, std::uint32_t> index;
    Storages storages;

    explicit Placed(const StoredProperty& set) {
        for (std::size_t i = 0; i < set.objects.size(); ++i) {
            index[set.keys.at(i)] = set.localKeys.at(i);
            storages[set.localKeys[i]] = set.objects[i];
        }
    }
    // What another program writes, whatever lies there.
    void Write(const Bytes& key, std::uint32_t number, StoredObject object) {
        index[key] = number;
        storages[number] = std::move(object);
    }
    void PutInto(StoredProperty& set) const {
        set.keys.clear();
        set.localKeys.clear();
        set.objects.clear();
        std::uint32_t number = 0;
        for (const auto& [key, place] : index) {
            set.keys.push_back(key);
            // Two entries of the index may lead to one place now; a tree has an object for each.
            set.localKeys.push_back(number++);
            set.objects.push_back(storages.at(place));
        }
    }
};

StoredProperty* FindIn(StoredObject& object, std::uint16_t pid) {
    for (StoredProperty& property : object.properties) {
        if (property.pid == pid) {
            return &property;
        }
    }
    return nullptr;
}

StoredProperty& SetOf(StoredObject& root, std::uint16_t pid) {
    return *FindIn(root.properties.at(0).objects.at(0), pid);
}

std::string NameIn(const StoredObject& definition) {
    const Bytes& text = definition.Find(meta::kName)->bytes;
    std::string name;
    for (std::size_t i = 0; i + 2 < text.size(); i += 2) {
        name += static_cast<char>(text[i]);
    }
    return name;
}

std::map<std::string, std::uint32_t> NumbersIn(const StoredProperty& set) {
    std::map<std::string, std::uint32_t> numbers;
    for (std::size_t i = 0; i < set.objects.size(); ++i) {
        numbers[NameIn(set.objects[i])] = set.localKeys.at(i);
    }
    return numbers;
}

std::vector<std::string> Words(const char* text) {
    std::istringstream stream(text);
    return {std::istream_iterator<std::string>(stream), {}};
}

StoredObject Saved(const sample::SampleModel& sample) {
    return ReadTree(WriteTree(TreeToWrite(*sample.model, *sample.header), SectorSize::Bytes512));
}

// All that is built in, as a program would write it.
StoredObject AllBuiltIn() {
    return ReadTree(sample::FileOfDefinitions(*sample::NewModel(), StoredMetaDictionary));
}

const StoredObject& Named(const StoredProperty& set, const std::string& name, Bytes& key) {
    for (std::size_t i = 0; i < set.objects.size(); ++i) {
        if (NameIn(set.objects[i]) == name) {
            key = set.keys[i];
            return set.objects[i];
        }
    }
    throw std::logic_error(name);
}

// What a program does that opens the file for modification and saves it.
void RewriteBuiltIn(StoredObject& root) {
    StoredObject builtIn = AllBuiltIn();
    StoredProperty& classes = SetOf(root, meta::kClassDefinitions);
    Placed placed(classes);
    for (std::uint32_t i = 0; i < std::size(kClassesInOrder); ++i) {
        Bytes key;
        StoredObject written =
            Named(SetOf(builtIn, meta::kClassDefinitions), kClassesInOrder[i].name, key);
        const auto present = placed.index.find(key);
        StoredProperty* const properties = FindIn(written, meta::kProperties);
        // A class that is there keeps what others added to it.
        StoredProperty* const own =
            present == placed.index.end() || properties == nullptr
                ? nullptr
                : FindIn(placed.storages.at(present->second), meta::kProperties);
        if (own != nullptr) {
            Placed inside(*own);
            std::uint32_t number = 0;
            for (const std::string& name : Words(kClassesInOrder[i].properties)) {
                if (name != "MobAttributeList") {
                    Bytes id;
                    const StoredObject& property = Named(*properties, name, id);
                    inside.Write(id, number, property);
                }
                ++number;
            }
            inside.PutInto(*properties);
        }
        placed.Write(key, i, std::move(written));
    }
    placed.PutInto(classes);
    StoredProperty& types = SetOf(root, meta::kTypeDefinitions);
    Placed placedTypes(types);
    for (std::uint32_t i = 0; i < std::size(kTypesInOrder); ++i) {
        Bytes key;
        const StoredObject& written =
            Named(SetOf(builtIn, meta::kTypeDefinitions), kTypesInOrder[i], key);
        placedTypes.Write(key, i, written);
    }
    placedTypes.PutInto(types);
}

// Whether all objects and extensions of the sample come out of the tree.
bool IsWhole(const StoredObject& root, const sample::SampleModel& sample) {
    const RefPtr<Model> model = sample::NewModel();
    std::vector<std::string> notes;
    const RefPtr<Object> header = ReadModel(root, *model, notes);
    return notes.empty() &&
           TreeOfModel(*model, *header) == TreeOfModel(*sample.model, *sample.header);
}

// A property of its own on a class that the published library makes itself.
sample::SampleModel ExtendedModel() {
    sample::SampleModel sample = sample::WholeModel();
    sample.model->FindClass(AUID_AAFMob)
        ->AddProperty(ncfGuid("9D2C1F10-4F5A-4C77-8A01-5B1E2C3D4E90"), L"AnotherOfMobs",
                      kAAFTypeID_Int32, true, false);
    sample.model->FindClass(AUID_AAFMob)
        ->AddProperty(kMobAttributeListId, L"MobAttributeList",
                      kAAFTypeID_TaggedValueStrongReferenceVector, true, false);
    return sample;
}

}  // namespace

TEST(CreationOrder, BuiltInDefinitionsHaveTheNumbersOfThePublishedLibrary) {
    StoredObject all = AllBuiltIn();
    const StoredProperty& classes = SetOf(all, meta::kClassDefinitions);
    const auto classNumbers = NumbersIn(classes);
    for (std::uint32_t i = 0; i < std::size(kClassesInOrder); ++i) {
        const auto& [name, properties] = kClassesInOrder[i];
        EXPECT_EQ(classNumbers.at(name), i) << name;
        Bytes key;
        const StoredProperty* const set = Named(classes, name, key).Find(meta::kProperties);
        std::uint32_t number = 0;
        for (const std::string& property : Words(properties)) {
            ASSERT_NE(set, nullptr) << name;
            if (property != "MobAttributeList") {
                EXPECT_EQ(NumbersIn(*set).at(property), number) << name << ": " << property;
            }
            ++number;
        }
    }
    const auto typeNumbers = NumbersIn(SetOf(all, meta::kTypeDefinitions));
    for (std::uint32_t i = 0; i < std::size(kTypesInOrder); ++i) {
        EXPECT_EQ(typeNumbers.at(kTypesInOrder[i]), i) << kTypesInOrder[i];
    }
}

// The numbers of what a file leaves out stay free.
TEST(CreationOrder, DefinitionsThatAreLeftOutKeepTheirPlace) {
    StoredProperty set;
    const GUID ids[] = {sample::kQuadTypeId, kAAFTypeID_IdentificationStrongReferenceVector,
                        kAAFTypeID_UInt32, kAAFTypeID_UInt64, sample::kOwnClassId};
    for (const GUID& id : ids) {
        const StoredAuid key = AuidOf(id);
        set.keys.emplace_back(key.begin(), key.end());
    }
    NumberTypes(set);
    // Three are none of that library's own: they are numbered by their ids.
    EXPECT_EQ(set.localKeys, (std::vector<std::uint32_t>{0x51, 0x4F, 1, 0x50, 0x52}));
    set.keys.resize(1);
    NumberClasses(set);
    EXPECT_EQ(set.localKeys, std::vector<std::uint32_t>{0x2C});
}

TEST(CreationOrder, OthersComeBehindAllBuiltInOnes) {
    StoredObject root = Saved(ExtendedModel());
    const auto check = [](const StoredProperty& set, const std::set<std::string>& inOrder) {
        std::set<std::uint32_t> seen;
        for (const auto& [name, number] : NumbersIn(set)) {
            EXPECT_EQ(number < inOrder.size(), inOrder.count(name) != 0) << name << ' ' << number;
            EXPECT_TRUE(seen.insert(number).second) << name;
        }
        EXPECT_TRUE(std::is_sorted(set.keys.begin(), set.keys.end()));
    };
    std::set<std::string> classes;
    for (const NumberedClass& entry : kClassesInOrder) {
        classes.insert(entry.name);
    }
    check(SetOf(root, meta::kClassDefinitions), classes);
    check(SetOf(root, meta::kTypeDefinitions),
          {std::begin(kTypesInOrder), std::end(kTypesInOrder)});
    Bytes key;
    const StoredObject& mob = Named(SetOf(root, meta::kClassDefinitions), "Mob", key);
    const auto properties = NumbersIn(*mob.Find(meta::kProperties));
    EXPECT_EQ(properties.at("MobAttributeList"), 9u);
    EXPECT_EQ(properties.at("UsageCode"), 8u);
    EXPECT_GE(properties.at("AnotherOfMobs"), 10u);
}

// A file may have a property of that name and another id, or two of them.
TEST(CreationOrder, TheLastPropertyOfMobsIsKnownByItsId) {
    sample::SampleModel sample = ExtendedModel();
    constexpr GUID other = ncfGuid("10000000-4F5A-4C77-8A01-5B1E2C3D4E91");
    sample.model->FindClass(AUID_AAFMob)
        ->AddProperty(other, L"MobAttributeList", kAAFTypeID_TaggedValueStrongReferenceVector, true,
                      false);
    StoredObject root = Saved(sample);
    EXPECT_TRUE(IsWhole(root, sample));
    Bytes key;
    const StoredObject& mob = Named(SetOf(root, meta::kClassDefinitions), "Mob", key);
    const StoredProperty& properties = *mob.Find(meta::kProperties);
    const auto numberOf = [&](const GUID& id) {
        const StoredAuid stored = AuidOf(id);
        const auto at = std::find(properties.keys.begin(), properties.keys.end(),
                                  Bytes(stored.begin(), stored.end()));
        return properties.localKeys.at(static_cast<std::size_t>(at - properties.keys.begin()));
    };
    EXPECT_EQ(numberOf(kMobAttributeListId), 9u);
    EXPECT_GE(numberOf(other), 10u);
}

TEST(CreationOrder, AFileThatAnotherProgramSavesInPlaceLosesNothing) {
    const sample::SampleModel sample = ExtendedModel();
    StoredObject root = Saved(sample);
    ASSERT_TRUE(IsWhole(root, sample));
    StoredObject rewritten = root;
    RewriteBuiltIn(rewritten);
    EXPECT_TRUE(IsWhole(rewritten, sample));
    EXPECT_TRUE(IsWhole(ReadTree(WriteTree(rewritten, SectorSize::Bytes4096)), sample));

    // With other numbers it would.
    for (const std::uint16_t pid : {meta::kClassDefinitions, meta::kTypeDefinitions}) {
        StoredObject damaged = root;
        StoredProperty& set = SetOf(damaged, pid);
        for (std::size_t i = 0; i < set.localKeys.size(); ++i) {
            set.localKeys[i] = static_cast<std::uint32_t>(
                pid == meta::kClassDefinitions ? i : set.localKeys.size() - 1 - i);
        }
        RewriteBuiltIn(damaged);
        EXPECT_FALSE(IsWhole(damaged, sample)) << pid;
    }
    StoredObject damaged = root;
    for (StoredObject& definition : SetOf(damaged, meta::kClassDefinitions).objects) {
        if (NameIn(definition) == "Mob") {
            StoredProperty& set = *FindIn(definition, meta::kProperties);
            std::reverse(set.localKeys.begin(), set.localKeys.end());
        }
    }
    RewriteBuiltIn(damaged);
    EXPECT_FALSE(IsWhole(damaged, sample));
}
