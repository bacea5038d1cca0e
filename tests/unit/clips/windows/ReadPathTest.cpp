// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// Movies read through the module's Windows source, over a system that refuses a read
// past its cache unless it begins and ends with a sector, in the file and in memory.

#include <gtest/gtest.h>

#include <algorithm>
#include <cstdlib>
#include <memory>
#include <random>
#include <string>
#include <vector>

#include "public_include/SimpleFileIO.h"
#include "reference_host/header_parser/QTParser.h"
#include "reference_host/movie_writer/Movie.h"
#include "reference_host/util/Ref.h"
#include "source/clips/LoadMedia.h"
#include "tests/support/fakes/FakeHost.h"
#include "tests/support/fakes/RecordingLogger.h"
#include "tests/support/windows_calls/WindowsCalls.h"
#include "tests/unit/clips/ClipFixture.h"

namespace {

using NMA::Impl::SimpleFileIO;
using Bytes = std::vector<ncfUInt8>;

// Where a movie lies, and what the system tells of the volume.
struct Volume {
    const char* name;
    const char16_t* path;
    ncfUInt32 sectorSize;
    const char16_t* root;  // null: by no root is it asked, or it doesn't tell
    ncfUInt32 toldSize;
};
void PrintTo(const Volume& volume, std::ostream* out) {
    *out << volume.name;
}

const Volume kVolumes[] = {
    {"Drive", u"C:\\movies\\clip.mov", 512, u"C:\\", 512},
    {"DriveOf4096", u"C:\\movies\\clip.mov", 4096, u"C:\\", 4096},
    {"Disc", u"D:\\clip.mov", 2048, u"D:\\", 2048},
    {"DriveThatTellsMoreThanItNeeds", u"C:\\clip.mov", 512, u"C:\\", 65536},
    {"Share", u"\\\\server\\share\\clip.mov", 512, u"\\\\server\\share\\", 512},
    {"ShareOf4096", u"\\\\server\\share\\a\\clip.mov", 4096, u"\\\\server\\share\\", 4096},
    {"LongName", u"\\\\?\\C:\\movies\\clip.mov", 4096, u"\\\\?\\C:\\", 4096},
    {"RelativeName", u"movies\\clip.mov", 512, nullptr, 0},
    {"NameOnACurrentFolder", u"C:clip.mov", 2048, nullptr, 0},
    {"DriveThatDoesNotTell", u"M:\\clip.mov", 512, nullptr, 0},
    {"DriveThatTellsNothing", u"M:\\clip.mov", 512, u"M:\\", 0},
};

std::string Utf8(const std::u16string& ascii) {
    return {ascii.begin(), ascii.end()};
}

class WindowsVolumes : public testing::TestWithParam<Volume> {
protected:
    WindowsVolumes() {
        if (GetParam().root) {
            windows.roots[GetParam().root] = GetParam().toldSize;
        }
    }
    ~WindowsVolumes() override {
        EXPECT_EQ(windows.misaligned, 0);
        EXPECT_EQ(windows.openHandles, 0);
        EXPECT_EQ(windows.liveBlocks, 0);
    }
    void Put(const Bytes& bytes) {
        WindowsCalls::File& file = windows.files[GetParam().path];
        file.bytes = bytes;
        file.sectorSize = GetParam().sectorSize;
    }

