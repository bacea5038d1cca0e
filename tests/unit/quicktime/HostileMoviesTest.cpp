// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include <gtest/gtest.h>

#include <random>

#include "reference_host/movie_writer/Movie.h"
#include "tests/unit/quicktime/AskEverything.h"
#include "tests/unit/quicktime/MadeMovie.h"

using namespace quicktime_tests;

namespace {

Bytes SmallMovie() {
    return MadeMovie(
               "-f lavfi -i testsrc2=s=64x48:r=25:d=0.4 -f lavfi -i sine=d=0.4 -c:v mpeg4 -bf 2 "
               "-c:a pcm_s16le -timecode 01:00:00:00 -movflags +faststart")
        .Content();
}

TEST(HostileMovies, CutAnywhereComeBack) {
    const Bytes whole = SmallMovie();
    for (std::size_t size = 0; size < whole.size(); size += 97) {
        const MadeMovie cut(Bytes(whole.begin(), whole.begin() + static_cast<std::ptrdiff_t>(size)),
                            ".mov");
        EXPECT_STREQ(AskEverything(cut.Path()), nullptr);
    }
}

TEST(HostileMovies, WithBitsTurnedComeBack) {
    const Bytes whole = SmallMovie();
    std::mt19937 random(11);
    for (int i = 0; i < 150; ++i) {
        Bytes broken = whole;
        for (int turn = 0; turn < 4; ++turn) {
            // Half of them within the headers, which come first.
            const std::size_t range = turn % 2 == 0 ? 3000 : broken.size();
            broken[random() % std::min(range, broken.size())] ^=
                static_cast<std::uint8_t>(1u << random() % 8);
        }
        SCOPED_TRACE(i);
        EXPECT_STREQ(AskEverything(MadeMovie(broken, ".mov").Path()), nullptr);
    }
}

// Edits of more time than numbers hold.
TEST(HostileMovies, WithEndlessEmptyEditsComeBack) {
    for (const std::uint64_t duration :
         {~std::uint64_t{0} >> 1, std::uint64_t{1} << 61, std::uint64_t{1} << 57}) {
        for (const bool isSound : {false, true}) {
            SCOPED_TRACE(duration);
            movies::Movie movie;
            movies::VideoFormat picture;
            picture.codec = "apcn";  // each picture stands alone
            movie.tracks.push_back(isSound ? movies::SoundTrack(movies::SoundFormat(), 48000)
                                           : movies::VideoTrack(picture, 10, 25000, 1000));
            movie.tracks[0].editVersion = 1;
            movie.tracks[0].edits = {
                {60, 0, 1.0}, {duration, -1, 1.0}, {600, 0, 1.0}, {duration, 7, 1.0}};
            EXPECT_STREQ(AskEverything(MadeMovie(movies::Build(movie).ToBytes(), ".mov").Path()),
                         nullptr);
        }
    }
}

TEST(HostileMovies, FilesOfNothingAreRefused) {
    for (const char* text : {"", "x", "not a movie at all, only words", "{\"a\": 1}"}) {
        const std::string content = text;
        const MadeMovie file(Bytes(content.begin(), content.end()), ".mov");
        EXPECT_FALSE(OpenWrapper(file.Path())) << text;
    }
}

// A list of other files reaches none of them.
TEST(HostileMovies, ListsReachNoOtherFiles) {
    const std::string list = "ffconcat version 1.0\nfile 'http://127.0.0.1:9/a.mov'\n";
    const MadeMovie file(Bytes(list.begin(), list.end()), ".ffconcat");
    EXPECT_STREQ(AskEverything(file.Path()), nullptr);
    EXPECT_FALSE(OpenWrapper(file.Path()));
}

}  // namespace
