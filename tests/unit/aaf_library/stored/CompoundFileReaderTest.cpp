// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/stored/CompoundFileReader.h"

#include "aaf_library/stored/CompoundFileFormat.h"
#include "aaf_library/stored/CompoundFileWriter.h"
#include "aaf_library/stored/StoredError.h"

#include <gtest/gtest.h>

using namespace aaf::stored;

namespace {

Bytes threeStreams() {
    CompoundFileWriter writer(SectorSize::Bytes512);
    writer.root().stream(u"a", Bytes(10, 1));
    writer.root().stream(u"b", Bytes(5000, 2));
    StorageWriter inner = writer.root().storage(u"inner");
    inner.stream(u"c", Bytes(100, 3));
    inner.close();
    return writer.finish();
}

std::uint32_t numberAt(const Bytes& file, std::size_t at) {
    return file[at] | file[at + 1] << 8 | file[at + 2] << 16 |
           static_cast<std::uint32_t>(file[at + 3]) << 24;
}

void put(Bytes& file, std::size_t at, std::uint32_t value) {
    for (int i = 0; i < 4; ++i) {
        file[at + static_cast<std::size_t>(i)] = static_cast<std::uint8_t>(value >> 8 * i);
    }
}

// Where the directory entry of that number stands; the sample's directory is
// short enough for its sectors to follow one another.
std::size_t entryAt(const Bytes& file, std::size_t index) {
    return (numberAt(file, firstDirectoryOffset) + 1) * 512 + index * directoryEntrySize;
}

std::string refusal(const Bytes& file) {
    try {
        CompoundFileReader reader(file);
        for (const auto& contained : reader.entry(CompoundFileReader::rootIndex).contained) {
            if (reader.entry(contained.second).kind == CompoundFileReader::Kind::Stream) {
                reader.read(contained.second);
            }
        }
        return "";
    } catch (const StoredError& problem) {
        return problem.what();
    }
}

constexpr std::size_t leftOffset = 68;
constexpr std::size_t rightOffset = 72;
constexpr std::size_t childOffset = 76;
constexpr std::size_t startOffset = 116;
constexpr std::size_t sizeOffset = 120;

}  // namespace

TEST(CompoundFileReader, ReadsStreamsOfBothKindsAndNestedStorages) {
    const Bytes file = threeStreams();
    CompoundFileReader reader(file);
    const auto& root = reader.entry(CompoundFileReader::rootIndex).contained;
    ASSERT_EQ(root.size(), 3u);
    EXPECT_EQ(reader.read(root.at(u"a")), Bytes(10, 1));
    EXPECT_EQ(reader.read(root.at(u"b")), Bytes(5000, 2));
    const auto& inner = reader.entry(root.at(u"inner")).contained;
    EXPECT_EQ(reader.read(inner.at(u"c")), Bytes(100, 3));
}

TEST(CompoundFileReader, GivesAStreamOutOnce) {
    const Bytes file = threeStreams();
    CompoundFileReader reader(file);
    const auto& root = reader.entry(CompoundFileReader::rootIndex).contained;
    reader.read(root.at(u"a"));
    EXPECT_THROW(reader.read(root.at(u"a")), StoredError);
    reader.read(root.at(u"b"));
    EXPECT_THROW(reader.read(root.at(u"b")), StoredError);
}

TEST(CompoundFileReader, RefusesOtherKindsOfFiles) {
    EXPECT_EQ(refusal({}), "is no compound file");
    EXPECT_EQ(refusal(Bytes(4096)), "is no compound file");
    Bytes file = threeStreams();
    file[sectorShiftOffset] = 10;
    EXPECT_EQ(refusal(file), "a kind of compound file that AAF does not use");
    file = threeStreams();
    file.resize(512);
    EXPECT_EQ(refusal(file), "the file ends after its header");
}

TEST(CompoundFileReader, RefusesACircleAmongSiblings) {
    Bytes file = threeStreams();
    const std::uint32_t first = numberAt(file, entryAt(file, 0) + childOffset);
    put(file, entryAt(file, first) + leftOffset, first);
    EXPECT_EQ(refusal(file), "the directory names an entry twice or one that it does not have");
}

TEST(CompoundFileReader, RefusesAStorageThatContainsTheRoot) {
    Bytes file = threeStreams();
    for (std::size_t i = 1; i < 5; ++i) {
        if (file[entryAt(file, i) + 66] == 1) {
            put(file, entryAt(file, i) + childOffset, 0);
        }
    }
    EXPECT_EQ(refusal(file), "the directory names an entry twice or one that it does not have");
}

