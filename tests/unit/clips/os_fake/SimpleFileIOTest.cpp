// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// The reader over a system that does as it is told: sector sizes, alignment,
// failing calls.

#include <gtest/gtest.h>

#include <cstdlib>
#include <memory>

#include "public_include/SimpleFileIO.h"
#include "tests/support/fakes/FakeHost.h"
#include "tests/support/fakes/RecordingLogger.h"
#include "tests/unit/clips/os_fake/FakeOs.h"

namespace {

using NMA::Impl::SimpleFileIO;
using Bytes = std::vector<ncfUInt8>;

struct FreeMemory {
    void operator()(ncfUInt8* memory) const { DeleteAligned(memory); }
};
using AlignedBuffer = std::unique_ptr<ncfUInt8, FreeMemory>;

AlignedBuffer MakeAligned(std::size_t alignment, std::size_t size) {
    return AlignedBuffer(static_cast<ncfUInt8*>(NewAligned(size, alignment)));
}

// Runs for each sector size.
class SimpleFileIOSectors : public testing::TestWithParam<ncfUInt32> {
protected:
    SimpleFileIOSectors() {
        system = FakeOs();
        system.sectorSize = GetParam();
        system.error = 0x57;
        system.content.resize(GetParam() * 5 + 100);
        for (std::size_t i = 0; i < system.content.size(); ++i) {
            system.content[i] = static_cast<ncfUInt8>(i * 7 % 253 + 1);  // never 0
        }
        path = MakeHostString("C:\\movies\\clip.mov");
        file = std::make_unique<SimpleFileIO>(path);
    }
    ~SimpleFileIOSectors() override {
        file.reset();
        path->Release();
        EXPECT_EQ(system.liveBuffers, 0);
        EXPECT_EQ(system.misaligned, 0) << "a real volume refuses such reads";
    }
    Bytes Part(std::size_t position, std::size_t size) const {
        Bytes part(size, 0);
        for (std::size_t i = 0; i < size && position + i < system.content.size(); ++i) {
            part[i] = system.content[position + i];
        }
        return part;
    }
    // A read into memory at an odd address.
    NCFRESULT Read(ncfUInt64 position, ncfUInt32 size) {
        Bytes target(size + 1, 0xDD);
        bytesRead = 77;
        const NCFRESULT result = file->Read(position, target.data() + 1, size, &bytesRead);
        seen.assign(target.begin() + 1, target.end());
        return result;
    }
    void ExpectLine(const std::string& call) {
        ASSERT_EQ(log.lines().size(), 1u);
        EXPECT_EQ(log.lines()[0].level, 1u);
        const std::string start =
            "SimpleFileIO error. " + call + " HRESULT = 0x57, public_include/SimpleFileIO(";
        EXPECT_EQ(log.lines()[0].text.compare(0, start.size(), start), 0) << log.lines()[0].text;
        EXPECT_GT(std::atoi(log.lines()[0].text.c_str() + start.size()), 0);
    }

    FakeOs& system = FakeOs::Get();
    RecordingNMALog log{1};
    INCFString* path = nullptr;
    std::unique_ptr<SimpleFileIO> file;
    ncfUInt32 bytesRead = 0;
    Bytes seen;
};

INSTANTIATE_TEST_SUITE_P(Volumes, SimpleFileIOSectors, testing::Values(512u, 2048u, 4096u));

}  // namespace

TEST_P(SimpleFileIOSectors, DoesNotTouchTheFileBeforeItIsNeeded) {
    EXPECT_EQ(system.opens, 0);
    file.reset();
    EXPECT_EQ(system.closes, 0);
}

TEST_P(SimpleFileIOSectors, ReadsWholeSectorsForAFewBytes) {
    ASSERT_EQ(Read(0, 100), NCF_OK);
    EXPECT_EQ(bytesRead, 100u);
    EXPECT_EQ(seen, Part(0, 100));
    ASSERT_EQ(system.reads.size(), 1u);
    EXPECT_EQ(system.reads[0].position, 0u);
    EXPECT_EQ(system.reads[0].size, GetParam());
    EXPECT_EQ(system.openedPath, u"C:\\movies\\clip.mov");
    EXPECT_EQ(system.askedRoot, u"C:\\");
}

