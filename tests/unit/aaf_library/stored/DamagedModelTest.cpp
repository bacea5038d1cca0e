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

StoredObject sampleTree() {
    const sample::SampleModel sample = sample::wholeModel();
    return treeOfModel(*sample.model, *sample.header);
}

std::string refusal(const StoredObject& tree) {
    const RefPtr<Model> model = sample::newModel();
    try {
        readModel(tree, *model);
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

StoredObject& firstSlot(StoredObject& tree) {
    return property(mobs(tree).objects.front(), prop::Mob_Slots.pid).objects.front();
}

StoredProperty& types(StoredObject& tree) {
    return property(property(tree, 1).objects.front(), meta::typeDefinitions);
}

}  // namespace

TEST(DamagedModel, TheSampleItselfIsRead) {
    EXPECT_EQ(refusal(sampleTree()), "");
}

TEST(DamagedModel, WithoutItsMainPartsIsRefused) {
    EXPECT_EQ(refusal(StoredObject()), "has no meta-dictionary");
    StoredObject tree = sampleTree();
    property(tree, 2).pid = 7;
    EXPECT_EQ(refusal(tree), "has no header");
    tree = sampleTree();
    property(header(tree), prop::Header_Dictionary.pid).pid = 0x7001;
    EXPECT_EQ(refusal(tree), "has no dictionary");
    tree = sampleTree();
    property(header(tree), prop::Header_Content.pid).pid = 0x7001;
    EXPECT_EQ(refusal(tree), "has no content");
}

TEST(DamagedModel, WithAnObjectOfAnUnknownClassIsRefused) {
    StoredObject tree = sampleTree();
    firstSlot(tree).classId[0] ^= 0xFF;
    EXPECT_EQ(refusal(tree), "Content: Mobs: Slots: an object of a class that is not defined");
}

TEST(DamagedModel, WithAnObjectInThePlaceOfAnotherKindIsRefused) {
    StoredObject tree = sampleTree();
    firstSlot(tree).classId = storedAuid(AUID_AAFFiller);
    EXPECT_EQ(refusal(tree),
              "Content: Mobs: Slots: an object of the class Filler in a place for others");
    tree = sampleTree();
    header(tree).classId = storedAuid(AUID_AAFFiller);
    EXPECT_EQ(refusal(tree), "an object of the class Filler in a place for others");
}

TEST(DamagedModel, WithADefinitionOfTheMetaModelAmongTheObjectsIsRefused) {
    StoredObject tree = sampleTree();
    firstSlot(tree).classId = storedAuid(ncfGuid("0D010101-0201-0000-060E-2B3402060101"));
    EXPECT_NE(refusal(tree), "");
}

TEST(DamagedModel, WithAValueOfTheWrongSizeIsRefused) {
    StoredObject tree = sampleTree();
    property(firstSlot(tree), prop::TimelineMobSlot_EditRate.pid).bytes.pop_back();
    EXPECT_EQ(refusal(tree), "Content: Mobs: Slots: EditRate: 7 bytes are no value of its type");
    tree = sampleTree();
    property(firstSlot(tree), prop::MobSlot_SlotName.pid).bytes.pop_back();
    EXPECT_NE(refusal(tree).find("SlotName: "), std::string::npos);
}

TEST(DamagedModel, WithAValueInAnotherFormIsRefused) {
    StoredObject tree = sampleTree();
    property(firstSlot(tree), prop::MobSlot_SlotName.pid).form = StoredForm::Stream;
    EXPECT_EQ(refusal(tree),
              "Content: Mobs: Slots: SlotName: is stored in another form than its type has");
}

TEST(DamagedModel, WithAKeyThatDiffersFromItsElementIsRefused) {
    StoredObject tree = sampleTree();
    mobs(tree).keys.front()[31] ^= 0xFF;
    EXPECT_EQ(refusal(tree), "Content: Mobs: an element whose key differs from that in the index");
}

TEST(DamagedModel, AValueThatNothingDescribesIsPassedOver) {
    StoredObject tree = sampleTree();
    StoredProperty odd;
    odd.pid = 0x9000;
    odd.bytes = {1, 2, 3};
    firstSlot(tree).properties.push_back(odd);
    EXPECT_EQ(refusal(tree), "");
}

TEST(DamagedModel, TypesThatAreMadeOfThemselvesAreLeftOut) {
    StoredObject tree = sampleTree();
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
    const StoredObject circle = storedMetaDictionary(records);
    const StoredProperty& added = *circle.find(meta::typeDefinitions);
    StoredProperty& set = types(tree);
    set.objects.insert(set.objects.end(), added.objects.begin(), added.objects.end());
    set.keys.insert(set.keys.end(), added.keys.begin(), added.keys.end());
    EXPECT_EQ(refusal(tree), "");
}

TEST(DamagedModel, ALongLineOfTypesIsRefused) {
    StoredObject tree = sampleTree();
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
    const StoredObject line = storedMetaDictionary(records);
    const StoredProperty& added = *line.find(meta::typeDefinitions);
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
    StoredObject tree = sampleTree();
    const StoredObject huge = storedMetaDictionary(records);
    StoredProperty& set = types(tree);
    set.objects.push_back(huge.find(meta::typeDefinitions)->objects.front());
    set.keys.push_back(huge.find(meta::typeDefinitions)->keys.front());
    const RefPtr<Model> model = sample::newModel();
    readModel(tree, *model);
    EXPECT_EQ(model->FindType(type.id), nullptr);
}

// Every number, key, name and value of the tree changed in turn.
TEST(DamagedModel, WithARandomChangeIsReadOrRefusedButNeverHarms) {
    const unsigned seed = std::random_device()();
    SCOPED_TRACE("seed " + std::to_string(seed));
    std::mt19937 random(seed);
    const Bytes file = writeTree(sampleTree(), SectorSize::Bytes512);
    int refused = 0;
    for (int round = 0; round < 300; ++round) {
        Bytes damaged = file;
        for (int i = 0; i < 8; ++i) {
            damaged[512 + random() % (damaged.size() - 512)] = static_cast<std::uint8_t>(random());
        }
        try {
            refused += refusal(readTree(damaged)).empty() ? 0 : 1;
        } catch (const StoredError&) {
            ++refused;
        }
    }
    EXPECT_GT(refused, 5);
}
