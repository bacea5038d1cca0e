// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// The reader over real files.

#include "public_include/SimpleFileIO.h"

#include "tests/unit/clips/ClipFixture.h"

namespace {

using NMA::Impl::SimpleFileIO;
using NMA::Impl::VolumeRootOf;

}  // namespace

TEST(VolumeRootOf, IsTheDriveOfAPathOnADrive) {
    EXPECT_EQ(VolumeRootOf(u"C:\\movies\\a.mov"), u"C:\\");
    EXPECT_EQ(VolumeRootOf(u"C:\\"), u"C:\\");
}

TEST(VolumeRootOf, IsTheShareOfANetworkPath) {
    EXPECT_EQ(VolumeRootOf(u"\\\\server\\share\\file"), u"\\\\server\\share\\");
    EXPECT_EQ(VolumeRootOf(u"\\\\server\\share\\"), u"\\\\server\\share\\");
    EXPECT_EQ(VolumeRootOf(u"\\\\?\\C:\\a.mov"), u"\\\\?\\C:\\");
}

TEST(VolumeRootOf, IsEmptyWithoutAFourthBackslash) {
    EXPECT_EQ(VolumeRootOf(u"\\\\server\\share"), u"");
    EXPECT_EQ(VolumeRootOf(u"\\\\server"), u"");
    EXPECT_EQ(VolumeRootOf(u"\\\\"), u"");
}

TEST(VolumeRootOf, IsEmptyForOtherPaths) {
    EXPECT_EQ(VolumeRootOf(u""), u"");
    EXPECT_EQ(VolumeRootOf(u"C:"), u"");
    EXPECT_EQ(VolumeRootOf(u"C:movies\\a.mov"), u"");
    EXPECT_EQ(VolumeRootOf(u"\\home\\me\\a.mov"), u"");
    EXPECT_EQ(VolumeRootOf(u"a.mov"), u"");
}

TEST(VolumeRootOf, StartsTheSearchBehindTheThirdCharacter) {
    // A share without a server name: the backslash at place 2 doesn't count.
    EXPECT_EQ(VolumeRootOf(u"\\\\\\a\\b\\c"), u"\\\\\\a\\b\\");
}

TEST(SimpleFileIO, ReadsAnyPartOfAFile) {
    const auto bytes = CountingBytes(20000);
    const TempFile temp(bytes);
    SimpleFileIO file(HostText(temp.path()).inArg());
    ncfUInt64 length = 0;
    EXPECT_EQ(file.GetFileSize(&length), NCF_OK);
    EXPECT_EQ(length, 20000u);
    for (const ncfUInt32 position : {0u, 1u, 511u, 4096u, 8191u, 12345u}) {
        std::vector<ncfUInt8> seen(5000);
        ncfUInt32 done = 0;
        ASSERT_EQ(file.Read(position, seen.data(), 5000, &done), NCF_OK);
        EXPECT_EQ(done, 5000u);
        EXPECT_EQ(seen,
                  std::vector<ncfUInt8>(bytes.begin() + position, bytes.begin() + position + 5000))
            << position;
    }
}

TEST(SimpleFileIO, OpensNamesWithBackslashesAndForeignLetters) {
    const TempFile temp(CountingBytes(10), "f\xC3\xB6lm \xF0\x9F\x8E\xAC.mov");
    std::string path = temp.path();
    for (char& c : path) {
        c = c == '/' ? '\\' : c;
    }
    SimpleFileIO file(HostText(path).inArg());
    ncfUInt64 length = 0;
    EXPECT_EQ(file.GetFileSize(&length), NCF_OK);
    EXPECT_EQ(length, 10u);
}

TEST(SimpleFileIO, KeepsItsOwnCopyOfThePath) {
    const TempFile temp(CountingBytes(10));
    NCFSmartPtr<INCFString> path = HostText(temp.path());
    SimpleFileIO file(path.inArg());
    path->AssignUTF8(kNCFUTF8, "elsewhere", kNCFZeroTerminated);
    ncfUInt64 length = 0;
    EXPECT_EQ(file.GetFileSize(&length), NCF_OK);
    EXPECT_EQ(length, 10u);
}

TEST(SimpleFileIO, DoesNotOpenFolders) {
    RecordingNMALog lines(1);
    const TestFolder folder;
    SimpleFileIO file(HostText(folder.path().u8string()).inArg());
    ncfUInt64 length = 0;
    EXPECT_THROW(file.GetFileSize(&length), NCFRESULT);
    EXPECT_TRUE(lines.contains("SimpleFileIO error. CreateFileW failed. HRESULT = 0x"));
}

// The order of the operations in the table; the destructor takes two places.
TEST(SimpleFileIO, KeepsItsOperationsInTheirPlaces) {
    struct Counting : SimpleFileIO {
        Counting() : SimpleFileIO(nullptr) {}
        NCFRESULT GetFileSize(ncfUInt64*) override { return 101; }
        NCFRESULT GetAlignment(ncfUInt32*, ncfUInt32*) override { return 102; }
        NCFRESULT Read(ncfUInt64, void*, ncfUInt32, ncfUInt32*) override { return 103; }
    } file;
    SimpleFileIO* const base = &file;
    void** table = nullptr;
    std::memcpy(&table, static_cast<void*>(base), sizeof table);
    using Operation = NCFRESULT (*)(SimpleFileIO*, std::uintptr_t, void*, std::uintptr_t, void*);
    EXPECT_EQ(reinterpret_cast<Operation>(table[2])(base, 0, nullptr, 0, nullptr), 101);
    EXPECT_EQ(reinterpret_cast<Operation>(table[3])(base, 0, nullptr, 0, nullptr), 102);
    EXPECT_EQ(reinterpret_cast<Operation>(table[4])(base, 0, nullptr, 0, nullptr), 103);
}
