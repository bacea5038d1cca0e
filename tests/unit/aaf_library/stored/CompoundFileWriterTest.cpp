// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/stored/CompoundFileWriter.h"

#include "aaf_library/stored/CompoundFileLimits.h"
#include "aaf_library/stored/CompoundFileReader.h"
#include "aaf_library/stored/StoredError.h"
#include "aaf_library/stored/UpperCase.h"
#include "tests/unit/aaf_library/stored/CompoundBytes.h"

#include <gtest/gtest.h>
#include <algorithm>
#include <map>

using namespace aaf::stored;

namespace {

Bytes Content(std::size_t size) {
    Bytes content(size);
    for (std::size_t i = 0; i < size; ++i) {
        content[i] = static_cast<std::uint8_t>(i * 7 + size);
    }
    return content;
}

Bytes FileWithOneStream(SectorSize sectorSize, std::size_t size) {
    CompoundFileWriter writer(sectorSize);
    writer.AddStream(kRoot, u"stream", Content(size));
    return writer.Finish();
}

std::string Refusal(const std::u16string& name, const std::u16string& second = u"other") {
    CompoundFileWriter writer(SectorSize::Bytes512);
    try {
        writer.AddStorage(kRoot, name);
        writer.AddStream(kRoot, second, {});
        writer.Finish();
        return "";
    } catch (const StoredError& problem) {
        return problem.what();
    }
}

// The names of a storage in the order of its tree.
std::vector<std::u16string> InTreeOrder(const CompoundFileReader& reader, std::uint32_t storage) {
    std::vector<std::u16string> names;
    std::vector<std::uint32_t> above;
    std::uint32_t at = reader.entry(storage).child;
    while (at != kNoEntry || !above.empty()) {
        while (at != kNoEntry) {
            above.push_back(at);
            at = reader.entry(at).left;
        }
        names.push_back(reader.entry(above.back()).name);
        at = reader.entry(above.back()).right;
        above.pop_back();
    }
    return names;
}

class CompoundFileWriterOf : public testing::TestWithParam<SectorSize> {};

}  // namespace

TEST(CompoundFileWriter, LaysOutASmallFileByteForByte) {
    CompoundFileWriter writer(SectorSize::Bytes512);
    writer.SetClass(kRoot, {1, 2, 3, 4, 5, 6, 7, 8, 9, 10, 11, 12, 13, 14, 15, 16});
    writer.AddStream(kRoot, u"ab", {0xAA, 0xBB});
    const auto storage = writer.AddStorage(kRoot, u"c");
    writer.AddStream(storage, u"none", {});
    const Bytes file = writer.Finish();

    // Header; short streams, their table, the directory, the allocation table.
    ASSERT_EQ(file.size(), 5 * 512u);
    Bytes header = {0xD0, 0xCF, 0x11, 0xE0, 0xA1, 0xB1, 0x1A, 0xE1, 0x41, 0x41, 0x46, 0x42, 0x0D,
                    0,    0x4F, 0x4D, 6,    0x0E, 0x2B, 0x34, 1,    1,    1,    0xFF, 0x3E, 0,
                    3,    0,    0xFE, 0xFF, 9,    0,    6,    0,    0,    0,    0,    0,    0,
                    0,    0,    0,    0,    0,    1,    0,    0,    0,    2,    0,    0,    0,
                    0,    0,    0,    0,    0,    0x10, 0,    0,    1,    0,    0,    0,    1,
                    0,    0,    0,    0xFE, 0xFF, 0xFF, 0xFF, 0,    0,    0,    0,    3};
    header.resize(80);
    header.resize(512, 0xFF);
    EXPECT_EQ(Bytes(file.begin(), file.begin() + 512), header);

    Bytes small = {0xAA, 0xBB};
    small.resize(512);
    EXPECT_EQ(Bytes(file.begin() + 512, file.begin() + 1024), small);

    Bytes smallTable = {0xFE, 0xFF, 0xFF, 0xFF};
    smallTable.resize(512, 0xFF);
    EXPECT_EQ(Bytes(file.begin() + 1024, file.begin() + 1536), smallTable);

    const auto entry = [&](std::size_t index) {
        const auto at = file.begin() + 1536 + static_cast<std::ptrdiff_t>(index) * 128;
        return Bytes(at, at + 128);
    };
    Bytes root(128);
    const char name[] = "Root Entry";
    for (std::size_t i = 0; i < 10; ++i) {
        root[2 * i] = static_cast<std::uint8_t>(name[i]);
    }
    const Bytes rootTail = {22,   0, 5, 1,  0xFF, 0xFF, 0xFF, 0xFF, 0xFF, 0xFF, 0xFF,
                            0xFF, 1, 0, 0,  0,    1,    2,    3,    4,    5,    6,
                            7,    8, 9, 10, 11,   12,   13,   14,   15,   16};
    std::copy(rootTail.begin(), rootTail.end(), root.begin() + 64);
    root[120] = 64;
    EXPECT_EQ(entry(0), root);

    Bytes stream(128);
    const Bytes streamTail = {6,    0,    2,    1,    2,    0,    0,    0,
                              0xFF, 0xFF, 0xFF, 0xFF, 0xFF, 0xFF, 0xFF, 0xFF};
    stream[0] = 'a';
    stream[2] = 'b';
    std::copy(streamTail.begin(), streamTail.end(), stream.begin() + 64);
    stream[120] = 2;
    EXPECT_EQ(entry(1), stream);

    // The shorter name comes first, so it is on the left, in a last level that is not full and so
    // red. A storage has neither a first sector nor a size.
    Bytes contained(128);
    const Bytes containedTail = {4,    0,    1,    0,    0xFF, 0xFF, 0xFF, 0xFF,
                                 0xFF, 0xFF, 0xFF, 0xFF, 3,    0,    0,    0};
    contained[0] = 'c';
    std::copy(containedTail.begin(), containedTail.end(), contained.begin() + 64);
    EXPECT_EQ(entry(2), contained);

    // A stream without content begins at no sector.
    Bytes empty(128);
    const Bytes emptyTail = {10,   0,    2,    1,    0xFF, 0xFF, 0xFF, 0xFF,
                             0xFF, 0xFF, 0xFF, 0xFF, 0xFF, 0xFF, 0xFF, 0xFF};
    for (std::size_t i = 0; i < 4; ++i) {
        empty[2 * i] = static_cast<std::uint8_t>("none"[i]);
    }
    std::copy(emptyTail.begin(), emptyTail.end(), empty.begin() + 64);
    std::fill(empty.begin() + 116, empty.begin() + 120, 0xFF);
    empty[116] = 0xFE;
    EXPECT_EQ(entry(3), empty);

    Bytes table(512, 0xFF);
    table[0] = table[4] = table[8] = 0xFE;
    table[12] = 0xFD;
    EXPECT_EQ(Bytes(file.begin() + 2048, file.end()), table);
}

