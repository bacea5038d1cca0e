// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include <gtest/gtest.h>

#include <algorithm>
#include <cstring>
#include <random>

#include "reference_host/movie_writer/Movie.h"
#include "tests/unit/quicktime/MadeMovie.h"

using namespace quicktime_tests;

namespace {

constexpr char kTwoTones[] =
    "-f lavfi -i sine=f=440:d=1:r=48000 -f lavfi -i sine=f=997:d=1:r=48000 "
    "-filter_complex [0][1]amerge=2 ";

host::Ref<QTWrapper::IQTAudioReader> OpenSound(const std::filesystem::path& path) {
    host::Ref<QTWrapper::IQTAudioReader> reader;
    const auto wrapper = OpenWrapper(path);
    if (!wrapper || wrapper->GetQTAudioReader(reader.Out()) != NCF_OK) {
        ADD_FAILURE() << "no audio reader for " << path;
    }
    return reader;
}

ncfUInt32 FirstSound(const std::filesystem::path& path) {
    const auto wrapper = OpenWrapper(path);
    for (ncfUInt32 track = 1; wrapper && track <= wrapper->GetNumberOfTracks(); ++track) {
        if (wrapper->IsAudioTrack(track)) {
            return track;
        }
    }
    return 0;
}

// `count` frames of three-byte sound; empty when the reader failed.
Bytes Sound(QTWrapper::IQTAudioReader& reader, ncfUInt32 track, ncfUInt64 place, ncfUInt64 count,
            ncfUInt32 channels, ncfUInt64* reached = nullptr) {
    Bytes bytes(count * channels * 3, 0xEE);
    ncfUInt64 got = count;
    const NCFRESULT result =
        reader.ReadSamples(track, place, &got, bytes.data(), bytes.size(), 0, 0);
    if (reached) {
        *reached = got;
    }
    return result == NCF_OK ? bytes : Bytes();
}

struct Kind {
    const char* name;
    const char* arguments;
    const char* ending;
    const char* decoder = "";  // which one to compare with, where there are two
};
void PrintTo(const Kind& kind, std::ostream* out) {
    *out << kind.name;
}

class EverySound : public testing::TestWithParam<Kind> {};

TEST_P(EverySound, EqualsWhatFfmpegDecodesBitForBit) {
    const MadeMovie movie(kTwoTones + std::string(GetParam().arguments), GetParam().ending);
    for (const bool little : {true, false}) {
        const Bytes wanted = movie.Decoded(little ? "-map 0:a:0 -f s24le" : "-map 0:a:0 -f s24be",
                                           GetParam().decoder);
        ASSERT_FALSE(wanted.empty());
        const auto reader = OpenSound(movie.Path());
        ASSERT_TRUE(reader);
        const ncfUInt32 track = FirstSound(movie.Path());
        ncfUInt32 channels = 0;
        ASSERT_EQ(reader->SetParams(track, 3, little, 48000.0, channels), NCF_OK);
        ASSERT_EQ(channels, 2u);
        const ncfUInt64 frames = wanted.size() / 6;
        const Bytes got = Sound(*reader, track, 0, frames, channels);
        ASSERT_EQ(got.size(), wanted.size());
        for (std::size_t i = 0; i < got.size(); ++i) {
            ASSERT_EQ(got[i], wanted[i]) << "byte " << i;
        }
        // The same from any place.
        std::mt19937 random(3);
        for (int i = 0; i < 20; ++i) {
            const ncfUInt64 place = random() % frames;
            const ncfUInt64 count = std::min<ncfUInt64>(1 + random() % 3000, frames - place);
            const Bytes piece = Sound(*reader, track, place, count, channels);
            ASSERT_EQ(piece.size(), count * 6);
            ASSERT_EQ(std::memcmp(piece.data(), wanted.data() + place * 6, piece.size()), 0)
                << place << " " << count;
        }
        // Past the end there is silence, and nothing but it is a failure.
        ncfUInt64 reached = 0;
        const Bytes tail = Sound(*reader, track, frames - 10, 100, channels, &reached);
        ASSERT_EQ(tail.size(), 600u);
        EXPECT_EQ(reached, 10u);
        EXPECT_EQ(std::memcmp(tail.data(), wanted.data() + (frames - 10) * 6, 60), 0);
        EXPECT_TRUE(std::all_of(tail.begin() + 60, tail.end(), [](auto b) { return b == 0; }));
        EXPECT_TRUE(Sound(*reader, track, frames, 100, channels).empty());
        EXPECT_TRUE(Sound(*reader, track, ~ncfUInt64{0} - 5, 100, channels).empty());
    }
}

INSTANTIATE_TEST_SUITE_P(
    AudioReader, EverySound,
    testing::Values(
        Kind{"U8", "-c:a pcm_u8", ".mov"}, Kind{"S16le", "-c:a pcm_s16le", ".mov"},
        Kind{"S16be", "-c:a pcm_s16be", ".mov"}, Kind{"S24le", "-c:a pcm_s24le", ".mov"},
        Kind{"S24be", "-c:a pcm_s24be", ".mov"}, Kind{"S32le", "-c:a pcm_s32le", ".mov"},
        Kind{"F32be", "-c:a pcm_f32be", ".mov"}, Kind{"F64le", "-c:a pcm_f64le", ".mov"},
        Kind{"Aac", "-c:a aac -aac_pns 0", ".mov"}, Kind{"Alac", "-c:a alac", ".m4a"},
        Kind{"Wav", "-c:a pcm_s24le", ".wav"}, Kind{"Aiff", "-c:a pcm_s16be", ".aiff"},
        Kind{"Flac", "-c:a flac", ".flac"}, Kind{"Au", "-c:a pcm_s16be", ".au"},
        Kind{"Ima4", "-c:a adpcm_ima_qt", ".mov"}, Kind{"Mp3", "-c:a libmp3lame", ".mp3"},
        Kind{"Mp3InMov", "-c:a libmp3lame", ".mov"}, Kind{"Mp3InAvi", "-c:a libmp3lame", ".avi"},
        Kind{"Mp3VbrInAvi", "-c:a libmp3lame -q:a 4", ".avi"},
        Kind{"PcmInAvi", "-c:a pcm_s16le", ".avi"}, Kind{"AacInTs", "-c:a aac -aac_pns 0", ".ts"},
        Kind{"Mp2InTs", "-c:a mp2", ".ts", "-c:a mp2float "},
        Kind{"Mp2InMpg", "-c:a mp2", ".mpg", "-c:a mp2float "},
        Kind{"AacInMkv", "-c:a aac -aac_pns 0", ".mkv"}, Kind{"FlacInMkv", "-c:a flac", ".mkv"},
        Kind{"PcmInMkv", "-c:a pcm_s16le", ".mkv"},
        Kind{"LateMkv", "-c:a pcm_s16le -output_ts_offset 5", ".mkv"},
        Kind{"Fragmented",
             "-c:a aac -aac_pns 0 -movflags frag_keyframe+empty_moov+default_base_moof "
             "-frag_duration 200000",
             ".mp4"}),
    [](const auto& kind) { return std::string(kind.param.name); });

// The edit list hides the encoder's priming: a click stays in its place.
TEST(AudioReader, PlacesSoundAfterThePrimingThatTheEditListHides) {
    const MadeMovie movie(
        "-f lavfi -i aevalsrc='if(between(n\\,24000\\,24010)\\,0.9\\,0)':d=1:s=48000 "
        "-c:a aac -b:a 256k");
    const auto reader = OpenSound(movie.Path());
    ASSERT_TRUE(reader);
    ncfUInt32 channels = 0;
    ASSERT_EQ(reader->SetParams(1, 3, 1, 48000.0, channels), NCF_OK);
    const Bytes all = Sound(*reader, 1, 0, 48000, channels);
    ASSERT_EQ(all.size(), 48000u * 3u);
    std::size_t loudest = 0;
    int most = 0;
    for (std::size_t i = 0; i < 48000; ++i) {
        const int value = std::abs(static_cast<signed char>(all[i * 3 + 2]));
        if (value > most) {
            most = value;
            loudest = i;
        }
    }
    EXPECT_NEAR(static_cast<double>(loudest), 24005.0, 40.0);
}

TEST(AudioReader, GivesSilenceForAnEmptyEdit) {
    const MadeMovie plain("-f lavfi -i sine=d=1:r=48000 -c:a pcm_s16le");
    const MadeMovie late("-itsoffset 0.5 -i " + plain.Quoted() +
                         " -f lavfi -i color=s=32x32:d=1 -map 0 -map 1 -c:a copy -c:v mpeg4");
    const auto reader = OpenSound(late.Path());
    ASSERT_TRUE(reader);
    const ncfUInt32 track = FirstSound(late.Path());
    ncfUInt32 channels = 0;
    ASSERT_EQ(reader->SetParams(track, 3, 1, 48000.0, channels), NCF_OK);
    const Bytes got = Sound(*reader, track, 0, 30000, channels);
    ASSERT_EQ(got.size(), 30000u * 3u);
    EXPECT_TRUE(std::all_of(got.begin(), got.begin() + 24000 * 3, [](auto b) { return b == 0; }));
    const Bytes wanted = plain.Decoded("-f s24le");
    EXPECT_EQ(std::memcmp(got.data() + 24000 * 3, wanted.data(), 6000 * 3), 0);
    EXPECT_EQ(Sound(*reader, track, 100, 50, channels).size(), 150u);
}

// Fragments cut from a longer movie begin when their first sample does.
TEST(AudioReader, BeginsWithTheFirstOfLateFragments) {
    const MadeMovie early(
        "-f lavfi -i sine=d=1:r=48000 -c:a pcm_s16le -frag_duration 200000 -movflags "
        "frag_keyframe+empty_moov+default_base_moof");
    Bytes content = early.Content();
    const char name[] = {'t', 'f', 'd', 't'};
    auto at = std::search(content.begin(), content.end(), name, name + 4);
    ASSERT_NE(at, content.end());
    for (; at != content.end(); at = std::search(at + 4, content.end(), name, name + 4)) {
        ASSERT_EQ(at[4], 1);  // times of 64 bits
        at[12] = 1;           // 65536 * 256 samples later
    }
    const MadeMovie late(content, ".mov");
    const auto reader = OpenSound(late.Path());
    ASSERT_TRUE(reader);
    ncfUInt32 channels = 0;
    ASSERT_EQ(reader->SetParams(1, 3, 1, 48000.0, channels), NCF_OK);
    EXPECT_EQ(Sound(*reader, 1, 0, 48000, 1), early.Decoded("-f s24le"));
}

// Pieces that begin and end within packets, with silence between them.
TEST(AudioReader, PutsThePiecesOfAnEditListTogether) {
    std::mt19937 random(5);
    movies::Movie movie;
    movie.timeScale = 1000;
    movies::SoundFormat format;
    format.channels = 1;
    movies::Track track = movies::SoundTrack(format, 48000);
    for (int i = 0; i < 96000; ++i) {
        track.data.push_back(static_cast<std::uint8_t>(random()));
    }
    track.edits = {{250, 1000, 1.0}, {101, -1, 1.0}, {250, 30500, 1.0}, {5, 77, 1.0}};
    movie.tracks.push_back(track);
    const MadeMovie file(movies::Build(movie).ToBytes(), ".mov");
    Bytes wanted;
    for (const movies::Edit& edit : track.edits) {
        for (std::uint64_t i = 0; i < edit.duration * 48; ++i) {
            const auto at = (static_cast<std::size_t>(edit.mediaTime) + i) * 2;
            const bool isEmpty = edit.mediaTime < 0;
            wanted.push_back(0);
            wanted.push_back(isEmpty ? std::uint8_t{0} : track.data[at]);
            wanted.push_back(isEmpty ? std::uint8_t{0} : track.data[at + 1]);
        }
    }
    const auto reader = OpenSound(file.Path());
    ASSERT_TRUE(reader);
    ncfUInt32 channels = 0;
    ASSERT_EQ(reader->SetParams(1, 3, 1, 48000.0, channels), NCF_OK);
    const ncfUInt64 frames = wanted.size() / 3;
    EXPECT_EQ(Sound(*reader, 1, 0, frames, 1), wanted);
    for (int i = 0; i < 50; ++i) {
        const ncfUInt64 place = random() % frames;
        const ncfUInt64 count = std::min<ncfUInt64>(1 + random() % 9000, frames - place);
        const Bytes piece = Sound(*reader, 1, place, count, 1);
        ASSERT_EQ(piece.size(), count * 3);
        ASSERT_EQ(std::memcmp(piece.data(), wanted.data() + place * 3, piece.size()), 0) << place;
    }
    ncfUInt64 reached = 0;
    EXPECT_EQ(Sound(*reader, 1, frames - 4, 10, 1, &reached).size(), 30u);
    EXPECT_EQ(reached, 4u);
    EXPECT_TRUE(Sound(*reader, 1, frames, 10, 1).empty());
    EXPECT_TRUE(Sound(*reader, 1, ~ncfUInt64{0} - 5, 100, 1).empty());
}

TEST(AudioReader, KeepsTheParametersOfEachTrackApart) {
    const MadeMovie movie(
        "-f lavfi -i sine=d=1:r=48000 -f lavfi -i sine=f=300:d=1:r=44100 -map 0 -map 1 "
        "-c:a pcm_s16le -ac:a:0 1 -ac:a:1 2");
    const auto reader = OpenSound(movie.Path());
    ASSERT_TRUE(reader);
    ncfUInt32 first = 0, second = 0;
    ASSERT_EQ(reader->SetParams(1, 3, 1, 48000.0, first), NCF_OK);
    ASSERT_EQ(reader->SetParams(2, 3, 0, 44100.0, second), NCF_OK);
    EXPECT_EQ(first, 1u);
    EXPECT_EQ(second, 2u);
    EXPECT_EQ(Sound(*reader, 1, 0, 48000, 1), movie.Decoded("-map 0:a:0 -f s24le"));
    EXPECT_EQ(Sound(*reader, 2, 0, 44100, 2), movie.Decoded("-map 0:a:1 -f s24be"));
}

TEST(AudioReader, WritesNoMoreThanTheRoomGiven) {
    const MadeMovie movie("-f lavfi -i sine=d=1:r=48000 -c:a pcm_s16le");
    const auto reader = OpenSound(movie.Path());
    ASSERT_TRUE(reader);
    ncfUInt32 channels = 0;
    ASSERT_EQ(reader->SetParams(1, 3, 1, 48000.0, channels), NCF_OK);
    Bytes room(100, 0xEE);
    ncfUInt64 count = 48000;
    EXPECT_EQ(reader->ReadSamples(1, 0, &count, room.data(), 50, 0, 0), NCF_OK);
    EXPECT_EQ(count, 16u);
    EXPECT_TRUE(std::all_of(room.begin() + 48, room.end(), [](auto b) { return b == 0xEE; }));
}

TEST(AudioReader, RefusesWhatItCantServe) {
    const MadeMovie movie("-f lavfi -i sine=d=1:r=48000 -c:a pcm_s16le");
    const auto reader = OpenSound(movie.Path());
    ASSERT_TRUE(reader);
    ncfUInt8 room[30] = {};
    ncfUInt64 count = 10;
    EXPECT_EQ(reader->ReadSamples(1, 0, &count, room, sizeof room, 0, 0), NMA_E_NOTINITIALIZED);
    ncfUInt32 channels = 77;
    EXPECT_EQ(reader->SetParams(9, 3, 1, 48000.0, channels), NCF_E_NOTFOUND);
    EXPECT_EQ(reader->SetParams(1, 5, 1, 48000.0, channels), NCF_E_INVALIDARG);
    EXPECT_EQ(channels, 77u);
    EXPECT_EQ(reader->ReadSamples(1, 0, nullptr, room, sizeof room, 0, 0), NCF_E_POINTER);
    EXPECT_EQ(reader->ReadSamples(1, 0, &count, nullptr, sizeof room, 0, 0), NCF_E_POINTER);
    EXPECT_EQ(reader->ReservedAudioReaderOperation(), NCF_E_NOTIMPL);
}

}  // namespace
