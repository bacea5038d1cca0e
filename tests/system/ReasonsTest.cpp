// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// The sentence that each failure is told with: what is wrong with the file, by
// track and numbers, and what helps.

#include <unistd.h>

#include <algorithm>
#include <functional>
#include <nlohmann/json.hpp>

#include "tests/system/Command.h"
#include "tests/system/SystemTest.h"

namespace {

using Json = nlohmann::json;

// Another code for the sample description of a codec, wherever it stands.
movies::Bytes WithCode(movies::Bytes bytes, const std::string& from, const std::string& to) {
    for (auto at = bytes.begin();;) {
        at = std::search(at, bytes.end(), from.begin(), from.end());
        if (at == bytes.end()) {
            return bytes;
        }
        std::copy(to.begin(), to.end(), at);
    }
}

movies::Movie OneTrack(movies::Track track) {
    movies::Movie movie;
    movie.header = movies::Place::kBeforeMedia;
    movie.tracks.push_back(std::move(track));
    return movie;
}

movies::Bytes Made(const char* name) {
    return ReadFile(MadeMovie(name));
}

movies::Bytes CutAt(movies::Bytes bytes, std::size_t size) {
    bytes.resize(size);
    return bytes;
}

// Two pictures of an hour each beside sound.
movies::Bytes TwoLongPictures() {
    movies::Movie movie = OneTrack(movies::VideoTrack(movies::VideoFormat(), 2, 1, 3600));
    movie.tracks.push_back(movies::SoundTrack(movies::SoundFormat(), 48000));
    return movies::Build(movie).ToBytes();
}

movies::Bytes TimecodeAlone() {
    return movies::Build(OneTrack(movies::TimecodeTrack(movies::TimecodeFormat(), 90000, 100)))
        .ToBytes();
}

struct Case {
    const char* name;
    movies::Bytes (*make)();
    std::string call;  // the movie's name follows
    std::string words;
};

void PrintTo(const Case& row, std::ostream* out) {
    *out << row.name;
}

class Reasons : public SystemTest {
protected:
    std::string In(const std::string& name) { return Quoted(folder() / name); }
    std::string Line(const std::string& arguments) {
        return RunCommand("cd " + Quoted(folder()) + " && " + Quoted(ProgramFolder() / "cliphost") +
                          " " + arguments + " 2>&1")
            .out;
    }
};

class ReasonOf : public Reasons, public testing::WithParamInterface<Case> {};

TEST_P(ReasonOf, IsTold) {
    Write(GetParam().make(), "a.mov");
    const std::string said = Line(GetParam().call + " a.mov");
    EXPECT_EQ(said.substr(0, said.find('\n')), GetParam().words) << said;
}

INSTANTIATE_TEST_SUITE_P(
    Files, ReasonOf,
    testing::Values(
        Case{"ImpossibleSize",
             [] {
                 return movies::Bytes{0, 0, 0, 16, 'f', 't', 'y', 'p', 'q', 't', ' ', ' ',
                                      0, 0, 0, 0,  0,   0,   0,   4,   'm', 'd', 'a', 't'};
             },
             "describe -q", "cliphost: a.mov: 'mdat' has the impossible size 4 (at byte 16)"},
        Case{"NoPictureAndNoSound", TimecodeAlone, "describe -q",
             "cliphost: a.mov: the movie holds no picture and no sound in its 1 track"},
        Case{"NoSampleDescription",
             [] {
                 movies::Track track = movies::VideoTrack(movies::VideoFormat(), 0, 25, 1);
                 track.descriptions.clear();
                 return movies::Build(OneTrack(track)).ToBytes();
             },
             "describe -q",
             "cliphost: a.mov: track 1 of the file: 'stsd' describes none of its samples"},
        Case{"TooManyChannels",
             [] {
                 movies::SoundFormat format;
                 format.channels = 600;
                 movies::Movie movie = OneTrack(movies::SoundTrack(format, 480));
                 movie.tracks.push_back(movies::SoundTrack(format, 480));
                 return movies::Build(movie).ToBytes();
             },
             "describe -q",
             "cliphost: a.mov: the sound tracks of the movie have more than 1024 channels in total "
             "(at "
             "byte 20)"},
        Case{"NoSamples",
             [] {
                 movies::Movie movie =
                     OneTrack(movies::VideoTrack(movies::VideoFormat(), 0, 25, 1));
                 return movies::Build(movie).ToBytes();
             },
             "describe -q", "cliphost: a.mov: track 1 of the file: it holds no samples"},
        Case{"LongPictures", TwoLongPictures, "describe -q",
             "cliphost: a.mov: track 1 of the file: 2 pictures in 7200 seconds give no frame "
             "rate; extract the sound alone: cliphost audio FILE --rate 48000 -o FILE.wav"},
        Case{"OneEndlessPicture",
             [] {
                 movies::Movie movie =
                     OneTrack(movies::VideoTrack(movies::VideoFormat(), 29, 30, 1));
                 movie.tracks[0].samples.push_back({1, 1000, 0x7FFFFFFF});
                 movie.tracks[0].mediaDuration = 30;
                 movie.tracks[0].trackDuration = 600;
                 return movies::Build(movie).ToBytes();
             },
             "describe -q",
             "cliphost: a.mov: track 1 of the file: 30 pictures in 71582789 seconds give no "
             "frame rate: by its table, sample 29 alone lasts 71582788 seconds, but 'mdhd' gives 1 "
             "second for all"},
        Case{"NoTimes",
             [] {
                 movies::Movie movie =
                     OneTrack(movies::VideoTrack(movies::VideoFormat(), 30, 30, 0));
                 return movies::Build(movie).ToBytes();
             },
             "describe -q",
             "cliphost: a.mov: track 1 of the file: neither its samples nor its headers tell how "
             "long it lasts"},
        Case{"NoTimesBesideARefusal",
             [] {
                 movies::Movie movie =
                     OneTrack(movies::VideoTrack(movies::VideoFormat(), 30, 30, 1));
                 movie.tracks[0].replaced = {movies::Box("stts").Version(0).U32(0)};
                 return movies::Build(movie).ToBytes();
             },
             "describe -q",
             "cliphost: a.mov: track 1: 'stts' counts 0 samples, the track has 30 (at byte 490)"},
        Case{"EditsThatShowNothing",
             [] {
                 movies::Movie movie = movies::Movie();
                 movies::VideoFormat format;
                 format.codec = "raw ";
                 format.width = format.height = 8;
                 movie.tracks = {movies::VideoTrack(format, 30, 30, 1, 192)};
                 movie.tracks[0].edits = {{600, -1, 1.0}};
                 return movies::Build(movie).ToBytes();
             },
             "frame -o o.png",
             "cliphost: a.mov: track 1 of the file: its edits show none of its 30 samples"},
        Case{"SoundThatIsAPicture",
             [] {
                 movies::VideoFormat format;
                 format.codec = "jpeg";
                 movies::Movie movie =
                     OneTrack(movies::VideoTrack(movies::VideoFormat(), 30, 30, 1));
                 movie.tracks.push_back(movies::VideoTrack(format, 30, 30, 1));
                 movie.tracks[1].handler = "soun";
                 return movies::Build(movie).ToBytes();
             },
             "describe -q",
             "cliphost: a.mov: track 2 of the file: its sound, 'jpeg', has no channels"},
        Case{"SoundWithoutSamples",
             [] {
                 movies::Movie movie =
                     OneTrack(movies::VideoTrack(movies::VideoFormat(), 30, 30, 1));
                 movie.tracks.push_back(movies::SoundTrack(movies::SoundFormat(), 0));
                 movie.tracks[1].mediaDuration = 48000;
                 movie.tracks[1].trackDuration = 600;
                 return movies::Build(movie).ToBytes();
             },
             "audio -o o.wav", "cliphost: a.mov: track 2 of the file: it holds no samples"},
        Case{"EncryptedPicture", [] { return WithCode(Made("png.mov"), "png ", "encv"); },
             "frame -o o.png",
             "cliphost: a.mov: track 1 of the file: its samples are encrypted "
             "('encv'); only someone with the key can read them"},
        Case{"PictureWithoutDecoder", [] { return WithCode(Made("png.mov"), "png ", "xyz1"); },
             "frame -o o.png",
             "cliphost: a.mov: track 1 of the file: no decoder is known for its codec 'xyz1'; "
             "convert it with a program that knows this codec"},
        Case{"FormatsWithoutDecoder", [] { return WithCode(Made("png.mov"), "png ", "xyz1"); },
             "formats",
             "cliphost: a.mov: track 1 of the file: no decoder is known for its codec 'xyz1'; "
             "convert it with a program that knows this codec"}),
    [](const auto& test) { return std::string(test.param.name); });

TEST_F(Reasons, TellWhereTheMediaDataEnds) {
    const std::string media = "mdat";
    // With the header in front, a cut leaves it whole.
    const auto front =
        Make("-i " + Quoted(MadeMovie("png.mov")) + " -c copy -movflags +faststart", "front.mov");
    const movies::Bytes bytes = ReadFile(front);
    const auto found = std::search(bytes.begin(), bytes.end(), media.begin(), media.end());
    const auto begin = static_cast<std::size_t>(found - bytes.begin()) + media.size();
    Write(CutAt(bytes, begin), "none.mov");
    ExpectSays(RunCliphost("frame -o " + In("o.png") + " " + In("none.mov")), 1,
               "track 1 of the file: its samples begin at byte " + std::to_string(begin) +
                   ", the file ends at byte " + std::to_string(begin) +
                   "; copy the file again from where it came");
    Write(CutAt(bytes, begin + 10), "few.mov");
    ExpectSays(RunCliphost("frame -o " + In("o.png") + " " + In("few.mov")), 1,
               "track 1 of the file: the file ends at byte " + std::to_string(begin + 10) +
                   ", so samples 0 to ");
    // What is damaged and not cut is not called missing.
    movies::Bytes damaged = bytes;
    std::fill(damaged.begin() + static_cast<std::ptrdiff_t>(begin), damaged.end(), 0);
    Write(damaged, "damaged.mov");
    ExpectSays(RunCliphost("frame -o " + In("o.png") + " " + In("damaged.mov")), 1,
               "frame 0 is left out: it can't be decoded");
}

TEST_F(Reasons, TellWhereAWayEnds) {
    std::filesystem::create_symlink("gone", folder() / "dangling.mov");
    std::filesystem::create_symlink("loop.mov", folder() / "loop.mov");
    Write(movies::Bytes(100, 'x'), "file.mov");
    const std::string at = folder().string();
    struct {
        const char* path;
        std::string words;
    } const cases[] = {
        {"absent.mov", "there is no such file or folder"},
        {"no/folder/a.mov", "there is no such file or folder, and no folder " + at + "/no"},
        {"file.mov/a.mov", at + "/file.mov is not a folder"},
        {"dangling.mov", "the link " + at +
                             "/dangling.mov leads to gone, which is not there; make it point to a "
                             "file that is there"},
        {"loop.mov", "the link " + at + "/loop.mov leads in a circle; make it point to a file"},
    };
    for (const auto& each : cases) {
        for (const char* const verb : {"describe", "formats", "samples", "audio -o o.wav"}) {
            EXPECT_EQ(Line(std::string(verb) + " " + each.path),
                      std::string("cliphost: ") + each.path + ": " + each.words + "\n");
        }
    }
}

// Root reads everything, so the program runs as another user then, where the
// machine can do that and lets that user reach the program.
TEST_F(Reasons, TellWhatPermissionsForbid) {
    const std::string program = Quoted(ProgramFolder() / "cliphost");
    const std::string other =
        geteuid() == 0 ? "setpriv --reuid=65534 --regid=65534 --clear-groups " : "";
    std::filesystem::permissions(folder(), std::filesystem::perms(0755));
    std::filesystem::create_directory(folder() / "in");
    const std::string in = (folder() / "in").string();
    const std::string canRun = other + program + " --version && " + other + "ls " + Quoted(in);
    if (RunCommand("(" + canRun + ") >/dev/null 2>&1").status != 0) {
        GTEST_SKIP() << "no other user can run the program";
    }
    std::filesystem::copy_file(MadeMovie("png.mov"), folder() / "in/a.mov");
    const struct {
        unsigned folder;
        unsigned file;
        const char* call;
        std::string words;
    } cases[] = {
        {0755, 0000, "describe in/a.mov",
         "in/a.mov: the file can't be opened: Permission denied; get permission to read it"},
        {0000, 0644, "describe in/a.mov",
         "in/a.mov: the folder " + in +
             " can't be entered: Permission denied; get permission to search it"},
        {0111, 0644, "scan in",
         "in: the folder can't be listed: Permission denied; get permission to read it"},
        {0444, 0644, "scan in",
         "in: the folder can't be entered: Permission denied; get permission to search it"},
        {0444, 0644, "describe in",
         "in: the folder can't be entered: Permission denied; get permission to search it"},
    };
    for (const auto& each : cases) {
        std::filesystem::permissions(folder() / "in", std::filesystem::perms(0755));
        std::filesystem::permissions(folder() / "in/a.mov", std::filesystem::perms(each.file));
        std::filesystem::permissions(folder() / "in", std::filesystem::perms(each.folder));
        const CommandResult ran = RunCommand("cd " + Quoted(folder()) + " && " + other + program +
                                             " " + each.call + " 2>&1");
        EXPECT_EQ(ran.out, "cliphost: " + each.words + "\n");
        EXPECT_EQ(ran.status, 2);
    }
    std::filesystem::permissions(folder() / "in", std::filesystem::perms(0755));
}

// The header parser leaves fragmented movies to the multimedia library.
TEST_F(Reasons, TellWhyAMovieIsReadTheSecondWay) {
    const auto movie = std::filesystem::path(CLIPHOST_TYPE_FILES) / "fragmented.mp4";
    const CommandResult json = RunCommand(Quoted(ProgramFolder() / "cliphost") +
                                          " describe --json " + Quoted(movie) + " 2>/dev/null");
    const Json entry = Json::parse(json.out);
    const Json& one = entry.is_array() ? entry[0] : entry;
    EXPECT_EQ(one["route"], "library");
    EXPECT_NE(one["routeReason"].get<std::string>().find("fragmented"), std::string::npos);
    ExpectSays(RunCliphost("-v describe -q " + Quoted(movie)), 0,
               "read by the multimedia library, since the header parser refuses it: the movie is "
               "fragmented");
    const CommandResult first = RunCommand(Quoted(ProgramFolder() / "cliphost") +
                                           " describe --json " + Quoted(MadeMovie("png.mov")));
    const Json parsed = Json::parse(first.out);
    const Json& other = parsed.is_array() ? parsed[0] : parsed;
    EXPECT_EQ(other["route"], "header");
    EXPECT_FALSE(other.contains("routeReason"));
}

// The parser takes the header; the module makes no clip of a picture without size.
TEST_F(Reasons, TellThatNoClipIsMadeOfAHeaderThatIsRead) {
    ASSERT_EQ(RunCommand("ffmpeg -nostdin -v error -f lavfi -i testsrc2=s=64x48 -frames:v 1 " +
                         In("a.jpg"))
                  .status,
              0);
    const movies::Bytes picture = ReadFile(folder() / "a.jpg");
    movies::VideoFormat format;
    format.codec = "jpeg";
    format.width = 0;
    format.height = 48;
    movies::Movie movie =
        OneTrack(movies::VideoTrack(format, 2, 25, 1, static_cast<std::uint32_t>(picture.size())));
    for (int i = 0; i < 2; ++i) {
        movies::Bytes& data = movie.tracks[0].data;
        data.insert(data.end(), picture.begin(), picture.end());
    }
    const CommandResult json =
        RunCommand(Quoted(ProgramFolder() / "cliphost") + " describe --json " +
                   Quoted(Write(movie)) + " 2>/dev/null");
    const Json entry = Json::parse(json.out);
    const Json& one = entry.is_array() ? entry[0] : entry;
    EXPECT_EQ(one["route"], "library");
    EXPECT_EQ(one.value("routeReason", ""), "track 1 of the file: 'jpeg' gives a size of 0 x 48");
}

// The library opens these, and makes no clip of them.
TEST_F(Reasons, KeepWhatTheHeaderParserSays) {
    Write(WithCode(Made("png.mov"), "stsd", "xxxx"), "a.mov");
    const CommandResult told = RunCliphost("describe -q " + In("a.mov"));
    ExpectSays(told, 1, "track 1: it lacks 'stsd', the sample descriptions (at byte ");
    EXPECT_EQ(told.out.find("does not say why"), std::string::npos) << told.out;
    EXPECT_EQ(told.out.find("no decoder"), std::string::npos) << told.out;
}

TEST_F(Reasons, TellWhyATrackHasNoFrames) {
    Write(WithCode(Made("png.mov"), "stco", "xxxx"), "a.mov");
    ExpectSays(RunCliphost("frame -o " + In("o.png") + " " + In("a.mov")), 1,
               "track 1: it lacks 'stco', the places of its chunks");
    ExpectSays(RunCliphost("describe -q " + In("a.mov")), 1,
               "track 1: it lacks 'stco', the places of its chunks");
}

TEST_F(Reasons, TellThatSoundIsEncryptedOrHasNoDecoder) {
    Write(WithCode(Made("pcm_s16be.mov"), "twos", "enca"), "a.mov");
    ExpectSays(RunCliphost("audio -o " + In("o.wav") + " " + In("a.mov")), 1,
               "its samples are encrypted ('enca'); only someone with the key can read them");
    Write(WithCode(Made("pcm_s16be.mov"), "twos", "xyz1"), "b.mov");
    ExpectSays(RunCliphost("audio -o " + In("o.wav") + " " + In("b.mov")), 1,
               "no decoder is known for its codec 'xyz1'");
}

TEST_F(Reasons, CountFramesThatACutFileLacks) {
    const auto front = Make(
        "-f lavfi -i testsrc=d=4:r=25:s=64x64 -c:v libx264 -pix_fmt yuv420p -movflags +faststart",
        "front.mov");
    const movies::Bytes bytes = ReadFile(front);
    Write(CutAt(bytes, bytes.size() * 3 / 4), "cut.mov");
    const std::string words = "are missing or cut off; copy the file again";
    ExpectSays(RunCliphost("frame --frame 98 -o " + In("o.png") + " " + In("cut.mov")), 1, words);
    ExpectSays(RunCliphost("frame --range 0: -o " + In("all") + " " + In("cut.mov")), 1, words);
    ExpectSays(RunCliphost("frame --frame 100 -o " + In("o.png") + " " + In("cut.mov")), 2,
               "there is no frame 100; it has 100 frames, 0 to 99");
    ExpectSays(RunCliphost("samples " + In("cut.mov")), 1, words);
}

TEST_F(Reasons, TellTheRouteInEveryVerb) {
    const std::string movie =
        " " + Quoted(std::filesystem::path(CLIPHOST_TYPE_FILES) / "fragmented.mp4");
    const std::string words = "read by the multimedia library, since the header parser refuses it";
    for (const char* const verb : {"formats", "samples", "params"}) {
        ExpectSays(RunCliphost(std::string("-v ") + verb + movie), 0, words);
        const CommandResult json = RunCommand(Quoted(ProgramFolder() / "cliphost") + " " + verb +
                                              " --json" + movie + " 2>/dev/null");
        const Json answer = Json::parse(json.out);
        EXPECT_EQ(answer["route"], "library") << verb;
        EXPECT_NE(answer["routeReason"].get<std::string>().find("fragmented"), std::string::npos);
    }
    ExpectSays(RunCliphost("-v frame -o " + In("o.png") + movie), 0, words);
}

TEST_F(Reasons, TellOfLinksInAFolder) {
    std::filesystem::create_directory(folder() / "in");
    std::filesystem::create_symlink("gone.mov", folder() / "in/a.mov");
    const std::string words = "/in/a.mov leads to gone.mov, which is not there";
    const CommandResult alone = RunCliphost("scan " + In("in"));
    ExpectSays(alone, 1, words);
    EXPECT_EQ(alone.out.find("no file in it is named"), std::string::npos) << alone.out;
    std::filesystem::copy_file(MadeMovie("png.mov"), folder() / "in/b.mov");
    ExpectSays(RunCliphost("scan " + In("in")), 2, words);
    ExpectSays(RunCliphost("describe -q " + In("in")), 2, words);
}

}  // namespace
