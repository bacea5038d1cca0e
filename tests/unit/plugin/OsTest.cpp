// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/plugin/os/Os.h"

#include <gtest/gtest.h>
#include <sys/stat.h>
#include <unistd.h>

#include <fcntl.h>

#include <cerrno>
#include <cstdio>
#include <cstring>
#include <filesystem>
#include <fstream>
#include <string>

namespace {

class OperatingSystem : public ::testing::Test {
protected:
    OperatingSystem() {
        std::filesystem::remove_all(folder);
        std::filesystem::create_directories(folder);
    }
    ~OperatingSystem() override { std::filesystem::remove_all(folder); }

    std::u16string write(const std::string& name, const std::string& bytes) {
        std::ofstream(folder / name, std::ios::binary) << bytes;
        return pathOf(name);
    }
    // Path in the module's form: backslashes.
    std::u16string pathOf(const std::string& name) const {
        std::u16string path = (folder / name).u16string();
        for (char16_t& c : path) {
            c = c == u'/' ? u'\\' : c;
        }
        return path;
    }

    const std::filesystem::path folder =
        std::filesystem::temp_directory_path() / ("os-test-" + std::to_string(getpid()));
};

TEST_F(OperatingSystem, ReadsAFileWhosePathHasBackslashes) {
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

TEST_F(OperatingSystem, StepsDownToBufferedReadsWhereUnbufferedOnesAreRefused) {
    std::string bytes(5000, '\0');
    for (std::size_t i = 0; i < bytes.size(); ++i) {
        bytes[i] = static_cast<char>(i % 251);
    }
    const os::FileHandle file = os::OpenForReading(write("a.bin", bytes));
    ASSERT_NE(file, os::kNoFile);
    // No unbuffered read starts at such a place, has such a size, or lands
    // there.
    std::string seen(1001, 'x');
    ncfUInt32 bytesRead = 0;
    ASSERT_TRUE(os::SetPosition(file, 7));
    ASSERT_TRUE(os::Read(file, &seen[1], 1000, &bytesRead));
    EXPECT_EQ(bytesRead, 1000u);
    EXPECT_EQ(seen.substr(1), bytes.substr(7, 1000));
    ASSERT_TRUE(os::SetPosition(file, 4990));
    ASSERT_TRUE(os::Read(file, &seen[1], 1000, &bytesRead)) << "and it stays so";
    EXPECT_EQ(bytesRead, 10u);
    EXPECT_TRUE(os::Close(file));
}

TEST_F(OperatingSystem, FailsOnAHandleThatIsNotOpen) {
    const os::FileHandle file = os::OpenForReading(write("a.bin", "x"));
    ASSERT_TRUE(os::Close(file));
    ncfUInt64 size = 7;
    ncfUInt32 number = 7;
    char byte = 'x';
    EXPECT_FALSE(os::GetFileSize(file, &size));
    EXPECT_EQ(os::LastError(), static_cast<ncfUInt32>(EBADF));
    EXPECT_FALSE(os::GetSectorSize(file, u"", &number));
    EXPECT_FALSE(os::SetPosition(file, 0));
    EXPECT_FALSE(os::Read(file, &byte, 1, &number));
    EXPECT_EQ(number, 7u);
}

TEST_F(OperatingSystem, RefusesFoldersPipesAndWhatIsAbsent) {
    std::filesystem::create_directory(folder / "x.mov");
    EXPECT_EQ(os::OpenForReading(pathOf("x.mov")), os::kNoFile);
    EXPECT_NE(os::LastError(), 0u);
    ASSERT_EQ(mkfifo((folder / "pipe.mov").c_str(), 0600), 0);
    EXPECT_EQ(os::OpenForReading(pathOf("pipe.mov")), os::kNoFile);
    EXPECT_EQ(os::OpenForReading(pathOf("absent.mov")), os::kNoFile);
    EXPECT_EQ(os::LastError(), static_cast<ncfUInt32>(ENOENT));
}

TEST_F(OperatingSystem, OpensANameThatIsNoUtf8) {
    const std::string name = std::string("caf\xE9.mov");
    std::ofstream(folder.string() + "/" + name) << "bytes";
    std::u16string path = pathOf("caf");
    path += static_cast<char16_t>(0xDC00 + 0xE9);
    path += u".mov";
    const os::FileHandle file = os::OpenForReading(path);
    EXPECT_NE(file, os::kNoFile);
    os::Close(file);
}

TEST_F(OperatingSystem, OpensANameOutsideTheBasicPlane) {
    const std::u16string path = write("\xF0\x9F\x8E\xAC.mov", "bytes");
    const os::FileHandle file = os::OpenForReading(path);
    EXPECT_NE(file, os::kNoFile);
    os::Close(file);
}

TEST_F(OperatingSystem, GivesASectorSizeThatIsAPowerOfTwoOrNone) {
    const os::FileHandle file = os::OpenForReading(write("a.bin", "x"));
    ncfUInt32 bytes = 0;
    if (os::GetSectorSize(file, u"", &bytes)) {
        EXPECT_GE(bytes, 512u);
        EXPECT_LE(bytes, 65536u);
        EXPECT_EQ(bytes & (bytes - 1), 0u);
    }
    os::Close(file);
}

TEST_F(OperatingSystem, TellsTheLastWriteInUtc) {
    const std::u16string path = write("a.bin", "x");
    struct timespec times[2] = {{86399, 0}, {86399, 0}};
    ASSERT_EQ(utimensat(AT_FDCWD, (folder / "a.bin").c_str(), times, 0), 0);
    os::DateTime date{};
    ASSERT_TRUE(os::GetLastWriteTime(path, &date));
    EXPECT_EQ(date.year, 1970);
    EXPECT_EQ(date.month, 1);
    EXPECT_EQ(date.day, 1);
    EXPECT_EQ(date.dayOfWeek, 4);
    EXPECT_EQ(date.hour, 23);
    EXPECT_EQ(date.minute, 59);
    EXPECT_EQ(date.second, 59);
    EXPECT_FALSE(os::GetLastWriteTime(pathOf("absent"), &date));
}

TEST_F(OperatingSystem, FindsTheModuleThatHoldsAnAddress) {
    std::wstring path;
    ASSERT_TRUE(os::GetModulePath(reinterpret_cast<const void*>(&os::LastError), &path));
    EXPECT_EQ(path.front(), L'/');
    EXPECT_NE(path.find(L"test_plugin"), std::wstring::npos);
    EXPECT_FALSE(os::GetModulePath(nullptr, &path));
}

TEST_F(OperatingSystem, RefusesAPositionThatNoFileHas) {
    const os::FileHandle file = os::OpenForReading(write("a.bin", "x"));
    EXPECT_FALSE(os::SetPosition(file, 0x8000000000000000u));
    os::Close(file);
    EXPECT_FALSE(os::Close(file));
}

}  // namespace
