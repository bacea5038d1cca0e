// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/stored/TreeWriter.h"

#include "aaf_library/stored/CompoundFileReader.h"
#include "aaf_library/stored/StoredError.h"
#include "aaf_library/stored/StoredFile.h"
#include "tests/unit/aaf_library/stored/Refusal.h"
#include "tests/unit/aaf_library/stored/SampleTree.h"

#include <gtest/gtest.h>

using namespace aaf::stored;

namespace {

Bytes StreamOf(const Bytes& file, const std::vector<std::u16string>& path) {
    CompoundFileReader reader(file);
    std::uint32_t at = CompoundFileReader::kRootIndex;
    for (const std::u16string& name : path) {
        const auto& contained = reader.entry(at).contained;
        const auto found = contained.find(name);
        if (found == contained.end()) {
            return {};
        }
        at = found->second;
    }
    return reader.Read(at);
}

std::string TreeRefusal(const StoredObject& tree) {
    return RefusalOf([&] { WriteTree(tree, SectorSize::Bytes512); });
}

}  // namespace

TEST(TreeWriter, LaysOutATimecodeByteForByte) {
    const StoredAuid timecode = {1, 2, 3, 1, 0, 1, 0, 0, 6, 0x0E, 0x2B, 0x34, 4, 1, 1, 1};
    StoredObject segment;
    segment.classId = sample::auid(1);
    StoredProperty definition;
    definition.pid = 0x0201;
    definition.form = StoredForm::WeakReference;
    definition.keys = {sample::bytes(timecode)};
    definition.keyPid = 0x1B01;
    definition.targetPath = {0x0002, 0x3B04, 0x2605};
    segment.properties = {definition, sample::data(0x0202, {0x64, 0, 0, 0, 0, 0, 0, 0}),
                          sample::data(0x1501, {0x80, 0x51, 1, 0, 0, 0, 0, 0}),
                          sample::data(0x1502, {0x18, 0}), sample::data(0x1503, {0})};
    const Bytes file = WriteTree(sample::RootWith(sample::reference(0x4803, u"Segment", segment)),
                                 SectorSize::Bytes512);
    const Bytes expected = {
        0x4C, 0x20, 0x05, 0x00, 0x01, 0x02, 0x02, 0x00, 0x15, 0x00, 0x02, 0x02, 0x82, 0x00, 0x08,
        0x00, 0x01, 0x15, 0x82, 0x00, 0x08, 0x00, 0x02, 0x15, 0x82, 0x00, 0x02, 0x00, 0x03, 0x15,
        0x82, 0x00, 0x01, 0x00, 0x00, 0x00, 0x01, 0x1B, 0x10, 0x01, 0x02, 0x03, 0x01, 0x00, 0x01,
        0x00, 0x00, 0x06, 0x0E, 0x2B, 0x34, 0x04, 0x01, 0x01, 0x01, 0x64, 0x00, 0x00, 0x00, 0x00,
        0x00, 0x00, 0x00, 0x80, 0x51, 0x01, 0x00, 0x00, 0x00, 0x00, 0x00, 0x18, 0x00, 0x00};
    EXPECT_EQ(StreamOf(file, {u"Segment-4803", u"properties"}), expected);
    const Bytes paths = {0x4C, 1, 0, 4, 0, 0, 0, 0x02, 0, 0x04, 0x3B, 0x05, 0x26, 0, 0};
    EXPECT_EQ(StreamOf(file, {u"referenced properties"}), paths);
}

TEST(TreeWriter, LaysOutTheIndexOfAVector) {
    const StoredObject bare;
    const Bytes file =
        WriteTree(sample::RootWith(sample::vector(0x4403, u"Slots", {bare, bare, bare})),
                  SectorSize::Bytes512);
    const Bytes expected = {3, 0, 0, 0, 3, 0, 0, 0, 0xFF, 0xFF, 0xFF, 0xFF,
                            0, 0, 0, 0, 1, 0, 0, 0, 2,    0,    0,    0};
    EXPECT_EQ(StreamOf(file, {u"Slots-4403 index"}), expected);
    EXPECT_EQ(StreamOf(file, {u"Slots-4403{2}", u"properties"}), (Bytes{0x4C, 0x20, 0, 0}));
}