TEST(CompoundFileWriter, LargeSectorsHaveAVersionOfTheirOwn) {
    CompoundFileWriter writer(SectorSize::Bytes4096);
    for (int i = 0; i < 32; ++i) {
        writer.AddStorage(kRoot, u"storage " + std::u16string(1, static_cast<char16_t>(u'a' + i)));
    }
    const Bytes file = writer.Finish();
    EXPECT_EQ(file[26], 4);
    EXPECT_EQ(file[30], 12);
    EXPECT_EQ(NumberAt(file, kDirectoryCountOffset), 2u);
    EXPECT_EQ(Bytes(file.begin() + 512, file.begin() + 4096), Bytes(4096 - 512));
}

TEST_P(CompoundFileWriterOf, StreamsOfEverySizeAroundALimitComeBack) {
    const std::size_t sizes[] = {0,   1,   63,   64,   65,   127,  128,  129,  511,
                                 512, 513, 4095, 4096, 4097, 8191, 8192, 8193, 70000};
    CompoundFileWriter writer(GetParam());
    for (std::size_t size : sizes) {
        const std::string digits = std::to_string(size);
        writer.AddStream(kRoot, std::u16string(digits.begin(), digits.end()), Content(size));
    }
    const Bytes file = writer.Finish();
    EXPECT_EQ(file.size() % static_cast<std::size_t>(GetParam()), 0u);
    CompoundFileReader reader(file);
    const auto& contained = reader.entry(kRoot).contained;
    ASSERT_EQ(contained.size(), std::size(sizes));
    for (std::size_t size : sizes) {
        const std::string digits = std::to_string(size);
        const auto index = contained.at(std::u16string(digits.begin(), digits.end()));
        EXPECT_EQ(reader.entry(index).size, size);
        EXPECT_EQ(reader.Read(index), Content(size));
    }
}

TEST_P(CompoundFileWriterOf, AStreamAloneOfEverySizeComesBack) {
    for (std::size_t size : {0, 1, 63, 64, 4095, 4096, 4097}) {
        const Bytes file = FileWithOneStream(GetParam(), size);
        CompoundFileReader reader(file);
        EXPECT_EQ(reader.Read(reader.entry(kRoot).contained.at(u"stream")), Content(size));
    }
}

