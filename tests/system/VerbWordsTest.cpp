// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// The sentences of the verbs for numbers of one and of none, and for what is
// not known.

#include "tests/system/Command.h"
#include "tests/system/SystemTest.h"

namespace {

class VerbWords : public SystemTest {
protected:
    std::string Made(const std::string& command, const std::string& name) {
        const std::string file = Quoted(folder() / name);
        EXPECT_EQ(RunCommand("ffmpeg -nostdin -v error " + command + " " + file).status, 0);
        return file;
    }
    std::string Out(const std::string& name) { return Quoted(folder() / name); }
};

TEST_F(VerbWords, CountOneChannelAndOneSample) {
    const std::string movie =
        Made("-f lavfi -i sine=r=48000 -af atrim=end_sample=1 -c:a pcm_s16le", "one.mov");
    const std::string mono =
        Made("-f lavfi -i sine=r=48000 -af atrim=end_sample=3840 -c:a pcm_s16le", "mono.mov");
    ExpectSays(RunCliphost("formats " + mono), 0,
               "track 0: sound, 3840 samples, 48000 samples a second, 1 channel\n");
    // So short a movie has no length in frames, and so no description.
    const std::string rate = " --rate 48000 -o ";
    ExpectSays(RunCliphost("samples " + movie), 0, "track 0: sound, 1 sample of 1 channel\n");
    ExpectSays(RunCliphost("samples " + movie), 0, "  2 bytes in 1 run; the file has ");
    ExpectSays(RunCliphost("audio " + movie + rate + Out("a.wav")), 0,
               "1 sample, 1 channel, 24 bits at 48000 Hz\n");
    ExpectSays(RunCliphost("audio " + movie + " --start 1" + rate + Out("a.wav")), 2,
               "there is no sample 1 of sound; it has 1 sample, sample 0\n");
    ExpectSays(RunCliphost("audio " + movie + " --count 9" + rate + Out("a.wav")), 0,
               "the sound ends 1 sample after sample 0");
    ExpectSays(RunCliphost("frame " + movie + " -o " + Out("a.png")), 1,
               "it has no picture track; its one track is 0 (sound)\n");
}

TEST_F(VerbWords, CountOneFrame) {
    const std::string movie =
        Made("-f lavfi -i testsrc2=s=64x48:r=25 -frames:v 1 -c:v png", "one.mov");
    const std::string settings = " --single-frame-duration 1 ";
    ExpectSays(RunCliphost("formats" + settings + movie), 0,
               "track 0: picture, 1 frame, 25 frames a second, frame 64 x 48\n");
    ExpectSays(RunCliphost("samples" + settings + movie), 0, "track 0: picture, 1 sample\n");
    ExpectSays(RunCliphost("contact" + settings + movie + " -o " + Out("a.png")), 0,
               "1 of 1 frame\n");
    ExpectSays(RunCliphost("frame" + settings + movie + " -o " + Out("a.raw")), 0, "1 raw frame\n");
    ExpectSays(RunCliphost("frame" + settings + movie + " -o " + Out("frames")), 0, "1 picture\n");
    ExpectSays(RunCliphost("frame" + settings + movie + " --frame 1 -o " + Out("a.png")), 2,
               "there is no frame 1; it has 1 frame, frame 0\n");
}

// A cut movie can't be described, so nothing tells its rate.
TEST_F(VerbWords, SayThatARateIsNotKnown) {
    const auto movie = Made(
        "-i " + Quoted(MadeMovie("pcm_s16le.mov")) + " -c copy -movflags +faststart", "cut.mov");
    const auto file = folder() / "cut.mov";
    std::filesystem::resize_file(file, std::filesystem::file_size(file) / 2);
    const CommandResult ran = RunCliphost("formats " + movie);
    ExpectSays(ran, 0, "samples a second not known, 2 channels\n");
    ExpectSays(ran, 0, "               bytes a second not known\n");
    EXPECT_EQ(ran.out.find("unknown a second"), std::string::npos);
    EXPECT_EQ(ran.out.find(" 0 bytes"), std::string::npos);
}

TEST_F(VerbWords, SayThatThereAreNone) {
    movies::Movie movie;
    movies::Track empty = movies::VideoTrack(movies::VideoFormat(), 0, 25, 1);
    movie.tracks = {empty, movies::SoundTrack(movies::SoundFormat(), 0)};
    const std::string file = Quoted(Write(movie, "none.mov"));
    for (const std::string& call :
         {"samples " + file, "formats " + file, "frame " + file + " -o " + Out("a.png"),
          "audio " + file + " -o " + Out("a.wav"), "contact " + file + " -o " + Out("b.png")}) {
        const CommandResult ran = RunCliphost(call);
        EXPECT_EQ(ran.out.find("from 0 on"), std::string::npos) << ran.out;
        EXPECT_EQ(ran.out.find("0 samples"), std::string::npos) << ran.out;
        EXPECT_EQ(ran.out.find("it has 0"), std::string::npos) << ran.out;
        EXPECT_NE(ran.status, 2) << ran.out;
    }
}

}  // namespace