TEST(TreeWriter, LaysOutTheIndexOfASet) {
    const Bytes file =
        WriteTree(sample::RootWith(sample::set(0x1901, u"Mobs", {sample::keyed(0x42)})),
                  SectorSize::Bytes4096);
    Bytes expected = {1, 0, 0,  0, 1, 0, 0, 0, 0xFF, 0xFF, 0xFF, 0xFF,
                      5, 0, 16, 0, 0, 0, 0, 1, 0,    0,    0};
    const Bytes key = sample::bytes(sample::auid(0x42));
    expected.insert(expected.end(), key.begin(), key.end());
    EXPECT_EQ(StreamOf(file, {u"Mobs-1901 index"}), expected);
}

TEST(TreeWriter, RefusesAPropertyThatOccursTwice) {
    StoredObject tree = sample::RootWith(sample::data(0x4402, {1}));
    tree.properties.push_back(sample::data(0x4402, {2}));
    EXPECT_EQ(TreeRefusal(tree), "property 4402: occurs twice in one object");
}

TEST(TreeWriter, RefusesAValueThatDoesNotFitItsSizeField) {
    EXPECT_EQ(TreeRefusal(sample::RootWith(sample::data(0x4402, Bytes(65536)))),
              "property 4402: 65536 bytes, a value may take 65535");
}

TEST(TreeWriter, RefusesEqualKeysInASet) {
    EXPECT_EQ(TreeRefusal(sample::RootWith(
                  sample::set(0x1901, u"Mobs", {sample::keyed(1), sample::keyed(1)}))),
              "property 1901: two elements of a set have the same key");
}

TEST(TreeWriter, RefusesAnElementThatDoesNotStoreItsKey) {
    StoredProperty set = sample::set(0x1901, u"Mobs", {sample::keyed(1)});
    set.objects[0].properties.clear();
    EXPECT_EQ(TreeRefusal(sample::RootWith(set)),
              "property 1901: an element does not store its key");
}

TEST(TreeWriter, RefusesKeysAndObjectsThatDoNotPair) {
    StoredProperty set = sample::set(0x1901, u"Mobs", {sample::keyed(1)});
    set.keys.clear();
    EXPECT_EQ(TreeRefusal(sample::RootWith(set)), "property 1901: a set has 1 elements and 0 keys");
}

TEST(TreeWriter, RefusesAReferenceWithoutObject) {
    StoredProperty property = sample::reference(0x4803, u"Segment", {});
    property.objects.clear();
    EXPECT_EQ(TreeRefusal(sample::RootWith(property)),
              "property 4803: a strong reference holds one object, not 0");
}

TEST(TreeWriter, RefusesAWeakReferenceThatLeadsNowhere) {
    StoredProperty property;
    property.pid = 0x0201;
    property.form = StoredForm::WeakReference;
    EXPECT_EQ(TreeRefusal(sample::RootWith(property)),
              "property 0201: a weak reference has one key, not 0");
    property.keys = {sample::bytes(sample::auid(1))};
    EXPECT_EQ(TreeRefusal(sample::RootWith(property)),
              "property 0201: a weak reference without a path to its targets");
    property.targetPath = {2, 0, 3};
    EXPECT_EQ(TreeRefusal(sample::RootWith(property)),
              "property 0201: a weak reference without a path to its targets");
    property.targetPath = {2, 3};
    property.keys = {Bytes(15)};
    EXPECT_EQ(TreeRefusal(sample::RootWith(property)), "property 0201: a key of 15 bytes");
}

TEST(TreeWriter, RefusesNamesThatACompoundFileCannotHold) {
    EXPECT_EQ(TreeRefusal(sample::RootWith(sample::reference(0x4803, u"a/b", {}))),
              "\"a/b-4803\" cannot be the name of a storage or stream");
}