TEST_P(CompoundFileWriterOf, TenThousandStoragesComeBackInOrder) {
    constexpr std::uint32_t count = 10000;
    CompoundFileWriter writer(GetParam());
    for (std::uint32_t i = 0; i < count; ++i) {
        const std::string digits = std::to_string(i * 7919 % count);
        const auto storage = writer.AddStorage(
            kRoot, u"Slot{" + std::u16string(digits.begin(), digits.end()) + u"}");
        StoredAuid classId{};
        classId[0] = static_cast<std::uint8_t>(i);
        writer.SetClass(storage, classId);
        writer.AddStream(storage, u"properties", Content(i % 200));
    }
    const Bytes file = writer.Finish();
    CompoundFileReader reader(file);
    ASSERT_EQ(reader.entry(kRoot).contained.size(), count);
    for (std::uint32_t i = 0; i < count; ++i) {
        const std::string digits = std::to_string(i * 7919 % count);
        const auto& storage = reader.entry(reader.entry(kRoot).contained.at(
            u"Slot{" + std::u16string(digits.begin(), digits.end()) + u"}"));
        ASSERT_EQ(storage.classId[0], static_cast<std::uint8_t>(i));
        ASSERT_EQ(reader.Read(storage.contained.at(u"properties")), Content(i % 200));
    }
    const std::vector<std::u16string> names = InTreeOrder(reader, kRoot);
    EXPECT_TRUE(std::is_sorted(names.begin(), names.end(), [](const auto& left, const auto& right) {
        return left.size() != right.size() ? left.size() < right.size() : left < right;
    }));
}

// The header lists 109 sectors of the allocation table; a sector of the list
// behind it 127 of 512 bytes.
TEST(CompoundFileWriter, ATableBeyondTheHeadersListGoesOnInSectorsOfItsOwn) {
    struct Case {
        std::size_t sectors;
        std::uint32_t tables;
        std::uint32_t lists;
    };
    // Beside the stream there is a sector for the directory.
    for (const Case& wanted :
         {Case{109 * 127 - 1, 109, 0}, Case{109 * 127, 110, 1}, Case{236 * 127 - 2, 236, 1},
          Case{236 * 127 - 1, 237, 2}, Case{236 * 127 + 300, 239, 2}}) {
        const Bytes file = FileWithOneStream(SectorSize::Bytes512, wanted.sectors * 512);
        EXPECT_EQ(NumberAt(file, kTableCountOffset), wanted.tables) << wanted.sectors;
        EXPECT_EQ(NumberAt(file, kTableListCountOffset), wanted.lists) << wanted.sectors;
        EXPECT_EQ(file.size(), (1 + wanted.sectors + 1 + wanted.tables + wanted.lists) * 512);
        CompoundFileReader reader(file);
        EXPECT_TRUE(reader.Read(reader.entry(kRoot).contained.at(u"stream")) ==
                    Content(wanted.sectors * 512))
            << wanted.sectors;
    }
}

// Every sector has an entry in the allocation table that tells what it is.
TEST_P(CompoundFileWriterOf, TheTableMarksItsOwnSectors) {
    const auto sector = static_cast<std::size_t>(GetParam());
    const Bytes file = FileWithOneStream(GetParam(), 8u << 20);
    std::map<std::uint32_t, std::uint32_t> marks;
    const std::size_t sectors = file.size() / sector - 1;
    const std::size_t first = NumberAt(file, kTableListOffset);
    for (std::size_t i = 0; i < sectors; ++i) {
        const std::uint32_t next = NumberAt(file, (first + 1) * sector + 4 * i);
        if (next > kLastPlainSector) {
            ++marks[next];
        }
    }
    EXPECT_EQ(marks[kFreeSector], 0u);
    EXPECT_EQ(marks[kEndOfChain], 2u);  // the stream and the directory
    EXPECT_EQ(marks[kTableSector], NumberAt(file, kTableCountOffset));
    EXPECT_EQ(marks[kTableListSector], NumberAt(file, kTableListCountOffset));
}

TEST_P(CompoundFileWriterOf, SiblingsAreOrderedByLengthAndThenByUpperCase) {
    CompoundFileWriter writer(GetParam());
    const std::u16string names[] = {u"b",      u"_",      u"Z",           u"a",  u"\u00E9",
                                    u"\u00D6", u"\u00FF", u"zz",          u"A0", u"[",
                                    u"\u03C9", u"\u0410", u"\xD83C\xDFAC"};
    for (const std::u16string& name : names) {
        writer.AddStorage(kRoot, name);
    }
    const Bytes file = writer.Finish();
    const std::vector<std::u16string> wanted = {
        u"a",      u"b",      u"Z",      u"[",  u"_",  u"\u00E9",      u"\u00D6",
        u"\u00FF", u"\u03C9", u"\u0410", u"A0", u"zz", u"\xD83C\xDFAC"};
    EXPECT_EQ(InTreeOrder(CompoundFileReader(file), kRoot), wanted);
}

