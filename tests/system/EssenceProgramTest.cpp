// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// The verbs of the program over essence: what they print and write, how they
// end, and what they leave behind.

#include <cstdlib>
#include <nlohmann/json.hpp>

#include "tests/system/EssenceSupport.h"
#include "tests/system/SystemTest.h"

namespace {

using Json = nlohmann::json;

class EssenceProgram : public SystemTest {
protected:
    // A file to write, as a word of a command.
    std::string Out(const std::string& name) { return Quoted(folder() / name); }
    std::size_t FilesLeft() {
        return static_cast<std::size_t>(
            std::distance(std::filesystem::directory_iterator(folder()), {}));
    }
};

TEST_F(EssenceProgram, ShowsTheSampleMapAsTextAndJson) {
    const auto movie = Quoted(MadeMovie("h264_with_aac.mov"));
    ExpectSays(RunCliphost("samples " + movie), 0, "all samples lie inside the file");
    const CommandResult result = RunCliphost("samples --json " + movie);
    ASSERT_EQ(result.status, 0) << result.out;
    const Json json = Json::parse(result.out);
    ASSERT_EQ(json["tracks"].size(), 2u);
    EXPECT_EQ(json["tracks"][0]["kind"], "picture");
    EXPECT_EQ(json["tracks"][0]["map"].size(), 10u);
    EXPECT_EQ(json["tracks"][0]["faults"], Json::array());
    EXPECT_EQ(json["tracks"][1]["channels"], 2);
    EXPECT_TRUE(json["tracks"][1].contains("runs"));
    const Json every = Json::parse(RunCliphost("samples --json --every --track 1 " + movie).out);
    ASSERT_EQ(every["tracks"].size(), 1u);
    EXPECT_EQ(every["tracks"][0]["map"].size(), every["tracks"][0]["samples"]);
    ExpectSays(RunCliphost("samples --track 7 " + movie), 2,
               "there is no track 7; its tracks are 0 (picture), 1 (sound)");
}

// The offset of a picture can't be found where the durations are uneven.
TEST_F(EssenceProgram, SaysUnknownWhereNoOffsetIsFound) {
    const auto movie = Out("uneven.mov");
    ASSERT_EQ(RunCommand("ffmpeg -nostdin -v error -f lavfi -i testsrc2=s=160x90:r=25:d=0.8 -vf "
                         "'setpts=(N+N*N/8)/25/TB' -vsync passthrough -c:v libx264 -bf 3 "
                         "-pix_fmt yuv420p " +
                         movie)
                  .status,
              0);
    ExpectSays(RunCliphost("samples " + movie), 0, "unknown");
}

TEST_F(EssenceProgram, ListsFormatsInWordsWithTheirBuffers) {
    const auto movie = Quoted(MadeMovie("prores_with_pcm.mov"));
    ExpectSays(RunCliphost("formats " + movie), 0,
               "16-bit R'G'B' 4:4:4:4, big-endian words A R G B, video range");
    const Json json = Json::parse(RunCliphost("formats --json " + movie).out);
    const Json& picture = json["tracks"][0]["formats"];
    ASSERT_EQ(picture.size(), 2u);
    EXPECT_EQ(picture[0]["name"], "2vuy");
    EXPECT_EQ(picture[0]["bufferBytes"], 4147200);
    EXPECT_EQ(picture[1]["name"], "b64a");
    EXPECT_EQ(picture[1]["bufferBytes"], 16588800);
    const Json& sound = json["tracks"][1];
    EXPECT_EQ(sound["channels"], 2);
    EXPECT_EQ(sound["formats"][0]["name"], "A2CL");
    EXPECT_EQ(sound["formats"][1]["name"], "A2CB");
    EXPECT_EQ(sound["formats"][0]["bufferBytes"], 288000);
}

TEST_F(EssenceProgram, WritesSixteenBitPicturesOfDeepFormats) {
    const auto movie = MadeMovie("prores_hq_1080p.mov");
    ExpectSays(RunCliphost("frame " + Quoted(movie) + " --format deepest -o " + Out("a.png")), 0,
               "1920 x 1080");
    EXPECT_EQ(RunCommand("ffprobe -v error -show_entries stream=width,height,pix_fmt -of csv=p=0 " +
                         Out("a.png"))
                  .out,
              "1920,1080,rgb48be\n");
    ASSERT_EQ(RunCliphost("frame " + Quoted(movie) + " -o " + Out("b.png")).status, 0);
    EXPECT_EQ(
        RunCommand("ffprobe -v error -show_entries stream=pix_fmt -of csv=p=0 " + Out("b.png")).out,
        "rgb24\n");
}

// What a person sees is what FFmpeg shows of the same file.
TEST_F(EssenceProgram, WritesPicturesInTheRightColours) {
    struct Case {
        const char* name;
        const char* arguments;
        const char* matrix;
    };
    for (const Case& each :
         {Case{"2vuy_ntsc.mov", "", "in_color_matrix=bt601:"},
          Case{"2vuy.mov", "", "in_color_matrix=bt709:"},
          Case{"prores_4444_576p.mov", "--format deepest", "in_color_matrix=bt601:"},
          Case{"png.mov", "", ""}}) {
        SCOPED_TRACE(each.name);
        const auto movie = MadeMovie(each.name);
        ASSERT_EQ(
            RunCliphost("frame " + Quoted(movie) + " " + each.arguments + " -o " + Out("own.png"))
                .status,
            0);
        const EssenceBytes own = Decoded(folder() / "own.png", "-f rawvideo -pix_fmt rgb24");
        const EssenceBytes theirs =
            Decoded(movie, std::string("-frames:v 1 -vf scale=") + each.matrix +
                               "flags=bilinear+accurate_rnd+full_chroma_int+full_chroma_inp "
                               "-f rawvideo -pix_fmt rgb24");
        // Between two colours each makes its own steps; all else is alike.
        ASSERT_EQ(own.size(), theirs.size());
        std::size_t alike = 0;
        for (std::size_t i = 0; i < own.size(); ++i) {
            alike += std::abs(own[i] - theirs[i]) <= 3 ? 1 : 0;
        }
        EXPECT_GT(alike, own.size() * 95 / 100);
    }
}

TEST_F(EssenceProgram, WritesAlphaAsAPictureAndIntoOne) {
    const auto movie = Quoted(MadeMovie("prores_4444_alpha.mov"));
    ASSERT_EQ(
        RunCliphost("frame " + movie + " --use-alpha --track 1 -o " + Out("alpha.png")).status, 0);
    EXPECT_EQ(
        RunCommand("ffprobe -v error -show_entries stream=pix_fmt -of csv=p=0 " + Out("alpha.png"))
            .out,
        "gray16be\n");
    ASSERT_EQ(RunCliphost("frame " + movie + " --with-alpha -o " + Out("both.png")).status, 0);
    EXPECT_EQ(
        RunCommand("ffprobe -v error -show_entries stream=pix_fmt -of csv=p=0 " + Out("both.png"))
            .out,
        "rgba64be\n");
    ExpectSays(RunCliphost("frame " + Quoted(MadeMovie("png.mov")) + " --with-alpha -o " +
                           Out("none.png")),
               1, "it has no alpha track");
}

TEST_F(EssenceProgram, StreamsRawFramesToAnotherProgram) {
    const auto movie = MadeMovie("h264_bframes.mov");
    const std::string cliphost = Quoted(ProgramFolder() / "cliphost");
    const CommandResult result =
        RunCommand(cliphost + " frame " + Quoted(movie) + " --range 2:9:3 -o - 2>" + Out("words"));
    EXPECT_EQ(result.status, 0);
    EXPECT_EQ(result.out.size(), 640u * 360 * 2 * 3);
    const movies::Bytes words = ReadFile(folder() / "words");
    EXPECT_NE(std::string(words.begin(), words.end())
                  .find("-f rawvideo -pixel_format uyvy422 -video_size 640x360 -framerate 25/1"),
              std::string::npos);
    // The options that it tells are those that another program needs.
    const CommandResult piped = RunCommand(
        cliphost + " frame " + Quoted(movie) +
        " --range 0: -o - 2>/dev/null | ffmpeg -nostdin -v "
        "error -f rawvideo -pixel_format uyvy422 -video_size 640x360 -framerate 25/1 -i - "
        "-f rawvideo - | wc -c");
    EXPECT_EQ(std::stoul(piped.out), 640u * 360 * 2 * 10);
}

TEST_F(EssenceProgram, StopsQuietlyWhenTheReaderOfItsFramesGoes) {
    const CommandResult result = RunCommand(
        "bash -c " +
        Quoted(Quoted(ProgramFolder() / "cliphost") + " frame " +
               Quoted(MadeMovie("prores_with_pcm.mov")) +
               " --range 0: -o - 2>/dev/null | head -c 1000 >/dev/null; echo ${PIPESTATUS[0]}"));
    EXPECT_EQ(result.out, "0\n");
}

TEST_F(EssenceProgram, TellsWhatIsWrongWithACallAndLeavesNoFile) {
    const auto movie = Quoted(MadeMovie("h264_bframes.mov"));
    ExpectSays(RunCliphost("frame " + movie + " --frame 10 -o " + Out("a.png")), 2,
               "there is no frame 10; it has 10 frames, 0 to 9");
    ExpectSays(RunCliphost("frame " + movie + " --range 20:30 -o " + Out("a.raw")), 2,
               "there is no frame 20");
    ExpectSays(RunCliphost("frame " + movie + " --range 5 -o " + Out("a.raw")), 2, "FIRST:END");
    ExpectSays(RunCliphost("frame " + movie + " --format b48r -o " + Out("a.png")), 2,
               "there is no format 'b48r'; it offers 2vuy");
    ExpectSays(RunCliphost("frame " + movie + " --track 1 -o " + Out("a.png")), 2,
               "there is no track 1");
    ExpectSays(RunCliphost("frame " + movie + " --range 0:3 -o " + Out("a.png")), 2,
               "a PNG file holds one frame");
    ExpectSays(RunCliphost("frame " + movie + " -o " + Out("a.jpg")), 2,
               "ends in '.jpg' can't be written");
    ExpectSays(RunCliphost("frame " + movie + " -o " + movie), 2, "this is the movie itself");
    ExpectSays(RunCliphost("frame " + movie), 2, "--output is required");
    ExpectSays(RunCliphost("frame nothing.mov -o " + Out("a.png")), 2, "there is no such file");
    ExpectSays(RunCliphost("audio " + movie + " -o " + Out("a.wav")), 1, "it has no sound track");
    ExpectSays(RunCliphost("audio " + Quoted(MadeMovie("pcm_u8.mov")) + " --start 19200 -o " +
                           Out("a.wav")),
               2, "there is no sample 19200 of sound; it has 19200 samples, 0 to 19199");
    ExpectSays(RunCliphost("frame " + Quoted(MadeMovie("pcm_u8.mov")) + " -o " + Out("a.png")), 1,
               "it has no picture track");
    ExpectSays(RunCliphost("contact " + movie + " -o " + Out("no/such/a.png")), 2, "not written");
    EXPECT_EQ(FilesLeft(), 0u);
}

TEST_F(EssenceProgram, TellsOfAFullDisk) {
    if (!std::filesystem::exists("/dev/full")) {
        GTEST_SKIP() << "there is no /dev/full";
    }
    const auto movie = Quoted(MadeMovie("prores_with_pcm.mov"));
    const std::string cliphost = Quoted(ProgramFolder() / "cliphost");
    ExpectSays(RunCommand(cliphost + " frame " + movie + " -o - 2>&1 >/dev/full"), 2,
               "standard output: not written: No space left");
    ExpectSays(RunCliphost("audio " + movie + " -o /dev/full"), 2,
               "/dev/full: not written: No space left");
}

TEST_F(EssenceProgram, SaysOfABadFileWhatWouldHelp) {
    const auto cut =
        Write(movies::Bytes{0, 0, 0, 20, 'f', 't', 'y', 'p', 'q', 't', ' ', ' '}, "short.mov");
    ExpectSays(RunCliphost("formats " + Quoted(cut)), 1,
               "'ftyp' claims 20 bytes, the file ends at byte 12");
}

TEST_F(EssenceProgram, PutsFramesFromAllThroughTheMovieOnASheet) {
    const auto movie = Quoted(MadeMovie("h264_bframes.mov"));
    ExpectSays(RunCliphost("contact " + movie + " --frames 6 --columns 3 --width 64 -o " +
                           Out("sheet.png")),
               0, "6 of 10 frames");
    // Cells of 64 by 36, eight between and around them.
    EXPECT_EQ(RunCommand("ffprobe -v error -show_entries stream=width,height -of csv=p=0 " +
                         Out("sheet.png"))
                  .out,
              "224,96\n");
}

TEST_F(EssenceProgram, ShowsNoProgressWhereThereIsNoTerminal) {
    const CommandResult result =
        RunCliphost("frame " + Quoted(MadeMovie("png.mov")) + " --range 0: -o " + Out("frames"));
    EXPECT_EQ(result.status, 0);
    EXPECT_EQ(result.out, (folder() / "frames").string() + ": 3 pictures\n");
}

TEST_F(EssenceProgram, HelpsWithExamplesForEachVerb) {
    for (const std::string verb :
         {"scan", "describe", "dump", "compare", "verify", "relink", "samples", "formats", "frame",
          "contact", "params", "audio", "types", "plugin", "check-data"}) {
        ExpectSays(RunCliphost(verb + " --help"), 0, "Examples:\n  cliphost " + verb);
    }
}

}  // namespace
