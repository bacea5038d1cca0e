// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// The program as scripts and careless hands call it: what it refuses, what it
// keeps safe, and what it goes on with.

#include <nlohmann/json.hpp>

#include "reference_host/util/text/FileUrl.h"
#include "tests/system/EssenceSupport.h"
#include "tests/system/SystemTest.h"

namespace {

using Json = nlohmann::json;

class ProgramCalls : public SystemTest {
protected:
    // A file of the test's folder, as a word of a command.
    std::string Out(const std::string& name) { return Quoted(folder() / name); }
    std::string Copy(const std::string& made, const std::string& name) {
        std::filesystem::copy_file(MadeMovie(made), folder() / name);
        return Out(name);
    }
    std::size_t FilesLeft() {
        return static_cast<std::size_t>(
            std::distance(std::filesystem::directory_iterator(folder()), {}));
    }
};

std::string Program() {
    return Quoted(ProgramFolder() / "cliphost");
}

TEST_F(ProgramCalls, NeverWriteOverTheMovie) {
    const auto movie = Copy("prores_with_pcm.mov", "a.mov");
    const auto before = ReadFile(folder() / "a.mov");
    std::filesystem::create_hard_link(folder() / "a.mov", folder() / "link.png");
    for (const std::string& call :
         {"describe " + movie + " --aaf " + movie,
          "describe " + movie + " --aaf " + Out("link.png"), "frame " + movie + " -o " + movie,
          "audio " + movie + " -o " + movie, "contact " + movie + " -o " + movie,
          "contact " + movie + " -o " + Out("link.png")}) {
        ExpectSays(RunCliphost(call), 2, "this is the movie itself");
        EXPECT_EQ(ReadFile(folder() / "a.mov"), before) << call;
    }
    EXPECT_EQ(FilesLeft(), 2u);
}

TEST_F(ProgramCalls, GoOnWithTheOtherMoviesAfterOneThatIsBad) {
    const auto movie = Copy("png.mov", "a.mov");
    const auto calls = "describe -q " + Out("missing.mov") + " " + movie;
    ExpectSays(RunCliphost(calls), 2, "missing.mov: there is no such file");
    ExpectSays(RunCliphost(calls), 2, "1 described, 1 not");
    ExpectSays(RunCliphost("describe -q " + Out("missing.mov")), 2, "there is no such file");
    const CommandResult json = RunCommand(Program() + " describe --json " + Out("missing.mov") +
                                          " " + movie + " 2>/dev/null");
    EXPECT_EQ(json.status, 2);
    const Json list = Json::parse(json.out);
    ASSERT_EQ(list.size(), 2u);
    EXPECT_EQ(list[0]["reason"], "there is no such file or folder");
    EXPECT_TRUE(list[0]["code"].is_null());
    EXPECT_TRUE(list[1].contains("description"));
}

TEST_F(ProgramCalls, GoOnAfterADescriptionThatCantBeSaved) {
    const auto first = Copy("png.mov", "a.mov");
    const auto second = Copy("png.mov", "b.mov");
    std::filesystem::create_directories(folder() / "out" / "a.aaf");
    ExpectSays(RunCliphost("describe -q --out-dir " + Out("out") + " " + first + " " + second), 2,
               "a.aaf: not written: Is a directory; a folder is there");
    EXPECT_TRUE(std::filesystem::is_regular_file(folder() / "out" / "b.aaf"));
}

TEST_F(ProgramCalls, LeaveNoEmptyFolderBehind) {
    std::filesystem::copy_file(MadeMovie("png.mov"), folder() / "a.mov");
    std::filesystem::resize_file(folder() / "a.mov", 20);
    EXPECT_EQ(RunCliphost("describe -q --out-dir " + Out("out/in") + " " + Out("a.mov")).status, 1);
    EXPECT_FALSE(std::filesystem::exists(folder() / "out"));
    EXPECT_NE(RunCliphost("frame -o " + Out("out") + " " + Out("a.mov")).status, 0);
    EXPECT_FALSE(std::filesystem::exists(folder() / "out"));
}

TEST_F(ProgramCalls, GiveEachDescriptionAFileOfItsOwn) {
    std::filesystem::create_directory(folder() / "x");
    const auto movies = Copy("png.mov", "a.mov") + " " + Copy("png.mov", "x/a.mov") + " " +
                        Copy("png.mov", "a-2.mov");
    ASSERT_EQ(RunCliphost("describe -q --out-dir " + Out("out") + " " + movies).status, 0);
    EXPECT_EQ(std::distance(std::filesystem::directory_iterator(folder() / "out"), {}), 3);
}

TEST_F(ProgramCalls, LeaveAForeignFileOfASimilarNameAlone) {
    const auto movie = Copy("png.mov", "a.mov");
    Write(movies::Bytes{'k', 'e', 'e', 'p'}, "a.aaf.new");
    ASSERT_EQ(RunCliphost("describe -q " + movie + " --aaf " + Out("a.aaf")).status, 0);
    EXPECT_EQ(ReadFile(folder() / "a.aaf.new").size(), 4u);
    EXPECT_EQ(FilesLeft(), 3u);
}

TEST_F(ProgramCalls, SaveDescriptionsInFoldersThatAreThere) {
    const auto movie = Copy("png.mov", "a.mov");
    ExpectSays(RunCliphost("describe -q " + movie + " --aaf " + Out("no/a.aaf")), 2,
               "a.aaf: not written: No such file or directory; make the folder ");
    ExpectSays(RunCliphost("describe -q " + movie + " --out-dir " + movie), 2,
               "the folder can't be made");
    EXPECT_EQ(FilesLeft(), 1u);
}

TEST_F(ProgramCalls, RefuseValuesThatMeanNothing) {
    const auto movie = Quoted(MadeMovie("h264_with_aac.mov"));
    const auto expectRefused = [](const std::string& call, const std::string& words) {
        ExpectSays(RunCliphost(call), 2, words);
    };
    for (const char* const rate : {"nan", "inf", "0", "-1", "1e300", "x"}) {
        expectRefused("types --editor-rate " + std::string(rate),
                      "is not a number of frames a second");
        expectRefused("types --forced-rate " + std::string(rate),
                      "is not a number of frames a second");
    }
    for (const char* const number : {"-1", "18446744073709551616", "1.5", "nan"}) {
        const std::string text = number;
        const std::string words = "'" + text + "' is not a whole number";
        expectRefused("frame " + movie + " -o - --frame " + text, words);
        expectRefused("frame " + movie + " -o - --track " + text, words);
        expectRefused("audio " + movie + " -o - --start " + text, words);
        expectRefused("audio " + movie + " -o - --count " + text, words);
        expectRefused("audio " + movie + " -o - --track " + text, words);
        expectRefused("samples " + movie + " --track " + text, words);
        expectRefused("types --single-frame-duration " + text, words);
    }
    expectRefused("audio " + movie + " -o - --count 0", "from 1 to");
    expectRefused("frame " + movie + " -o - --frame 18446744073709551615",
                  "there is no frame 18446744073709551615");
    for (const char* const time : {"2026-02-29T00:00:00Z", "2026-04-31T00:00:00Z",
                                   "-001-01-01T00:00:00Z", "\"2026- 1- 1T 0: 0: 0Z\"",
                                   "2026-01-01T24:00:00Z", "2026-01-01", "0000-01-01T00:00:00Z"}) {
        expectRefused("describe " + movie + " --pin-time " + time, "not a time");
    }
    EXPECT_EQ(RunCliphost("describe -q " + movie + " --pin-time 2024-02-29T23:59:59Z").status, 0);
    expectRefused("contact " + movie + " -o " + Out("c.jpg"), "ends in '.jpg' can't be written");
    expectRefused("decribe " + movie, "'decribe' is neither a verb nor an option");
    EXPECT_EQ(FilesLeft(), 0u);
}

TEST_F(ProgramCalls, RefuseEmptyTexts) {
    const auto movie = Quoted(MadeMovie("h264_with_aac.mov"));
    for (const std::string& call :
         {std::string("describe ''"), "describe " + movie + " --aaf ''",
          "describe " + movie + " --out-dir ''", "describe " + movie + " --pin-time ''",
          std::string("scan ''"), std::string("samples ''"), "frame " + movie + " -o ''",
          "frame " + movie + " -o - --range ''", "frame " + movie + " -o - --format ''",
          "params " + movie + " --set-xml ''", std::string("types --plugin ''"),
          std::string("types --aaf-library ''")}) {
        ExpectSays(RunCliphost(call), 2, "an empty text is not a value");
    }
}

TEST_F(ProgramCalls, EndARangeWhoseNextFrameWouldBeBeyondAllNumbers) {
    const auto movie = Quoted(MadeMovie("h264_with_aac.mov"));
    ExpectSays(
        RunCliphost("frame " + movie + " --range 1::18446744073709551615 -o " + Out("a.raw")), 0,
        "a.raw: 1 raw frame\n");
}

TEST_F(ProgramCalls, TellWhenStandardOutputTakesNothing) {
    if (!std::filesystem::exists("/dev/full")) {
        GTEST_SKIP() << "there is no /dev/full";
    }
    const auto movie = Quoted(MadeMovie("h264_with_aac.mov"));
    for (const std::string& call :
         {std::string("types"), std::string("plugin --json"), std::string("--help"),
          "describe " + movie, "samples --every " + movie, "params --xml values " + movie,
          "formats --json " + movie}) {
        ExpectSays(RunCommand(Program() + " " + call + " 2>&1 >/dev/full"), 2,
                   "standard output: not written: No space left");
        ExpectSays(RunCommand(Program() + " " + call + " 2>&1 >&-"), 2,
                   "standard output: not written:");
    }
    // More than is kept back, so that it fails amid the printing.
    const CommandResult amid = RunCommand(Program() + " samples --every " +
                                          Quoted(MadeMovie("pcm_u8.mov")) + " 2>&1 >/dev/full");
    EXPECT_EQ(amid.status, 2);
    EXPECT_EQ(amid.out,
              "cliphost: standard output: not written: No space left on device; make room there or "
              "name another place\n");
    EXPECT_EQ(RunCommand(Program() + " describe missing.mov 2>/dev/full").status, 2);
}

// With its number free, the next file opened would be what is printed into.
TEST_F(ProgramCalls, PrintIntoNoFileWhenStandardStreamsAreClosed) {
    const auto movie = Copy("prores_with_pcm.mov", "a.mov");
    ASSERT_EQ(RunCommand(Program() + " audio " + movie + " -o " + Out("open.wav")).status, 0);
    RunCommand(Program() + " audio " + movie + " -o " + Out("closed.wav") + " <&- >&- 2>&-");
    EXPECT_EQ(ReadFile(folder() / "closed.wav"), ReadFile(folder() / "open.wav"));
}

// Also of what fails before any movie is read.
TEST_F(ProgramCalls, AnswerAFailureInJsonWhateverTheVerb) {
    const auto movie = Quoted(MadeMovie("png.mov"));
    for (const std::string& call :
         {"scan --json " + Out("."), "describe --json " + movie, "samples --json " + movie,
          "formats --json " + movie, "params --json " + movie, std::string("types --json"),
          std::string("plugin --json")}) {
        const CommandResult ran =
            RunCommand(Program() + " " + call + " --plugin " + Out("no.nvx") + " 2>/dev/null");
        EXPECT_EQ(ran.status, 2) << call;
        const Json answer = Json::parse(ran.out, nullptr, false);
        ASSERT_TRUE(answer.is_structured()) << call << "\n" << ran.out;
        const Json problem = answer.is_array() ? answer.at(0) : answer;
        EXPECT_NE(problem["reason"].get<std::string>().find("no.nvx"), std::string::npos) << call;
        EXPECT_EQ(problem["hint"], "name another with --plugin FILE") << call;
        EXPECT_EQ(problem["code"], "NCF_E_NOTFOUND") << call;
        EXPECT_TRUE(problem["route"].is_null()) << call;
    }
}

TEST_F(ProgramCalls, TellInJsonWhyAMovieIsMappedWithoutADescription) {
    // Too short for a frame.
    const std::string movie = Out("short.mov");
    ASSERT_EQ(RunCommand("ffmpeg -nostdin -v error -f lavfi -i sine=r=48000 -af atrim=end_sample=1 "
                         "-c:a pcm_s16le " +
                         movie)
                  .status,
              0);
    const CommandResult ran = RunCommand(Program() + " formats --json " + movie + " 2>/dev/null");
    EXPECT_EQ(ran.status, 0);
    const Json answer = Json::parse(ran.out);
    EXPECT_TRUE(answer["reason"].is_string()) << ran.out;
    EXPECT_TRUE(answer["tracks"][0]["rate"].is_null()) << ran.out;
    const Json whole =
        Json::parse(RunCliphost("formats --json " + Quoted(MadeMovie("png.mov"))).out);
    EXPECT_FALSE(whole.contains("reason"));
    EXPECT_EQ(whole["tracks"][0]["rate"], "25/1");
}

TEST_F(ProgramCalls, GiveValidJsonForNamesThatAreNoUtf8) {
    std::filesystem::create_directory(folder() / "f\xFF");
    const auto movie = Copy("png.mov", "f\xFF/b\xFE name.mov");
    for (const std::string& call :
         {"scan --json " + Out("f\xFF"), "describe --json " + movie, "samples --json " + movie,
          "formats --json " + movie, "params --json " + movie}) {
        const CommandResult result = RunCommand(Program() + " " + call);
        EXPECT_EQ(result.status, 0) << call;
        EXPECT_TRUE(Json::accept(result.out)) << call << "\n" << result.out;
    }
}

// What --json says of a movie, given back as it stands, is that movie.
TEST_F(ProgramCalls, TakeThePathsBackThatTheyGiveInJson) {
    for (const char* const name : {"caf\xE9 \xFF.mov", "new\nline\x1B[2J.mov", "caf\xC3\xA9.mov"}) {
        SCOPED_TRACE(name);
        std::filesystem::create_directory(folder() / "in");
        const auto movie = Copy("png.mov", std::string("in/") + name);
        const auto takesBack = [&](const Json& path) {
            ASSERT_TRUE(path.is_string());
            const CommandResult again =
                RunCliphost("describe -q " + Quoted(path.get<std::string>()));
            EXPECT_EQ(again.status, 0) << again.out;
        };
        const auto json = [&](const std::string& call) {
            return Json::parse(RunCommand(Program() + " " + call).out);
        };
        takesBack(json("scan --json " + Out("in"))["movies"][0]);
        takesBack(json("samples --json " + movie)["movie"]);
        takesBack(json("formats --json " + movie)["movie"]);
        takesBack(json("params --json " + movie)["movie"]);
        const Json described = json("describe --json " + movie + " --out-dir " + Out("out"))[0];
        takesBack(described["movie"]);
        std::string saved = described["aaf"].get<std::string>();
        host::text::PathOfFileUrl(saved, saved);
        EXPECT_TRUE(std::filesystem::is_regular_file(saved)) << saved;
        std::filesystem::remove_all(folder() / "in");
        std::filesystem::remove_all(folder() / "out");
    }
    EXPECT_EQ(RunCliphost("describe -q file://server/a.mov").status, 2);
}

TEST_F(ProgramCalls, TellInTheirHelpHowJsonNamesPathsThatAreNoText) {
    for (const char* const verb : {"scan", "describe", "samples", "formats", "params", "plugin"}) {
        ExpectSays(RunCliphost(std::string(verb) + " --help"), 0, "file:///a%FF.mov");
    }
}

TEST_F(ProgramCalls, ShowNamesWithControlsEscaped) {
    std::filesystem::create_directory(folder() / "in");
    const auto movie = Copy("h264_with_aac.mov", "in/a\nb\x1B[2J\xFF.mov");
    const std::string shown = "/in/a\\nb\\x1B[2J\\xFF.mov";
    Write(movies::Bytes{'x'}, "in/bad\x1B.mov");
    for (const std::string& call :
         {"scan " + Out("in"), "describe " + movie, "describe -q " + Out("in"), "samples " + movie,
          "formats " + movie, "params " + movie, "frame -o " + Out("a.raw") + " " + movie + "x",
          "frame --frame 999 -o " + Out("a.raw") + " " + movie,
          "frame -v -o " + Out("a.raw") + " " + movie,
          "audio -o " + Out("in/c\x1B.wav") + " " + movie}) {
        const CommandResult ran = RunCliphost(call);
        EXPECT_EQ(ran.out.find('\x1B'), std::string::npos) << ran.out;
        EXPECT_EQ(ran.out.find('\xFF'), std::string::npos) << ran.out;
    }
    ExpectSays(RunCliphost("describe -q " + movie), 0, shown);
    ExpectSays(RunCliphost("describe -q " + Out("in")), 1, "/in/bad\\x1B.mov: ");
    ExpectSays(RunCliphost(Quoted("a\x1B"
                                  "b")),
               2, "'a\\x1Bb' is neither a verb nor an option");
}

TEST_F(ProgramCalls, LeaveNothingBehindWhenInterrupted) {
    const auto movie = Quoted(MadeMovie("prores_with_pcm.mov"));
    // A raw file is open all the while the frames are read.
    const CommandResult result = RunCommand(
        "bash -c " +
        Quoted("set -m; " + Program() + " frame " + movie + " --range 0: -o " + Out("a.raw") +
               " 2>/dev/null & for i in $(seq 2000); do ls " + Quoted(folder()) +
               " | grep -q part && break; sleep 0.005; done; kill -TERM $!; wait $!; echo $?"));
    EXPECT_TRUE(result.out == "143\n" || result.out == "0\n") << result.out;
    EXPECT_EQ(FilesLeft(), result.out == "0\n" ? 1u : 0u);
}

}  // namespace