TEST_P(SimpleFileIOSectors, ReadsTwoSectorsAcrossTheirBorder) {
    const ncfUInt32 sector = GetParam();
    ASSERT_EQ(Read(sector - 10, 20), NCF_OK);
    EXPECT_EQ(bytesRead, 20u);
    EXPECT_EQ(seen, Part(sector - 10, 20));
    ASSERT_EQ(system.reads.size(), 1u);
    EXPECT_EQ(system.reads[0].position, 0u);
    EXPECT_EQ(system.reads[0].size, 2 * sector);
}

TEST_P(SimpleFileIOSectors, AddsNothingBehindARangeThatEndsWithASector) {
    const ncfUInt32 sector = GetParam();
    ASSERT_EQ(Read(sector + 5, sector - 5), NCF_OK);
    EXPECT_EQ(seen, Part(sector + 5, sector - 5));
    ASSERT_EQ(system.reads.size(), 1u);
    EXPECT_EQ(system.reads[0].position, sector);
    EXPECT_EQ(system.reads[0].size, sector);
}

TEST_P(SimpleFileIOSectors, ReadsAlignedRangesStraightIntoAlignedMemory) {
    const ncfUInt32 sector = GetParam();
    const AlignedBuffer target = MakeAligned(sector, 2 * sector);
    ASSERT_EQ(file->Read(sector, target.get(), 2 * sector, &bytesRead), NCF_OK);
    EXPECT_EQ(bytesRead, 2 * sector);
    EXPECT_EQ(Bytes(target.get(), target.get() + 2 * sector), Part(sector, 2 * sector));
    EXPECT_EQ(system.lastBuffer, target.get());
    EXPECT_EQ(system.allocations, 0);
}

TEST_P(SimpleFileIOSectors, ReadsAlignedRangesAroundUnalignedMemory) {
    const ncfUInt32 sector = GetParam();
    ASSERT_EQ(Read(sector, sector), NCF_OK);
    EXPECT_EQ(seen, Part(sector, sector));
    EXPECT_EQ(system.allocations, 1);
}

TEST_P(SimpleFileIOSectors, GrowsItsBufferAndNeverShrinksIt) {
    const ncfUInt32 sector = GetParam();
    ASSERT_EQ(Read(0, 10), NCF_OK);
    ASSERT_EQ(Read(0, 3 * sector), NCF_OK);
    EXPECT_EQ(system.liveBuffers, 1) << "the former one is dropped";
    EXPECT_EQ(system.largestBuffer, 3 * sector);
    ASSERT_EQ(Read(5, 10), NCF_OK);
    EXPECT_EQ(seen, Part(5, 10));
    EXPECT_EQ(system.allocations, 2);
}

TEST_P(SimpleFileIOSectors, GivesWhatIsLeftAtTheEnd) {
    const auto length = static_cast<ncfUInt32>(system.content.size());
    const ncfUInt32 lastSector = length - 100;
    ASSERT_EQ(Read(lastSector, 300), NCF_OK);
    EXPECT_EQ(bytesRead, 100u);
    EXPECT_EQ(Bytes(seen.begin(), seen.begin() + 100), Part(lastSector, 100));
    EXPECT_EQ(seen[100], 0xDD) << "nothing is written behind";
}

TEST_P(SimpleFileIOSectors, CountsTheHeadAsDataNearTheEndAndShowsZeros) {
    const auto length = static_cast<ncfUInt32>(system.content.size());
    // A longer read first: its bytes must not come back.
    ASSERT_EQ(Read(0, 3 * GetParam()), NCF_OK);
    ASSERT_EQ(Read(length - 60, 90), NCF_OK);
    EXPECT_EQ(bytesRead, 90u) << "40 bytes of head and 60 of data were read";
    EXPECT_EQ(seen, Part(length - 60, 90)) << "60 bytes and 30 zeros";
    ASSERT_EQ(Read(length - 60, 150), NCF_OK);
    EXPECT_EQ(bytesRead, 100u);
}