TEST(CompoundFileReader, RefusesAnEntryBeyondTheDirectory) {
    Bytes file = threeStreams();
    const std::uint32_t first = numberAt(file, entryAt(file, 0) + childOffset);
    put(file, entryAt(file, first) + rightOffset, 5000);
    EXPECT_EQ(refusal(file), "the directory names an entry twice or one that it does not have");
}

TEST(CompoundFileReader, RefusesAChainThatRunsInACircle) {
    Bytes file = threeStreams();
    const std::uint32_t table = numberAt(file, tableListOffset);
    const std::uint32_t directory = numberAt(file, firstDirectoryOffset);
    put(file, (table + 1) * 512 + directory * 4, directory);
    EXPECT_EQ(refusal(file), "sector " + std::to_string(directory) + " is used twice");
}

TEST(CompoundFileReader, RefusesAStreamThatRunsOutOfTheFile) {
    Bytes file = threeStreams();
    for (std::size_t i = 1; i < 5; ++i) {
        if (numberAt(file, entryAt(file, i) + sizeOffset) == 5000) {
            put(file, entryAt(file, i) + startOffset, 4000);
        }
    }
    EXPECT_EQ(refusal(file), "sector 4000 lies beyond the end of the file");
}

TEST(CompoundFileReader, RefusesAHugeClaimBeforeItTakesMemory) {
    Bytes file = threeStreams();
    for (std::size_t i = 1; i < 5; ++i) {
        if (numberAt(file, entryAt(file, i) + sizeOffset) == 5000) {
            put(file, entryAt(file, i) + sizeOffset, 0xFFFFFFF0);
        }
    }
    EXPECT_EQ(refusal(file), "a stream claims 4294967280 bytes");
    file = threeStreams();
    put(file, tableCountOffset, 0x7FFFFFFF);
    EXPECT_EQ(refusal(file).find("the header counts 2147483647 table sectors"), 0u);
}

TEST(CompoundFileReader, RefusesTwoStreamsThatShareASector) {
    Bytes file = threeStreams();
    for (std::size_t i = 1; i < 5; ++i) {
        if (numberAt(file, entryAt(file, i) + sizeOffset) == 10) {
            put(file, entryAt(file, i) + sizeOffset, 5000);
            put(file, entryAt(file, i) + startOffset, 0);
        } else if (numberAt(file, entryAt(file, i) + sizeOffset) == 5000) {
            put(file, entryAt(file, i) + startOffset, 0);
        }
    }
    EXPECT_EQ(refusal(file), "sector 0 is used twice");
}

// Siblings in one long chain are what a simple writer makes of a large set;
// no walk may go deeper with their number.
TEST(CompoundFileReader, WalksAVeryLongChainOfSiblings) {
    constexpr std::uint32_t count = 60000;
    constexpr std::uint32_t perSector = 4096 / directoryEntrySize;
    const std::uint32_t directorySectors = (count + 1 + perSector - 1) / perSector;
    const std::uint32_t tableSectors = (directorySectors + 2 + 1023) / 1024;
    Bytes file((1 + tableSectors + directorySectors) * std::size_t{4096});
    std::copy(std::begin(compoundMagic), std::end(compoundMagic), file.begin());
    file[28] = 0xFE;
    file[29] = 0xFF;
    file[30] = 12;
    file[32] = 6;
    put(file, tableCountOffset, tableSectors);
    put(file, firstDirectoryOffset, tableSectors);
    put(file, smallLimitOffset, smallStreamLimit);
    put(file, firstSmallTableOffset, endOfChain);
    for (std::uint32_t i = 0; i < tableSectors; ++i) {
        put(file, tableListOffset + 4 * i, i);
    }
    for (std::uint32_t i = 0; i < directorySectors; ++i) {
        const bool last = i + 1 == directorySectors;
        put(file, 4096 + std::size_t{tableSectors + i} * 4,
            last ? endOfChain : tableSectors + i + 1);
    }
    for (std::uint32_t i = 0; i <= count; ++i) {
        const std::size_t at = (tableSectors + 1) * std::size_t{4096} + i * directoryEntrySize;
        const std::string name = i == 0 ? "Root Entry" : std::to_string(100000 + i);
        for (std::size_t c = 0; c < name.size(); ++c) {
            file[at + 2 * c] = static_cast<std::uint8_t>(name[c]);
        }
        file[at + 64] = static_cast<std::uint8_t>(2 * name.size() + 2);
        file[at + 66] = i == 0 ? 5 : 1;
        put(file, at + leftOffset, freeSector);
        put(file, at + rightOffset, i == 0 || i == count ? freeSector : i + 1);
        put(file, at + childOffset, i == 0 ? 1 : freeSector);
    }
    CompoundFileReader reader(file);
    EXPECT_EQ(reader.entry(CompoundFileReader::rootIndex).contained.size(), count);
}