    WindowsCalls& windows = WindowsCalls::Anew();
};
INSTANTIATE_TEST_SUITE_P(Of, WindowsVolumes, testing::ValuesIn(kVolumes),
                         [](const auto& row) { return row.param.name; });

TEST_P(WindowsVolumes, GiveAnyRangeToAnyAddress) {
    const Bytes bytes = CountingBytes(100'001);
    Put(bytes);
    const NCFSmartPtr<INCFString> path = HostText(Utf8(GetParam().path));
    SimpleFileIO file(path.inArg());
    std::mt19937 random(20261122);
    const auto below = [&](std::size_t end) { return static_cast<ncfUInt32>(random() % end); };
    const std::unique_ptr<void, void (*)(void*)> block(std::aligned_alloc(65'536, 196'608),
                                                       std::free);
    auto* const memory = static_cast<ncfUInt8*>(block.get());
    for (int i = 0; i < 300; ++i) {
        // Every other range begins and ends with sectors, every third address is aligned.
        const ncfUInt32 step = i % 2 == 0 ? 4096 : 1;
        const ncfUInt32 position = below(100'001 / step) * step;
        const ncfUInt32 size = (1 + below(65'536 / step)) * step;
        ncfUInt8* const target = memory + (i % 3 == 0 ? 0 : below(65'536));
        ncfUInt32 count = 0;
        ASSERT_EQ(file.Read(position, target, size, &count), NCF_OK) << position << ' ' << size;
        // Near the end the count may hold what is not there; that is zero.
        const auto there = std::min<std::size_t>(size, bytes.size() - position);
        ASSERT_GE(count, there);
        ASSERT_LE(count, size);
        ASSERT_TRUE(std::equal(target, target + there, bytes.begin() + position));
        ASSERT_TRUE(std::all_of(target + there, target + count, [](int b) { return b == 0; }));
    }
}

TEST_P(WindowsVolumes, GiveWholeMovies) {
    FakeHost host;
    NMAInitialize(host.factory());
    host.maker(NCFCompID_QTParser, [](const GUID& iid, void** out) {
        return host::MakeRef<header_parser::QTParser>()->QueryInterface(iid, out);
    });
    for (const movies::Place place : {movies::Place::kBeforeMedia, movies::Place::kBehindMedia}) {
        movies::Movie movie;
        movie.header = place;
        movies::Track video = movies::VideoTrack(movies::VideoFormat(), 100, 25, 1, 3001);
        for (int i = 0; i < 300'100; ++i) {
            video.data.push_back(static_cast<std::uint8_t>(i % 251));
        }
        movie.tracks = {video, movies::SoundTrack(movies::SoundFormat(), 192'000)};
        Put(movies::Build(movie).ToBytes());

        std::tr1::shared_ptr<BaseClip> clip;
        ncfBool isOne = 0;
        const NCFSmartPtr<INCFConsole> console(&host.console());
        const NCFSmartPtr<INCFString> path = HostText(Utf8(GetParam().path));
        EXPECT_EQ(IsQuickTimeContainer(path, console, &isOne), NCF_OK);
        EXPECT_EQ(isOne, 1);
        ASSERT_EQ(LoadMedia(path, console, NCFSmartPtr<INCFComponentFactory>(host.factory()), clip),
                  NCF_OK);
        ncfUInt32 tracks = 0;
        EXPECT_EQ(clip->GetTrackCount(&tracks), NCF_OK);
        EXPECT_EQ(tracks, 2u);
        ByteVector content;
        EXPECT_EQ(clip->GetContentForHash(content), NCF_OK);
        // Bytes from the middle of the picture's media are in it.
        const Bytes& media = video.data;
        EXPECT_NE(
            std::search(content.begin(), content.end(), media.begin() + 1000, media.begin() + 1251),
            content.end());
        EXPECT_GT(content.size(), 3000u);
    }
    NMATerminate();
}

class WindowsReads : public testing::Test {
protected:
    WindowsReads() {
        windows.files[u"C:\\movies\\clip.mov"].bytes = CountingBytes(5000);
        windows.files[u"C:\\movies\\clip.mov"].sectorSize = 2048;
        windows.roots[u"C:\\"] = 2048;
    }
    // One more line, which begins like this.
    void ExpectLine(const std::string& start) {
        ASSERT_EQ(log.lines().size(), ++linesTold) << start;
        EXPECT_EQ(log.lines().back().level, 1u);
        EXPECT_EQ(log.lines().back().text.substr(0, start.size()), start);
    }

    WindowsCalls& windows = WindowsCalls::Anew();
    RecordingNMALog log{1};
    std::size_t linesTold = 0;
    NCFSmartPtr<INCFString> path = HostText("C:\\movies\\clip.mov");
    std::unique_ptr<SimpleFileIO> file = std::make_unique<SimpleFileIO>(path.inArg());
    alignas(2048) ncfUInt8 memory[8192] = {};
    ncfUInt32 count = 0;
};

const char kOpened[] =
    R"(CreateFileW("C:\movies\clip.mov", 0x80000000, 0x1, null, 3, 0x20000000, null))";
const char kAskedRoot[] = R"(GetDiskFreeSpaceW("C:\", null, place, null, null))";

TEST_F(WindowsReads, AskOneSectorForAFewBytes) {
    EXPECT_TRUE(windows.calls.empty()) << "nothing is opened before it is needed";
    ASSERT_EQ(file->Read(0, memory, 512, &count), NCF_OK);
    file.reset();
    EXPECT_EQ(windows.calls,
              (std::vector<std::string>{
                  kOpened, "GetFileType(0x104)", kAskedRoot, "_aligned_malloc(2048, 2048)",
                  "SetFilePointerEx(0x104, 0, null, 0)",
                  "ReadFile(0x104, place, 2048, place, null)", "CloseHandle(0x104)"}));
    EXPECT_EQ(count, 512u);
}

TEST_F(WindowsReads, AskTwoSectorsAcrossTheirBorder) {
    file->GetAlignment(nullptr, nullptr);
    windows.TakeCalls();
    ASSERT_EQ(file->Read(2000, memory, 100, &count), NCF_OK);
    EXPECT_EQ(windows.calls,
              (std::vector<std::string>{"_aligned_malloc(4096, 2048)",
                                        "SetFilePointerEx(0x104, 0, null, 0)",
                                        "ReadFile(0x104, place, 4096, place, null)"}));
    const Bytes all = CountingBytes(2100);
    EXPECT_TRUE(std::equal(memory, memory + 100, all.begin() + 2000));
}

TEST_F(WindowsReads, TakeNoMemoryForAlignedRangesAtAlignedAddresses) {
    file->GetAlignment(nullptr, nullptr);
    windows.TakeCalls();
    ASSERT_EQ(file->Read(2048, memory, 2048, &count), NCF_OK);
    EXPECT_EQ(windows.calls,
              (std::vector<std::string>{"SetFilePointerEx(0x104, 2048, null, 0)",
                                        "ReadFile(0x104, place, 2048, place, null)"}));
}

TEST_F(WindowsReads, ReachBeyondFourGigabytes) {
    constexpr ncfUInt64 kLength = 0x3'0000'0000;
    windows.files[u"C:\\movies\\clip.mov"].length = kLength;
    ncfUInt64 size = 0;
    EXPECT_EQ(file->GetFileSize(&size), NCF_OK);
    EXPECT_EQ(size, kLength);
    windows.TakeCalls();
    ASSERT_EQ(file->Read(0x2'0000'0000, memory, 2048, &count), NCF_OK);
    EXPECT_EQ(windows.calls[0], "SetFilePointerEx(0x104, 8589934592, null, 0)");
}

TEST_F(WindowsReads, GiveWhatIsLeftAtTheEndAndThenNothing) {
    ASSERT_EQ(file->Read(4096, memory, 2048, &count), NCF_OK);
    EXPECT_EQ(count, 904u);
    EXPECT_EQ(file->Read(6144, memory, 2048, &count), NMA_E_NODATA);
    EXPECT_EQ(count, 0u);
    ExpectLine(
        "SimpleFileIO error. ReadFile read 0 bytes. HRESULT = 0x0, "
        "public_include/SimpleFileIO(");
}

// The default is too small for such a volume. It is no silent fault.
TEST_F(WindowsReads, FailOnLargeSectorsThatTheVolumeDoesNotTell) {
    windows.files[u"C:\\movies\\clip.mov"].sectorSize = 4096;
    windows.roots.clear();
    EXPECT_EQ(file->Read(2048, memory, 2048, &count), NCF_E_HANDLE);
    ExpectLine("SimpleFileIO error. SetFilePointerEx failed. HRESULT = 0x57, ");
    EXPECT_EQ(file->Read(0, memory, 2048, &count), NCF_E_HANDLE);
    ExpectLine("SimpleFileIO error. ReadFile failed. HRESULT = 0x57, ");
    EXPECT_EQ(windows.misaligned, 2);
}

TEST_F(WindowsReads, HaveNoMemoryForSectorsOfNoPowerOfTwo) {
    windows.roots[u"C:\\"] = 3000;
    EXPECT_EQ(file->Read(0, memory, 10, &count), NCF_E_OUTOFMEMORY);
    EXPECT_EQ(count, 0u);
}

TEST_F(WindowsReads, ThrowWhenTheFileCannotBeOpened) {
    windows.failures["CreateFileW"] = 32;
    EXPECT_THROW(file->Read(0, memory, 1, &count), NCFRESULT);
    ExpectLine(
        "SimpleFileIO error. CreateFileW failed. HRESULT = 0x20, "
        "public_include/SimpleFileIO(");
}

// A call that fails behind the opening, the operation that makes it, its answer.
struct Failure {
    const char* function;
    NCFRESULT (*ask)(SimpleFileIO& file, ncfUInt8* memory, ncfUInt32* count);
    NCFRESULT result;
};
NCFRESULT AskSize(SimpleFileIO& file, ncfUInt8*, ncfUInt32*) {
    ncfUInt64 size = 1;
    const NCFRESULT result = file.GetFileSize(&size);
    EXPECT_EQ(size, 0u);
    return result;
}
NCFRESULT AskBytes(SimpleFileIO& file, ncfUInt8* memory, ncfUInt32* count) {
    return file.Read(0, memory, 100, count);
}

TEST_F(WindowsReads, TellWhichCallFailedAndWhy) {
    const Failure kFailures[] = {{"GetFileInformationByHandle", AskSize, NCF_OK},
                                 {"SetFilePointerEx", AskBytes, NCF_E_HANDLE},
                                 {"ReadFile", AskBytes, NCF_E_HANDLE}};
    for (const Failure& failure : kFailures) {
        windows.failures = {{failure.function, 1117}};
        EXPECT_EQ(failure.ask(*file, memory, &count), failure.result) << failure.function;
        EXPECT_EQ(count, 0u);
        ExpectLine(std::string("SimpleFileIO error. ") + failure.function +
                   " failed. HRESULT = 0x45d, public_include/SimpleFileIO(");
    }
    windows.failures = {{"CloseHandle", 6}};
    file.reset();
    ExpectLine(
        "SimpleFileIO error. CloseHandle failed. HRESULT = 0x6, "
        "public_include/SimpleFileIO(");
}

}  // namespace
