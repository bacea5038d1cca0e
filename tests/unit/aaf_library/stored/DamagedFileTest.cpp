// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/stored/CompoundFileWriter.h"
#include "aaf_library/stored/LittleEndian.h"
#include "aaf_library/stored/StoredError.h"
#include "aaf_library/stored/StoredFile.h"
#include "aaf_library/stored/TreeReader.h"
#include "aaf_library/stored/TreeWriter.h"
#include "tests/unit/aaf_library/stored/CompoundBytes.h"
#include "tests/unit/aaf_library/stored/Refusal.h"
#include "tests/unit/aaf_library/stored/SampleTree.h"

#include <gtest/gtest.h>
#include <functional>
#include <random>

using namespace aaf::stored;

namespace {

std::string FileRefusal(const Bytes& file) {
    return RefusalOf([&] { ReadTree(file); });
}

using Storage = CompoundFileWriter::Storage;

// A file whose root storage holds what the function puts there.
Bytes FileWith(const std::function<void(CompoundFileWriter&)>& fill) {
    CompoundFileWriter writer(SectorSize::Bytes512);
    writer.SetClass(kRoot, kRootClassId);
    fill(writer);
    return writer.Finish();
}

// A properties stream with one property.
Bytes OneProperty(std::uint16_t pid, std::uint16_t form, const Bytes& value) {
    return ByteWriter()
        .AppendNumber(std::uint8_t{0x4C})
        .AppendNumber(std::uint8_t{0x20})
        .AppendNumber(std::uint16_t{1})
        .AppendNumber(pid)
        .AppendNumber(form)
        .AppendNumber(static_cast<std::uint16_t>(value.size()))
        .Append(value)
        .bytes();
}

Bytes name(const std::u16string& text) {
    return ByteWriter().AppendText(text).bytes();
}

Bytes FileWithProperties(const Bytes& properties) {
    return FileWith(
        [&](CompoundFileWriter& writer) { writer.AddStream(kRoot, u"properties", properties); });
}

Bytes FileWithIndex(std::uint16_t form, const Bytes& index) {
    return FileWith([&](CompoundFileWriter& writer) {
        writer.AddStream(kRoot, u"properties", OneProperty(0x1901, form, name(u"Mobs-1901")));
        writer.AddStream(kRoot, u"Mobs-1901 index", index);
    });
}

}  // namespace

TEST(DamagedFile, IsRefusedHoweverItIsCutShort) {
    for (SectorSize size : {SectorSize::Bytes512, SectorSize::Bytes4096}) {
        const Bytes file = WriteTree(sample::EveryForm(), size);
        for (std::size_t length = 0; length < file.size(); length += 64) {
            const Bytes cut(file.begin(), file.begin() + static_cast<std::ptrdiff_t>(length));
            // A last sector that nothing uses may be missing; all else is felt.
            const std::string why = FileRefusal(cut);
            if (why.empty()) {
                EXPECT_EQ(ReadTree(cut), ReadTree(file)) << length;
                EXPECT_GE(length, file.size() - static_cast<std::size_t>(size)) << length;
            }
        }
    }
}

TEST(DamagedFile, WithAFlippedByteIsReadOrRefusedButNeverHarms) {
    const Bytes file = WriteTree(sample::EveryForm(), SectorSize::Bytes512);
    std::size_t refused = 0;
    for (std::size_t at = 0; at < file.size(); ++at) {
        Bytes damaged = file;
        damaged[at] ^= at % 2 == 0 ? 0x01 : 0xFF;
        refused += FileRefusal(damaged).empty() ? 0 : 1;
    }
    // Content and padding may change without notice, structure may not.
    EXPECT_GT(refused, file.size() / 20);
}