TEST(TreeWriter, RefusesNestingWithoutEnd) {
    StoredObject tree;
    for (int i = 0; i < kMaximumDepth; ++i) {
        tree = sample::RootWith(sample::reference(0x4803, u"Segment", tree));
    }
    EXPECT_EQ(TreeRefusal(tree), "");
    tree = sample::RootWith(sample::reference(0x4803, u"Segment", tree));
    EXPECT_NE(TreeRefusal(tree).find("objects are nested too deep"), std::string::npos);
}

TEST(TreeWriter, NamesThePlaceOfADeepDefect) {
    StoredObject inner = sample::RootWith(sample::data(0x5001, Bytes(70000)));
    const StoredObject tree = sample::RootWith(sample::vector(0x4403, u"Slots", {{}, inner}));
    EXPECT_EQ(TreeRefusal(tree),
              "Slots-4403{1}: property 5001: 70000 bytes, a value may take 65535");
}

TEST(TreeWriter, AnObjectLaidOutBeforeGivesTheSameBytes) {
    const std::vector<TargetPath> paths = {{0x0002, 0x3B04, 0x2605}};
    StoredProperty definition;
    definition.pid = 0x0201;
    definition.form = StoredForm::WeakReference;
    definition.keys = {sample::bytes(sample::auid(7))};
    definition.keyPid = 0x1B01;
    definition.targetPath = paths[0];
    StoredObject whole = sample::EveryForm();
    whole.properties.clear();
    whole.properties = {sample::keyed(9).properties[0], definition,
                        sample::vector(0x4403, u"Slots", {sample::keyed(1), {}})};
    StoredObject known = whole;
    known.properties.clear();
    const auto fileWith = [&](const StoredObject& object, SectorSize size) {
        StoredProperty set = sample::set(0x1901, u"Mobs", {sample::keyed(3)});
        set.objects.push_back(object);
        set.keys.push_back(sample::bytes(sample::auid(9)));
        StoredObject root = sample::RootWith(definition);
        root.properties.push_back(set);
        root.properties.push_back(sample::stream(0x2702, u"Data", Bytes(5000, 1)));
        return WriteTree(root, size);
    };
    const Bytes small = fileWith(whole, SectorSize::Bytes512);
    const Bytes large = fileWith(whole, SectorSize::Bytes4096);
    // One of these is the place where it stands.
    for (std::uint32_t entry = 0; entry < 40; ++entry) {
        for (std::uint32_t sector = 0; sector < 40; ++sector) {
            known.laidOut = LayOut(whole, paths, {entry, sector});
            ASSERT_NE(known.laidOut, nullptr);
            ASSERT_EQ(fileWith(known, SectorSize::Bytes512), small) << entry << ", " << sector;
            ASSERT_EQ(fileWith(known, SectorSize::Bytes4096), large) << entry << ", " << sector;
        }
    }
}

TEST(TreeWriter, AnObjectWithALongStreamIsNotLaidOutBefore) {
    const auto holding = [](std::size_t size) {
        return sample::RootWith(sample::stream(0x2702, u"Data", Bytes(size, 1)));
    };
    EXPECT_NE(LayOut(holding(4095), {}), nullptr);
    EXPECT_EQ(LayOut(holding(4096), {}), nullptr);
}

TEST(TreeWriter, RefusesAnObjectThatWasLaidOutForOtherTargets) {
    StoredProperty definition;
    definition.pid = 0x0201;
    definition.form = StoredForm::WeakReference;
    definition.keys = {sample::bytes(sample::auid(7))};
    definition.targetPath = {2, 3};
    StoredObject root = sample::RootWith(definition);
    StoredObject known;
    known.laidOut = LayOut({}, {{4, 5}});
    root.properties.push_back(sample::reference(0x4803, u"Segment", known));
    EXPECT_EQ(TreeRefusal(root), "an object was laid out for another table of targets");
}
