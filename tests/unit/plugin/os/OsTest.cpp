// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/plugin/os/Os.h"
#include "tests/support/TestFiles.h"
#include "tests/unit/plugin/os/OsFixture.h"

#include <dlfcn.h>
#include <fcntl.h>
#include <gtest/gtest.h>
#include <sys/mman.h>
#include <sys/stat.h>
#include <sys/statfs.h>
#include <sys/statvfs.h>
#include <unistd.h>

#include <algorithm>
#include <cerrno>
#include <cstdio>
#include <cstring>
#include <filesystem>
#include <fstream>
#include <limits>
#include <string>
#include <thread>
#include <vector>

namespace {

// Block size that the volume of every file claims to have; 0: its own.
unsigned long toldBlockSize = 0;

}  // namespace

// The program's own function comes before the system's.
extern "C" int fstatvfs(int file, struct statvfs* volume) noexcept {
    struct statfs known {};
    if (fstatfs(file, &known) != 0) {
        return -1;
    }
    *volume = {};
    volume->f_bsize =
        toldBlockSize != 0 ? toldBlockSize : static_cast<unsigned long>(known.f_bsize);
    return 0;
}

namespace {

class OperatingSystem : public OsFixture {
protected:
    ~OperatingSystem() override { toldBlockSize = 0; }
};

TEST_F(OperatingSystem, ReadsFromAnyPlaceToAnyPlace) {
    std::string bytes(5000, '\0');
    for (std::size_t i = 0; i < bytes.size(); ++i) {
        bytes[i] = static_cast<char>(i % 251);
    }
    const os::FileHandle file = os::OpenForReading(write("a.bin", bytes));
    ASSERT_NE(file, os::kNoFile);
    // Neither place nor size nor address is a multiple of a sector.
    std::string seen(1001, 'x');
    ncfUInt32 bytesRead = 0;
    ASSERT_TRUE(os::SetPosition(file, 7));
    ASSERT_TRUE(os::Read(file, &seen[1], 1000, &bytesRead));
    EXPECT_EQ(bytesRead, 1000u);
    EXPECT_EQ(seen.substr(1), bytes.substr(7, 1000));
    ASSERT_TRUE(os::SetPosition(file, 4990));
    ASSERT_TRUE(os::Read(file, &seen[1], 1000, &bytesRead));
    EXPECT_EQ(bytesRead, 10u);
    EXPECT_TRUE(os::Close(file));
}

// How many bytes of a file the system's cache holds, in whole pages.
std::size_t CachedBytes(const std::filesystem::path& path) {
    const std::size_t size = std::filesystem::file_size(path);
    const auto page = static_cast<std::size_t>(sysconf(_SC_PAGESIZE));
    const int descriptor = open(path.c_str(), O_RDONLY);
    void* const view = mmap(nullptr, size, PROT_READ, MAP_SHARED, descriptor, 0);
    std::vector<unsigned char> states((size + page - 1) / page);
    EXPECT_EQ(mincore(view, size, states.data()), 0);
    munmap(view, size);
    close(descriptor);
    const auto cached = std::count_if(states.begin(), states.end(),
                                      [](unsigned char state) { return (state & 1) != 0; });
    return static_cast<std::size_t>(cached) * page;
}

// A movie may be as long as the machine's memory.
TEST_F(OperatingSystem, BringsIntoTheCacheOnlyWhatIsRead) {
    constexpr ncfUInt32 kPiece = 64 << 10;
    const std::u16string name = write("a.bin", std::string(16 * kPiece, 'x'));
    const std::filesystem::path path = folder / "a.bin";
    const int descriptor = open(path.c_str(), O_RDWR);
    fdatasync(descriptor);
    posix_fadvise(descriptor, 0, 0, POSIX_FADV_DONTNEED);
    close(descriptor);
    if (CachedBytes(path) != 0) {
        GTEST_SKIP() << "this file system keeps its files in memory";
    }
    const os::FileHandle file = os::OpenForReading(name);
    std::string seen(kPiece, ' ');
    ncfUInt32 bytesRead = 0;
    for (const ncfUInt64 position : {ncfUInt64{0}, ncfUInt64{8} * kPiece}) {
        ASSERT_TRUE(os::SetPosition(file, position));
        ASSERT_TRUE(os::Read(file, seen.data(), kPiece, &bytesRead));
    }
    EXPECT_EQ(CachedBytes(path), 2 * kPiece);
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
    ASSERT_TRUE(MakePipe(folder / "pipe.mov"));
    EXPECT_EQ(os::OpenForReading(pathOf("pipe.mov")), os::kNoFile);
    EXPECT_EQ(os::OpenForReading(pathOf("absent.mov")), os::kNoFile);
    EXPECT_EQ(os::LastError(), static_cast<ncfUInt32>(ENOENT));
}

TEST_F(OperatingSystem, OpensANameThatIsNoUtf8) {
    const std::string name = std::string("caf\xE9.mov");
    std::ofstream(folder.u8string() + "/" + name) << "bytes";
    std::u16string path = pathOf("caf");
    path += static_cast<char16_t>(0xDC00 + 0xE9);
    path += u".mov";
    const os::FileHandle file = os::OpenForReading(path);
    EXPECT_NE(file, os::kNoFile);
    os::Close(file);
}

// A name's bytes and its UTF-16 form. Bytes that are no UTF-8 stand as lone
// surrogates, each for itself.
struct Name {
    const char* bytes;
    std::u16string units;
};
const Name kNames[] = {
    {"\x80", {0xDC80}},
    {"\xFF", {0xDCFF}},
    {"\x7F\xC2\x80", {0x7F, 0x80}},
    {"\xDF\xBF\xE0\xA0\x80", {0x7FF, 0x800}},
    {"\xED\x9F\xBF", {0xD7FF}},
    {"\xEE\x80\x80", {0xE000}},
    {"\xEF\xBF\xBF", {0xFFFF}},
    {"\xF0\x90\x80\x80", {0xD800, 0xDC00}},
    {"\xF0\x9F\x8E\xAC", {0xD83C, 0xDFAC}},
    {"\xF4\x8F\xBF\xBF", {0xDBFF, 0xDFFF}},
    // A surrogate's own bytes, a form that is too long, a number too high, and
    // one that ends too early.
    {"\xED\xA0\x80", {0xDCED, 0xDCA0, 0xDC80}},
    {"\xED\xBF\xBF", {0xDCED, 0xDCBF, 0xDCBF}},
    {"\xC1\xBF", {0xDCC1, 0xDCBF}},
    {"\xE0\x9F\xBF", {0xDCE0, 0xDC9F, 0xDCBF}},
    {"\xF0\x8F\xBF\xBF", {0xDCF0, 0xDC8F, 0xDCBF, 0xDCBF}},
    {"\xF4\x90\x80\x80", {0xDCF4, 0xDC90, 0xDC80, 0xDC80}},
    {"\xE2\x82", {0xDCE2, 0xDC82}},
    {"\xF8\x88", {0xDCF8, 0xDC88}},
};

TEST_F(OperatingSystem, OpensNamesOfEveryForm) {
    for (const Name& name : kNames) {
        std::ofstream(folder.u8string() + "/" + name.bytes + ".mov") << name.bytes;
        const os::FileHandle file = os::OpenForReading(pathOf("") + name.units + u".mov");
        EXPECT_NE(file, os::kNoFile) << testing::PrintToString(name.units);
        ncfUInt64 size = 0;
        EXPECT_TRUE(os::GetFileSize(file, &size));
        EXPECT_EQ(size, std::strlen(name.bytes));
        os::Close(file);
    }
}

TEST_F(OperatingSystem, BelievesSectorSizesOfPowersOfTwoFrom512To65536) {
    const os::FileHandle file = os::OpenForReading(write("a.bin", "x"));
    for (const unsigned long size : {512ul, 4096ul, 65536ul}) {
        toldBlockSize = size;
        ncfUInt32 bytes = 0;
        EXPECT_TRUE(os::GetSectorSize(file, u"", &bytes)) << size;
        EXPECT_EQ(bytes, size);
    }
    for (const unsigned long size :
         {1ul, 256ul, 511ul, 513ul, 3072ul, 65535ul, 131072ul, 1048576ul}) {
        toldBlockSize = size;
        ncfUInt32 bytes = 7;
        EXPECT_FALSE(os::GetSectorSize(file, u"", &bytes)) << size;
        EXPECT_EQ(bytes, 7u);
        EXPECT_EQ(os::LastError(), static_cast<ncfUInt32>(ERANGE));
    }
    os::Close(file);
}

TEST_F(OperatingSystem, ConvertsTimesOfTheYears1601To30827Only) {
    constexpr os::FileTime kFirst = -11644473600;  // 1601-01-01, 00:00:00
    constexpr os::FileTime kLast = 910670515199;   // 30827-12-31, 23:59:59
    os::DateTime date{};
    ASSERT_TRUE(os::ToDateTime(kFirst, &date));
    EXPECT_EQ(date.year, 1601);
    EXPECT_EQ(date.month, 1);
    EXPECT_EQ(date.day, 1);
    EXPECT_FALSE(os::ToDateTime(kFirst - 1, &date));
    ASSERT_TRUE(os::ToDateTime(kLast, &date));
    EXPECT_EQ(date.year, 30827);
    EXPECT_FALSE(os::ToDateTime(kLast + 1, &date));
    EXPECT_FALSE(os::ToDateTime(std::numeric_limits<os::FileTime>::max(), &date));
    EXPECT_FALSE(os::ToDateTime(std::numeric_limits<os::FileTime>::min(), &date));
}

TEST_F(OperatingSystem, TellsThreadsApartAlsoOnceOneHasEnded) {
    const ncfUInt64 own = os::CurrentThreadId();
    EXPECT_EQ(os::CurrentThreadId(), own);
    EXPECT_EQ(own, static_cast<ncfUInt64>(getpid())) << "the first thread's number";
    ncfUInt64 first = 0;
    ncfUInt64 second = 0;
    std::thread([&] { first = os::CurrentThreadId(); }).join();
    std::thread([&] { second = os::CurrentThreadId(); }).join();
    EXPECT_NE(first, own);
    EXPECT_NE(second, own);
    EXPECT_NE(first, second) << "the second stands where the first did";
}

TEST_F(OperatingSystem, FindsTheModuleThatHoldsAnAddress) {
    std::wstring path;
    ASSERT_TRUE(os::GetModulePath(reinterpret_cast<const void*>(&os::LastError), &path));
    EXPECT_EQ(path.front(), L'/');
    EXPECT_TRUE(std::filesystem::equivalent(path, "/proc/self/exe")) << "the program itself";
    EXPECT_FALSE(os::GetModulePath(nullptr, &path));
}

// Loads a copy of a small library by a name relative to the working folder, as
// the system then keeps it.
class ModulePath : public OperatingSystem {
protected:
    ~ModulePath() override { std::filesystem::current_path(former_); }

