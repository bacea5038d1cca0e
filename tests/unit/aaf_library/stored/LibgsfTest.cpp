// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// What we write, read by another library: every name, size and byte, and the tree.

#include "aaf_library/stored/CompoundFileFormat.h"
#include "aaf_library/stored/LittleEndian.h"
#include "aaf_library/stored/ModelWriter.h"
#include "aaf_library/stored/TreeWriter.h"
#include "tests/support/compound/CompoundTree.h"
#include "tests/support/compound/GsfFile.h"
#include "tests/unit/aaf_library/stored/SampleModel.h"
#include "tests/unit/aaf_library/stored/SampleTree.h"

#include <gtest/gtest.h>
#include <random>

using namespace aaf::stored;
using compound::Content;
using compound::Node;
using compound::Storage;
using compound::Stream;

namespace {

std::u16string Number(std::size_t number) {
    const std::string digits = std::to_string(number);
    return std::u16string(digits.begin(), digits.end());
}

// Read by libgsf and by our own reader, the file is what was written.
void ExpectWhole(const Node& root, SectorSize sectorSize) {
    const Bytes file = compound::Written(root, sectorSize);
    EXPECT_EQ(compound::Difference(gsf::Read(file), root), "");
    EXPECT_EQ(compound::Difference(compound::Read(file), root), "");
}

// A tree of random shape with names, sizes and classes of every kind.
Node RandomStorage(std::mt19937& random, int depth) {
    const std::u16string letters = u"aZ_\u00E9\u03A9\u4E2D";
    Node node = Storage(u"");
    node.classId[0] = static_cast<std::uint8_t>(random());
    const std::size_t count = random() % 12;
    for (std::size_t i = 0; i < count; ++i) {
        const bool isStorage = depth < 3 && random() % 2 == 0;
        Node contained = isStorage ? RandomStorage(random, depth + 1)
                                   : Stream(u"", Content(random() % (i % 3 == 0 ? 9000 : 300)));
        contained.name =
            std::u16string(1 + random() % 20, letters[random() % letters.size()]) + Number(i);
        node.nodes.push_back(std::move(contained));
    }
    return node;
}

class LibgsfOf : public testing::TestWithParam<SectorSize> {};

}  // namespace

TEST_P(LibgsfOf, ReadsAFileWithoutContent) {
    ExpectWhole(Storage(u""), GetParam());
}

// Short streams lie in small sectors, those from 4096 bytes on in sectors of their own.
TEST_P(LibgsfOf, ReadsStreamsOfEverySizeAroundALimit) {
    Node root = Storage(u"");
    for (const std::size_t size : {0, 1, 63, 64, 65, 127, 128, 129, 511, 512, 513, 4095, 4096, 4097,
                                   8191, 8192, 8193, 70000}) {
        root.nodes.push_back(Stream(Number(size), Content(size)));
        ExpectWhole(Storage(u"", {root.nodes.back()}), GetParam());
    }
    ExpectWhole(root, GetParam());
}

TEST_P(LibgsfOf, ReadsStoragesWithinStoragesWithTheirClasses) {
    Node root = Storage(u"innermost", {Stream(u"stream", Content(5000))});
    for (std::uint8_t depth = 0; depth < 60; ++depth) {
        root.classId.fill(depth);
        root = Storage(u"storage", {std::move(root), Stream(u"stream", Content(depth))});
    }
    ExpectWhole(root, GetParam());
}

TEST_P(LibgsfOf, ReadsManyStoragesAndStreamsInOneStorage) {
    Node root = Storage(u"");
    for (std::size_t i = 0; i < 3000; ++i) {
        const std::u16string name = u"Slot{" + Number(i * 7919 % 3000) + u"}";
        root.nodes.push_back(i % 2 == 0 ? Storage(name, {Stream(u"properties", Content(i % 200))})
                                        : Stream(name, Content(i % 200)));
    }
    ExpectWhole(root, GetParam());
}

TEST_P(LibgsfOf, ReadsNamesOfEveryScript) {
    Node root = Storage(u"");
    for (const char16_t* name :
         {u"\u00E9t\u00E9", u"\u00D6", u"\u03C9\u03A9", u"\u0436", u"\u4E2D\u6587", u"\u0661",
          u"\xD83C\xDFAC", u"a\xD83C\xDFAC", u"\uFF5A", u"\u1F80", u"\u01C6", u"\u0130", u"\u0131",
          u"\u00DF", u"a b", u"-1", u"\u0001", u"0123456789012345678901234567890"}) {
        root.nodes.push_back(Stream(name, Content(root.nodes.size())));
    }
    // What differs in capitals alone may lie in two storages.
    root.nodes.push_back(Storage(u"storage", {Stream(u"\u00C9T\u00C9", Content(1))}));
    ExpectWhole(root, GetParam());
}

TEST_P(LibgsfOf, ReadsRandomTrees) {
    const unsigned seed = std::random_device()();
    SCOPED_TRACE("seed " + std::to_string(seed));
    std::mt19937 random(seed);
    for (int i = 0; i < 20; ++i) {
        ExpectWhole(RandomStorage(random, 0), GetParam());
    }
}

TEST_P(LibgsfOf, ReadsTreesOfObjects) {
    const Bytes file = WriteTree(sample::EveryForm(), GetParam());
    const Node tree = gsf::Read(file);
    EXPECT_FALSE(tree.nodes.empty());
    EXPECT_EQ(compound::Difference(tree, compound::Read(file)), "");
}

// With definitions that were laid out before and put in as they are.
TEST_P(LibgsfOf, ReadsAModelWithItsDefinitions) {
    const sample::SampleModel model = sample::WholeModel();
    const Bytes file = WriteTree(TreeToWrite(*model.model, *model.header, nullptr), GetParam());
    const Node tree = gsf::Read(file);
    EXPECT_GT(tree.nodes.size(), 2u);
    EXPECT_EQ(compound::Difference(tree, compound::Read(file)), "");
}

// With small sectors; with large ones it makes files that it can't read itself.
TEST(Libgsf, WritesWhatOurReaderReads) {
    std::mt19937 random(7);
    for (int i = 0; i < 20; ++i) {
        const Node root = RandomStorage(random, 0);
        Bytes file = gsf::Written(root, SectorSize::Bytes512);
        file.resize((file.size() + 511) / 512 * 512);  // it may leave the last sector short
        EXPECT_EQ(compound::Difference(compound::Read(file), root), "");
    }
}

// The header lists 109 sectors of the allocation table, a sector of the list behind it 127. With
// sectors of 4096 bytes the list begins at 450 MB.
TEST(Libgsf, ReadsFilesWhoseTableIsListedBeyondTheHeader) {
    for (const std::size_t sectors : {109 * 127 - 1, 109 * 127, 236 * 127 - 1, 236 * 127 + 300}) {
        SCOPED_TRACE(sectors);
        const Node root =
            Storage(u"", {Stream(u"short", Content(100)), Stream(u"long", Content(sectors * 512))});
        const Bytes file = compound::Written(root, SectorSize::Bytes512);
        EXPECT_GT(NumberIn(file.data() + kTableCountOffset), kHeaderTableCount - 1);
        EXPECT_EQ(compound::Difference(gsf::Read(file), root), "");
    }
}

INSTANTIATE_TEST_SUITE_P(SectorSizes, LibgsfOf,
                         testing::Values(SectorSize::Bytes512, SectorSize::Bytes4096),
                         [](const testing::TestParamInfo<SectorSize>& size) {
                             return std::to_string(static_cast<unsigned>(size.param));
                         });