TEST(DamagedFile, WithSeveralRandomBytesIsReadOrRefusedButNeverHarms) {
    const unsigned seed = std::random_device()();
    SCOPED_TRACE("seed " + std::to_string(seed));
    std::mt19937 random(seed);
    const Bytes file = WriteTree(sample::EveryForm(), SectorSize::Bytes512);
    std::size_t refused = 0;
    for (int round = 0; round < 2000; ++round) {
        Bytes damaged = file;
        for (int i = 0; i < 20; ++i) {
            damaged[random() % damaged.size()] = static_cast<std::uint8_t>(random());
        }
        refused += FileRefusal(damaged).empty() ? 0 : 1;
    }
    EXPECT_GT(refused, 100u);
}

TEST(DamagedFile, WithoutPropertiesIsRefused) {
    EXPECT_EQ(FileRefusal(FileWith([](CompoundFileWriter&) {})), "\"properties\" is missing");
}

TEST(DamagedFile, WithAPropertyTableThatEndsEarlyIsRefused) {
    EXPECT_EQ(FileRefusal(FileWithProperties({0x4C})), "1 bytes wanted, 0 left");
    EXPECT_EQ(FileRefusal(FileWithProperties({0x4C, 0x20, 0xFF, 0xFF})),
              "393210 bytes wanted, 0 left");
    Bytes properties = OneProperty(0x4402, 0x82, {1, 2, 3});
    properties.pop_back();
    EXPECT_EQ(FileRefusal(FileWithProperties(properties)), "property 4402: 3 bytes wanted, 2 left");
}

TEST(DamagedFile, OfTheOtherByteOrderIsRefused) {
    EXPECT_EQ(FileRefusal(FileWithProperties({0x42, 0x20, 0, 0})),
              "big-endian files are not supported");
    EXPECT_EQ(FileRefusal(FileWithProperties({0x41, 0x20, 0, 0})), "unknown byte order");
}

TEST(DamagedFile, APropertyThatComesTwiceCountsOnce) {
    const Bytes twice = {0x4C, 0x20, 2, 0, 2, 0x44, 0x82, 0, 1, 0, 2, 0x44, 0x82, 0, 1, 0, 7, 8};
    const StoredObject tree = ReadTree(FileWithProperties(twice));
    ASSERT_EQ(tree.properties.size(), 2u);
    EXPECT_EQ(tree.Find(0x4402)->bytes, Bytes{7});
    EXPECT_EQ(tree.Find(0x4402)->problem, "");
    EXPECT_EQ(tree.properties[1].problem, "occurs twice");
}

TEST(DamagedFile, WithAPropertyOfNoBytesIsReadWithoutIt) {
    const StoredObject tree = ReadTree(FileWithProperties(OneProperty(0x4402, 0x82, {})));
    EXPECT_TRUE(tree.properties.empty());
}

TEST(DamagedFile, WithAnObjectMissingIsRefused) {
    EXPECT_EQ(FileRefusal(FileWithProperties(OneProperty(2, 0x22, name(u"Header-2")))),
              "property 0002: \"Header-2\" is missing");
}

TEST(DamagedFile, WithANameThatDoesNotEndIsRefused) {
    EXPECT_EQ(FileRefusal(FileWithProperties(OneProperty(2, 0x22, {'H', 0}))),
              "property 0002: a name that does not end with its terminator");
    EXPECT_EQ(FileRefusal(FileWithProperties(OneProperty(2, 0x22, {'H', 0, 0}))),
              "property 0002: a name of 3 bytes");
}

TEST(DamagedFile, WithOneObjectInTwoPlacesIsRefused) {
    Bytes index = ByteWriter()
                      .AppendNumber(std::uint32_t{2})
                      .AppendNumber(std::uint64_t{0})
                      .AppendNumber(std::uint32_t{0})
                      .AppendNumber(std::uint32_t{0})
                      .bytes();
    const Bytes file = FileWith([&](CompoundFileWriter& writer) {
        writer.AddStream(kRoot, u"properties", OneProperty(0x4403, 0x32, name(u"Slots-4403")));
        writer.AddStream(kRoot, u"Slots-4403 index", index);
        const Storage slot = writer.AddStorage(kRoot, u"Slots-4403{0}");
        writer.AddStream(slot, u"properties", {0x4C, 0x20, 0, 0});
    });
    EXPECT_EQ(FileRefusal(file), "property 4403: \"Slots-4403{0}\" is referred to twice");
}

