// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/stored/CompoundFileWriter.h"
#include "aaf_library/stored/LittleEndian.h"
#include "aaf_library/stored/StoredError.h"
#include "tests/support/compound/CompoundTree.h"
#include "tests/support/compound/GsfFile.h"
#include "tests/unit/aaf_library/limits/SmallLimits.h"

#include <gtest/gtest.h>
#include <algorithm>

using namespace aaf::stored;
using compound::Content;
using compound::Node;
using compound::Storage;
using compound::Stream;

namespace {

constexpr CompoundFileWriter::Storage kRoot = CompoundFileWriter::kRoot;

class CompoundFileLimitsOf : public testing::TestWithParam<SectorSize> {
protected:
    std::size_t Sector() const { return static_cast<std::size_t>(GetParam()); }

    SmallLimits limits_;
};

// Long and short streams, and storages that take several sectors of the directory.
Node EveryPart(std::size_t longStream) {
    Node root = Storage(u"", {Stream(u"long", Content(longStream)),
                              Stream(u"longer", Content(20000)), Stream(u"short", Content(4095))});
    for (int i = 0; i < 100; ++i) {
        const std::u16string name(1, static_cast<char16_t>(u'\u4E00' + i));
        root.nodes.push_back(Storage(name, {Stream(u"small", Content(100))}));
    }
    return root;
}

std::string Refusal(const Node& root, SectorSize sectorSize) {
    try {
        compound::Written(root, sectorSize);
        return "";
    } catch (const TooLargeError& problem) {
        return problem.what();
    }
}

}  // namespace

TEST_P(CompoundFileLimitsOf, AFileOfTheLargestSizeIsWrittenAndNoneThatIsLarger) {
    const Node root = EveryPart(3 * 4096);
    const Bytes file = compound::Written(root, GetParam());
    limits_.largestFile = file.size();
    EXPECT_EQ(compound::Written(root, GetParam()), file);
    limits_.largestFile = file.size() - 1;
    EXPECT_NE(Refusal(root, GetParam()), "");
}

TEST_P(CompoundFileLimitsOf, TheRefusalTellsTheLimitAndTheKindOfFile) {
    limits_.largestFile = 10000;
    EXPECT_EQ(Refusal(EveryPart(4096), GetParam()),
              GetParam() == SectorSize::Bytes512
                  ? "takes more than 10000 bytes, the most that a file with sectors of 512 bytes "
                    "may have; one with sectors of 4096 bytes may have 10000"
                  : "takes more than 10000 bytes, the most that a file with sectors of 4096 bytes "
                    "may have");
}

TEST_P(CompoundFileLimitsOf, AStreamThatIsTooLargeIsRefusedBeforeItIsTaken) {
    limits_.largestFile = 100000;
    CompoundFileWriter writer(GetParam());
    writer.AddStream(kRoot, u"first", Content(60000));
    EXPECT_THROW(writer.AddStream(kRoot, u"second", Content(60000)), TooLargeError);
    EXPECT_NO_THROW(writer.AddStream(kRoot, u"third", Content(3000)));
    const Node wanted =
        Storage(u"", {Stream(u"first", Content(60000)), Stream(u"third", Content(3000))});
    EXPECT_EQ(compound::Difference(compound::Read(writer.Finish()), wanted), "");
}

TEST_P(CompoundFileLimitsOf, ManyShortStreamsAndPartsCountAsWell) {
    limits_.largestFile = 100000;
    CompoundFileWriter made(GetParam());
    made.AddStream(kRoot, u"small", Content(4000));
    const std::optional<CompoundPart> part = made.FinishPart();
    ASSERT_TRUE(part);
    CompoundFileWriter parts(GetParam());
    CompoundFileWriter streams(GetParam());
    const auto fill = [&] {
        for (char16_t i = 0; i < 30; ++i) {
            parts.AddPart(kRoot, std::u16string(1, u'\u4E00' + i), *part);
        }
    };
    EXPECT_THROW(fill(), TooLargeError);
    const auto fillStreams = [&] {
        for (char16_t i = 0; i < 30; ++i) {
            streams.AddStream(kRoot, std::u16string(1, u'\u4E00' + i), Content(4000));
        }
    };
    EXPECT_THROW(fillStreams(), TooLargeError);
}

