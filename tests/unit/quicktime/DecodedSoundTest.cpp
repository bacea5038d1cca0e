// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/quicktime/DecodedSound.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <iterator>
#include <numeric>

#include "reference_host/quicktime/MovieFile.h"
#include "reference_host/quicktime/OpenProblem.h"
#include "tests/unit/quicktime/MadeMovie.h"

using namespace quicktime_tests;

namespace {

std::vector<int> Streams(int count) {
    std::vector<int> streams(static_cast<std::size_t>(count));
    std::iota(streams.begin(), streams.end(), 0);
    return streams;
}

// A movie of that many tracks of the same sound.
MadeMovie TracksOf(int count, const std::string& form) {
    std::string maps;
    for (int i = 0; i < count; ++i) {
        maps += "-map 1 ";
    }
    const MadeMovie one("-f lavfi -i sine=440:d=0.5:r=44100 " + form, ".mov");
    return MadeMovie("-i " + one.Quoted() + " -i " + one.Quoted() + " " + maps + "-c copy");
}

// More than are decoded in one reading of the movie.
TEST(DecodedSound, IsToldOfEachOfManyTracks) {
    const MadeMovie movie = TracksOf(100, "-ac 1 -c:a libmp3lame");
    const auto told = host::DecodeFirstSounds(movie.Path(), Streams(100));
    EXPECT_EQ(told.size(), 100u);
    for (const auto& [stream, sound] : told) {
        EXPECT_EQ(sound.channels, 1) << stream;
        EXPECT_EQ(sound.rate, 44100) << stream;
        EXPECT_EQ(sound.framesPerPacket, 1152) << stream;
    }
}

// The descriptions tell of one channel each, the packets hold two.
TEST(DecodedSound, OfAllTracksTogetherHasABound) {
    for (const int count : {512, 513}) {
        Bytes bytes = TracksOf(count, "-ac 2 -c:a libmp3lame").Content();
        constexpr char kCodec[] = {'s', 't', 's', 'd', 0, 0, 0, 0, 0, 0, 0, 1};
        int patched = 0;
        for (auto at = bytes.begin();; ++patched) {
            at = std::search(at, bytes.end(), std::begin(kCodec), std::end(kCodec));
            if (at == bytes.end()) {
                break;
            }
            at += std::size(kCodec) + 8 + 16;  // to the channels of its description
            ASSERT_EQ(at[1], 2);
            at[1] = 1;
        }
        ASSERT_EQ(patched, count);
        const MadeMovie movie(bytes, ".mov");
        std::string reason;
        const auto opened = host::MovieFile::Open(movie.Path(), reason);
        if (count == 512) {
            ASSERT_TRUE(opened) << reason;
            EXPECT_EQ(opened->SoundFormOf(1)->channels, 2u);
        } else {
            EXPECT_FALSE(opened);
            EXPECT_EQ(reason,
                      "the sound tracks of the movie have more than 1024 channels in total");
            EXPECT_EQ(host::OpenProblem(movie.Path()), reason);
        }
    }
}

TEST(DecodedSound, IsToldOfStreamsThatAreAskedFor) {
    const MadeMovie movie(
        "-f lavfi -i testsrc=d=0.5:s=64x64 -f lavfi -i sine=440:d=0.5:r=44100 "
        "-f lavfi -i sine=440:d=0.5:r=22050 -map 0 -map 1 -map 2 -c:v mpeg4 -c:a:0 aac -ac:a:0 2 "
        "-c:a:1 libmp3lame -ac:a:1 1");
    const auto both = host::DecodeFirstSounds(movie.Path(), {1, 2});
    ASSERT_EQ(both.size(), 2u);
    EXPECT_EQ(both.at(1).channels, 2);
    EXPECT_EQ(both.at(1).rate, 44100);
    EXPECT_EQ(both.at(1).framesPerPacket, 1024);
    EXPECT_EQ(both.at(2).channels, 1);
    EXPECT_EQ(both.at(2).rate, 22050);
    EXPECT_EQ(host::DecodeFirstSounds(movie.Path(), {2}).size(), 1u);
    EXPECT_TRUE(host::DecodeFirstSounds(movie.Path(), {-1, 3}).empty());
    EXPECT_TRUE(host::DecodeFirstSounds(movie.Path(), {}).empty());
    EXPECT_TRUE(host::DecodeFirstSounds("missing.mov", {0}).empty());
}

}  // namespace