    std::wstring PathOfACopyIn(const std::string& subfolder) {
        std::filesystem::create_directories(folder.u8string() + "/" + subfolder);
        const std::string copy = subfolder + "/library.so";
        std::filesystem::copy_file(OS_TEST_LIBRARY, folder.u8string() + "/" + copy);
        std::filesystem::current_path(folder);
        void* const library = dlopen(("./" + copy).c_str(), RTLD_NOW);
        EXPECT_NE(library, nullptr) << dlerror();
        std::wstring path;
        EXPECT_TRUE(os::GetModulePath(dlsym(library, "OsTestLibrary"), &path));
        dlclose(library);
        std::filesystem::current_path(former_);
        return path;
    }
    // By UTF-32: the way to wide characters depends on the locale.
    std::wstring WideFolder() const {
        const std::u32string text = folder.u32string();
        return {text.begin(), text.end()};
    }
    bool IsMapped(const std::string& name) const {
        void* const library =
            dlopen((folder.u8string() + "/" + name).c_str(), RTLD_NOW | RTLD_NOLOAD);
        if (library) {
            dlclose(library);
        }
        return library != nullptr;
    }

private:
    const std::filesystem::path former_ = std::filesystem::current_path();
};

TEST_F(ModulePath, IsMadeAbsolute) {
    const std::wstring path = PathOfACopyIn("plug-ins");
    EXPECT_EQ(path, WideFolder() + L"/./plug-ins/library.so");
}

TEST_F(ModulePath, CarriesBytesThatAreNoUtf8) {
    for (const Name& name : kNames) {
        std::wstring wide;
        for (std::size_t i = 0; i < name.units.size(); ++i) {
            const wchar_t unit = name.units[i];
            const bool isPair = unit >= 0xD800 && unit < 0xDC00;
            wide += isPair ? 0x10000 + ((unit - 0xD800) << 10) + (name.units[++i] - 0xDC00) : unit;
        }
        const std::wstring path = PathOfACopyIn(name.bytes);
        EXPECT_EQ(path, WideFolder() + L"/./" + wide + L"/library.so");
    }
}

TEST_F(ModulePath, KeepsTheModuleThatAskedMapped) {
    PathOfACopyIn("asked");
    EXPECT_TRUE(IsMapped("asked/library.so"));
    std::filesystem::copy_file(OS_TEST_LIBRARY, folder / "other.so");
    void* const other = dlopen((folder / "other.so").c_str(), RTLD_NOW);
    ASSERT_NE(other, nullptr);
    EXPECT_TRUE(IsMapped("other.so"));
    dlclose(other);
    EXPECT_FALSE(IsMapped("other.so")) << "one that did not ask goes";
}

TEST_F(OperatingSystem, RefusesAPositionThatNoFileHas) {
    const os::FileHandle file = os::OpenForReading(write("a.bin", "x"));
    EXPECT_FALSE(os::SetPosition(file, 0x8000000000000000u));
    os::Close(file);
    EXPECT_FALSE(os::Close(file));
}

}  // namespace
