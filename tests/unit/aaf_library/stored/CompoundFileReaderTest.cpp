// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/stored/CompoundFileReader.h"

#include "aaf_library/stored/CompoundFileFormat.h"
#include "aaf_library/stored/CompoundFileWriter.h"
#include "aaf_library/stored/StoredError.h"
#include "tests/unit/aaf_library/stored/CompoundBytes.h"
#include "tests/unit/aaf_library/stored/Refusal.h"

#include <gtest/gtest.h>

using namespace aaf::stored;

namespace {

Bytes ThreeStreams() {
    CompoundFileWriter writer(SectorSize::Bytes512);
    writer.AddStream(CompoundFileWriter::kRoot, u"a", Bytes(10, 1));
    writer.AddStream(CompoundFileWriter::kRoot, u"b", Bytes(5000, 2));
    const auto inner = writer.AddStorage(CompoundFileWriter::kRoot, u"inner");
    writer.AddStream(inner, u"c", Bytes(100, 3));
    return writer.Finish();
}

void put(Bytes& file, std::size_t at, std::uint32_t value) {
    for (int i = 0; i < 4; ++i) {
        file[at + static_cast<std::size_t>(i)] = static_cast<std::uint8_t>(value >> 8 * i);
    }
}

// Where the directory entry of that number stands; the sample's directory is
// short enough for its sectors to follow one another.
std::size_t EntryAt(const Bytes& file, std::size_t index) {
    return (NumberAt(file, kFirstDirectoryOffset) + 1) * 512 + index * kDirectoryEntrySize;
}

std::string StreamRefusal(const Bytes& file) {
    return RefusalOf([&] {
        CompoundFileReader reader(file);
        for (const auto& contained : reader.entry(CompoundFileReader::kRootIndex).contained) {
            if (reader.entry(contained.second).kind == CompoundFileReader::Kind::Stream) {
                reader.Read(contained.second);
            }
        }
    });
}

}  // namespace

TEST(CompoundFileReader, ReadsStreamsOfBothKindsAndNestedStorages) {
    const Bytes file = ThreeStreams();
    CompoundFileReader reader(file);
    const auto& root = reader.entry(CompoundFileReader::kRootIndex).contained;
    ASSERT_EQ(root.size(), 3u);
    EXPECT_EQ(reader.Read(root.at(u"a")), Bytes(10, 1));
    EXPECT_EQ(reader.Read(root.at(u"b")), Bytes(5000, 2));
    const auto& inner = reader.entry(root.at(u"inner")).contained;
    EXPECT_EQ(reader.Read(inner.at(u"c")), Bytes(100, 3));
}

TEST(CompoundFileReader, GivesAStreamOutOnce) {
    const Bytes file = ThreeStreams();
    CompoundFileReader reader(file);
    const auto& root = reader.entry(CompoundFileReader::kRootIndex).contained;
    reader.Read(root.at(u"a"));
    EXPECT_THROW(reader.Read(root.at(u"a")), StoredError);
    reader.Read(root.at(u"b"));
    EXPECT_THROW(reader.Read(root.at(u"b")), StoredError);
}

TEST(CompoundFileReader, RefusesOtherKindsOfFiles) {
    EXPECT_EQ(StreamRefusal({}), "is no compound file");
    EXPECT_EQ(StreamRefusal(Bytes(4096)), "is no compound file");
    Bytes file = ThreeStreams();
    file[kSectorShiftOffset] = 10;
    EXPECT_EQ(StreamRefusal(file), "a kind of compound file that AAF does not use");
    file = ThreeStreams();
    file.resize(512);
    EXPECT_EQ(StreamRefusal(file), "the file ends after its header");
}

TEST(CompoundFileReader, RefusesACircleAmongSiblings) {
    Bytes file = ThreeStreams();
    const std::uint32_t first = NumberAt(file, EntryAt(file, 0) + kEntryChildOffset);
    put(file, EntryAt(file, first) + kEntryLeftOffset, first);
    EXPECT_EQ(StreamRefusal(file),
              "the directory names an entry twice or one that it does not have");
}

