// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// One exit status for one kind of failure: in every verb, for one movie as for
// several.

#include <sys/stat.h>

#include <algorithm>
#include <string_view>

#include "tests/system/Command.h"
#include "tests/system/SystemTest.h"

namespace {

class ExitStatus : public SystemTest {
protected:
    std::string In(const std::string& name) { return Quoted(folder() / name); }
    std::string Good() { return " " + Quoted(MadeMovie("png.mov")); }
    // Every verb that reads one movie.
    std::vector<std::string> Calls() {
        return {"describe -q ",
                "samples ",
                "formats ",
                "params ",
                "frame -o " + In("a.png") + " ",
                "contact -o " + In("b.png") + " ",
                "audio -o " + In("c.wav") + " "};
    }
};

TEST_F(ExitStatus, IsTheCallersForWhatCantBeOpenedAsAFile) {
    std::filesystem::create_directory(folder() / "folder.mov");
    ASSERT_EQ(mkfifo((folder() / "pipe.mov").c_str(), 0600), 0);
    std::filesystem::create_symlink("gone", folder() / "dangling.mov");
    for (const std::string& call : Calls()) {
        for (const char* const name : {"absent.mov", "pipe.mov", "dangling.mov", "folder.mov"}) {
            if (call == "describe -q " && std::string_view(name) == "folder.mov") {
                continue;  // it takes folders
            }
            EXPECT_EQ(RunCliphost(call + In(name)).status, 2) << call << name;
        }
    }
}

TEST_F(ExitStatus, IsTheFilesForWhatItHolds) {
    Write(movies::Bytes{}, "empty.mov");
    Write(movies::Bytes(100, 'x'), "text.mov");
    for (const std::string& call : Calls()) {
        EXPECT_EQ(RunCliphost(call + In("empty.mov")).status, 1) << call;
        EXPECT_EQ(RunCliphost(call + In("text.mov")).status, 1) << call;
    }
}

TEST_F(ExitStatus, DoesNotHangOnTheNumberOfMovies) {
    Write(movies::Bytes(100, 'x'), "text.mov");
    ASSERT_EQ(mkfifo((folder() / "pipe.mov").c_str(), 0600), 0);
    struct Case {
        std::string name;
        int status;
    };
    for (const Case& each : {Case{In("absent.mov"), 2}, Case{In("pipe.mov"), 2},
                             Case{In("text.mov"), 1}, Case{Quoted(folder() / "absent"), 2}}) {
        for (const std::string& others : {std::string(), Good(), Good() + Good()}) {
            EXPECT_EQ(RunCliphost("describe -q " + each.name + others).status, each.status)
                << each.name << others;
        }
    }
    // Of several failures the highest, in any order.
    EXPECT_EQ(RunCliphost("describe -q " + In("absent.mov") + " " + In("text.mov")).status, 2);
    EXPECT_EQ(RunCliphost("describe -q " + In("text.mov") + " " + In("absent.mov")).status, 2);
}

TEST_F(ExitStatus, IsTheSameForAMovieOutOfAFolder) {
    std::filesystem::create_directory(folder() / "in");
    std::filesystem::copy_file(MadeMovie("png.mov"), folder() / "in/good.mov");
    Write(movies::Bytes(100, 'x'), "in/text.mov");
    EXPECT_EQ(RunCliphost("describe -q " + In("in")).status, 1);
    ExpectSays(RunCliphost("--help"), 0, "Exit status: 0, everything was done; 1, ");
}

// The edits leave fewer pictures than the movie's length says.
TEST_F(ExitStatus, OfAFramePastTheEndIsThatOfARange) {
    movies::Bytes bytes = ReadFile(MadeMovie("mjpeg.mov"));
    const std::string_view type = "elst";
    const auto found = std::search(bytes.begin(), bytes.end(), type.begin(), type.end());
    ASSERT_NE(found, bytes.end());
    // Version and flags, count, duration, then where in the media it begins.
    const auto mediaTime = found + 4 + 4 + 4 + 4;
    const CommandResult scale =
        RunCommand("ffprobe -v error -show_entries stream=time_base -of csv=p=0 " +
                   Quoted(MadeMovie("mjpeg.mov")));
    const auto frame = static_cast<std::uint32_t>(std::stoul(scale.out.substr(2)) / 25);
    for (int i = 0; i < 4; ++i) {
        mediaTime[i] = static_cast<std::uint8_t>(2 * frame >> (24 - 8 * i));
    }
    const std::string movie = Quoted(Write(bytes, "edited.mov"));
    const std::string output = " -o " + In("a.raw");
    ExpectSays(RunCliphost("frame " + movie + " --frame 1" + output), 0, "1 raw frame");
    for (const char* const past : {"2", "3", "4", "100"}) {
        const std::string words =
            std::string("there is no frame ") + past + "; it has 2 frames, 0 to 1";
        ExpectSays(RunCliphost("frame " + movie + " --frame " + past + output), 2, words);
        ExpectSays(RunCliphost("frame " + movie + " --range " + past + ":" + output), 2, words);
    }
}

}  // namespace
