// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// The directory as it stands in a file: the search tree of each storage, walked without the reader.

#include "aaf_library/stored/CompoundFileWriter.h"
#include "aaf_library/stored/LittleEndian.h"
#include "aaf_library/stored/UpperCase.h"
#include "tests/unit/aaf_library/stored/CompoundBytes.h"

#include <gtest/gtest.h>
#include <algorithm>
#include <cmath>
#include <map>

using namespace aaf::stored;

namespace {

// The entries of a file, spare ones included.
class Directory {
public:
    // Its sectors follow one another, and the allocation table follows them.
    Directory(const Bytes& file, SectorSize sectorSize) {
        const auto place = [&](std::size_t header) {
            return (NumberIn(file.data() + header) + std::size_t{1}) *
                   static_cast<std::size_t>(sectorSize);
        };
        bytes_.assign(file.begin() + static_cast<std::ptrdiff_t>(place(kFirstDirectoryOffset)),
                      file.begin() + static_cast<std::ptrdiff_t>(place(kTableListOffset)));
    }

    std::uint32_t Count() const {
        return static_cast<std::uint32_t>(bytes_.size() / kDirectoryEntrySize);
    }
    Bytes Entry(std::uint32_t index) const {
        const auto at = bytes_.begin() + std::ptrdiff_t{index} * kDirectoryEntrySize;
        return Bytes(at, at + kDirectoryEntrySize);
    }
    std::uint8_t ByteOf(std::uint32_t index, std::size_t offset) const {
        return bytes_.at(index * kDirectoryEntrySize + offset);
    }
    std::uint32_t NumberOf(std::uint32_t index, std::size_t offset) const {
        return NumberIn(&bytes_.at(index * kDirectoryEntrySize + offset));
    }
    std::u16string NameOf(std::uint32_t index) const {
        const std::uint8_t* const entry = &bytes_.at(index * kDirectoryEntrySize);
        return ByteReader(entry, entry[kEntryNameSizeOffset]).TakeText();
    }

private:
    Bytes bytes_;
};

// What a walk through the tree of a storage finds.
struct Walk {
    explicit Walk(const Directory& directory, std::uint32_t storage) : directory_(directory) {
        blackHeight = Visit(directory.NumberOf(storage, kEntryChildOffset), kBlack, 0);
    }

    std::vector<std::u16string> names;  // in order
    int blackHeight = 0;
    int height = 0;
    bool isRedBelowRed = false;
    bool isUneven = false;

private:
    // Gives the black entries on each way down; recursion as simple readers have it.
    int Visit(std::uint32_t index, std::uint8_t above, int depth) {
        if (index == kNoEntry) {
            return 0;
        }
        ++depth;
        height = std::max(height, depth);
        const std::uint8_t colour = directory_.ByteOf(index, kEntryColourOffset);
        // The top is black, too.
        isRedBelowRed |= colour == kRed && (above == kRed || depth == 1);
        const int left = Visit(directory_.NumberOf(index, kEntryLeftOffset), colour, depth);
        names.push_back(directory_.NameOf(index));
        const int right = Visit(directory_.NumberOf(index, kEntryRightOffset), colour, depth);
        isUneven |= left != right;
        return left + (colour == kBlack ? 1 : 0);
    }

    const Directory& directory_;
};

// Names of several lengths, in small letters and capitals of several scripts, in no order.
std::vector<std::u16string> Names(std::uint32_t count) {
    const std::u16string letters = u"aB\u00E9\u03A9\u0436Z";
    std::vector<std::u16string> names;
    for (std::uint32_t i = 0; i < count; ++i) {
        const std::string digits = std::to_string((i * 7919ull) % count);
        names.push_back(letters[i % letters.size()] + std::u16string(digits.begin(), digits.end()));
    }
    return names;
}

std::vector<std::u16string> InOrder(const std::vector<std::u16string>& names) {
    std::map<std::pair<std::size_t, std::u16string>, std::u16string> sorted;
    for (const std::u16string& name : names) {
        std::u16string capitals = name;
        std::transform(name.begin(), name.end(), capitals.begin(), UpperCase);
        sorted[{name.size(), capitals}] = name;
    }
    std::vector<std::u16string> inOrder;
    for (auto& entry : sorted) {
        inOrder.push_back(std::move(entry.second));
    }
    return inOrder;
}

void ExpectATree(const Directory& directory, std::uint32_t storage,
                 const std::vector<std::u16string>& names) {
    const Walk walk(directory, storage);
    EXPECT_EQ(walk.names, InOrder(names));
    EXPECT_FALSE(walk.isRedBelowRed);
    EXPECT_FALSE(walk.isUneven);
    const double levels = std::log2(static_cast<double>(names.size()) + 1);
    EXPECT_LE(walk.height, 2 * levels);
    EXPECT_EQ(walk.height, std::ceil(levels)) << "the least height";
    EXPECT_EQ(walk.blackHeight, std::floor(levels));
}

class CompoundDirectoryOf : public testing::TestWithParam<SectorSize> {};

}  // namespace