TEST(CompoundFileReader, RefusesAStorageThatContainsTheRoot) {
    Bytes file = ThreeStreams();
    for (std::size_t i = 1; i < 5; ++i) {
        if (file[EntryAt(file, i) + 66] == 1) {
            put(file, EntryAt(file, i) + kEntryChildOffset, 0);
        }
    }
    EXPECT_EQ(StreamRefusal(file),
              "the directory names an entry twice or one that it does not have");
}

TEST(CompoundFileReader, RefusesAnEntryBeyondTheDirectory) {
    Bytes file = ThreeStreams();
    const std::uint32_t first = NumberAt(file, EntryAt(file, 0) + kEntryChildOffset);
    put(file, EntryAt(file, first) + kEntryRightOffset, 5000);
    EXPECT_EQ(StreamRefusal(file),
              "the directory names an entry twice or one that it does not have");
}

TEST(CompoundFileReader, RefusesAChainThatRunsInACircle) {
    Bytes file = ThreeStreams();
    const std::uint32_t table = NumberAt(file, kTableListOffset);
    const std::uint32_t directory = NumberAt(file, kFirstDirectoryOffset);
    put(file, (table + 1) * 512 + directory * 4, directory);
    EXPECT_EQ(StreamRefusal(file), "sector " + std::to_string(directory) + " is used twice");
}

TEST(CompoundFileReader, RefusesAStreamThatRunsOutOfTheFile) {
    Bytes file = ThreeStreams();
    for (std::size_t i = 1; i < 5; ++i) {
        if (NumberAt(file, EntryAt(file, i) + kEntrySizeOffset) == 5000) {
            put(file, EntryAt(file, i) + kEntryStartOffset, 4000);
        }
    }
    EXPECT_EQ(StreamRefusal(file), "sector 4000 lies beyond the end of the file");
}

TEST(CompoundFileReader, RefusesAHugeClaimBeforeItTakesMemory) {
    Bytes file = ThreeStreams();
    for (std::size_t i = 1; i < 5; ++i) {
        if (NumberAt(file, EntryAt(file, i) + kEntrySizeOffset) == 5000) {
            put(file, EntryAt(file, i) + kEntrySizeOffset, 0xFFFFFFF0);
        }
    }
    EXPECT_EQ(StreamRefusal(file), "a stream claims 4294967280 bytes");
    file = ThreeStreams();
    put(file, kTableCountOffset, 0x7FFFFFFF);
    EXPECT_EQ(StreamRefusal(file).find("the header counts 2147483647 table sectors"), 0u);
}

TEST(CompoundFileReader, RefusesTwoStreamsThatShareASector) {
    Bytes file = ThreeStreams();
    for (std::size_t i = 1; i < 5; ++i) {
        if (NumberAt(file, EntryAt(file, i) + kEntrySizeOffset) == 10) {
            put(file, EntryAt(file, i) + kEntrySizeOffset, 5000);
            put(file, EntryAt(file, i) + kEntryStartOffset, 0);
        } else if (NumberAt(file, EntryAt(file, i) + kEntrySizeOffset) == 5000) {
            put(file, EntryAt(file, i) + kEntryStartOffset, 0);
        }
    }
    EXPECT_EQ(StreamRefusal(file), "sector 0 is used twice");
}

