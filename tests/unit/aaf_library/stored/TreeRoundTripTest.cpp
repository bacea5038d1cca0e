// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/stored/CompoundFileReader.h"
#include "aaf_library/stored/StoredFile.h"
#include "aaf_library/stored/StoredNames.h"
#include "aaf_library/stored/TreeReader.h"
#include "aaf_library/stored/TreeWriter.h"
#include "tests/unit/aaf_library/stored/SampleTree.h"

#include <gtest/gtest.h>
#include <algorithm>

using namespace aaf::stored;

namespace {

// What a tree looks like after a round trip: squeezed names stay squeezed.
StoredObject AsRead(StoredObject object) {
    for (StoredProperty& property : object.properties) {
        if (property.form == StoredForm::StrongVector || property.form == StoredForm::StrongSet ||
            property.form == StoredForm::WeakVector || property.form == StoredForm::WeakSet) {
            property.name = PropertyPart(CollectionName(property.name, property.pid), property.pid);
        }
        for (StoredObject& contained : property.objects) {
            contained = AsRead(contained);
        }
    }
    return object;
}

class TreeRoundTrip : public testing::TestWithParam<SectorSize> {};

}  // namespace

TEST_P(TreeRoundTrip, EveryStoredFormComesBackAsItWas) {
    const StoredObject tree = sample::EveryForm();
    EXPECT_EQ(ReadTree(WriteTree(tree, GetParam())), AsRead(tree));
}

TEST_P(TreeRoundTrip, TheSameTreeGivesTheSameBytes) {
    const StoredObject tree = sample::EveryForm();
    EXPECT_EQ(WriteTree(tree, GetParam()), WriteTree(tree, GetParam()));
}

TEST_P(TreeRoundTrip, ATreeThatWasReadIsWrittenAsTheSameBytes) {
    const Bytes first = WriteTree(sample::EveryForm(), GetParam());
    EXPECT_EQ(WriteTree(ReadTree(first), GetParam()), first);
}

TEST_P(TreeRoundTrip, TheFileIsAWholeNumberOfSectorsWithRootClassAndSignature) {
    const Bytes file = WriteTree(sample::EveryForm(), GetParam());
    EXPECT_EQ(file.size() % static_cast<std::size_t>(GetParam()), 0u);
    const CompoundFileReader reader(file);
    EXPECT_EQ(reader.sectorSize(), GetParam());
    EXPECT_EQ(reader.entry(CompoundFileReader::kRootIndex).classId, kRootClassId);
    const StoredAuid wanted =
        GetParam() == SectorSize::Bytes512
            ? StoredAuid{0x41, 0x41, 0x46, 0x42, 0x0D, 0, 0x4F, 0x4D,
                         6,    0x0E, 0x2B, 0x34, 1,    1, 1,    0xFF}
            : StoredAuid{1, 2, 1, 0x0D, 0, 2, 0, 0, 6, 0x0E, 0x2B, 0x34, 3, 2, 1, 1};
    EXPECT_EQ(reader.signature(), wanted);
}

// Around 127 sectors a table of 512 bytes is full.
TEST_P(TreeRoundTrip, StreamsOfManySizesKeepTheFileConsistent) {
    for (std::size_t sectors = 118; sectors <= 134; ++sectors) {
        const Bytes content(sectors * 4096 - 1, 0xAB);
        const StoredObject tree = sample::RootWith(sample::stream(0x2702, u"Data", content));
        const Bytes file = WriteTree(tree, GetParam());
        ASSERT_EQ(file.size() % static_cast<std::size_t>(GetParam()), 0u) << sectors;
        ASSERT_EQ(ReadTree(file), tree) << sectors;
    }
}

// More table sectors than the header can list.
TEST(TreeRoundTripLarge, ATableListBeyondTheHeaderIsFollowed) {
    const Bytes content(8u << 20, 0x5C);
    const StoredObject tree = sample::RootWith(sample::stream(0x2702, u"Data", content));
    EXPECT_EQ(ReadTree(WriteTree(tree, SectorSize::Bytes512)), tree);
}