TEST(DamagedFile, WithAnIndexThatClaimsTooMuchIsRefused) {
    Bytes vector(12, 0xFF);
    EXPECT_EQ(FileRefusal(FileWithIndex(0x32, vector)),
              "property 1901: the index counts 4294967295 elements, 0 bytes left");
    Bytes set(12, 0xFF);
    set.insert(set.end(), {0x01, 0x44, 32, 0, 0});
    EXPECT_EQ(FileRefusal(FileWithIndex(0x3A, set)),
              "property 1901: the index counts 4294967295 elements, 2 bytes left");
    set[14] = 0;
    EXPECT_EQ(FileRefusal(FileWithIndex(0x3A, set)), "property 1901: a key of 0 bytes");
}

TEST(DamagedFile, WithAKeyTwiceInOneSetIsRefused) {
    ByteWriter index;
    index.AppendNumber(std::uint32_t{2})
        .AppendNumber(std::uint64_t{0})
        .AppendNumber(std::uint16_t{5});
    index.AppendNumber(std::uint8_t{16});
    for (std::uint32_t i = 0; i < 2; ++i) {
        index.AppendNumber(i).AppendNumber(std::uint32_t{1}).Append(Bytes(16, 7));
    }
    const Bytes file = FileWith([&](CompoundFileWriter& writer) {
        writer.AddStream(kRoot, u"properties", OneProperty(0x1901, 0x3A, name(u"Mobs-1901")));
        writer.AddStream(kRoot, u"Mobs-1901 index", index.bytes());
        for (const char16_t* element : {u"Mobs-1901{0}", u"Mobs-1901{1}"}) {
            const Storage mob = writer.AddStorage(kRoot, element);
            writer.AddStream(mob, u"properties", {0x4C, 0x20, 0, 0});
        }
    });
    EXPECT_EQ(FileRefusal(file), "property 1901: a set has a key twice");
}

TEST(DamagedFile, AWeakReferenceThatMakesNoSenseIsKeptAsItStands) {
    Bytes reference = {7, 0, 0x01, 0x1B, 16};
    reference.resize(21);
    Bytes longKey = {0, 0, 0x01, 0x1B, 17};
    longKey.resize(22);
    const std::pair<Bytes, std::string> kept[] = {
        {reference, "a weak reference has tag 7, the file has 0 paths"},
        {Bytes{7, 0}, "2 bytes wanted, 0 left"},
        {longKey, "a weak reference has tag 0, the file has 0 paths"},
    };
    for (const auto& [value, problem] : kept) {
        const Bytes file = FileWithProperties(OneProperty(0x0201, 0x02, value));
        const StoredObject tree = ReadTree(file);
        ASSERT_EQ(tree.properties.size(), 1u) << problem;
        EXPECT_EQ(tree.properties[0].problem, problem);
        EXPECT_EQ(tree.properties[0].bytes, value) << problem;
        EXPECT_EQ(ReadTree(WriteTree(tree, SectorSize::Bytes512)), tree) << problem;
    }
}

TEST(DamagedFile, WeakReferencesWithABrokenIndexAreKeptAsTheyStand) {
    const Bytes properties = OneProperty(0x001C, 0x12, name(u"MemberTypes-1c"));
    const StoredObject without = ReadTree(FileWithProperties(properties));
    EXPECT_EQ(without.properties.at(0).problem, "\"MemberTypes-1c index\" is missing");
    EXPECT_TRUE(without.properties[0].bytes.empty());
    const StoredObject cut = ReadTree(FileWith([&](CompoundFileWriter& writer) {
        writer.AddStream(kRoot, u"properties", properties);
        writer.AddStream(kRoot, u"MemberTypes-1c index", {1, 0, 0});
    }));
    EXPECT_EQ(cut.properties.at(0).problem, "4 bytes wanted, 3 left");
    EXPECT_EQ(cut.properties[0].bytes, (Bytes{1, 0, 0}));
    for (const StoredObject& tree : {without, cut}) {
        EXPECT_EQ(ReadTree(WriteTree(tree, SectorSize::Bytes512)), tree);
    }
}