TEST_P(CompoundFileWriterOf, AnEmptyFileHasItsRoot) {
    CompoundFileWriter writer(GetParam());
    const Bytes file = writer.Finish();
    EXPECT_EQ(file.size(), 3 * static_cast<std::size_t>(GetParam()));
    const CompoundFileReader reader(file);
    EXPECT_EQ(reader.entry(kRoot).name, u"Root Entry");
    EXPECT_TRUE(reader.entry(kRoot).contained.empty());
}

TEST_P(CompoundFileWriterOf, TheLongestNameComesBack) {
    const std::u16string name(31, u'n');
    CompoundFileWriter writer(GetParam());
    writer.AddStream(writer.AddStorage(kRoot, name), name, Content(3));
    const Bytes file = writer.Finish();
    CompoundFileReader reader(file);
    const auto& storage = reader.entry(reader.entry(kRoot).contained.at(name));
    EXPECT_EQ(reader.Read(storage.contained.at(name)), Content(3));
}

TEST(CompoundFileWriter, RefusesNamesThatNoEntryCanHold) {
    EXPECT_EQ(Refusal(std::u16string(31, u'n')), "");
    EXPECT_EQ(Refusal(std::u16string(32, u'n')),
              "\"" + std::string(32, 'n') + "\" cannot be the name of a storage or stream");
    EXPECT_EQ(Refusal(u""), "\"\" cannot be the name of a storage or stream");
    for (const char16_t bad : {u'/', u'\\', u':', u'!', u'\0'}) {
        EXPECT_NE(Refusal(std::u16string(u"a") + bad + u"b"), "") << static_cast<int>(bad);
    }
}

TEST(CompoundFileWriter, RefusesANameTwiceInOneStorage) {
    EXPECT_EQ(Refusal(u"name", u"name"), "\"name\" is twice in one storage");
    EXPECT_EQ(Refusal(u"name", u"Name"), "\"Name\" is twice in one storage");
    EXPECT_EQ(Refusal(u"\u00C9t\u00E9", u"\u00E9T\u00C9"),
              "\"\xC3\xA9T\xC3\x89\" is twice in one storage");
    EXPECT_NE(Refusal(u"\u03C9", u"\u03A9"), "") << "Greek";
    EXPECT_NE(Refusal(u"\u01C6", u"\u01C5"), "") << "one that has a form for titles";
    EXPECT_EQ(Refusal(u"\u00DF", u"SS"), "") << "a letter has one capital or none";
    CompoundFileWriter writer(SectorSize::Bytes512);
    writer.AddStream(writer.AddStorage(kRoot, u"name"), u"name", {});
    EXPECT_NO_THROW(writer.Finish());
}

// Bytes from 0x7FFFFF00 on, up to 2 GiB, are where programs lock.
TEST(CompoundFileLimits, AreThoseOfTheFormatAndOfMemory) {
    EXPECT_EQ(LargestFile(SectorSize::Bytes512), 0x7FFFFE00u) << "the last whole sector before";
    EXPECT_EQ(LockSector(SectorSize::Bytes512), kFreeSector) << "no file reaches it";
    EXPECT_EQ(LargestFile(SectorSize::Bytes4096), 0x100000000u);
    EXPECT_EQ((LockSector(SectorSize::Bytes4096) + 1) * 4096u, 0x7FFFF000u) << "the sector of it";
}

TEST(UpperCase, FollowsTheSimpleMappings) {
    const std::pair<char16_t, char16_t> pairs[] = {
        {u'a', u'A'},           {u'z', u'Z'},           {u'A', u'A'},
        {u'`', u'`'},           {u'{', u'{'},           {u'\u00B5', u'\u039C'},
        {u'\u00E4', u'\u00C4'}, {u'\u00F7', u'\u00F7'}, {u'\u00DF', u'\u00DF'},
        {u'\u00FF', u'\u0178'}, {u'\u0101', u'\u0100'}, {u'\u0102', u'\u0102'},
        {u'\u0131', u'I'},      {u'\u03C2', u'\u03A3'}, {u'\u044F', u'\u042F'},
        {u'\u4E2D', u'\u4E2D'}, {u'\uFF5A', u'\uFF3A'}, {u'\uFF5B', u'\uFF5B'},
        {u'\u1F80', u'\u1F88'}, {u'\u1FB3', u'\u1FBC'}, {0xD83C, 0xD83C},
        {0xFFFF, 0xFFFF}};
    for (const auto& [small, capital] : pairs) {
        EXPECT_EQ(UpperCase(small), capital) << std::hex << static_cast<int>(small);
    }
}

INSTANTIATE_TEST_SUITE_P(SectorSizes, CompoundFileWriterOf,
                         testing::Values(SectorSize::Bytes512, SectorSize::Bytes4096),
                         [](const testing::TestParamInfo<SectorSize>& size) {
                             return std::to_string(static_cast<unsigned>(size.param));
                         });
