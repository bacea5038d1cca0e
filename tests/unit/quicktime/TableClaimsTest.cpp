// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/quicktime/TableClaims.h"

#include <gtest/gtest.h>

#include "reference_host/movie_writer/Movie.h"
#include "reference_host/quicktime/OpenInput.h"
#include "tests/unit/quicktime/MadeMovie.h"

using namespace quicktime_tests;
using movies::Box;

namespace {

constexpr std::uint32_t kMany = 1u << 28;

movies::Movie Film() {
    movies::Movie movie;
    movies::VideoFormat picture;
    picture.codec = "mp4v";
    movie.tracks.push_back(movies::VideoTrack(picture, 10, 25000, 1000));
    return movie;
}

// What is said of a movie, and that opening it says the same.
std::string ClaimOf(const movies::Movie& movie) {
    const MadeMovie file(movies::Build(movie).ToBytes(), ".mov");
    const std::string claim = host::FindImpossibleTable(file.Path());
    if (!claim.empty()) {
        std::string reason;
        EXPECT_FALSE(host::OpenInput(file.Path(), host::InputView::AsPresented, reason));
        EXPECT_EQ(reason, claim);
    }
    return claim;
}

std::string ClaimWith(const Box& table) {
    movies::Movie movie = Film();
    movie.tracks[0].replaced = {table};
    movie.tracks[0].added = {table};
    return ClaimOf(movie);
}

TEST(TableClaims, OfAWholeMovieAreFine) {
    EXPECT_EQ(ClaimOf(Film()), "");
}

TEST(TableClaims, NameTrackTableAndNumbers) {
    movies::Movie movie = Film();
    movie.tracks.insert(movie.tracks.begin(), movies::SoundTrack(movies::SoundFormat(), 100));
    movie.tracks[1].replaced = {Box("stsz").Version(0).U32(1).U32(kMany)};
    const std::string claim = ClaimOf(movie);
    EXPECT_EQ(claim.rfind("track 2: 'stsz' counts 268435456 samples and a file of ", 0), 0u)
        << claim;
}

TEST(TableClaims, OfSamplesOfOneSizeAreBounded) {
    EXPECT_NE(ClaimWith(Box("stsz").Version(0).U32(1).U32(kMany)), "");
    EXPECT_NE(ClaimWith(Box("stz2").Version(0).U32(8).U32(kMany)), "");
}

// However small the samples, a file holds no more of them than bytes.
TEST(TableClaims, OfSamplesMayBeAsManyAsAFileHasBytes) {
    movies::Movie movie = Film();
    movie.trailing = {Box("free").Zeros(host::kClaimsAlwaysFine)};
    movie.tracks[0].replaced = {Box("stsz").Version(0).U32(1).U32(1)};
    const auto length = static_cast<std::uint32_t>(movies::Build(movie).ToBytes().size());
    ASSERT_GT(length, host::kClaimsAlwaysFine);
    movie.tracks[0].replaced = {Box("stsz").Version(0).U32(1).U32(length)};
    EXPECT_EQ(ClaimOf(movie), "");
    movie.tracks[0].replaced = {Box("stsz").Version(0).U32(1).U32(length + 1)};
    EXPECT_NE(ClaimOf(movie), "");
}

TEST(TableClaims, OfDisplayTimesAreBounded) {
    EXPECT_NE(ClaimWith(Box("ctts").Version(0).U32(2).U32(10).U32(0).U32(kMany).U32(1)), "");
    EXPECT_EQ(ClaimWith(Box("ctts").Version(0).U32(2).U32(10).U32(0).U32(1).U32(1)), "");
}

TEST(TableClaims, OfGroupsAreBoundedInBothVersions) {
    EXPECT_NE(ClaimWith(Box("sbgp").Version(0).Code("sync").U32(1).U32(kMany).U32(1)), "");
    EXPECT_NE(ClaimWith(Box("sbgp").Version(1).Code("sync").U32(0).U32(1).U32(kMany).U32(1)), "");
    EXPECT_EQ(ClaimWith(Box("sbgp").Version(0).Code("sync").U32(1).U32(10).U32(1)), "");
}

TEST(TableClaims, OfFragmentsAreBounded) {
    movies::Movie movie = Film();
    movie.trailing = {Box("moof").Add(
        Box("traf").Add(Box("tfhd").Version(0).U32(1)).Add(Box("trun").Version(0).U32(kMany)))};
    EXPECT_NE(ClaimOf(movie), "");
    movie.trailing = {Box("moof").Add(
        Box("traf").Add(Box("tfhd").Version(0).U32(1)).Add(Box("trun").Version(0).U32(5)))};
    EXPECT_EQ(ClaimOf(movie), "");
}

TEST(TableClaims, OfFragmentsNameTheTrackThatTheyGoOnWith) {
    movies::Movie movie = Film();
    movie.tracks.push_back(movie.tracks[0]);
    movie.tracks[0].id = 7;
    movie.tracks[1].id = 3;
    const auto fragmentOf = [](std::uint32_t track) {
        return Box("moof").Add(Box("traf")
                                   .Add(Box("tfhd").Version(0).U32(track))
                                   .Add(Box("trun").Version(0).U32(kMany)));
    };
    movie.trailing = {fragmentOf(7)};
    EXPECT_EQ(ClaimOf(movie).rfind("track 1: 'trun' counts", 0), 0u) << ClaimOf(movie);
    movie.trailing = {fragmentOf(3)};
    EXPECT_EQ(ClaimOf(movie).rfind("track 2: 'trun' counts", 0), 0u) << ClaimOf(movie);
    movie.trailing = {fragmentOf(5)};
    EXPECT_EQ(ClaimOf(movie).rfind("'trun' counts", 0), 0u) << ClaimOf(movie);
}

// Each table alone is fine.
TEST(TableClaims, AreAddedUp) {
    movies::Movie movie = Film();
    movie.tracks[0].replaced = {Box("stsz").Version(0).U32(1).U32(host::kClaimsAlwaysFine)};
    EXPECT_EQ(ClaimOf(movie), "");
    movie.tracks.push_back(movie.tracks[0]);
    EXPECT_NE(ClaimOf(movie), "");
}

// Twenty thousand edits of a track of one sync sample each decode all of it.
TEST(TableClaims, OfEditsThatPlayTheSameSamplesAreBounded) {
    movies::Movie movie = Film();
    movie.tracks[0] = movies::VideoTrack(movies::VideoFormat(), 500, 25000, 1000, 4);
    movie.tracks[0].edits.assign(20000, movies::Edit{1, 0, 1.0});
    EXPECT_EQ(ClaimOf(movie), "") << "every sample stands alone";
    movie.tracks[0].added = {Box("stss").Version(0).U32(1).U32(1)};
    EXPECT_NE(ClaimOf(movie), "");
    movie.tracks[0].editVersion = 1;
    EXPECT_NE(ClaimOf(movie), "");
    movie.tracks[0].edits.resize(1000);
    EXPECT_EQ(ClaimOf(movie), "");
}

TEST(TableClaims, AreFoundWhereTheirParentsEndTooEarlyOrTooLate) {
    const Box table = Box("ctts").Version(0).U32(1).U32(kMany).U32(1);
    const Box track =
        Box("trak").Add(Box("mdia").Add(Box("minf").Add(Box("stbl").Add(table).ClaimSize(4000))));
    movies::Movie movie = Film();
    movie.inHeader = {track};
    EXPECT_NE(ClaimOf(movie), "");
}

TEST(TableClaims, AreFoundInACompressedHeader) {
    movies::Movie movie = Film();
    movie.compressed = true;
    EXPECT_EQ(ClaimOf(movie), "");
    movie.tracks[0].added = {Box("ctts").Version(0).U32(1).U32(kMany).U32(1)};
    EXPECT_NE(ClaimOf(movie), "");
}

// Samples of sound are many more than bytes where a few bytes hold a packet.
TEST(TableClaims, OfSoundMayCountMoreSamplesThanBytes) {
    movies::Movie movie;
    movies::SoundFormat sound;
    sound.codec = "ima4";
    sound.version = 1;
    movie.tracks.push_back(movies::SoundTrack(sound, 100));
    movie.tracks[0].replaced = {Box("stsz").Version(0).U32(1).U32(3u << 20),
                                Box("stts").Version(0).U32(1).U32(3u << 20).U32(1),
                                Box("stsc").Version(0).U32(1).U32(1).U32(3u << 20).U32(1)};
    EXPECT_EQ(ClaimOf(movie), "");
    // Chunks of that many samples, again and again.
    movie.tracks[0].replaced[2] = Box("stsc").Version(0).U32(1).U32(1).U32(0xFFFFFFFF).U32(1);
    EXPECT_NE(ClaimOf(movie), "");
}

TEST(TableClaims, OfFilesOfOtherKindsAreNone) {
    for (const std::string text : {"", "RIFF", "moov", "no movie at all, only words"}) {
        const MadeMovie file(Bytes(text.begin(), text.end()), ".mov");
        EXPECT_EQ(host::FindImpossibleTable(file.Path()), "") << text;
    }
}

TEST(OpenInputChannels, AreBoundedInSum) {
    movies::Movie movie;
    movies::SoundFormat sound;
    for (const unsigned channels : {1000u, 24u}) {
        sound.channels = channels;
        movie.tracks.push_back(movies::SoundTrack(sound, 10));
    }
    std::string reason;
    {
        const MadeMovie file(movies::Build(movie).ToBytes(), ".mov");
        EXPECT_TRUE(host::OpenInput(file.Path(), host::InputView::AsPresented, reason)) << reason;
    }
    sound.channels = 1;
    movie.tracks.push_back(movies::SoundTrack(sound, 10));
    const MadeMovie file(movies::Build(movie).ToBytes(), ".mov");
    EXPECT_FALSE(host::OpenInput(file.Path(), host::InputView::AsPresented, reason));
    EXPECT_EQ(reason, "the sound tracks of the movie have more than 1024 channels in total");
}

}  // namespace