TEST(DamagedFile, AStreamThatIsMissingIsKeptByItsName) {
    const Bytes value =
        ByteWriter().AppendNumber(std::uint8_t{0x55}).AppendText(u"Data-2702").bytes();
    const StoredObject tree = ReadTree(FileWithProperties(OneProperty(0x2702, 0x42, value)));
    EXPECT_EQ(tree.properties.at(0).problem, "\"Data-2702\" is missing");
    EXPECT_EQ(tree.properties[0].name, u"Data");
    EXPECT_EQ(ReadTree(WriteTree(tree, SectorSize::Bytes512)), tree);
    const StoredObject unnamed = ReadTree(FileWithProperties(OneProperty(0x2702, 0x42, {0x55, 1})));
    EXPECT_EQ(unnamed.properties.at(0).problem, "a name of 1 bytes");
    EXPECT_EQ(unnamed.properties[0].bytes, (Bytes{0x55, 1}));
    EXPECT_EQ(ReadTree(WriteTree(unnamed, SectorSize::Bytes512)), unnamed);
}

TEST(DamagedFile, APropertyOfAnUnknownFormIsKeptAsItStands) {
    const StoredObject tree = ReadTree(FileWithProperties(OneProperty(0x4402, 0x40, {1, 2, 3})));
    EXPECT_EQ(tree.properties.at(0).bytes, (Bytes{1, 2, 3}));
    EXPECT_EQ(ReadTree(WriteTree(tree, SectorSize::Bytes512)), tree);
}

TEST(DamagedFile, WithATableOfWeakReferencesThatLiesIsRefused) {
    const auto withTable = [](const Bytes& table) {
        return FileWith([&](CompoundFileWriter& writer) {
            writer.AddStream(kRoot, u"properties", {0x4C, 0x20, 0, 0});
            writer.AddStream(kRoot, u"referenced properties", table);
        });
    };
    EXPECT_EQ(FileRefusal(withTable({0x4C, 1, 0, 2, 0, 0, 0, 1, 0, 0, 0})), "");
    EXPECT_EQ(FileRefusal(withTable({0x4C, 1, 0, 0xFF, 0xFF, 0xFF, 0xFF, 1, 0, 0, 0})),
              "the table of weak references ends early");
    EXPECT_EQ(FileRefusal(withTable({0x4C, 9, 0, 2, 0, 0, 0, 1, 0, 0, 0})),
              "the table of weak references has 1 paths and counts 9");
}

TEST(DamagedFile, NestedWithoutEndIsRefused) {
    std::function<void(CompoundFileWriter&, Storage, int)> nest = [&](CompoundFileWriter& writer,
                                                                      Storage storage, int depth) {
        writer.AddStream(storage, u"properties", OneProperty(0x4803, 0x22, name(u"Segment-4803")));
        if (depth > 0) {
            const Storage inner = writer.AddStorage(storage, u"Segment-4803");
            nest(writer, inner, depth - 1);
        }
    };
    const Bytes file =
        FileWith([&](CompoundFileWriter& writer) { nest(writer, kRoot, kMaximumDepth + 50); });
    EXPECT_NE(FileRefusal(file).find("objects are nested too deep"), std::string::npos);
}

TEST(DamagedFile, StoragesThatNobodyNamesArePassedOver) {
    const Bytes file = FileWith([&](CompoundFileWriter& writer) {
        writer.AddStream(kRoot, u"properties", {0x4C, 0x20, 0, 0});
        writer.AddStream(kRoot, u"something else", {1, 2, 3});
    });
    EXPECT_EQ(FileRefusal(file), "");
}
