// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// Numbers and ids of tracks, and what movies tell of each.

#include <gtest/gtest.h>

#include <array>

#include "reference_host/framework/String.h"
#include "reference_host/movie_writer/Movie.h"
#include "tests/unit/quicktime/MadeMovie.h"

using namespace quicktime_tests;

namespace {

using Wrapper = host::Ref<QTWrapper::IQuickTimeWrapper>;

// Picture, sound of one channel and sound of two, under these ids.
MadeMovie MovieWithIds(const std::vector<std::uint32_t>& ids) {
    movies::Movie movie;
    movie.timeScale = 48000;
    movies::SoundFormat one;
    one.channels = 1;
    movie.tracks = {movies::VideoTrack(movies::VideoFormat(), 10, 25, 1, 100),
                    movies::SoundTrack(one, 1000), movies::SoundTrack(movies::SoundFormat(), 2000)};
    for (std::size_t i = 0; i < ids.size(); ++i) {
        movie.tracks[i].id = ids[i];
    }
    return MadeMovie(movies::Build(movie).ToBytes(), ".mov");
}

Wrapper OpenWithIds(const std::vector<std::uint32_t>& ids) {
    return OpenWrapper(MovieWithIds(ids).Path());
}

// Channels of a sound track, 0 when there is none of that number or id.
ncfUInt32 Channels(const Wrapper& wrapper, ncfUInt32 track) {
    ncfUInt32 channels = 0;
    return wrapper->GetAudioInfoForTrack(track, &channels, nullptr, nullptr, nullptr, nullptr,
                                         nullptr, nullptr, nullptr, nullptr) == NCF_OK
               ? channels
               : 0;
}

std::string Kinds(const Wrapper& wrapper) {
    std::string kinds;
    for (ncfUInt32 i = 0; i <= wrapper->GetNumberOfTracks(); ++i) {
        kinds += wrapper->IsVideoTrack(i)      ? 'v'
                 : wrapper->IsAudioTrack(i)    ? 'a'
                 : wrapper->IsTimeCodeTrack(i) ? 't'
                                               : '-';
    }
    return kinds;
}

TEST(TrackNumbers, AreTheMoviesOwnIds) {
    const Wrapper wrapper = OpenWithIds({3, 7, 5});
    ASSERT_TRUE(wrapper);
    EXPECT_EQ(Kinds(wrapper), "---v-a-a");
    EXPECT_EQ(wrapper->GetDescribedTrackCount(), 3u);
    EXPECT_EQ(Channels(wrapper, 7), 1u);
    EXPECT_EQ(Channels(wrapper, 5), 2u);
    EXPECT_EQ(Channels(wrapper, 3), 0u);
    EXPECT_EQ(Channels(wrapper, 2), 0u);
    EXPECT_EQ(wrapper->GetTrackDuration(7), 1000u);
    EXPECT_EQ(wrapper->GetTrackDuration(5), 2000u);
}

// The highest that is looped to, and the first that is not.
TEST(TrackNumbers, AreOneToNWhereAnIdIsTooHigh) {
    EXPECT_EQ(OpenWithIds({1, 65535, 3})->GetNumberOfTracks(), 65535u);
    const Wrapper wrapper = OpenWithIds({65536, 3, 5});
    ASSERT_TRUE(wrapper);
    EXPECT_EQ(wrapper->GetNumberOfTracks(), 3u);
    // What has an id within 1 to n keeps it, so ids and numbers never disagree.
    EXPECT_EQ(Kinds(wrapper), "-vaa");
    EXPECT_EQ(Channels(wrapper, 3), 1u);
    EXPECT_EQ(Channels(wrapper, 5), 2u);
    EXPECT_EQ(Channels(wrapper, 2), 2u);
    EXPECT_EQ(wrapper->IsVideoTrack(65536), 1);
    EXPECT_EQ(wrapper->GetTrackDuration(3), 1000u);
    EXPECT_EQ(wrapper->GetTrackDuration(2), 2000u);
    EXPECT_EQ(wrapper->GetTrackDuration(5), 2000u);
}

TEST(TrackNumbers, AreOneToNWhereIdsAreTheSame) {
    const Wrapper wrapper = OpenWithIds({9, 9, 9});
    ASSERT_TRUE(wrapper);
    EXPECT_EQ(Kinds(wrapper), "-vaa");
    EXPECT_EQ(Channels(wrapper, 2), 1u);
    EXPECT_EQ(Channels(wrapper, 3), 2u);
}

TEST(TrackNumbers, ServeTheReadersToo) {
    const MadeMovie movie = MovieWithIds({65536, 3, 4000000000});
    const Wrapper wrapper = OpenWrapper(movie.Path());
    ASSERT_TRUE(wrapper);
    host::Ref<QTWrapper::IQTAudioReader> reader;
    host::Ref<QTWrapper::IQTWSampleTable> table;
    ASSERT_EQ(wrapper->GetQTAudioReader(reader.Out()), NCF_OK);
    ASSERT_EQ(wrapper->GetSampleTable(table.Out()), NCF_OK);
    for (const ncfUInt32 track : {2u, 4000000000u}) {
        ncfUInt32 channels = 0;
        EXPECT_EQ(reader->SetParams(track, 3, 1, 48000.0, channels), NCF_OK);
        EXPECT_EQ(channels, 2u);
        ncfUInt64 count = 0;
        EXPECT_EQ(table->GetNumSamples(track, &count), NCF_OK);
        EXPECT_EQ(count, 2000u);
    }
}

TEST(TrackNumbers, CountStreamsOfOtherContainers) {
    for (const char* const ending : {".ts", ".mpg", ".avi", ".mkv"}) {
        const MadeMovie movie(
            "-f lavfi -i testsrc2=s=64x48:r=25:d=0.4 -f lavfi -i sine=d=0.4:r=48000 -c:v "
            "mpeg2video "
            "-c:a mp2",
            ending);
        EXPECT_EQ(Kinds(OpenWrapper(movie.Path())), "-va") << ending;
    }
}

// A picture on the sleeve is no picture track, and takes no number that the
// movie gives.
TEST(TrackNumbers, LeavePicturesAttachedToSoundAside) {
    for (const char* const ending : {".m4a", ".mp3"}) {
        const MadeMovie movie(
            "-f lavfi -i sine=d=0.4:r=48000 -f lavfi -i testsrc2=s=64x48:r=25:d=0.04 -map 0 -map 1 "
            "-c:v mjpeg -disposition:v attached_pic",
            ending);
        const Wrapper wrapper = OpenWrapper(movie.Path());
        ASSERT_TRUE(wrapper) << ending;
        ncfUInt32 track = 7;
        EXPECT_EQ(wrapper->GetFirstVideoTrack(&track), 0) << ending;
        EXPECT_EQ(wrapper->MovieHasMultipleVideoTracks(0, 0), 0);
        EXPECT_EQ(wrapper->IsAudioTrack(1), 1) << ending;
        EXPECT_EQ(wrapper->GetNumberOfTracks(), 2u) << ending;
    }
}

// Two uncompressed pictures, the first red and 16 wide, the second blue and 8
// wide, under these ids.
movies::Movie TwoPictures(std::uint32_t first, std::uint32_t second) {
    movies::Movie movie;
    const struct {
        std::uint32_t id;
        unsigned width;
        std::uint64_t frames;
        std::array<std::uint8_t, 3> color;
    } kTracks[] = {{first, 16, 6, {255, 0, 0}}, {second, 8, 3, {0, 0, 255}}};
    for (const auto& each : kTracks) {
        movies::VideoFormat format;
        format.codec = "raw ";
        format.width = each.width;
        format.height = 8;
        movies::Track track =
            movies::VideoTrack(format, each.frames, 25, 1, each.width * format.height * 3);
        track.id = each.id;
        for (std::uint64_t i = 0; i < each.frames * each.width * format.height; ++i) {
            track.data.insert(track.data.end(), each.color.begin(), each.color.end());
        }
        movie.tracks.push_back(track);
    }
    return movie;
}

TEST(FirstPictureTrack, IsTheFirstOfTheFileWhateverItsId) {
    for (const auto& [first, second] :
         {std::pair(1u, 2u), std::pair(5u, 2u), std::pair(65536u, 2u), std::pair(7u, 65536u)}) {
        SCOPED_TRACE(std::to_string(first) + " before " + std::to_string(second));
        const MadeMovie movie(movies::Build(TwoPictures(first, second)).ToBytes(), ".mov");
        const Wrapper wrapper = OpenWrapper(movie.Path());
        ASSERT_TRUE(wrapper);
        ncfUInt32 track = 0, width = 0, height = 0;
        ASSERT_EQ(wrapper->GetFirstVideoTrack(&track), 1);
        EXPECT_EQ(track, first == 65536u ? 1u : first == 7u ? 1u : first);
        ASSERT_EQ(wrapper->GetMovieBox(&width, &height, nullptr, nullptr), NCF_OK);
        EXPECT_EQ(width, 16u);
        const auto reader = OpenVideo(movie.Path(), Code("BGRA"));
        ASSERT_TRUE(reader);
        ncfUInt64 count = 0;
        const Bytes pictures = AllPictures(*reader, &count);
        EXPECT_EQ(count, 6u);
        ASSERT_EQ(pictures.size(), 6u * 16u * 8u * 4u);
        EXPECT_EQ(Bytes(pictures.begin(), pictures.begin() + 4), (Bytes{0, 0, 255, 255}));
    }
}

// Of a movie whose header only the wrapper reads, callers walk the numbers: the
// lowest is the first that they find.
TEST(FirstPictureTrack, IsThatOfTheLowestNumberWhereTheHeaderIsRefused) {
    movies::Movie movie = TwoPictures(5, 2);
    movie.headerVersion = 1;
    movie.duration = std::uint64_t{1} << 33;
    const MadeMovie file(movies::Build(movie).ToBytes(), ".mov");
    const Wrapper wrapper = OpenWrapper(file.Path());
    ASSERT_TRUE(wrapper);
    ncfUInt32 track = 0, width = 0, height = 0;
    ASSERT_EQ(wrapper->GetFirstVideoTrack(&track), 1);
    EXPECT_EQ(track, 2u);
    ASSERT_EQ(wrapper->GetMovieBox(&width, &height, nullptr, nullptr), NCF_OK);
    EXPECT_EQ(width, 8u);
    const auto reader = OpenVideo(file.Path(), Code("BGRA"));
    ASSERT_TRUE(reader);
    ncfUInt64 count = 0;
    AllPictures(*reader, &count);
    EXPECT_EQ(count, 3u);
}

// Chapters of a sound are pictures as well, whoever names them.
TEST(FirstPictureTrack, MayBeTheChaptersOfAnother) {
    for (const std::size_t by : {0u, 1u}) {
        movies::Movie movie = TwoPictures(1, 2);
        movie.tracks[by].inTrack = {movies::Box("tref").Add(movies::Box("chap").U32(1))};
        const MadeMovie file(movies::Build(movie).ToBytes(), ".mov");
        const Wrapper wrapper = OpenWrapper(file.Path());
        ASSERT_TRUE(wrapper);
        EXPECT_EQ(Kinds(wrapper), "-vv") << by;
        ncfUInt32 track = 0;
        ASSERT_EQ(wrapper->GetFirstVideoTrack(&track), 1);
        EXPECT_EQ(track, 1u) << by;
    }
}

// The handler tells the header's readers the kind of a track, its code tells
// the multimedia library.
TEST(FirstPictureTrack, HasTheHandlerOfPictures) {
    for (const char* const handler : {"pict", "text", "meta", "tmcd", "hint", "gnrc", "m1v "}) {
        movies::Movie movie = TwoPictures(1, 2);
        movie.tracks[0].handler = handler;
        movies::VideoFormat format;
        format.codec = "jpeg";  // 'raw ' would be sound
        movie.tracks[0].descriptions = {format.ToBox()};
        const MadeMovie file(movies::Build(movie).ToBytes(), ".mov");
        const Wrapper wrapper = OpenWrapper(file.Path());
        ASSERT_TRUE(wrapper) << handler;
        ncfUInt32 track = 0;
        ASSERT_EQ(wrapper->GetFirstVideoTrack(&track), 1) << handler;
        EXPECT_EQ(track, 2u) << handler;
    }
}

// The parser takes this header, but a picture without a size makes no clip.
TEST(FirstPictureTrack, IsThatOfTheLowestNumberWhereNoClipIsMadeOfTheHeader) {
    for (const auto& [first, second] : {std::pair(9u, 3u), std::pair(3u, 9u)}) {
        movies::Movie movie = TwoPictures(first, second);
        movies::VideoFormat format;
        format.codec = "raw ";
        format.width = 0;
        format.height = 8;
        movie.tracks[0].descriptions = {format.ToBox()};
        const MadeMovie file(movies::Build(movie).ToBytes(), ".mov");
        const Wrapper wrapper = OpenWrapper(file.Path());
        ASSERT_TRUE(wrapper);
        ncfUInt32 track = 0;
        ASSERT_EQ(wrapper->GetFirstVideoTrack(&track), 1);
        EXPECT_EQ(track, 3u);
    }
}

// The rate of a movie's first pictures, "0/1" where nothing tells it.
std::string RateOf(const movies::Movie& movie) {
    const MadeMovie file(movies::Build(movie).ToBytes(), ".mov");
    const Wrapper wrapper = OpenWrapper(file.Path());
    ncfSInt32 numerator = 0, denominator = 1;
    ncfUInt64 length = 0, track = 0;
    EXPECT_TRUE(wrapper);
    wrapper->DetermineMovieEditRateAndLength(0, 25, 60, &numerator, &denominator, &length, &track,
                                             1, 0);
    return std::to_string(numerator) + "/" + std::to_string(denominator);
}

movies::Movie OnePictureTrack(const std::vector<movies::SampleRun>& samples) {
    movies::Movie movie;
    movie.tracks = {movies::VideoTrack(movies::VideoFormat(), 30, 30, 1, 100)};
    if (!samples.empty()) {
        movie.tracks[0].samples = samples;
    }
    return movie;
}

// As with a header that is read: what samples last counts, give or take the mean
// of one.
TEST(TrackDescriptions, TellTheRateOfTheSamplesWhateverTheHeaderSays) {
    const std::vector<movies::SampleRun> even;
    const std::vector<movies::SampleRun> uneven = {{10, 100, 20}, {4, 100, 50}, {1, 100, 200}};
    const struct {
        const std::vector<movies::SampleRun>& samples;
        std::uint32_t timeScale;
        std::uint64_t told;  // 0 and all bits: unknown
        const char* rate;
    } kMovies[] = {
        {even, 30, 30, "30/1"},      {even, 30, 10, "30/1"},         {even, 30, 28, "30/1"},
        {even, 30, 300, "30/1"},     {even, 30, 31, "29/1"},         {even, 30, 29, "31/1"},
        {even, 30, 0, "30/1"},       {even, 30, 0xFFFFFFFF, "30/1"}, {uneven, 1200, 600, "30/1"},
        {uneven, 1200, 641, "30/1"}, {uneven, 1200, 640, "28/1"},    {uneven, 1200, 559, "30/1"},
        {uneven, 1200, 560, "32/1"},
    };
    for (const unsigned version : {0u, 1u}) {
        for (const auto& each : kMovies) {
            movies::Movie movie = OnePictureTrack(each.samples);
            movie.tracks[0].headerVersion = version;
            movie.tracks[0].mediaTimeScale = each.timeScale;
            movie.tracks[0].mediaDuration = each.told;
            EXPECT_EQ(RateOf(movie), each.rate) << each.told << " of " << each.timeScale;
        }
    }
}

// The table that tells how long samples last counts them as well.
TEST(TrackDescriptions, TellTheRateOfATableOfFewerOrMoreSamples) {
    const auto with = [](const movies::Box& table) {
        movies::Movie movie = OnePictureTrack({});
        movie.tracks[0].replaced = {table};
        return RateOf(movie);
    };
    const auto table = [] { return movies::Box("stts").Version(0); };
    EXPECT_EQ(with(table().U32(1).U32(20).U32(1)), "30/1");
    EXPECT_EQ(with(table().U32(1).U32(40).U32(1)), "30/1");
    EXPECT_EQ(with(table().U32(0)), "0/1");
    EXPECT_EQ(with(table().U32(1).U32(30).U32(0)), "30/1") << "as the header tells";
}

TEST(TrackDescriptions, TellVendorsOfAnyBytes) {
    const auto vendorOf = [](const std::string& vendor) {
        movies::Movie movie;
        movies::VideoFormat format;
        format.vendor = vendor;
        movie.tracks.push_back(movies::VideoTrack(format, 10, 25, 1, 100));
        ncfUInt32 value = 7;
        EXPECT_EQ(OpenWrapper(MadeMovie(movies::Build(movie).ToBytes(), ".mov").Path())
                      ->GetVendor(1, &value),
                  NCF_OK);
        return value;
    };
    EXPECT_EQ(vendorOf("appl"), Code("appl"));
    EXPECT_EQ(vendorOf(""), 0u);
    EXPECT_EQ(vendorOf(std::string("a\0\xFF"
                                   "d",
                                   4)),
              0x6100FF64u);
}

TEST(TrackDescriptions, GiveTimecodeOnlyWhereItCounts) {
    const auto answerFor = [](const movies::TimecodeFormat& format) {
        movies::Movie movie;
        movie.tracks = {movies::VideoTrack(movies::VideoFormat(), 10, 25, 1, 100),
                        movies::TimecodeTrack(format, 90000, 10)};
        const Wrapper wrapper =
            OpenWrapper(MadeMovie(movies::Build(movie).ToBytes(), ".mov").Path());
        EXPECT_EQ(wrapper->IsTimeCodeTrack(2), 1);
        ncfUInt8 at[4] = {7, 7, 7, 7};
        ncfUInt32 scale = 7, duration = 7, drop = 7, frames = 7;
        const NCFRESULT result = wrapper->GetTimeCodeInfoForTrack(
            2, at, at + 1, at + 2, at + 3, &scale, &duration, &drop, &frames);
        if (result < 0) {
            EXPECT_EQ(at[0] + at[1] + at[2] + at[3] + scale + duration + drop + frames, 7u * 8u);
        } else {
            EXPECT_EQ(at[0], 1);  // 90000 frames of 25
            EXPECT_EQ(at[1] + at[2] + at[3], 0);
            EXPECT_EQ(frames, 25u);
        }
        return result;
    };
    movies::TimecodeFormat format;
    format.timeScale = 25;
    format.frameDuration = 1;
    format.numFrames = 25;
    EXPECT_EQ(answerFor(format), NCF_OK);
    movies::TimecodeFormat none = format;
    none.numFrames = 0;
    EXPECT_EQ(answerFor(none), NCF_E_FAIL);
    none = format;
    none.frameDuration = 0;
    EXPECT_EQ(answerFor(none), NCF_E_FAIL);
    none = format;
    none.timeScale = 0;
    EXPECT_EQ(answerFor(none), NCF_E_FAIL);
}

// The container's size and not the codec's, whatever was asked before.
TEST(TrackDescriptions, KeepTheBoxOfTheMovie) {
    const MadeMovie made("-f lavfi -i testsrc2=s=64x48:r=25:d=0.4 -c:v mjpeg -movflags +faststart");
    Bytes content = made.Content();
    const std::string text(content.begin(), content.end());
    const std::size_t place = text.find("jpeg", text.find("stsd"));
    content[place + 4 + 24 + 1] = 60;
    content[place + 4 + 26 + 1] = 40;
    const MadeMovie bent(content, ".mov");
    const Wrapper wrapper = OpenWrapper(bent.Path());
    ASSERT_TRUE(wrapper);
    for (int i = 0; i < 2; ++i) {
        ncfUInt32 width = 0, height = 0;
        ASSERT_EQ(wrapper->GetMovieBox(&width, &height, nullptr, nullptr), NCF_OK);
        EXPECT_EQ(width, 60u);
        EXPECT_EQ(height, 40u);
        host::Ref<QTWrapper::IQTVideoReader> reader;
        ASSERT_EQ(wrapper->GetQTVideoReader(reader.Out()), NCF_OK);
        ASSERT_EQ(reader->SetOutputPixelFormat(Code("2vuy"), 0, 0), NCF_OK);
        EXPECT_EQ(reader->GetFrameBufferSize(0xFFFFFFFF, 0, 0), 60u * 40u * 2u);
        ncfBool a = 0, b = 0;  // reads on for the codec's own word
        ASSERT_EQ(wrapper->GetCodecColorSpaceInfo(&a, &b), NCF_OK);
    }
}

}  // namespace