TEST_P(SimpleFileIOSectors, HasNoDataBehindTheEnd) {
    EXPECT_EQ(Read(GetParam() * 6, 10), NMA_E_NODATA);
    EXPECT_EQ(bytesRead, 0u);
    ExpectLine("ReadFile read 0 bytes.");
}

TEST_P(SimpleFileIOSectors, ReadsNothingWhenAskedForNothing) {
    ncfUInt8 byte = 0xDD;
    bytesRead = 77;
    EXPECT_EQ(file->Read(0, &byte, 0, &bytesRead), NCF_OK);
    EXPECT_EQ(bytesRead, 0u);
    EXPECT_TRUE(system.reads.empty());
    EXPECT_EQ(system.opens, 1) << "but the file must be there";
}

TEST_P(SimpleFileIOSectors, ChecksItsArguments) {
    ncfUInt8 byte = 0;
    EXPECT_EQ(file->Read(0, nullptr, 1, &bytesRead), NCF_E_POINTER);
    EXPECT_EQ(file->Read(0, &byte, 1, nullptr), NCF_E_INVALIDARG);
    EXPECT_EQ(file->GetFileSize(nullptr), NCF_E_POINTER);
    EXPECT_EQ(system.opens, 0);
}

TEST_P(SimpleFileIOSectors, RefusesPlacesAndSizesBeyondTheSystem) {
    EXPECT_EQ(Read(0x8000000000000000ull, 10), NCF_E_HANDLE);
    EXPECT_EQ(Read(0xFFFFFFFFFFFFFFFFull, 10), NCF_E_HANDLE);
    ncfUInt8 byte = 0;
    EXPECT_EQ(file->Read(1, &byte, 0xFFFFFFFFu, &bytesRead), NCF_E_HANDLE);
    EXPECT_EQ(bytesRead, 0u);
    EXPECT_TRUE(system.reads.empty());
    EXPECT_EQ(system.allocations, 0);
}

TEST_P(SimpleFileIOSectors, FindsNothingAtTheLastPlaceOfAll) {
    EXPECT_EQ(Read(0x7FFFFFFFFFFFFFFFull, 1), NMA_E_NODATA);
    ASSERT_EQ(system.reads.size(), 1u);
    EXPECT_EQ(system.reads[0].position, 0x8000000000000000ull - GetParam());
}

TEST_P(SimpleFileIOSectors, ThrowsEachTimeTheFileCannotBeOpened) {
    system.openFails = true;
    for (int attempt = 1; attempt <= 2; ++attempt) {
        try {
            Read(0, 10);
            FAIL() << "nothing was thrown";
        } catch (NCFRESULT result) {
            EXPECT_EQ(result, NCF_E_HANDLE);
        }
        EXPECT_EQ(system.opens, attempt);
    }
    ncfUInt64 size = 0;
    EXPECT_THROW(file->GetFileSize(&size), NCFRESULT);
    EXPECT_THROW(file->GetAlignment(nullptr, nullptr), NCFRESULT);
    file.reset();
    EXPECT_EQ(system.closes, 0);
    EXPECT_EQ(log.lines().size(), 4u);
}

TEST_P(SimpleFileIOSectors, LogsAFailingOpen) {
    system.openFails = true;
    EXPECT_THROW(Read(0, 10), NCFRESULT);
    ExpectLine("CreateFileW failed.");
}

TEST_P(SimpleFileIOSectors, LogsAFailingSeek) {
    system.positionFails = true;
    EXPECT_EQ(Read(0, 10), NCF_E_HANDLE);
    EXPECT_EQ(bytesRead, 0u);
    EXPECT_TRUE(system.reads.empty());
    ExpectLine("SetFilePointerEx failed.");
}

TEST_P(SimpleFileIOSectors, LogsAFailingRead) {
    system.readFails = true;
    EXPECT_EQ(Read(0, 10), NCF_E_HANDLE);
    EXPECT_EQ(bytesRead, 0u);
    ExpectLine("ReadFile failed.");
}

