// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/header_parser/Movie.h"

#include <gtest/gtest.h>

#include "tests/unit/header_parser/ParsedMovie.h"

namespace {

using movies::Box;
using movies::Movie;

TEST(MovieHeader, IsReadInBothVersions) {
    for (const unsigned version : {0u, 1u}) {
        Movie movie = PlainMovie();
        movie.headerVersion = version;
        movie.timeScale = 90000;
        movie.duration = 123456;
        movie.creationTime = 3786825601u;
        const ParsedMovie parsed(movie);
        ASSERT_EQ(parsed.Result(), NCF_OK);
        EXPECT_EQ(Ask(&parsed.Parser(), &IQTParser::GetTimeScale), 90000u);
        EXPECT_EQ(Ask(&parsed.Parser(), &IQTParser::GetMovieDuration), 123456u);
        EXPECT_EQ(Ask(&parsed.Parser(), &IQTParser::GetCreationTime), 3786825601u);
    }
}

TEST(MovieHeader, GivesACreationTimeOfMoreThan32Bits) {
    Movie movie = PlainMovie();
    movie.headerVersion = 1;
    movie.creationTime = 0x123456789ull;
    EXPECT_EQ(Ask(&ParsedMovie(movie).Parser(), &IQTParser::GetCreationTime), 0x123456789ull);
}

TEST(MovieHeader, TakesTheLongestTrackWhereTheDurationIsUnknown) {
    Movie movie = PlainMovie();  // one second of 600
    movie.tracks.push_back(movies::VideoTrack(movies::VideoFormat(), 60, 30, 1));
    for (const ncfUInt64 unknown : {ncfUInt64{0}, ncfUInt64{0xFFFFFFFF}}) {
        movie.duration = unknown;
        EXPECT_EQ(Ask(&ParsedMovie(movie).Parser(), &IQTParser::GetMovieDuration), 1200u);
    }
    movie.headerVersion = 1;
    movie.duration = ~ncfUInt64{0};
    EXPECT_EQ(Ask(&ParsedMovie(movie).Parser(), &IQTParser::GetMovieDuration), 1200u);
}

TEST(MovieHeader, TakesTheLargestDurationOf32Bits) {
    Movie movie = PlainMovie();
    movie.headerVersion = 1;
    movie.duration = 0xFFFFFFFF;
    EXPECT_EQ(Ask(&ParsedMovie(movie).Parser(), &IQTParser::GetMovieDuration), 0xFFFFFFFFu);
}

TEST(Movie, PassesOverUserDataAndMetadata) {
    Movie movie = PlainMovie();
    movie.inHeader = {Box("udta").Add(Box("\xA9nam").U16(4).U16(0).Text("name")).U32(0),
                      Box("meta").Version(0).Add(Box("hdlr").Zeros(24)), Box("iods").Zeros(12)};
    movie.tracks[0].userData = {Box("name").Text("first")};
    EXPECT_EQ(ParsedMovie(movie).Result(), NCF_OK);
}

TEST(Movie, TakesAHeaderThatStandsBehindItsTracks) {
    Movie movie = PlainMovie();
    const movies::MadeMovie whole = movies::Build(movie);
    // The header box once more, behind the tracks, in place of the first.
    const movies::Bytes moov = whole.Range(whole.headerPosition, whole.headerSize);
    const movies::Bytes mvhd(moov.begin() + 8, moov.begin() + 8 + 108);
    Box rest("moov");
    rest.Raw(movies::Bytes(moov.begin() + 116, moov.end())).Raw(mvhd);
    movies::Bytes file = whole.Range(0, whole.headerPosition);
    const movies::Bytes tail = rest.ToBytes();
    file.insert(file.end(), tail.begin(), tail.end());
    const ParsedMovie parsed(file);
    ASSERT_EQ(parsed.Result(), NCF_OK) << parsed.Reason();
    EXPECT_EQ(Ask(parsed.Video(), &ITrackInfo::GetTrackDuration), 600u);
}

TEST(Movie, HasAtMost1024ChannelsOfSoundInAllItsTracks) {
    Movie movie;
    movies::SoundFormat sound;
    for (const unsigned channels : {1000u, 20u, 4u}) {
        sound.channels = channels;
        movie.tracks.push_back(movies::SoundTrack(sound, 10));
    }
    EXPECT_EQ(ParsedMovie(movie).Result(), NCF_OK);
    sound.channels = 1;
    movie.tracks.push_back(movies::SoundTrack(sound, 10));
    const ParsedMovie parsed(movie);
    EXPECT_EQ(parsed.Result(), NCF_E_OUTOFMEMORY);
    EXPECT_EQ(parsed.Reason(),
              "the sound tracks of the movie have more than 1024 channels in total");
}

TEST(Movie, WithoutTracksIsTakenWithNoneOfAnyKind) {
    Movie movie;
    const ParsedMovie parsed(movie);
    ASSERT_EQ(parsed.Result(), NCF_OK);
    EXPECT_EQ(Ask(&parsed.Parser(), &IQTParser::GetVideoTrackCount), 0u);
    EXPECT_EQ(Ask(&parsed.Parser(), &IQTParser::GetAudioTrackCount), 0u);
    EXPECT_EQ(Ask(&parsed.Parser(), &IQTParser::GetTimeCodeTrackCount), 0u);
    EXPECT_EQ(Ask(&parsed.Parser(), &IQTParser::GetOtherTrackCount), 0u);
}

TEST(Movie, IsSelfContainedUntilADescriptionRefersToAnotherFile) {
    Movie movie = PlainMovie();
    movie.tracks[0].dataReferences = {
        {"alis", true, ""}, {"url ", false, "file:///b"}, {"rsrc", false, "c"}};
    EXPECT_EQ(Ask(&ParsedMovie(movie).Parser(), &IQTParser::IsMovieSelfContained), 1);
    for (const unsigned reference : {2u, 3u}) {
        movies::VideoFormat format;
        format.dataReference = reference;
        movie.tracks[0].descriptions = {movies::VideoFormat().ToBox(), format.ToBox()};
        EXPECT_EQ(Ask(&ParsedMovie(movie).Parser(), &IQTParser::IsMovieSelfContained), 0);
    }
    // Also where the tracks before and behind it have their media in the file.
    movie = PlainMovie();
    movie.tracks.insert(movie.tracks.begin() + 1, movie.tracks[0]);
    movie.tracks[1].dataReferences = {{"url ", false, "file:///b"}};
    EXPECT_EQ(Ask(&ParsedMovie(movie).Parser(), &IQTParser::IsMovieSelfContained), 0);
}

TEST(Movie, IsNotSelfContainedWhenAnotherTrackIsNot) {
    Movie movie = PlainMovie();
    movie.tracks.push_back(movies::OtherTrack("text", 1, 600, 600));
    movie.tracks[1].dataReferences = {{"alis", false, "x"}};
    EXPECT_EQ(Ask(&ParsedMovie(movie).Parser(), &IQTParser::IsMovieSelfContained), 0);
}

TEST(CompressedHeader, GivesTheSameMovieAsThePlainOne) {
    Movie movie = PlainMovie();
    movie.tracks.push_back(movies::SoundTrack(movies::SoundFormat(), 4800));
    movie.compressed = true;
    for (const movies::Place place : {movies::Place::kBeforeMedia, movies::Place::kBehindMedia}) {
        movie.header = place;
        const movies::MadeMovie made = movies::Build(movie);
        const ParsedMovie parsed(made);
        ASSERT_EQ(parsed.Result(), NCF_OK) << parsed.Reason();
        EXPECT_EQ(Ask(parsed.Samples(), &IQTSampleTable::GetNumSamples), 30u);
        EXPECT_EQ(Ask(&parsed.Parser(), &IQTParser::GetAudioTrackCount), 1u);
        ncfUInt64 position = 0, size = 0;
        ASSERT_EQ(parsed->GetMOOVAtom(&position, &size), NCF_OK);
        EXPECT_EQ(position, made.headerPosition);  // the packed atom in the file
        EXPECT_EQ(size, made.headerSize);
    }
}

}  // namespace
