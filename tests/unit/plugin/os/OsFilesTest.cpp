// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// What every system has to do with files and their dates.

#include "source/plugin/os/Os.h"

#include <string>

#include "tests/support/TestFiles.h"
#include "tests/unit/plugin/os/OsFixture.h"

namespace {

constexpr ncfUInt32 kNoSuchFile = 2;  // ENOENT, and Windows' ERROR_FILE_NOT_FOUND

class SystemFiles : public OsFixture {};

TEST_F(SystemFiles, ReadsAFileWhosePathHasBackslashes) {
    const std::u16string path = write("a.bin", std::string(5000, 'x'));
    const os::FileHandle file = os::OpenForReading(path);
    ASSERT_NE(file, os::kNoFile);
    ncfUInt64 size = 0;
    EXPECT_TRUE(os::GetFileSize(file, &size));
    EXPECT_EQ(size, 5000u);
    void* const buffer = os::AllocateAligned(8192, 4096);
    ncfUInt32 bytesRead = 0;
    EXPECT_TRUE(os::SetPosition(file, 0));
    ASSERT_TRUE(os::Read(file, buffer, 8192, &bytesRead));
    EXPECT_EQ(bytesRead, 5000u);
    EXPECT_TRUE(os::SetPosition(file, 8192));
    ASSERT_TRUE(os::Read(file, buffer, 8192, &bytesRead));
    EXPECT_EQ(bytesRead, 0u);
    os::FreeAligned(buffer);
    EXPECT_TRUE(os::Close(file));
}

TEST_F(SystemFiles, TellsTheLastWriteInUtc) {
    const std::u16string path = write("a.bin", "x");
    SetDate(folder / "a.bin", 86399);
    os::FileTime written = 0;
    os::DateTime date{};
    ASSERT_TRUE(os::GetLastWriteTime(path, &written));
    ASSERT_TRUE(os::ToDateTime(written, &date));
    EXPECT_EQ(date.year, 1970);
    EXPECT_EQ(date.month, 1);
    EXPECT_EQ(date.day, 1);
    EXPECT_EQ(date.dayOfWeek, 4);
    EXPECT_EQ(date.hour, 23);
    EXPECT_EQ(date.minute, 59);
    EXPECT_EQ(date.second, 59);
    EXPECT_FALSE(os::GetLastWriteTime(pathOf("absent"), &written));
    EXPECT_EQ(os::LastError(), kNoSuchFile);
}

TEST_F(SystemFiles, OpensNamesInAnyScript) {
    for (const char16_t* const name : {u"caf\u00E9.mov", u"\u6620\u753B.mov", u"\U0001F3AC.mov"}) {
        testFolder.Write(name, "bytes");
        const os::FileHandle file = os::OpenForReading(pathOf("") + name);
        EXPECT_NE(file, os::kNoFile) << std::filesystem::path(name);
        os::Close(file);
    }
}

TEST_F(SystemFiles, RefusesFoldersAndWhatIsAbsent) {
    EXPECT_EQ(os::OpenForReading(folder.u16string()), os::kNoFile);
    EXPECT_NE(os::LastError(), 0u);
    EXPECT_EQ(os::OpenForReading(pathOf("absent.mov")), os::kNoFile);
    EXPECT_EQ(os::LastError(), kNoSuchFile);
}

}  // namespace
