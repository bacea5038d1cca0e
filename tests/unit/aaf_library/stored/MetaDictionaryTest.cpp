// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/stored/CompoundFileReader.h"
#include "aaf_library/stored/MetaPids.h"
#include "aaf_library/stored/StoredError.h"
#include "aaf_library/stored/TreeReader.h"
#include "aaf_library/stored/TreeWriter.h"
#include "tests/unit/aaf_library/stored/BuiltInRecords.h"
#include "tests/unit/aaf_library/stored/Refusal.h"
#include "tests/unit/aaf_library/stored/SampleTree.h"

#include <gtest/gtest.h>
#include <algorithm>

using namespace aaf;
using namespace aaf::stored;

namespace {

constexpr GUID kQuadId = ncfGuid("9D2C1F10-4F5A-4C77-8A01-5B1E2C3D4E01");
constexpr GUID kRationalId = ncfGuid("03010100-0000-0000-060E-2B3401040101");

TypeFacts quad() {
    TypeFacts type;
    type.id = kQuadId;
    type.name = L"ExampleQuad";
    type.kind = TypeKind::Record;
    for (const wchar_t* name : {L"Left", L"Top", L"Right", L"Bottom"}) {
        type.members.push_back({name, kRationalId, 0});
    }
    return type;
}

MetaRecords OneType(TypeFacts type) {
    MetaRecords records;
    records.types.push_back(std::move(type));
    return records;
}

void SortById(MetaRecords& records) {
    const auto byId = [](const auto& a, const auto& b) { return AuidOf(a.id) < AuidOf(b.id); };
    std::sort(records.classes.begin(), records.classes.end(), byId);
    std::sort(records.types.begin(), records.types.end(), byId);
    for (MetaClass& entry : records.classes) {
        std::sort(entry.properties.begin(), entry.properties.end(), byId);
    }
}

std::string DictionaryRefusal(const StoredObject& dictionary) {
    return RefusalOf([&] { ReadMetaDictionary(dictionary); });
}

// Why the only type is left out.
std::string note(const StoredObject& dictionary) {
    const MetaRecords records = ReadMetaDictionary(dictionary);
    EXPECT_TRUE(records.types.empty());
    return records.notes.size() == 1 ? records.notes.front() : "";
}

StoredProperty& FirstType(StoredObject& dictionary, std::uint16_t pid) {
    for (StoredProperty& property : dictionary.properties[1].objects[0].properties) {
        if (property.pid == pid) {
            return property;
        }
    }
    throw std::logic_error("no such property");
}

}  // namespace

TEST(MetaDictionary, EveryBuiltInDefinitionComesBackFromTheFile) {
    MetaRecords wanted = sample::BuiltInRecords();
    const Bytes file = WriteTree(
        sample::RootWith(sample::reference(1, u"MetaDictionary", StoredMetaDictionary(wanted))),
        SectorSize::Bytes4096);
    const StoredObject root = ReadTree(file);
    MetaRecords read = ReadMetaDictionary(root.properties.front().objects.front());
    SortById(wanted);
    SortById(read);

    ASSERT_EQ(read.classes.size(), wanted.classes.size());
    for (std::size_t i = 0; i < wanted.classes.size(); ++i) {
        const MetaClass& a = read.classes[i];
        const MetaClass& b = wanted.classes[i];
        EXPECT_EQ(a.id, b.id);
        EXPECT_EQ(a.name, b.name);
        EXPECT_EQ(a.parent, b.parent);
        EXPECT_EQ(a.concrete, b.concrete);
        ASSERT_EQ(a.properties.size(), b.properties.size());
        for (std::size_t j = 0; j < b.properties.size(); ++j) {
            EXPECT_EQ(a.properties[j].id, b.properties[j].id);
            EXPECT_EQ(a.properties[j].name, b.properties[j].name);
            EXPECT_EQ(a.properties[j].pid, b.properties[j].pid);
            EXPECT_EQ(a.properties[j].type, b.properties[j].type);
            EXPECT_EQ(a.properties[j].optional, b.properties[j].optional);
            EXPECT_EQ(a.properties[j].unique, b.properties[j].unique);
        }
    }
    ASSERT_EQ(read.types.size(), wanted.types.size());
    for (std::size_t i = 0; i < wanted.types.size(); ++i) {
        const TypeFacts& a = read.types[i];
        const TypeFacts& b = wanted.types[i];
        EXPECT_EQ(a.id, b.id);
        EXPECT_EQ(a.name, b.name);
        EXPECT_EQ(a.kind, b.kind);
        EXPECT_EQ(a.target, b.target);
        EXPECT_EQ(a.size, b.size);
        EXPECT_EQ(a.isSigned, b.isSigned);
        ASSERT_EQ(a.members.size(), b.members.size());
        for (std::size_t j = 0; j < b.members.size(); ++j) {
            EXPECT_EQ(a.members[j].name, b.members[j].name);
            EXPECT_EQ(a.members[j].id, b.members[j].id);
            EXPECT_EQ(a.members[j].value, b.members[j].value);
        }
    }
}

