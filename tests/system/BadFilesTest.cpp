// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// Files that are no usable movie: a clear result, a message that names the file
// and says what would help, and nothing left behind.

#include <sys/stat.h>
#include <unistd.h>

#include <chrono>

#include "host_interfaces/media/MediaContainer.h"
#include "host_interfaces/media/PluginComponents.h"
#include "reference_host/cliphost/Describe.h"
#include "reference_host/cliphost/Failure.h"
#include "tests/system/Facts.h"
#include "tests/system/SystemTest.h"

namespace {

class BadFiles : public SystemTest {
protected:
    // The message for a movie that must be refused.
    std::string Refusal(const std::filesystem::path& movie,
                        NCFRESULT expected = NMA_E_NOTINITIALIZED) {
        const cliphost::Description description = cliphost::DescribeMovie(session(), movie);
        EXPECT_FALSE(description.file);
        EXPECT_EQ(description.result, expected) << LineOf(description.problem);
        EXPECT_NE(LineOf(description.problem).find(movie.string()), std::string::npos)
            << LineOf(description.problem);
        return LineOf(description.problem);
    }
    static bool Says(const std::string& message, const std::string& words) {
        return message.find(words) != std::string::npos;
    }
};

TEST_F(BadFiles, EmptyFileIsRefused) {
    const std::string message = Refusal(Write(movies::Bytes{}, "empty.mov"));
    EXPECT_TRUE(Says(message, "the file is empty")) << message;
}

TEST_F(BadFiles, TextFileIsRefused) {
    const std::string text = "This is no movie but a letter, long enough to be read.\n";
    const std::string message =
        Refusal(Write(movies::Bytes(text.begin(), text.end()), "letter.mov"));
    EXPECT_TRUE(Says(message, "no movie of the QuickTime family")) << message;
    EXPECT_TRUE(Says(message, "can't be opened as another kind")) << message;
}

TEST_F(BadFiles, FewBytesAreRefused) {
    for (std::size_t size = 1; size <= 40; ++size) {
        Refusal(Write(movies::Bytes(size, 0), "few.mov"));
    }
}

TEST_F(BadFiles, FolderIsRefused) {
    std::filesystem::create_directory(folder() / "folder.mov");
    Refusal(folder() / "folder.mov", NCF_E_HANDLE);
}

TEST_F(BadFiles, PipeIsRefusedAtOnce) {
    const auto pipe = folder() / "pipe.mov";
    ASSERT_EQ(mkfifo(pipe.c_str(), 0600), 0);
    const auto start = std::chrono::steady_clock::now();
    host::Ref<NMA::IMediaContainer3> container;
    ASSERT_EQ(session().host().Create(NMA::CompID_QuickTimeContainer, container), NCF_OK);
    ASSERT_EQ(container->SetFilePath(cliphost::PathForModule(pipe).get()), NCF_OK);
    // The one operation that throws: the file can't be opened.
    EXPECT_THROW(container->IsContainerSupported(), NCFRESULT);
    EXPECT_LT(std::chrono::steady_clock::now() - start, std::chrono::seconds(1));
}

TEST_F(BadFiles, UnreadableFileIsRefused) {
    if (geteuid() == 0) {
        // Root reads everything: what no one can read is what is not there.
        const auto dangling = folder() / "dangling.mov";
        std::filesystem::create_symlink(folder() / "gone", dangling);
        host::Ref<NMA::IMediaContainer3> container;
        ASSERT_EQ(session().host().Create(NMA::CompID_QuickTimeContainer, container), NCF_OK);
        const auto path = host::MakeString(std::string_view(dangling.string()));
        ASSERT_EQ(container->SetFilePath(path.get()), NCF_OK);
        EXPECT_THROW(container->IsContainerSupported(), NCFRESULT);
        return;
    }
    const auto movie = Write(ReadFile(MadeMovie("png.mov")), "locked.mov");
    std::filesystem::permissions(movie, std::filesystem::perms::none);
    const std::string message = Refusal(movie, NCF_E_HANDLE);
    EXPECT_TRUE(Says(message, "get permission to read it")) << message;
}

TEST_F(BadFiles, AbsentFileIsTheCallersMistake) {
    try {
        cliphost::DescribeMovie(session(), folder() / "absent.mov");
        FAIL() << "described a file that is not there";
    } catch (const cliphost::Failure& failure) {
        EXPECT_EQ(failure.status(), cliphost::kExitCaller);
        EXPECT_TRUE(Says(failure.what(), "absent.mov: there is no such file")) << failure.what();
    }
}

TEST_F(BadFiles, NameWithABackslashIsTheCallersMistake) {
    Write(movies::Bytes{1}, "a\\b.mov");
    EXPECT_THROW(cliphost::DescribeMovie(session(), folder() / "a\\b.mov"), cliphost::Failure);
}

TEST_F(BadFiles, FragmentedMovieWithEmptyFragmentsIsRefused) {
    movies::Movie movie;
    movies::Track track = movies::VideoTrack(movies::VideoFormat(), 0, 25, 1);
    movie.tracks.push_back(track);
    movies::Box extends("mvex");
    extends.Add(movies::Box("trex").Version(0).U32(1).U32(1).U32(0).U32(0).U32(0));
    movie.inHeader.push_back(extends);
    movie.trailing.push_back(movies::Box("moof").Add(movies::Box("mfhd").Version(0).U32(1)));
    const std::string message = Refusal(Write(movie));
    EXPECT_TRUE(Says(message, "fragmented")) << message;
    EXPECT_TRUE(Says(message, "no length is found in it")) << message;
}

TEST_F(BadFiles, MovieCutInItsHeaderIsRefused) {
    movies::Movie movie;
    movie.header = movies::Place::kBeforeMedia;
    movie.tracks.push_back(movies::VideoTrack(movies::VideoFormat(), 10, 25, 1));
    movies::Bytes bytes = movies::Build(movie).ToBytes();
    bytes.resize(200);
    const std::string message = Refusal(Write(bytes, "cut.mov"));
    EXPECT_TRUE(Says(message, "the file ends at byte 200")) << message;
}

TEST_F(BadFiles, MovieWithoutPictureOrSoundIsRefused) {
    movies::Movie movie;
    movie.tracks.push_back(movies::TimecodeTrack(movies::TimecodeFormat(), 90000, 100));
    const cliphost::Description description = cliphost::DescribeMovie(session(), Write(movie));
    EXPECT_LT(description.result, 0);
    EXPECT_TRUE(Says(LineOf(description.problem), "no picture and no sound in its 1 track"))
        << LineOf(description.problem);
}

TEST_F(BadFiles, MovieWithoutTracksIsRefused) {
    Refusal(Write(movies::Movie()));
}

// A module whose data files are gone still describes sound; a movie with a
// picture fails, and the message names the file that is missing.
class MissingData : public BadFiles {
protected:
    void SetUp() override {
        const auto plugins = folder() / "plugins";
        std::filesystem::create_directory(plugins);
        for (const char* const name :
             {"QuickTimePlugin.nvx", "FourCharMapper.xml", "AAFInfo.xml"}) {
            std::filesystem::copy_file(ProgramFolder() / "plugins" / name, plugins / name);
        }
        options.plugin = plugins / "QuickTimePlugin.nvx";
    }
    void Remove(const char* name) { std::filesystem::remove(folder() / "plugins" / name); }
};

TEST_F(MissingData, IsNamed) {
    for (const char* const name : {"FourCharMapper.xml", "AAFInfo.xml"}) {
        SCOPED_TRACE(name);
        std::filesystem::copy_file(ProgramFolder() / "plugins" / "FourCharMapper.xml",
                                   folder() / "plugins" / "FourCharMapper.xml",
                                   std::filesystem::copy_options::overwrite_existing);
        Remove(name);
        Start();
        const cliphost::Description description =
            cliphost::DescribeMovie(session(), MadeMovie("png.mov"));
        EXPECT_FALSE(description.file);
        EXPECT_LT(description.result, 0);
        EXPECT_TRUE(
            Says(LineOf(description.problem), std::string(name) + ": this data file is missing"))
            << LineOf(description.problem);
        EXPECT_EQ(SoundLine(Describe(MadeMovie("pcm_s16le.mov"))).substr(0, 13), "little-endian");
        End();
    }
}

// Broken ones are told with the place, and with what the parser says.
TEST_F(MissingData, IsToldFromBrokenData) {
    for (const char* const name : {"FourCharMapper.xml", "AAFInfo.xml"}) {
        SCOPED_TRACE(name);
        const auto file = folder() / "plugins" / name;
        const movies::Bytes whole = ReadFile(file);
        const std::string broken = "<?xml version=\"1.0\"?>\n<a>\n  <b></a>\n";
        Write(movies::Bytes(broken.begin(), broken.end()), std::string("plugins/") + name);
        Start();
        const cliphost::Description description =
            cliphost::DescribeMovie(session(), MadeMovie("png.mov"));
        EXPECT_LT(description.result, 0);
        const std::string line = LineOf(description.problem);
        EXPECT_TRUE(
            Says(line, std::string(name) + ": this data file is broken, line 3, column 8: "))
            << line;
        EXPECT_EQ(description.problem.route, cliphost::route::kHeader);
        Write(whole, std::string("plugins/") + name);
        End();
    }
}

TEST_F(MissingData, IsReadOnceItIsBack) {
    Remove("AAFInfo.xml");
    Start();
    EXPECT_LT(cliphost::DescribeMovie(session(), MadeMovie("png.mov")).result, 0);
    std::filesystem::copy_file(ProgramFolder() / "plugins" / "AAFInfo.xml",
                               folder() / "plugins" / "AAFInfo.xml");
    EXPECT_EQ(Pictures(Describe(MadeMovie("png.mov"))).size(), 1u);
}

}  // namespace
