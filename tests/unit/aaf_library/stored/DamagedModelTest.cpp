// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/model/ClassDefinition.h"
#include "aaf_library/stored/MetaPids.h"
#include "aaf_library/stored/MetaRecords.h"
#include "aaf_library/stored/ModelReader.h"
#include "aaf_library/stored/ModelWriter.h"
#include "aaf_library/stored/StoredError.h"
#include "aaf_library/stored/TreeReader.h"
#include "aaf_library/stored/TreeWriter.h"
#include "host_interfaces/aaf/AAFClassIds.h"
#include "tests/unit/aaf_library/stored/SampleModel.h"

#include <gtest/gtest.h>
#include <functional>
#include <random>

using namespace aaf;
using namespace aaf::stored;

namespace {

StoredObject SampleTree() {
    const sample::SampleModel sample = sample::WholeModel();
    return TreeOfModel(*sample.model, *sample.header);
}

std::string refusal(const StoredObject& tree) {
    const RefPtr<Model> model = sample::NewModel();
    try {
        ReadModel(tree, *model);
        return "";
    } catch (const StoredError& problem) {
        return problem.what();
    }
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

}  // namespace

TEST(DamagedModel, TheSampleItselfIsRead) {
    EXPECT_EQ(refusal(SampleTree()), "");
}

TEST(DamagedModel, WithoutItsMainPartsIsRefused) {
    EXPECT_EQ(refusal(StoredObject()), "has no meta-dictionary");
    StoredObject tree = SampleTree();
    property(tree, 2).pid = 7;
    EXPECT_EQ(refusal(tree), "has no header");
    tree = SampleTree();
    property(header(tree), prop::Header_Dictionary.pid).pid = 0x7001;
    EXPECT_EQ(refusal(tree), "has no dictionary");
    tree = SampleTree();
    property(header(tree), prop::Header_Content.pid).pid = 0x7001;
    EXPECT_EQ(refusal(tree), "has no content");
}

TEST(DamagedModel, WithAnObjectOfAnUnknownClassIsRefused) {
    StoredObject tree = SampleTree();
    FirstSlot(tree).classId[0] ^= 0xFF;
    EXPECT_EQ(refusal(tree), "Content: Mobs: Slots: an object of a class that is not defined");
}

TEST(DamagedModel, WithAnObjectInThePlaceOfAnotherKindIsRefused) {
    StoredObject tree = SampleTree();
    FirstSlot(tree).classId = AuidOf(AUID_AAFFiller);
    EXPECT_EQ(refusal(tree),
              "Content: Mobs: Slots: an object of the class Filler in a place for others");
    tree = SampleTree();
    header(tree).classId = AuidOf(AUID_AAFFiller);
    EXPECT_EQ(refusal(tree), "an object of the class Filler in a place for others");
}

TEST(DamagedModel, WithADefinitionOfTheMetaModelAmongTheObjectsIsRefused) {
    StoredObject tree = SampleTree();
    FirstSlot(tree).classId = AuidOf(ncfGuid("0D010101-0201-0000-060E-2B3402060101"));
    EXPECT_NE(refusal(tree), "");
}

TEST(DamagedModel, WithAValueOfTheWrongSizeIsRefused) {
    StoredObject tree = SampleTree();
    property(FirstSlot(tree), prop::TimelineMobSlot_EditRate.pid).bytes.pop_back();
    EXPECT_EQ(refusal(tree), "Content: Mobs: Slots: EditRate: 7 bytes are no value of its type");
    tree = SampleTree();
    property(FirstSlot(tree), prop::MobSlot_SlotName.pid).bytes.pop_back();
    EXPECT_NE(refusal(tree).find("SlotName: "), std::string::npos);
}

TEST(DamagedModel, WithAValueInAnotherFormIsRefused) {
    StoredObject tree = SampleTree();
    property(FirstSlot(tree), prop::MobSlot_SlotName.pid).form = StoredForm::Stream;
    EXPECT_EQ(refusal(tree),
              "Content: Mobs: Slots: SlotName: is stored in another form than its type has");
}

TEST(DamagedModel, WithAKeyThatDiffersFromItsElementIsRefused) {
    StoredObject tree = SampleTree();
    mobs(tree).keys.front()[31] ^= 0xFF;
    EXPECT_EQ(refusal(tree), "Content: Mobs: an element whose key differs from that in the index");
}

TEST(DamagedModel, AValueThatNothingDescribesIsPassedOver) {
    StoredObject tree = SampleTree();
    StoredProperty odd;
    odd.pid = 0x9000;
    odd.bytes = {1, 2, 3};
    FirstSlot(tree).properties.push_back(odd);
    EXPECT_EQ(refusal(tree), "");
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
    EXPECT_EQ(refusal(tree), "");
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
    EXPECT_EQ(refusal(tree), "definitions that are made of one another without end");
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
    const RefPtr<Model> model = sample::NewModel();
    ReadModel(tree, *model);
    EXPECT_EQ(model->FindType(type.id), nullptr);
}

// Every number, key, name and value of the tree changed in turn.
TEST(DamagedModel, WithARandomChangeIsReadOrRefusedButNeverHarms) {
    const unsigned seed = std::random_device()();
    SCOPED_TRACE("seed " + std::to_string(seed));
    std::mt19937 random(seed);
    const Bytes file = WriteTree(SampleTree(), SectorSize::Bytes512);
    int refused = 0;
    for (int round = 0; round < 300; ++round) {
        Bytes damaged = file;
        for (int i = 0; i < 8; ++i) {
            damaged[512 + random() % (damaged.size() - 512)] = static_cast<std::uint8_t>(random());
        }
        try {
            refused += refusal(ReadTree(damaged)).empty() ? 0 : 1;
        } catch (const StoredError&) {
            ++refused;
        }
    }
    EXPECT_GT(refused, 5);
}