TEST(MetaDictionary, LaysOutARecordTypeByteForByte) {
    const Bytes file = WriteTree(sample::RootWith(sample::reference(
                                     1, u"MetaDictionary", StoredMetaDictionary(OneType(quad())))),
                                 SectorSize::Bytes512);
    CompoundFileReader reader(file);
    const auto inside = [&](std::uint32_t storage, const char16_t* name) {
        return reader.entry(storage).contained.at(name);
    };
    const std::uint32_t definition = inside(
        inside(CompoundFileReader::kRootIndex, u"MetaDictionary-1"), u"TypeDefinitions-4{50}");
    EXPECT_EQ(GuidOf(reader.entry(definition).classId),
              ncfGuid("0D010101-020D-0000-060E-2B3402060101"));

    const Bytes head = {0x4C, 0x20, 4,    0, 5,    0,    0x82, 0,    0x10, 0,    6,    0,
                        0x82, 0,    0x18, 0, 0x1C, 0,    0x12, 0,    0x1E, 0,    0x1D, 0,
                        0x82, 0,    0x2C, 0, 0x10, 0x1F, 0x2C, 0x9D, 0x5A, 0x4F, 0x77, 0x4C};
    const Bytes properties = reader.Read(inside(definition, u"properties"));
    ASSERT_EQ(properties.size(), 4u + 24 + 16 + 24 + 30 + 44);
    EXPECT_TRUE(std::equal(head.begin(), head.end(), properties.begin()));

    Bytes index = {4, 0, 0, 0, 0, 0, 5, 0, 16};
    for (int i = 0; i < 4; ++i) {
        const Bytes key = sample::bytes(AuidOf(kRationalId));
        index.insert(index.end(), key.begin(), key.end());
    }
    EXPECT_EQ(reader.Read(inside(definition, u"MemberTypes-1c index")), index);
}

TEST(MetaDictionary, IdsAreStoredWithTheirNumbersTurnedRound) {
    const GUID id = ncfGuid("0D010101-0201-2F00-060E-2B3402060101");
    const StoredAuid stored = {1, 1, 1, 0x0D, 1, 2, 0, 0x2F, 6, 0x0E, 0x2B, 0x34, 2, 6, 1, 1};
    EXPECT_EQ(AuidOf(id), stored);
    EXPECT_EQ(GuidOf(stored), id);
    EXPECT_THROW(GuidOf(Bytes(15)), StoredError);
}

TEST(MetaDictionary, DefinitionsOfAnUnknownKindArePassedOver) {
    StoredObject dictionary = StoredMetaDictionary(OneType(quad()));
    dictionary.properties[1].objects[0].classId = sample::auid(0x77);
    EXPECT_TRUE(ReadMetaDictionary(dictionary).types.empty());
}

TEST(MetaDictionary, ADefinitionWithoutNameOrIdIsLeftOut) {
    StoredObject dictionary = StoredMetaDictionary(OneType(quad()));
    FirstType(dictionary, meta::kName).pid = 0x7000;
    EXPECT_EQ(note(dictionary), "meta-dictionary: a type is left out: property 0006 is missing");
    dictionary = StoredMetaDictionary(OneType(quad()));
    FirstType(dictionary, meta::kIdentification).bytes.pop_back();
    EXPECT_EQ(note(dictionary), "meta-dictionary: a type is left out: an id of 15 bytes");
}

TEST(MetaDictionary, NamesAndMembersThatDoNotPairAreLeftOut) {
    StoredObject dictionary = StoredMetaDictionary(OneType(quad()));
    FirstType(dictionary, meta::kRecordMemberTypes).keys.pop_back();
    EXPECT_EQ(note(dictionary), "meta-dictionary: a type is left out: 4 names for 3 members");
    dictionary = StoredMetaDictionary(OneType(quad()));
    Bytes& names = FirstType(dictionary, meta::kRecordMemberNames).bytes;
    names.resize(names.size() - 2);
    EXPECT_EQ(note(dictionary),
              "meta-dictionary: a type is left out: property 001d ends within a name");
}

TEST(MetaDictionary, AValueOfTheWrongSizeIsLeftOut) {
    TypeFacts type;
    type.id = kQuadId;
    type.name = L"Odd";
    type.kind = TypeKind::FixedArray;
    type.size = 3;
    StoredObject dictionary = StoredMetaDictionary(OneType(type));
    FirstType(dictionary, meta::kFixedArrayCount).bytes.pop_back();
    EXPECT_EQ(note(dictionary), "meta-dictionary: a type is left out: 4 bytes wanted, 3 left");
}

TEST(MetaDictionary, OnlyTheOddPropertyOfAClassIsLeftOut) {
    MetaRecords records;
    MetaClass entry;
    entry.id = kQuadId;
    entry.name = L"Example";
    entry.parent = kQuadId;
    for (const GUID& id : {kQuadId, kRationalId}) {
        MetaProperty property;
        property.id = id;
        property.name = L"Property";
        property.pid = 0xFFFF;
        property.type = kRationalId;
        entry.properties.push_back(property);
    }
    records.classes.push_back(entry);
    StoredObject dictionary = StoredMetaDictionary(records);
    for (StoredProperty& set : dictionary.properties[0].objects[0].properties) {
        if (set.pid == meta::kProperties) {
            set.objects[0].properties.clear();
        }
    }
    const MetaRecords read = ReadMetaDictionary(dictionary);
    ASSERT_EQ(read.classes.size(), 1u);
    EXPECT_EQ(read.classes[0].properties.size(), 1u);
    EXPECT_EQ(read.notes, std::vector<std::string>{"meta-dictionary: a property of Example is left "
                                                   "out: property 0005 is missing"});
}

TEST(MetaDictionary, WithoutItsSetsItIsRefused) {
    EXPECT_EQ(DictionaryRefusal(StoredObject()), "meta-dictionary: property 0003 is missing");
}
