// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include <gtest/gtest.h>

#include <algorithm>
#include <chrono>

#include "reference_host/movie_writer/Movie.h"
#include "reference_host/quicktime/MovieAtoms.h"
#include "tests/unit/quicktime/MadeMovie.h"

using namespace quicktime_tests;

namespace {

host::MovieAtoms Read(const movies::Movie& movie) {
    return host::ReadMovieAtoms(MadeMovie(movies::Build(movie).ToBytes(), ".mov").Path());
}

movies::Movie TwoDescriptions() {
    movies::Movie movie;
    movies::Track track = movies::VideoTrack(movies::VideoFormat(), 0, 25, 1, 10);
    track.descriptions.push_back(movies::VideoFormat().ToBox());
    track.samples = {{5, 10, 1}, {7, 10, 1}, {4, 10, 1}};
    track.samples[1].description = 2;
    track.samplesPerChunk = 3;
    movie.tracks.push_back(track);
    return movie;
}

TEST(MovieAtoms, TellWhereTheDescriptionChanges) {
    const host::MovieAtoms atoms = Read(TwoDescriptions());
    ASSERT_EQ(atoms.tracks.size(), 1u);
    EXPECT_EQ(atoms.tracks[0].descriptionCount, 2u);
    EXPECT_EQ(atoms.tracks[0].descriptionChanges, (std::vector<ncfUInt64>{5, 12}));
}

movies::Bytes FloatSound(unsigned version) {
    movies::SoundFormat format;
    format.codec = "fpcm";
    format.version = version;
    format.extensions = {movies::Box("pcmC").Version(0).U8(1).U8(64)};
    movies::Movie movie;
    movie.tracks = {movies::SoundTrack(format, 10)};
    return movies::Build(movie).ToBytes();
}

host::MovieAtoms::Track TrackOf(const movies::Bytes& bytes) {
    const host::MovieAtoms atoms = host::ReadMovieAtoms(MadeMovie(bytes, ".mov").Path());
    EXPECT_EQ(atoms.tracks.size(), 1u);
    return atoms.tracks.empty() ? host::MovieAtoms::Track() : atoms.tracks[0];
}

TEST(MovieAtoms, TellTheLinearKindBehindTheFieldsOfEachVersion) {
    for (const unsigned version : {0u, 1u, 2u}) {
        const host::MovieAtoms::Track track = TrackOf(FloatSound(version));
        EXPECT_EQ(track.linearBits, 64u) << version;
        EXPECT_TRUE(track.isLittleEndian) << version;
    }
}

TEST(MovieAtoms, TakeTheFieldsOfVersion1OutOfAListOfTheIsoForm) {
    constexpr char kList[] = "stsd";
    movies::Bytes bytes = FloatSound(0);
    const auto list = std::search(bytes.begin(), bytes.end(), kList, kList + 4);
    ASSERT_NE(list, bytes.end());
    list[4] = 1;           // version of the list
    list[12 + 8 + 9] = 1;  // of its one description
    EXPECT_EQ(TrackOf(bytes).linearBits, 64u);
}

TEST(MovieAtoms, PassOverFieldsThatClaimMoreThanTheDescriptionHolds) {
    constexpr char kList[] = "stsd";
    for (const int claim : {0, 73, 0xFF}) {
        movies::Bytes bytes = FloatSound(2);
        const auto list = std::search(bytes.begin(), bytes.end(), kList, kList + 4);
        ASSERT_NE(list, bytes.end());
        const auto size = list + 12 + 36;
        ASSERT_EQ(size[3], 72);
        size[0] = claim == 0xFF ? 0xFF : 0;
        size[3] = static_cast<std::uint8_t>(claim);
        EXPECT_EQ(TrackOf(bytes).linearBits, claim == 0 ? 64u : 0u) << claim;
    }
}

TEST(MovieAtoms, TellEditsOfEitherVersion) {
    for (const unsigned version : {0u, 1u}) {
        movies::Movie movie = TwoDescriptions();
        movie.tracks[0].editVersion = version;
        movie.tracks[0].edits = {{30, -1, 1.0}, {600, 12, 1.0}};
        const std::vector<host::MovieAtoms::Edit> edits = Read(movie).tracks.at(0).edits;
        ASSERT_EQ(edits.size(), 2u);
        EXPECT_EQ(edits[0].duration, 30u);
        EXPECT_EQ(edits[0].mediaTime, -1);
        EXPECT_EQ(edits[1].duration, 600u);
        EXPECT_EQ(edits[1].mediaTime, 12);
        movie.tracks[0].edits[1].rate = 2.0;
        EXPECT_TRUE(Read(movie).tracks.at(0).edits.empty());
    }
}

TEST(MovieAtoms, TellNoChangeWithinOneDescription) {
    movies::Movie movie;
    movie.tracks.push_back(movies::VideoTrack(movies::VideoFormat(), 20, 25, 1, 10));
    EXPECT_TRUE(Read(movie).tracks.at(0).descriptionChanges.empty());
}

TEST(MovieAtoms, TellWhatSamplesLastInSum) {
    movies::Movie movie = TwoDescriptions();
    movie.tracks[0].samples[1].duration = 0xFFFFFFFF;
    const MadeMovie file(movies::Build(movie).ToBytes(), ".mov");
    const auto sum =
        host::SumDurations(file.Path(), host::ReadMovieAtoms(file.Path()).tracks.at(0));
    ASSERT_TRUE(sum);
    EXPECT_EQ(sum->samples, 16u);
    EXPECT_EQ(sum->units, 5 + 7 * 0xFFFFFFFFull + 4);
}

TEST(MovieAtoms, SumUpNothingThatIsNotThereOrTooMuch) {
    movies::Movie movie = TwoDescriptions();
    EXPECT_FALSE(host::SumDurations("nowhere.mov", Read(movie).tracks.at(0)));
    movie.tracks[0].omitted = {"stts"};
    EXPECT_FALSE(host::SumDurations(MadeMovie(movies::Build(movie).ToBytes(), ".mov").Path(),
                                    Read(movie).tracks.at(0)));
    movie.tracks[0].omitted.clear();
    movie.tracks[0].replaced = {
        movies::Box("stts").Version(0).U32(1).U32(0xFFFFFFFF).U32(0xFFFFFFFF)};
    EXPECT_FALSE(host::SumDurations(MadeMovie(movies::Build(movie).ToBytes(), ".mov").Path(),
                                    Read(movie).tracks.at(0)));
}

// A table of chunks that goes back, or names more of them than it has, ends there.
TEST(MovieAtoms, StopAtATableThatLies) {
    movies::Movie movie = TwoDescriptions();
    movies::Box chunks("stsc");
    chunks.Version(0).U32(900000000).U32(1).U32(2).U32(1).U32(4).U32(2).U32(2).U32(2).U32(2).U32(1);
    movie.tracks[0].replaced.push_back(chunks);
    const auto start = std::chrono::steady_clock::now();
    EXPECT_EQ(Read(movie).tracks.at(0).descriptionChanges, (std::vector<ncfUInt64>{6}));
    EXPECT_LT(std::chrono::steady_clock::now() - start, std::chrono::seconds(5));
}

TEST(MovieAtoms, EndRunsOfSamplesInTheTable) {
    const MadeMovie movie(movies::Build(TwoDescriptions()).ToBytes(), ".mov");
    const auto wrapper = OpenWrapper(movie.Path());
    ASSERT_TRUE(wrapper);
    EXPECT_EQ(wrapper->GetImageDescriptionCount(1), 2u);
    host::Ref<QTWrapper::IQTWSampleTable> table;
    ASSERT_EQ(wrapper->GetSampleTable(table.Out()), NCF_OK);
    for (const auto& [sample, expected] :
         {std::pair<ncfUInt64, ncfUInt64>{1, 6}, {5, 6}, {6, 13}, {12, 13}, {13, 17}, {16, 17}}) {
        ncfUInt64 next = 0;
        ASSERT_EQ(table->GetNextDiscontiguousDataAttributeChange(1, sample, &next), NCF_OK);
        EXPECT_EQ(next, expected) << sample;
    }
}

}  // namespace
