// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// Sound through the module, beside FFmpeg's PCM of the same file, bit for bit.

#include <algorithm>
#include <random>

#include "reference_host/cliphost/SoundReader.h"
#include "tests/system/EssenceSupport.h"
#include "tests/system/SystemTest.h"

namespace {

using cliphost::ClipTrack;
using cliphost::Essence;
using cliphost::SoundReader;
using cliphost::TrackKind;

class EssenceSound : public SystemTest {
protected:
    // Whole sounds of a track, read in pieces of a size that divides nothing.
    EssenceBytes All(Essence& essence, ncfUInt32 track) {
        SoundReader reader(essence, essence.tracks().at(track));
        EssenceBytes all;
        constexpr std::uint64_t piece = 1021;
        for (std::uint64_t at = 0; at < reader.Count(); at += piece) {
            const auto block = reader.Read(at, std::min(piece, reader.Count() - at));
            EXPECT_FALSE(block.isSilence) << at;
            all.insert(all.end(), block.bytes, block.bytes + block.size);
        }
        return all;
    }
};

TEST_F(EssenceSound, OfEveryKindIsFfmpegsBitForBit) {
    for (const char* const name :
         {"pcm_s16le.mov",      "pcm_s16be.mov", "pcm_s24le.mov", "pcm_s24be.mov", "pcm_s32le.mov",
          "pcm_s32be.mov",      "pcm_f32le.mov", "pcm_f32be.mov", "pcm_f64le.mov", "pcm_f64be.mov",
          "pcm_u8.mov",         "pcm_s8.mov",    "pcm_alaw.mov",  "pcm_mulaw.mov", "pcm_44100.mov",
          "pcm_96000_mono.mov", "alac.mov",      "ima4.mov",      "aac.mov",       "aac.m4a"}) {
        SCOPED_TRACE(name);
        Essence essence(session(), MadeMovie(name));
        const EssenceBytes got = All(essence, 0);
        EssenceBytes wanted = Decoded(MadeMovie(name), "-f s24le -c:a pcm_s24le");
        ASSERT_FALSE(got.empty());
        ASSERT_GE(wanted.size(), got.size());
        wanted.resize(got.size());  // what lies behind the clip's length
        EXPECT_TRUE(got == wanted);
    }
}

TEST_F(EssenceSound, OfSeveralTracksIsEachTracksOwn) {
    const auto movie = MadeMovie("three_sounds.mov");
    Essence essence(session(), movie);
    for (ncfUInt32 track = 1; track < 4; ++track) {
        SCOPED_TRACE(track);
        const EssenceBytes wanted =
            Decoded(movie, "-map 0:a:" + std::to_string(track - 1) + " -f s24le -c:a pcm_s24le");
        EXPECT_TRUE(All(essence, track) == wanted);
    }
    // Once more from the first: what the others set does not stay.
    EXPECT_EQ(All(essence, 1).size(), 19200u * 3);
}

TEST_F(EssenceSound, IsExactToTheSampleAtAnyPlace) {
    // Noise that a decoder makes up depends on where it began; this has none.
    const auto aac =
        Make("-f lavfi -i sine=440:sample_rate=48000:d=2 -c:a aac -aac_pns 0", "without_noise.mov");
    for (const std::filesystem::path& movie :
         {MadeMovie("pcm_s24be.mov"), aac, MadeMovie("alac.mov"), MadeMovie("ima4.mov")}) {
        SCOPED_TRACE(movie);
        Essence essence(session(), movie);
        const EssenceBytes all = All(essence, 0);
        SoundReader reader(essence, essence.tracks().at(0));
        const unsigned seed = std::random_device()();
        SCOPED_TRACE("seed " + std::to_string(seed));
        std::mt19937 random(seed);
        for (int i = 0; i < 40; ++i) {
            ExpectRandomRange(reader, random, all);
        }
    }
}

TEST_F(EssenceSound, PastItsEndIsSilenceAndSaysSo) {
    Essence essence(session(), MadeMovie("pcm_s16le.mov"));
    SoundReader reader(essence, essence.tracks().at(0));
    const auto past = reader.Read(reader.Count() + 1000, 10);
    EXPECT_TRUE(past.isSilence);
    EXPECT_EQ(std::count(past.bytes, past.bytes + past.size, 0),
              static_cast<std::ptrdiff_t>(past.size));
    const auto last = reader.Read(reader.Count() - 5, 10);
    EXPECT_FALSE(last.isSilence);
    ASSERT_EQ(last.size, 60u);
    EXPECT_EQ(std::count(last.bytes + 30, last.bytes + 60, 0), 30);
    EXPECT_NE(std::count(last.bytes, last.bytes + 30, 0), 30);
}

TEST_F(EssenceSound, IsWrittenAsAWavFileThatFfmpegReads) {
    struct Sound {
        const char* name;
        const char* stream;
        int track;
    };
    for (const Sound& sound :
         {Sound{"prores_with_pcm.mov", "0:a:0", 1}, Sound{"three_sounds.mov", "0:a:2", 3},
          Sound{"pcm_96000_mono.mov", "0:a:0", 0}}) {
        SCOPED_TRACE(sound.name);
        const auto movie = MadeMovie(sound.name);
        const auto wav = folder() / "sound.wav";
        const CommandResult result =
            RunCliphost("audio " + Quoted(movie) + " --track " + std::to_string(sound.track) +
                        " -o " + Quoted(wav));
        EXPECT_EQ(result.status, 0) << result.out;
        EXPECT_TRUE(
            Decoded(wav, "-f s24le -c:a pcm_s24le") ==
            Decoded(movie, std::string("-map ") + sound.stream + " -f s24le -c:a pcm_s24le"));
        EXPECT_EQ(RunCommand("ffprobe -v error -show_entries stream=sample_rate,channels,"
                             "codec_name -of csv=p=0 " +
                             Quoted(wav))
                      .out.find("pcm_s24le,"),
                  0u);
    }
}

TEST_F(EssenceSound, IsWrittenFromAnyPlace) {
    const auto movie = MadeMovie("pcm_s24le.mov");
    const auto wav = folder() / "piece.wav";
    ASSERT_EQ(RunCliphost("audio " + Quoted(movie) + " --start 1000 --count 2001 -o " + Quoted(wav))
                  .status,
              0);
    const EssenceBytes all = Decoded(movie, "-f s24le -c:a pcm_s24le");
    const EssenceBytes piece = Decoded(wav, "-f s24le -c:a pcm_s24le");
    ASSERT_EQ(piece.size(), 2001u * 6);
    EXPECT_TRUE(std::equal(piece.begin(), piece.end(), all.begin() + 6000));
}

}  // namespace
