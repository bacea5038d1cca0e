// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include <gtest/gtest.h>

#include <cstdio>
#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <iterator>
#include <random>

#include "tests/support/Quoted.h"
#include "tests/support/TestFolder.h"
#include "tests/unit/header_parser/ParsedMovie.h"

// Short real movies, each made by the command above its expectations.

namespace {

class MadeByFfmpeg : public testing::Test {
protected:
    ParsedMovie Make(const std::string& arguments) const {
        const std::string command =
            "ffmpeg -y -v error " + arguments + " -bitexact " + Quoted(file_);
        EXPECT_EQ(std::system(command.c_str()), 0) << command;
        std::ifstream stream(file_, std::ios::binary);
        const movies::Bytes bytes{std::istreambuf_iterator<char>(stream),
                                  std::istreambuf_iterator<char>()};
        ParsedMovie parsed(bytes);
        EXPECT_EQ(parsed.Result(), NCF_OK) << parsed.Reason();
        return parsed;
    }

    const TestFolder folder_;
    const std::filesystem::path file_ = folder_ / "made.mov";
};

TEST_F(MadeByFfmpeg, ProResWithTimecodeAndSound) {
    const ParsedMovie parsed = Make(
        "-f lavfi -i testsrc2=s=192x108:r=30000/1001:d=1 -f lavfi -i sine=d=1:r=48000 "
        "-c:v prores_ks -profile:v 3 -c:a pcm_s24le -ac 2 -timecode 01:00:00\\;00");
    const auto description = parsed.VideoDescription();
    ASSERT_TRUE(description);
    EXPECT_EQ(Ask(description, &IVideoSampleDescription::GetDataFormat), movies::Code("apch"));
    const auto sound = parsed.SoundDescription();
    ASSERT_TRUE(sound);
    EXPECT_EQ(Ask(sound, &IAudioSampleDescription::GetBitsPerChannel), 24u);
    EXPECT_EQ(Ask(sound, &IAudioSampleDescription::GetBytesPerPacket), 6u);
    EXPECT_EQ(Ask(sound, &IAudioSampleDescription::IsLittleEndian), 1);
    EXPECT_EQ(parsed.Sound()->HasConstantSampleRate(nullptr), 0);
    ncfUInt8 h = 0, m = 0, s = 0, f = 0;
    ncfUInt32 scale = 0, duration = 0, drop = 0, frames = 0;
    ASSERT_EQ(parsed->GetTimeCodeInfo(&h, &m, &s, &f, &scale, &duration, &drop, &frames), NCF_OK);
    EXPECT_EQ(h, 1);
    EXPECT_EQ(m + s + f, 0);
    EXPECT_EQ(drop, 1u);
    EXPECT_EQ(frames, 30u);
}

TEST_F(MadeByFfmpeg, H264WithReorderingInFront) {
    const ParsedMovie parsed = Make(
        "-f lavfi -i testsrc2=s=128x96:r=25:d=2 -c:v libx264 -bf 2 -g 12 -movflags +faststart");
    const auto table = parsed.Samples();
    ASSERT_TRUE(table);
    EXPECT_EQ(Ask(table, &IQTSampleTable::GetNumSamples), 50u);
    EXPECT_EQ(Ask(table, &IQTSampleTable::GetHasOutOfOrderFrameDependencies), 1);
    // Every picture is shown once, in its own frame's time.
    const ncfUInt32 scale = Ask(parsed.Video(), &ITrackInfo::GetMediaTS);
    std::vector<bool> seen(51);
    for (ncfUInt64 frame = 0; frame < 50; ++frame) {
        const ncfUInt64 sample =
            AskSample(table, &IQTSampleTable::DisplayTimeToFrameNum, frame * scale / 25);
        EXPECT_FALSE(seen[sample]) << frame;
        seen[sample] = true;
    }
}

TEST_F(MadeByFfmpeg, AnimationWithAlpha) {
    const ParsedMovie parsed =
        Make("-f lavfi -i color=red@0.5:s=64x48:r=10:d=1,format=argb -c:v qtrle");
    ASSERT_TRUE(parsed.VideoDescription());
    EXPECT_EQ(Ask(parsed.VideoDescription(), &IVideoSampleDescription::HasAlpha), 1);
}

TEST_F(MadeByFfmpeg, DvOfFiveHundredAndTwentyFiveLines) {
    const ParsedMovie parsed = Make(
        "-f lavfi -i testsrc2=s=720x480:r=30000/1001:d=0.2 -c:v dvvideo -pix_fmt yuv411p "
        "-aspect 4:3");
    const auto description = parsed.VideoDescription();
    ASSERT_TRUE(description);
    ncfUInt32 above = 0, below = 0;
    ASSERT_EQ(description->GetImageAspectRatio(&above, &below), NCF_OK);
    EXPECT_EQ(above, 4u);
    EXPECT_EQ(below, 3u);
}

TEST_F(MadeByFfmpeg, LinearSoundOfEveryKind) {
    struct Kind {
        const char* encoder;
        ncfUInt32 bits;
        ncfBool little;
    };
    for (const Kind& kind :
         {Kind{"pcm_u8", 8, 0}, Kind{"pcm_s16le", 16, 1}, Kind{"pcm_s16be", 16, 0},
          Kind{"pcm_s24be", 24, 0}, Kind{"pcm_s32le", 32, 1}, Kind{"pcm_f32be", 32, 0},
          Kind{"pcm_f64le", 64, 1}}) {
        const ParsedMovie parsed =
            Make(std::string("-f lavfi -i sine=d=0.1:r=48000 -ac 2 -c:a ") + kind.encoder);
        const auto sound = parsed.SoundDescription();
        ASSERT_TRUE(sound) << kind.encoder;
        EXPECT_EQ(Ask(sound, &IAudioSampleDescription::IsLPCM), 1) << kind.encoder;
        EXPECT_EQ(Ask(sound, &IAudioSampleDescription::GetBitsPerChannel), kind.bits)
            << kind.encoder;
        EXPECT_EQ(Ask(sound, &IAudioSampleDescription::IsLittleEndian), kind.little)
            << kind.encoder;
        EXPECT_EQ(Ask(sound, &IAudioSampleDescription::GetBytesPerPacket), kind.bits / 8 * 2)
            << kind.encoder;
    }
}

TEST_F(MadeByFfmpeg, AFragmentedMovieIsRefused) {
    const std::string command =
        "ffmpeg -y -v error -f lavfi -i testsrc2=s=64x48:r=25:d=1 -c:v libx264 "
        "-movflags frag_keyframe+empty_moov " +
        Quoted(file_);
    ASSERT_EQ(std::system(command.c_str()), 0);
    std::ifstream stream(file_, std::ios::binary);
    const movies::Bytes bytes{std::istreambuf_iterator<char>(stream),
                              std::istreambuf_iterator<char>()};
    EXPECT_EQ(ParsedMovie(bytes).Result(), NCF_E_NOTSUPPORTED);
}

}  // namespace