// Wherever the sector falls: into a stream, the short streams, a table, the directory.
TEST_P(CompoundFileLimitsOf, NothingLiesInTheSectorThatIsLocked) {
    const Node root = EveryPart(3 * 4096);
    const Bytes whole = compound::Written(root, GetParam());
    const std::size_t sectors = whole.size() / Sector() - 1;
    for (std::size_t sector = 0; sector < sectors; ++sector) {
        SCOPED_TRACE(sector);
        limits_.lockSector = static_cast<std::uint32_t>(sector);
        const Bytes file = compound::Written(root, GetParam());
        ASSERT_EQ(file.size(), whole.size() + Sector());
        EXPECT_EQ(compound::Difference(compound::Read(file), root), "");
        EXPECT_EQ(compound::Difference(gsf::Read(file), root), "");
        const auto locked = file.begin() + static_cast<std::ptrdiff_t>((sector + 1) * Sector());
        EXPECT_EQ(Bytes(locked, locked + static_cast<std::ptrdiff_t>(Sector())), Bytes(Sector()));
        const std::size_t perTable = Sector() / 4;
        const std::uint32_t table =
            NumberIn(file.data() + kTableListOffset + 4 * (sector / perTable));
        EXPECT_EQ(NumberIn(file.data() + (table + 1) * Sector() + 4 * (sector % perTable)),
                  kEndOfChain);
    }
}

TEST_P(CompoundFileLimitsOf, AFileThatEndsBeforeTheLockedSectorHasNone) {
    const Node root = EveryPart(3 * 4096);
    const Bytes whole = compound::Written(root, GetParam());
    limits_.lockSector = static_cast<std::uint32_t>(whole.size() / Sector() - 1);
    EXPECT_EQ(compound::Written(root, GetParam()), whole);
}

// Of a file whose tables need a list beyond the header's.
TEST(CompoundFileLimits, TheLockedSectorMayLieAmongTablesAndTheirList) {
    SmallLimits limits;
    const Node root = Storage(u"", {Stream(u"stream", Content(236 * 127 * 512))});
    const Bytes whole = compound::Written(root, SectorSize::Bytes512);
    const auto sectors = static_cast<std::uint32_t>(whole.size() / 512 - 1);
    for (const std::uint32_t fromEnd : {1u, 2u, 3u, 100u, 200u, 238u, 239u, 240u, 241u}) {
        SCOPED_TRACE(fromEnd);
        limits.lockSector = sectors - fromEnd;
        const Bytes file = compound::Written(root, SectorSize::Bytes512);
        EXPECT_EQ(file.size(), whole.size() + 512);
        EXPECT_EQ(compound::Difference(compound::Read(file), root), "");
        EXPECT_EQ(compound::Difference(gsf::Read(file), root), "");
    }
}

// A table of 512 bytes is full with 128 sectors: the one that is left out may be one too many.
TEST(CompoundFileLimits, TheLockedSectorHasItsEntryInTheTable) {
    for (std::size_t sectors = 120; sectors < 130; ++sectors) {
        SCOPED_TRACE(sectors);
        SmallLimits limits;
        const Node root = Storage(u"", {Stream(u"stream", Content(sectors * 512))});
        const Bytes whole = compound::Written(root, SectorSize::Bytes512);
        limits.lockSector = static_cast<std::uint32_t>(whole.size() / 512 - 2);
        const Bytes file = compound::Written(root, SectorSize::Bytes512);
        const std::size_t described = NumberIn(file.data() + kTableCountOffset) * std::size_t{128};
        EXPECT_GE(described, file.size() / 512 - 1);
        EXPECT_EQ(compound::Difference(compound::Read(file), root), "");
        EXPECT_EQ(compound::Difference(gsf::Read(file), root), "");
    }
}

INSTANTIATE_TEST_SUITE_P(SectorSizes, CompoundFileLimitsOf,
                         testing::Values(SectorSize::Bytes512, SectorSize::Bytes4096),
                         [](const testing::TestParamInfo<SectorSize>& size) {
                             return std::to_string(static_cast<unsigned>(size.param));
                         });
