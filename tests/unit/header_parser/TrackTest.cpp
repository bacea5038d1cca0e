// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include <gtest/gtest.h>

#include "tests/unit/header_parser/ParsedMovie.h"

namespace {

using movies::Box;
using movies::Movie;
using movies::Track;

Movie WithTrack(const Track& track) {
    Movie movie;
    movie.tracks = {track};
    return movie;
}

TEST(Track, IsReadInBothHeaderVersions) {
    for (const unsigned version : {0u, 1u}) {
        Movie movie = PlainMovie();
        movie.tracks[0].headerVersion = version;
        movie.tracks[0].id = 77;
        movie.tracks[0].mediaDuration = 31;
        movie.tracks[0].trackDuration = 601;
        movie.tracks[0].matrix = movies::kRotated90;
        const auto track = ParsedMovie(movie).Video();
        ASSERT_TRUE(track);
        EXPECT_EQ(Ask(track, &ITrackInfo::GetTrackId), 77u);
        EXPECT_EQ(Ask(track, &ITrackInfo::GetTrackDuration), 601u);
        EXPECT_EQ(Ask(track, &ITrackInfo::GetMediaTS), 30u);
        EXPECT_EQ(Ask(track, &ITrackInfo::GetMediaDuration), 31u);
        float matrix[9] = {};
        ASSERT_EQ(track->GetTrackMatrix(matrix), NCF_OK);
        for (std::size_t i = 0; i < 9; ++i) {
            EXPECT_FLOAT_EQ(matrix[i], static_cast<float>(movies::kRotated90[i])) << i;
        }
    }
}

TEST(Track, GivesEachDisplayMatrixRowByRow) {
    for (const movies::Matrix& expected :
         {movies::kIdentity, movies::kRotated180, movies::kRotated270,
          movies::Matrix{0.5, 0.25, 0, -1.5, 2, 0, 100, -20, 1}}) {
        Movie movie = PlainMovie();
        movie.tracks[0].matrix = expected;
        float matrix[9] = {};
        ASSERT_EQ(ParsedMovie(movie).Video()->GetTrackMatrix(matrix), NCF_OK);
        for (std::size_t i = 0; i < 9; ++i) {
            EXPECT_FLOAT_EQ(matrix[i], static_cast<float>(expected[i])) << i;
        }
    }
}

TEST(Track, DerivesAnUnknownMediaDurationFromItsSamples) {
    for (const unsigned version : {0u, 1u}) {
        for (const ncfUInt64 unknown :
             {ncfUInt64{0}, version == 1 ? ~ncfUInt64{0} : ncfUInt64{0xFFFFFFFF}}) {
            Movie movie = PlainMovie();
            movie.tracks[0].headerVersion = version;
            movie.tracks[0].mediaDuration = unknown;
            EXPECT_EQ(Ask(ParsedMovie(movie).Video(), &ITrackInfo::GetMediaDuration), 30u);
        }
    }
}

// The thirty samples of a plain movie last a unit each.
TEST(Track, LastsAsLongAsItsSamplesWhereItsHeaderIsMoreThanOneOff) {
    const struct {
        ncfUInt64 told;
        ncfUInt32 expected;
    } kHeaders[] = {{30, 30}, {31, 31}, {29, 29}, {32, 30}, {28, 30}, {1, 30}, {100, 30}};
    for (const unsigned version : {0u, 1u}) {
        for (const auto& header : kHeaders) {
            Movie movie = PlainMovie();
            movie.tracks[0].headerVersion = version;
            movie.tracks[0].mediaDuration = header.told;
            EXPECT_EQ(Ask(ParsedMovie(movie).Video(), &ITrackInfo::GetMediaDuration),
                      header.expected)
                << header.told;
        }
    }
}

TEST(Track, MeasuresItsHeaderByTheMeanOfUnevenSamples) {
    const struct {
        ncfUInt64 told;
        ncfUInt32 expected;
    } kHeaders[] = {{640, 640}, {641, 600}, {560, 560}, {559, 600}};
    for (const auto& header : kHeaders) {
        Movie movie = PlainMovie();
        movie.tracks[0].samples = {{10, 100, 20}, {4, 100, 50}, {1, 100, 200}};
        movie.tracks[0].mediaDuration = header.told;
        EXPECT_EQ(Ask(ParsedMovie(movie).Video(), &ITrackInfo::GetMediaDuration), header.expected)
            << header.told;
    }
}

TEST(Track, BelievesItsHeaderWhereItsSamplesTakeNoTime) {
    for (const std::uint64_t count : {0u, 5u}) {
        Movie movie = PlainMovie();
        movie.tracks[0].samples = {{count, 100, 0}};
        movie.tracks[0].mediaDuration = 40;
        EXPECT_EQ(Ask(ParsedMovie(movie).Video(), &ITrackInfo::GetMediaDuration), 40u);
    }
}

TEST(Track, OfPlainSoundIsAsLongAsItsHeadersAgree) {
    const struct {
        ncfUInt64 media;
        ncfUInt64 track;  // a tenth of a second is 4800 units of the media
        ncfUInt32 expected;
    } kHeaders[] = {
        {4800, 60, 4800},  {2400, 30, 2400}, {2401, 30, 4800},
        {9600, 60, 4800},  {9600, 0, 4800},  // nothing but the media's header says so
        {4880, 61, 4880},                    // a unit of the movie
        {4960, 62, 4800},                    // more than there is
        {9600, 120, 4800},                   // likewise
    };
    for (const auto& header : kHeaders) {
        Movie movie;
        movie.tracks = {movies::SoundTrack(movies::SoundFormat(), 4800)};
        movie.tracks[0].mediaDuration = header.media;
        movie.tracks[0].trackDuration = header.track;
        EXPECT_EQ(Ask(ParsedMovie(movie).Sound(), &ITrackInfo::GetMediaDuration), header.expected)
            << header.media << " in " << header.track;
        movies::SoundFormat packed;
        packed.codec = "mp4a";
        movie.tracks[0].descriptions = {packed.ToBox()};
        EXPECT_EQ(Ask(ParsedMovie(movie).Sound(), &ITrackInfo::GetMediaDuration), 4800u)
            << "compressed";
    }
}

// What the track tells in units of the movie is half a sample of the media off at
// most: 31 of 600 a second are 2278.5 of 44100.
TEST(Track, OfPlainSoundAgreesToTheNearestSample) {
    for (const auto& [media, expected] :
         {std::pair(2277u, 4410u), {2278u, 2278u}, {2279u, 2279u}, {2280u, 4410u}}) {
        movies::SoundFormat format;
        format.rate = 44100;
        Movie movie;
        movie.tracks = {movies::SoundTrack(format, 4410)};
        movie.tracks[0].mediaDuration = media;
        movie.tracks[0].trackDuration = 31;
        EXPECT_EQ(Ask(ParsedMovie(movie).Sound(), &ITrackInfo::GetMediaDuration), expected);
    }
}

// An edit counts for more than the track's header.
TEST(Track, OfPlainSoundAgreesWithItsEditsFirst) {
    Movie movie;
    movie.tracks = {movies::SoundTrack(movies::SoundFormat(), 4800)};
    movie.tracks[0].mediaDuration = 9600;
    movie.tracks[0].trackDuration = 120;
    movie.tracks[0].edits = {{60, 0, 1.0}};
    EXPECT_EQ(Ask(ParsedMovie(movie).Sound(), &ITrackInfo::GetMediaDuration), 4800u);
    movie.tracks[0].mediaDuration = 2400;
    EXPECT_EQ(Ask(ParsedMovie(movie).Sound(), &ITrackInfo::GetMediaDuration), 4800u);
    movie.tracks[0].edits = {{30, 0, 1.0}};
    EXPECT_EQ(Ask(ParsedMovie(movie).Sound(), &ITrackInfo::GetMediaDuration), 2400u);
}

// Whole units of the movie are all that a track can tell, and hosts read plain
// sound themselves where track and media tell the same.
TEST(Track, OfPlainSoundEndsWithItsSamplesAtAWholeUnit) {
    Movie movie;
    movie.tracks = {movies::SoundTrack(movies::SoundFormat(), 4850)};
    movie.tracks[0].mediaDuration = 9600;
    movie.tracks[0].trackDuration = 120;
    const ParsedMovie parsed(movie);
    EXPECT_EQ(Ask(parsed.Sound(), &ITrackInfo::GetTrackDuration), 60u);
    EXPECT_EQ(Ask(parsed.Sound(), &ITrackInfo::GetMediaDuration), 4800u);
    EXPECT_EQ(Ask(&parsed.Parser(), &IQTParser::GetMovieDuration), 60u);
}

// Thirty samples, one second: 600 units of the movie, 20 to each sample.
TEST(Track, LastsNoLongerThanItsMediaCanFill) {
    using movies::Edit;
    const struct {
        const char* name;
        std::vector<Edit> edits;
        ncfUInt64 header;
        ncfUInt32 expected;
    } kTracks[] = {
        {"as long", {}, 600, 600},
        {"a sample and a unit more", {}, 621, 621},
        {"more", {}, 622, 600},
        {"much more", {}, 2000, 600},
        {"less", {}, 300, 300},
        {"an edit that is longer", {{2000, 0, 1.0}}, 2000, 600},
        {"an edit of all that there can be", {{0xFFFFFFFF, 0, 1.0}}, 600, 600},
        {"an edit that begins later", {{600, 15, 1.0}}, 600, 300},
        {"an open edit that begins later", {{0, 15, 1.0}}, 600, 300},
        {"two edits, one too long", {{300, 0, 1.0}, {600, 15, 1.0}}, 900, 600},
        {"all twice", {{600, 0, 1.0}, {600, 0, 1.0}}, 1200, 1200},
        {"a gap in front", {{900, -1, 1.0}, {600, 0, 1.0}}, 1500, 1500},
        {"slow", {{1200, 0, 0.5}}, 1200, 1200},
        {"too long for a fast one", {{600, 0, 2.0}}, 600, 300},
        {"dwelling", {{2000, 5, 0.0}}, 2000, 2000},
        {"backwards", {{2000, 5, -1.0}}, 2000, 2000},
        {"nothing but a gap", {{900, -1, 1.0}}, 900, 900},
        {"nothing that there is", {{900, 30, 1.0}}, 900, 900},
    };
    for (const auto& track : kTracks) {
        SCOPED_TRACE(track.name);
        Movie movie = PlainMovie();
        movie.tracks[0].edits = track.edits;
        movie.tracks[0].trackDuration = track.header;
        movie.duration = track.header;
        const ParsedMovie parsed(movie);
        EXPECT_EQ(Ask(parsed.Video(), &ITrackInfo::GetTrackDuration), track.expected);
        EXPECT_EQ(Ask(&parsed.Parser(), &IQTParser::GetMovieDuration), track.expected);
    }
}

// Pictures shown late end late, and edits begin where the first is shown.
TEST(Track, IsFilledUpToTheLastPictureShown) {
    Movie movie = PlainMovie();
    movie.tracks[0].samples[0].displayOffset = 15;
    movie.tracks[0].edits = {{600, 15, 1.0}};
    EXPECT_EQ(Ask(ParsedMovie(movie).Video(), &ITrackInfo::GetTrackDuration), 600u);
    movie.tracks[0].edits = {{900, 15, 1.0}};
    EXPECT_EQ(Ask(ParsedMovie(movie).Video(), &ITrackInfo::GetTrackDuration), 600u);
}

// What neither shows nor sounds fills no time, nor do samples without duration.
TEST(Track, OfAnotherKindLastsAsLongAsItTells) {
    Movie movie = PlainMovie();
    movie.tracks[0].trackDuration = 2000;
    movie.tracks[0].handler = "text";
    EXPECT_EQ(Ask(ParsedMovie(movie).Other(), &ITrackInfo::GetTrackDuration), 2000u);
    movie.tracks[0].handler = "vide";
    movie.tracks[0].samples[0].duration = 0;
    EXPECT_EQ(Ask(ParsedMovie(movie).Video(), &ITrackInfo::GetTrackDuration), 2000u);
}

TEST(Track, WhoseSamplesLastLongerThan32BitsTellIsRefused) {
    const auto parsed = [](std::uint32_t duration) {
        Movie movie = PlainMovie();
        movie.tracks[0].samples = {{2, 100, duration}};
        movie.tracks[0].mediaDuration = 30;
        return ParsedMovie(movie);
    };
    EXPECT_EQ(Ask(parsed(0x7FFFFFFF).Video(), &ITrackInfo::GetMediaDuration), 0xFFFFFFFEu);
    EXPECT_EQ(parsed(0x80000000).Result(), NCF_E_NOTSUPPORTED);
    EXPECT_NE(parsed(0x80000000).Reason().find("32 bits"), std::string::npos);
    EXPECT_EQ(parsed(0xFFFFFFFF).Result(), NCF_E_NOTSUPPORTED);
}

TEST(Track, DerivesAnUnknownDurationFromItsMedia) {
    for (const ncfUInt64 unknown : {ncfUInt64{0}, ncfUInt64{0xFFFFFFFF}}) {
        Movie movie = PlainMovie();
        movie.tracks[0].trackDuration = unknown;
        EXPECT_EQ(Ask(ParsedMovie(movie).Video(), &ITrackInfo::GetTrackDuration), 600u);
    }
}

TEST(Track, HasTheDurationOfItsEdits) {
    Movie movie = PlainMovie();
    movie.tracks[0].edits = {{100, -1, 1.0}, {300, 0, 1.0}};
    movie.tracks[0].trackDuration = 999;
    EXPECT_EQ(Ask(ParsedMovie(movie).Video(), &ITrackInfo::GetTrackDuration), 400u);
}

TEST(Track, HasItsHeadersDurationWhereTheEditLeavesItOpen) {
    Movie movie = PlainMovie();
    movie.tracks[0].edits = {{0, 2, 1.0}};
    movie.tracks[0].trackDuration = 555;
    EXPECT_EQ(Ask(ParsedMovie(movie).Video(), &ITrackInfo::GetTrackDuration), 555u);
}

TEST(Track, IsSortedByItsHandler) {
    Movie movie;
    movie.tracks = {movies::OtherTrack("text", 1, 600, 600),
                    PlainMovie().tracks[0],
                    movies::SoundTrack(movies::SoundFormat(), 4800),
                    movies::TimecodeTrack(movies::TimecodeFormat(), 0, 25),
                    movies::OtherTrack("meta", 1, 600, 600),
                    PlainMovie().tracks[0]};
    const ParsedMovie parsed(movie);
    ASSERT_EQ(parsed.Result(), NCF_OK) << parsed.Reason();
    EXPECT_EQ(Ask(&parsed.Parser(), &IQTParser::GetVideoTrackCount), 2u);
    EXPECT_EQ(Ask(&parsed.Parser(), &IQTParser::GetAudioTrackCount), 1u);
    EXPECT_EQ(Ask(&parsed.Parser(), &IQTParser::GetTimeCodeTrackCount), 1u);
    EXPECT_EQ(Ask(&parsed.Parser(), &IQTParser::GetOtherTrackCount), 2u);
    EXPECT_EQ(Ask(parsed.Video(0), &ITrackInfo::GetTrackId), 2u);
    EXPECT_EQ(Ask(parsed.Video(1), &ITrackInfo::GetTrackId), 6u);
    EXPECT_EQ(Ask(parsed.Sound(0), &ITrackInfo::GetTrackId), 3u);
    EXPECT_EQ(Ask(parsed.Timecode(0), &ITrackInfo::GetTrackId), 4u);
    EXPECT_EQ(Ask(parsed.Other(0), &ITrackInfo::GetTrackId), 1u);
    EXPECT_EQ(Ask(parsed.Other(1), &ITrackInfo::GetTrackId), 5u);
}

TEST(Track, WithoutHandlerGoesByItsMediaHeader) {
    Track video = PlainMovie().tracks[0];
    video.omitted = {"hdlr"};
    EXPECT_TRUE(ParsedMovie(WithTrack(video)).Video());
    Track sound = movies::SoundTrack(movies::SoundFormat(), 4800);
    sound.omitted = {"hdlr"};
    EXPECT_TRUE(ParsedMovie(WithTrack(sound)).Sound());
}

TEST(Track, MayHaveTheNumberOfAnother) {
    Movie movie = PlainMovie();
    movie.tracks.push_back(movie.tracks[0]);
    movie.tracks[0].id = movie.tracks[1].id = 5;
    const ParsedMovie parsed(movie);
    ASSERT_EQ(parsed.Result(), NCF_OK);
    EXPECT_EQ(Ask(parsed.Video(1), &ITrackInfo::GetTrackId), 5u);
}

TEST(Track, CountsItsDescriptionsAndGivesEach) {
    movies::VideoFormat first;
    movies::VideoFormat second;
    first.codec = "apcn";
    second.codec = "apch";
    Movie movie = PlainMovie();
    movie.tracks[0].descriptions = {first.ToBox(), second.ToBox()};
    const ParsedMovie parsed(movie);
    EXPECT_EQ(Ask(parsed.Video(), &ITrackInfo::GetSampleDescriptionCount), 2u);
    EXPECT_EQ(Ask(parsed.VideoDescription(0), &IVideoSampleDescription::GetDataFormat),
              movies::Code("apcn"));
    EXPECT_EQ(Ask(parsed.VideoDescription(1), &IVideoSampleDescription::GetDataFormat),
              movies::Code("apch"));
    IVideoSampleDescription* none = reinterpret_cast<IVideoSampleDescription*>(8);
    EXPECT_EQ(parsed.Video()->GetVideoSampleDescription(2, &none), NCF_E_NOTFOUND);
    EXPECT_EQ(none, nullptr);
}

TEST(Track, MayHaveNoSamplesAndNoDescriptions) {
    Movie movie = PlainMovie();
    movie.tracks[0].samples.clear();
    movie.tracks[0].descriptions.clear();
    const ParsedMovie parsed(movie);
    ASSERT_EQ(parsed.Result(), NCF_OK) << parsed.Reason();
    EXPECT_EQ(Ask(parsed.Samples(), &IQTSampleTable::GetNumSamples), 0u);
    EXPECT_EQ(Ask(parsed.Samples(), &IQTSampleTable::GetMaxDataSizeInBytes), 0u);
    EXPECT_EQ(Ask(parsed.Video(), &ITrackInfo::GetSampleDescriptionCount), 0u);
    ncfUInt64 position = 0, size = 0;
    EXPECT_EQ(parsed.Samples()->GetChunkFromTheMiddle(&position, &size), NMA_E_NODATA);
}

TEST(Track, NeedsNoDataReferencesToBeInItsOwnFile) {
    Movie movie = PlainMovie();
    movie.tracks[0].omitted = {"dinf"};
    EXPECT_EQ(Ask(&ParsedMovie(movie).Parser(), &IQTParser::IsMovieSelfContained), 1);
    movies::VideoFormat format;
    format.dataReference = 0;
    movie.tracks[0].omitted.clear();
    movie.tracks[0].descriptions = {format.ToBox()};
    EXPECT_EQ(Ask(&ParsedMovie(movie).Parser(), &IQTParser::IsMovieSelfContained), 1);
}

// Recorders write descriptions of data that lack even the common fields.
TEST(Track, OfAnotherKindMayHaveADescriptionOfText) {
    Movie movie = PlainMovie();
    movie.tracks.push_back(movies::OtherTrack("meta", 1, 600, 600));
    movie.tracks[1].descriptions = {Box("mett").Text("application/octet-stream")};
    EXPECT_EQ(ParsedMovie(movie).Result(), NCF_OK);
}

TEST(Track, AnswersToItsOwnInterfacesOnly) {
    Movie movie = PlainMovie();
    movie.tracks.push_back(movies::SoundTrack(movies::SoundFormat(), 4800));
    const ParsedMovie parsed(movie);
    const auto video = parsed.Video();
    host::Ref<ITrackInfo> track;
    host::Ref<IVideoTrackInfo> again;
    host::Ref<IAudioTrackInfo> sound;
    host::Ref<INCFUnknown> root;
    EXPECT_EQ(host::Query(video.get(), track), NCF_OK);
    EXPECT_EQ(host::Query(track.get(), again), NCF_OK);
    EXPECT_EQ(again.get(), video.get());
    EXPECT_EQ(host::Query(track.get(), sound), NCF_E_NOINTERFACE);
    EXPECT_EQ(host::Query(track.get(), root), NCF_OK);
    const auto other = parsed.Sound();
    EXPECT_EQ(host::Query(other.get(), sound), NCF_OK);
    EXPECT_EQ(host::Query(other.get(), again), NCF_E_NOINTERFACE);
}

TEST(Track, OutlivesItsParser) {
    host::Ref<IQTSampleTable> table;
    host::Ref<IVideoSampleDescription> description;
    {
        const ParsedMovie parsed(PlainMovie());
        table = parsed.Samples();
        description = parsed.VideoDescription();
    }
    EXPECT_EQ(AskSample(table, &IQTSampleTable::GetDataSizePerSample, 30), 100u);
    EXPECT_EQ(Ask(description, &IVideoSampleDescription::GetDataFormat), movies::Code("avc1"));
}

}  // namespace