namespace {

// Header and empty sectors of a file that is made by hand.
Bytes FileOf(std::uint32_t sectors, std::uint32_t sectorShift) {
    Bytes file((1 + std::size_t{sectors}) << sectorShift);
    std::copy(std::begin(kCompoundMagic), std::end(kCompoundMagic), file.begin());
    file[28] = 0xFE;
    file[29] = 0xFF;
    file[kSectorShiftOffset] = static_cast<std::uint8_t>(sectorShift);
    file[32] = 6;
    put(file, kSmallLimitOffset, kSmallStreamLimit);
    put(file, kFirstSmallTableOffset, kEndOfChain);
    return file;
}

void PutEntry(Bytes& file, std::size_t at, const std::string& name, std::uint8_t kind,
              std::uint32_t right, std::uint32_t child) {
    for (std::size_t c = 0; c < name.size(); ++c) {
        file[at + 2 * c] = static_cast<std::uint8_t>(name[c]);
    }
    file[at + 64] = static_cast<std::uint8_t>(2 * name.size() + 2);
    file[at + 66] = kind;
    put(file, at + kEntryLeftOffset, kFreeSector);
    put(file, at + kEntryRightOffset, right);
    put(file, at + kEntryChildOffset, child);
}

// A file of small sectors with so many of them for the allocation table: they come first,
// behind them the sectors that list those for which the header has no place, then the directory.
Bytes FileWithTables(std::uint32_t tables) {
    constexpr std::uint32_t kListed = 127;  // of 128 numbers the last names the next list
    const std::uint32_t beyond = tables > kHeaderTableCount ? tables - kHeaderTableCount : 0;
    const std::uint32_t lists = (beyond + kListed - 1) / kListed;
    const std::uint32_t directory = tables + lists;
    Bytes file = FileOf(directory + 1, 9);
    std::fill(file.begin() + 512, file.end() - 512, std::uint8_t{0xFF});
    const auto place = [](std::uint32_t sector) { return (std::size_t{sector} + 1) * 512; };
    put(file, kTableCountOffset, tables);
    put(file, kFirstDirectoryOffset, directory);
    put(file, kFirstTableListOffset, lists > 0 ? tables : kEndOfChain);
    for (std::uint32_t i = 0; i < tables; ++i) {
        const std::uint32_t behind = i - kHeaderTableCount;
        put(file,
            i < kHeaderTableCount
                ? kTableListOffset + 4 * std::size_t{i}
                : place(tables + behind / kListed) + 4 * std::size_t{behind % kListed},
            i);
    }
    for (std::uint32_t i = 0; i < lists; ++i) {
        put(file, place(tables + i) + 4 * kListed, i + 1 < lists ? tables + i + 1 : kEndOfChain);
    }
    put(file, place(0) + 4 * std::size_t{directory}, kEndOfChain);
    PutEntry(file, place(directory), "Root Entry", 5, kFreeSector, kFreeSector);
    return file;
}

}  // namespace

TEST(CompoundFileReader, ReadsAsManyTablesAsTheHeaderCounts) {
    // Those of the header alone; one, all but one and all of a list; two of a second list.
    for (const std::uint32_t tables : {108u, 109u, 110u, 109u + 126u, 109u + 127u, 109u + 129u}) {
        EXPECT_EQ(StreamRefusal(FileWithTables(tables)), "") << tables;
    }
}

// Siblings in one long chain are what a simple writer makes of a large set;
// no walk may go deeper with their number.
TEST(CompoundFileReader, WalksAVeryLongChainOfSiblings) {
    constexpr std::uint32_t count = 60000;
    constexpr std::uint32_t perSector = 4096 / kDirectoryEntrySize;
    const std::uint32_t directorySectors = (count + 1 + perSector - 1) / perSector;
    const std::uint32_t tableSectors = (directorySectors + 2 + 1023) / 1024;
    Bytes file = FileOf(tableSectors + directorySectors, 12);
    put(file, kTableCountOffset, tableSectors);
    put(file, kFirstDirectoryOffset, tableSectors);
    for (std::uint32_t i = 0; i < tableSectors; ++i) {
        put(file, kTableListOffset + 4 * i, i);
    }
    for (std::uint32_t i = 0; i < directorySectors; ++i) {
        const bool last = i + 1 == directorySectors;
        put(file, 4096 + std::size_t{tableSectors + i} * 4,
            last ? kEndOfChain : tableSectors + i + 1);
    }
    for (std::uint32_t i = 0; i <= count; ++i) {
        PutEntry(file, (tableSectors + 1) * std::size_t{4096} + i * kDirectoryEntrySize,
                 i == 0 ? "Root Entry" : std::to_string(100000 + i), i == 0 ? 5 : 1,
                 i == 0 || i == count ? kFreeSector : i + 1, i == 0 ? 1 : kFreeSector);
    }
    CompoundFileReader reader(file);
    EXPECT_EQ(reader.entry(CompoundFileReader::kRootIndex).contained.size(), count);
}