TEST_P(CompoundDirectoryOf, EntriesOfAStorageAreABalancedTreeOfRedAndBlack) {
    for (const std::uint32_t count : {0u, 1u, 2u, 3u, 4u, 5u, 6u, 7u, 8u, 15u, 16u, 1000u}) {
        SCOPED_TRACE(count);
        CompoundFileWriter writer(GetParam());
        const auto storage = writer.AddStorage(kRoot, u"storage");
        const std::vector<std::u16string> names = Names(count);
        for (std::size_t i = 0; i < names.size(); ++i) {
            if (i % 2 == 0) {
                writer.AddStorage(storage, names[i]);
            } else {
                writer.AddStream(storage, names[i], Bytes(i));
            }
        }
        const Directory directory(writer.Finish(), GetParam());
        ExpectATree(directory, kRoot, {u"storage"});
        ExpectATree(directory, storage, names);
    }
}

TEST_P(CompoundDirectoryOf, EachStorageHasATreeOfItsOwn) {
    CompoundFileWriter writer(GetParam());
    const auto outer = writer.AddStorage(kRoot, u"outer");
    const auto inner = writer.AddStorage(outer, u"inner");
    const std::vector<std::u16string> names = Names(20);
    for (const std::u16string& name : names) {
        writer.AddStream(inner, name, {1});
        writer.AddStorage(kRoot, name);
    }
    std::vector<std::u16string> beside = names;
    beside.emplace_back(u"outer");
    const Directory directory(writer.Finish(), GetParam());
    ExpectATree(directory, kRoot, beside);
    ExpectATree(directory, outer, {u"inner"});
    ExpectATree(directory, inner, names);
}

TEST_P(CompoundDirectoryOf, APartKeepsItsTreesBehindOtherEntries) {
    const std::vector<std::u16string> names = Names(12);
    CompoundFileWriter made(GetParam());
    const auto contained = made.AddStorage(kRoot, u"contained");
    for (const std::u16string& name : names) {
        made.AddStream(contained, name, {1});
    }
    const std::optional<CompoundPart> part = made.FinishPart();
    ASSERT_TRUE(part);
    CompoundFileWriter writer(GetParam());
    writer.AddStorage(kRoot, u"before");
    writer.AddPart(kRoot, u"part", *part);
    writer.AddStorage(kRoot, u"behind");
    const Directory directory(writer.Finish(), GetParam());
    ExpectATree(directory, kRoot, {u"before", u"part", u"behind"});
    ExpectATree(directory, 2, {u"contained"});
    ExpectATree(directory, 3, names);
}

// Readers that recurse survive it: a chain of so many would take their stack.
TEST(CompoundDirectory, ATreeOfAHundredThousandEntriesIsSeventeenHigh) {
    CompoundFileWriter writer(SectorSize::Bytes4096);
    const std::vector<std::u16string> names = Names(100000);
    for (const std::u16string& name : names) {
        writer.AddStorage(kRoot, name);
    }
    const Directory directory(writer.Finish(), SectorSize::Bytes4096);
    const Walk walk(directory, kRoot);
    EXPECT_EQ(walk.height, 17);
    EXPECT_EQ(walk.names.size(), names.size());
}

TEST_P(CompoundDirectoryOf, SpareEntriesAreEmptyAndLeadNowhere) {
    Bytes spare(kDirectoryEntrySize);
    std::fill(spare.begin() + kEntryLeftOffset, spare.begin() + kEntryClassOffset, 0xFF);
    const std::uint32_t perSector = static_cast<std::uint32_t>(GetParam()) / kDirectoryEntrySize;
    for (std::uint32_t used = 1; used <= 2 * perSector + 1; ++used) {
        SCOPED_TRACE(used);
        CompoundFileWriter writer(GetParam());
        for (std::uint32_t i = 1; i < used; ++i) {
            writer.AddStorage(kRoot, std::u16string(1, static_cast<char16_t>(u'\u4E00' + i)));
        }
        const Directory directory(writer.Finish(), GetParam());
        ASSERT_EQ(directory.Count(), (used + perSector - 1) / perSector * perSector);
        for (std::uint32_t i = used; i < directory.Count(); ++i) {
            EXPECT_EQ(directory.Entry(i), spare) << i;
        }
    }
}

INSTANTIATE_TEST_SUITE_P(SectorSizes, CompoundDirectoryOf,
                         testing::Values(SectorSize::Bytes512, SectorSize::Bytes4096),
                         [](const testing::TestParamInfo<SectorSize>& size) {
                             return std::to_string(static_cast<unsigned>(size.param));
                         });
