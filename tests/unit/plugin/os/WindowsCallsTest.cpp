// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// What each operation of Os.h asks of Windows, to the last argument, and what it
// answers, also when Windows refuses.

#include <gtest/gtest.h>

#include <algorithm>
#include <functional>
#include <iterator>
#include <sstream>
#include <string>
#include <vector>

#include "source/plugin/os/Os.h"
#include "tests/support/windows_calls/WindowsCalls.h"

namespace {

constexpr char16_t kClip[] = u"C:\\movies\\clip.mov";
constexpr std::uint64_t kLong = 0x1'2345'6789;
constexpr char kAddress = 0;  // one within the module
constexpr ncfUInt32 kError = 5;

// An open file; what opening asks for is a row of its own.
os::FileHandle OpenClip() {
    const os::FileHandle file = os::OpenForReading(kClip);
    WindowsCalls::Get().TakeCalls();
    return file;
}
std::string Answer(bool good) {
    return good ? "true" : "false";
}
// What an operation gave out, or that it left alone what was there.
template <class Value>
std::string Answer(bool good, const Value& value) {
    std::ostringstream text;
    text << Answer(good) << ' ' << value;
    return text.str();
}

// An operation with what Windows is asked for it. `ask` gives the answer as text.
struct Row {
    const char* name;
    std::function<std::string()> ask;
    std::vector<std::string> calls;
    const char* answer;
    // The answer when the last of the calls fails; null when there is none, or when a
    // test of its own tells.
    const char* refused;
};

void PrintTo(const Row& row, std::ostream* out) {
    *out << row.name;
}

std::string AskSectorSize(const std::u16string& root) {
    ncfUInt32 bytes = 1;
    const bool good = os::GetSectorSize(4, root, &bytes);
    return Answer(good, bytes);
}
std::string AskModulePath(const void* address) {
    std::wstring path = L"before";
    const bool good = os::GetModulePath(address, &path);
    return Answer(good, std::string(path.begin(), path.end()));
}
std::string AskWait(std::uint32_t outcome) {
    WindowsCalls::Get().wait = outcome;
    return std::to_string(static_cast<int>(os::WaitForMutex(reinterpret_cast<void*>(0x20))));
}

const Row kRows[] = {
    {"OpensForReadingPastTheCache",
     [] { return Answer(os::OpenForReading(kClip) != os::kNoFile); },
     {R"(CreateFileW("C:\movies\clip.mov", 0x80000000, 0x1, null, 3, 0x20000000, null))",
      "GetFileType(0x104)"},
     "true",
     nullptr},
    {"ClosesFiles",
     [] { return Answer(os::Close(OpenClip())); },
     {"CloseHandle(0x104)"},
     "true",
     "false"},
    {"MakesTheSizeOfTwoWords",
     [] {
         ncfUInt64 size = 1;
         const bool good = os::GetFileSize(OpenClip(), &size);
         return Answer(good, size);
     },
     {"GetFileInformationByHandle(0x104, place)"},
     "true 4886718345",
     "false 1"},
    {"AsksTheRootForItsSectors",
     [] { return AskSectorSize(u"C:\\"); },
     {R"(GetDiskFreeSpaceW("C:\", null, place, null, null))"},
     "true 4096",
     "false 1"},
    {"AsksAShareForItsSectors",
     [] { return AskSectorSize(u"\\\\server\\share\\"); },
     {R"(GetDiskFreeSpaceW("\\server\share\", null, place, null, null))"},
     "true 2048",
     "false 1"},
    {"AsksNobodyWithoutARoot", [] { return AskSectorSize(u""); }, {}, "false 1", nullptr},
    {"DoesNotBelieveSectorsOfNoBytes",
     [] { return AskSectorSize(u"Z:\\"); },
     {R"(GetDiskFreeSpaceW("Z:\", null, place, null, null))"},
     "false 1",
     "false 1"},
    {"SetsPositionsOfMoreThan32BitsFromTheBegin",
     [] { return Answer(os::SetPosition(OpenClip(), 0x1'0000'0200)); },
     {"SetFilePointerEx(0x104, 4294967808, null, 0)"},
     "true",
     "false"},
    {"ReadsWithoutOverlap",
     [] {
         alignas(512) char bytes[1024] = {};
         ncfUInt32 count = 1;
         const bool good = os::Read(OpenClip(), bytes, 1024, &count);
         return Answer(good, std::to_string(count) + bytes);
     },
     {"ReadFile(0x104, place, 1024, place, null)"},
     "true 1024moov",
     "false 1"},
    {"AllocatesAligned",
     [] {
         void* const memory = os::AllocateAligned(8192, 4096);
         const bool given = memory != nullptr;
         os::FreeAligned(memory);
         return Answer(given);
     },
     {"_aligned_malloc(8192, 4096)"},
     "true",
     "false"},
    {"AsksNoMemoryAtWhatIsNoPowerOfTwo",
     [] { return Answer(os::AllocateAligned(8192, 3000) != nullptr); },
     {},
     "false",
     nullptr},
    {"AsksNoMemoryAtMultiplesOfNothing",
     [] { return Answer(os::AllocateAligned(8192, 0) != nullptr); },
     {},
     "false",
     nullptr},
    {"TakesTheLastWriteOfTheAttributes",
     [] {
         os::FileTime time = 1;
         const bool good = os::GetLastWriteTime(kClip, &time);
         return Answer(good, time);
     },
     {R"(GetFileAttributesExW("C:\movies\clip.mov", 0, place))"},
     "true 134084222370000000",
     "false 1"},
    {"TurnsBothWordsOfATimeIntoADate",
     [] {
         os::DateTime date{1, 2, 3, 4, 5, 6, 7};
         const bool good = os::ToDateTime(0x01DC'1234'8765'4321, &date);
         std::ostringstream text;
         text << date.year << '-' << date.month << '-' << date.day << " day " << date.dayOfWeek
              << ' ' << date.hour << ':' << date.minute << ':' << date.second;
         return Answer(good, text.str());
     },
     {"FileTimeToSystemTime(0x1dc1234, 0x87654321, place)"},
     "true 2026-11-22 day 0 21:43:57",
     "false 1-2-3 day 4 5:6:7"},
    {"FindsTheModuleByAnAddressAndKeepsIt",
     [] { return AskModulePath(&kAddress); },
     {"GetModuleHandleExA(0x4, place, place)", "GetModuleFileNameW(place, place, 260)"},
     R"(true C:\editor\QuickTimePlugin.nvx)",
     "false before"},
    {"LoadsLibrariesByTheirBareName",
     [] { return Answer(os::LoadLibraryByName("AAFCOAPI.dll") != nullptr); },
     {R"(LoadLibraryA("AAFCOAPI.dll"))"},
     "true",
     "false"},
    {"FindsSymbols",
     [] {
         return Answer(os::FindSymbol(os::LoadLibraryByName("AAFCOAPI.dll"), "AAFLoad") != nullptr);
     },
     {R"(LoadLibraryA("AAFCOAPI.dll"))", R"(GetProcAddress(place, "AAFLoad"))"},
     "true",
     "false"},
    {"MakesMutexesThatNobodyOwns",
     [] { return Answer(os::CreateNamedMutex("log") != nullptr); },
     {R"(CreateMutexA(null, 0, "log"))"},
     "true",
     "false"},
    {"WaitsForEver",
     [] { return AskWait(0); },
     {"WaitForSingleObject(0x20, 0xffffffff)"},
     "0",
     "3"},
    {"KnowsAbandonedMutexes",
     [] { return AskWait(0x80); },
     {"WaitForSingleObject(0x20, 0xffffffff)"},
     "1",
     "3"},
    {"KnowsTheEndOfTime",
     [] { return AskWait(0x102); },
     {"WaitForSingleObject(0x20, 0xffffffff)"},
     "2",
     "3"},
    {"KnowsFailedWaits",
     [] { return AskWait(0xFFFFFFFF); },
     {"WaitForSingleObject(0x20, 0xffffffff)"},
     "3",
     "3"},
    {"KnowsNoOtherEndOfAWait",
     [] { return AskWait(0xC0); },
     {"WaitForSingleObject(0x20, 0xffffffff)"},
     "4",
     "3"},
    {"ReleasesMutexes",
     [] { return Answer(os::ReleaseMutex(reinterpret_cast<void*>(0x20))); },
     {"ReleaseMutex(0x20)"},
     "true",
     "false"},
    {"ClosesMutexes",
     [] {
         os::CloseMutex(reinterpret_cast<void*>(0x20));
         return "closed";
     },
     {"CloseHandle(0x20)"},
     "closed",
     "closed"},
    {"ClosesNoMutexThatWasNotMade",
     [] {
         os::CloseMutex(nullptr);
         return "closed";
     },
     {},
     "closed",
     nullptr},
    {"TakesTheTextOfTheSystemInItsNeutralLanguage",
     [] { return os::ErrorText(32); },
     {"FormatMessageA(0x1200, null, 32, 0x400, place, 511, null)"},
     "In use.",
     ""},
    {"NamesThreadsByTheirNumber",
     [] { return std::to_string(os::CurrentThreadId()); },
     {},
     "77",
     nullptr},
};

// Windows as each row finds it.
WindowsCalls& Prepared() {
    WindowsCalls& windows = WindowsCalls::Anew();
    WindowsCalls::File& clip = windows.files[kClip];
    clip.bytes = {'m', 'o', 'o', 'v', 0};
    clip.length = kLong;
    clip.written = 134084222370000000;
    windows.roots = {{u"C:\\", 4096}, {u"\\\\server\\share\\", 2048}, {u"Z:\\", 0}};
    windows.modules[&kAddress] = u"C:\\editor\\QuickTimePlugin.nvx";
    windows.libraries["AAFCOAPI.dll"] = "AAFLoad";
    windows.errorTexts[32] = "In use.\r\n";
    return windows;
}

class WindowsCall : public testing::TestWithParam<Row> {
protected:
    WindowsCalls& windows = Prepared();
};
INSTANTIATE_TEST_SUITE_P(Each, WindowsCall, testing::ValuesIn(kRows),
                         [](const auto& row) { return row.param.name; });

std::vector<Row> RowsThatCanFail() {
    std::vector<Row> rows;
    std::copy_if(std::begin(kRows), std::end(kRows), std::back_inserter(rows),
                 [](const Row& row) { return row.refused != nullptr; });
    return rows;
}
class WindowsRefusal : public WindowsCall {};
INSTANTIATE_TEST_SUITE_P(Each, WindowsRefusal, testing::ValuesIn(RowsThatCanFail()),
                         [](const auto& row) { return row.param.name; });

TEST_P(WindowsCall, IsMadeWithTheseArguments) {
    EXPECT_EQ(GetParam().ask(), GetParam().answer);
    EXPECT_EQ(windows.calls, GetParam().calls);
}

TEST_P(WindowsRefusal, IsToldWithItsError) {
    const std::string& last = GetParam().calls.back();
    windows.failures[last.substr(0, last.find('('))] = kError;
    EXPECT_EQ(GetParam().ask(), GetParam().refused);
    EXPECT_EQ(os::LastError(), kError);
    EXPECT_EQ(windows.liveBlocks, 0);
}

class WindowsFiles : public testing::Test {
protected:
    WindowsCalls& windows = Prepared();
};

TEST_F(WindowsFiles, AreNotOpenedWhereWindowsRefuses) {
    windows.files[u"C:\\folder.mov"].isFolder = true;
    windows.files[u"C:\\unfinished.mov"].isWritten = true;
    const struct {
        const char16_t* path;
        ncfUInt32 error;
    } kCases[] = {{u"C:\\absent.mov", 2}, {u"C:\\folder.mov", 5}, {u"C:\\unfinished.mov", 32}};
    for (const auto& [path, error] : kCases) {
        EXPECT_EQ(os::OpenForReading(path), os::kNoFile);
        EXPECT_EQ(os::LastError(), error);
    }
    EXPECT_EQ(windows.openHandles, 0);
}

// A console or a pipe would let the reader wait for ever.
TEST_F(WindowsFiles, AreNoDevicesOrPipes) {
    windows.files[u"CON"].type = 2;
    windows.files[u"\\\\.\\pipe\\clip.mov"].type = 3;
    windows.files[u"unknown"].type = 0;
    for (const char16_t* path : {u"CON", u"\\\\.\\pipe\\clip.mov", u"unknown"}) {
        EXPECT_EQ(os::OpenForReading(path), os::kNoFile);
        EXPECT_EQ(os::LastError(), 87u) << "the error is not that of closing";
        EXPECT_EQ(windows.openHandles, 0);
    }
}

TEST_F(WindowsFiles, AreFoundByEveryNameOfSixteenBits) {
    // A pair of surrogates, and a lone one, which file systems of Windows bear.
    const std::u16string path = u"C:\\\u00E9 \u6620\u753B \U0001F3AC " + std::u16string{0xD83C};
    windows.files[path].bytes = {1, 2, 3};
    ncfUInt64 size = 0;
    EXPECT_TRUE(os::GetFileSize(os::OpenForReading(path), &size));
    EXPECT_EQ(size, 3u);
    EXPECT_EQ(windows.calls[0].substr(0, 61),
              R"(CreateFileW("C:\<0xe9> <0x6620><0x753b> <0xd83c><0xdfac> <0xd)");
}

TEST_F(WindowsFiles, FailOnAHandleThatIsNotOpen) {
    ncfUInt64 size = 1;
    ncfUInt32 count = 1;
    char byte = 'x';
    EXPECT_FALSE(os::GetFileSize(4, &size));
    EXPECT_FALSE(os::SetPosition(4, 0));
    EXPECT_FALSE(os::Read(4, &byte, 1, &count));
    EXPECT_EQ(os::LastError(), 6u);
    EXPECT_EQ(size, 1u);
    EXPECT_EQ(count, 1u);
}

class WindowsModule : public WindowsFiles {
protected:
    std::size_t LengthOfPathOf(std::size_t length) {
        windows.modules[&kAddress] = std::u16string(length, u'x');
        std::wstring path;
        EXPECT_TRUE(os::GetModulePath(&kAddress, &path));
        return path.size();
    }
};

TEST_F(WindowsModule, HasNoPathWhereNoneHoldsTheAddress) {
    std::wstring path = L"before";
    EXPECT_FALSE(os::GetModulePath(&path, &path));
    EXPECT_EQ(os::LastError(), 126u);
    EXPECT_EQ(path, L"before");
    EXPECT_EQ(windows.calls.size(), 1u);
}

TEST_F(WindowsModule, HasAPathOfAtMost259Characters) {
    for (const std::size_t length : {1u, 258u, 259u}) {
        EXPECT_EQ(LengthOfPathOf(length), length);
    }
    for (const std::size_t length : {260u, 261u, 400u}) {
        EXPECT_EQ(LengthOfPathOf(length), 259u) << "it is cut";
    }
}

TEST_F(WindowsModule, IsIdentifiedWithoutAReference) {
    EXPECT_EQ(os::OwnModule(), nullptr) << "no module holds the function";
    windows.modules[reinterpret_cast<const void*>(&os::OwnModule)] = u"module";
    EXPECT_EQ(os::OwnModule(), &windows.modules[reinterpret_cast<const void*>(&os::OwnModule)]);
    EXPECT_EQ(windows.calls, std::vector<std::string>(2, "GetModuleHandleExA(0x6, place, place)"));
}

TEST_F(WindowsFiles, HaveErrorTextsWithoutLineEnds) {
    windows.errorTexts = {{1, "One."},     {2, "Two.\r\n"}, {3, "Two\r\nlines.\r\n\r\n"},
                          {4, "\r\n"},     {5, ""},         {6, std::string(510, 'x')},
                          {7, "100 %1 %s"}};
    EXPECT_EQ(os::ErrorText(1), "One.");
    EXPECT_EQ(os::ErrorText(2), "Two.");
    EXPECT_EQ(os::ErrorText(3), "Two\r\nlines.");
    EXPECT_EQ(os::ErrorText(4), "");
    EXPECT_EQ(os::ErrorText(5), "");
    EXPECT_EQ(os::ErrorText(6), std::string(510, 'x'));
    EXPECT_EQ(os::ErrorText(7), "100 %1 %s");
}

}  // namespace