TEST_P(TreeRoundTrip, ManyObjectsInOneSetAreKept) {
    StoredProperty set = sample::set(0x1901, u"Mobs", {});
    for (int i = 0; i < 3000; ++i) {
        StoredObject object = sample::keyed(static_cast<std::uint8_t>(i >> 8));
        object.properties.front().bytes[1] = static_cast<std::uint8_t>(i);
        set.keys.push_back(object.properties.front().bytes);
        set.objects.push_back(object);
    }
    const StoredObject tree = sample::RootWith(set);
    EXPECT_EQ(ReadTree(WriteTree(tree, GetParam())), tree);
}

TEST_P(TreeRoundTrip, SetsAreStoredInTheOrderOfTheirKeys) {
    const StoredObject mixed = sample::RootWith(
        sample::set(0x1901, u"Mobs", {sample::keyed(0xF0), sample::keyed(1), sample::keyed(0x70)}));
    const StoredObject sorted = sample::RootWith(
        sample::set(0x1901, u"Mobs", {sample::keyed(1), sample::keyed(0x70), sample::keyed(0xF0)}));
    EXPECT_EQ(ReadTree(WriteTree(mixed, GetParam())), sorted);
    EXPECT_EQ(WriteTree(mixed, GetParam()), WriteTree(sorted, GetParam()));
}

TEST_P(TreeRoundTrip, WeakSetsAreStoredInTheOrderOfTheirKeysAndVectorsAsTheyAre) {
    StoredProperty weak;
    weak.pid = 0x1E09;
    weak.form = StoredForm::WeakSet;
    weak.name = u"Parameters";
    weak.keyPid = 0x1B01;
    weak.targetPath = {2, 0x3B04};
    weak.keys = {sample::bytes(sample::auid(9)), sample::bytes(sample::auid(3))};
    StoredProperty sorted = weak;
    std::reverse(sorted.keys.begin(), sorted.keys.end());
    EXPECT_EQ(ReadTree(WriteTree(sample::RootWith(weak), GetParam())), sample::RootWith(sorted));
    weak.form = StoredForm::WeakVector;
    EXPECT_EQ(ReadTree(WriteTree(sample::RootWith(weak), GetParam())), sample::RootWith(weak));
}

TEST_P(TreeRoundTrip, PropertiesWithoutContentAreLeftOut) {
    StoredObject tree;
    tree.classId = kRootClassId;
    tree.properties = {sample::data(0x0201, {}), sample::stream(0x2702, u"Data", {}),
                       sample::text(0x4402, u"")};
    StoredObject expected = tree;
    expected.properties.erase(expected.properties.begin(), expected.properties.begin() + 2);
    EXPECT_EQ(ReadTree(WriteTree(tree, GetParam())), expected);
}

TEST_P(TreeRoundTrip, AFormThatNobodyKnowsSurvivesAsBytes) {
    StoredProperty odd = sample::data(0x4402, {9, 8, 7});
    odd.form = StoredForm(0x86);
    const StoredObject tree = sample::RootWith(odd);
    EXPECT_EQ(ReadTree(WriteTree(tree, GetParam())), tree);
}

TEST_P(TreeRoundTrip, TheLargestValueIsKept) {
    const StoredObject tree = sample::RootWith(sample::data(0x4402, Bytes(65535, 0x31)));
    EXPECT_EQ(ReadTree(WriteTree(tree, GetParam())), tree);
}

INSTANTIATE_TEST_SUITE_P(SectorSizes, TreeRoundTrip,
                         testing::Values(SectorSize::Bytes512, SectorSize::Bytes4096),
                         [](const testing::TestParamInfo<SectorSize>& size) {
                             return std::to_string(static_cast<unsigned>(size.param));
                         });