TEST_P(SimpleFileIOSectors, FailsInTheSameWayWithoutItsOwnBuffer) {
    system.readFails = true;
    const AlignedBuffer target = MakeAligned(GetParam(), GetParam());
    EXPECT_EQ(file->Read(0, target.get(), GetParam(), &bytesRead), NCF_E_HANDLE);
    EXPECT_EQ(bytesRead, 0u);
    ExpectLine("ReadFile failed.");
}

TEST_P(SimpleFileIOSectors, LogsAFailingClose) {
    ASSERT_EQ(Read(0, 10), NCF_OK);
    system.closeFails = true;
    file.reset();
    EXPECT_EQ(system.closes, 1);
    ExpectLine("CloseHandle failed.");
}

TEST_P(SimpleFileIOSectors, SurvivesWithoutMemory) {
    system.outOfMemory = true;
    EXPECT_EQ(Read(0, 10), NCF_E_OUTOFMEMORY);
    system.outOfMemory = false;
    EXPECT_EQ(Read(0, 10), NCF_OK);
    EXPECT_EQ(seen, Part(0, 10));
}

TEST_P(SimpleFileIOSectors, SurvivesWhenItsBufferCannotGrow) {
    ASSERT_EQ(Read(0, 10), NCF_OK);
    system.outOfMemory = true;
    EXPECT_EQ(Read(0, 2 * GetParam() + 1), NCF_E_OUTOFMEMORY);
    EXPECT_EQ(bytesRead, 0u);
    system.outOfMemory = false;
    EXPECT_EQ(Read(0, 10), NCF_OK);
    EXPECT_EQ(seen, Part(0, 10));
}

TEST_P(SimpleFileIOSectors, AsksForTheSizeOnce) {
    ncfUInt64 size = 0;
    EXPECT_EQ(file->GetLength(&size), NCF_OK);
    EXPECT_EQ(size, system.content.size());
    EXPECT_EQ(file->GetFileSize(&size), NCF_OK);
    EXPECT_EQ(system.sizeQuestions, 1);
    EXPECT_EQ(system.opens, 1);
}

TEST_P(SimpleFileIOSectors, AsksAgainForASizeOfZero) {
    system.content.clear();
    ncfUInt64 size = 5;
    EXPECT_EQ(file->GetFileSize(&size), NCF_OK);
    EXPECT_EQ(size, 0u);
    system.content.resize(10);
    EXPECT_EQ(file->GetFileSize(&size), NCF_OK);
    EXPECT_EQ(size, 10u);
}

TEST_P(SimpleFileIOSectors, GoesOnWhenTheSizeCannotBeAsked) {
    system.sizeFails = true;
    ncfUInt64 size = 5;
    EXPECT_EQ(file->GetFileSize(&size), NCF_OK);
    EXPECT_EQ(size, 0u);
    ExpectLine("GetFileInformationByHandle failed.");
}

TEST_P(SimpleFileIOSectors, TellsTheAlignment) {
    ncfUInt32 offset = 0;
    ncfUInt32 size = 0;
    EXPECT_EQ(file->GetAlignment(&offset, &size), NCF_OK);
    EXPECT_EQ(offset, GetParam());
    EXPECT_EQ(size, GetParam());
    EXPECT_EQ(file->GetAlignment(nullptr, nullptr), NCF_OK);
}

TEST(SimpleFileIOVolume, Takes2048WhereTheVolumeDoesNotTell) {
    FakeOs::Get() = FakeOs();
    FakeOs::Get().sectorSize = 0;
    INCFString* const path = MakeHostString("\\\\server\\share\\clip.mov");
    {
        SimpleFileIO file(path);
        ncfUInt32 size = 0;
        EXPECT_EQ(file.GetAlignment(nullptr, &size), NCF_OK);
        EXPECT_EQ(size, 2048u);
        EXPECT_EQ(FakeOs::Get().askedRoot, u"\\\\server\\share\\");
    }
    path->Release();
}
