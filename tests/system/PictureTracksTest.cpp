// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// Of several picture tracks one is described, and it is that one which is mapped
// and delivered, whatever the others are called and whoever points at them.

#include <functional>

#include "reference_host/cliphost/SampleMap.h"
#include "tests/system/EssenceSupport.h"
#include "tests/system/Facts.h"
#include "tests/system/SystemTest.h"

namespace {

using cliphost::ClipTrack;
using cliphost::Essence;
using cliphost::FrameReader;
using cliphost::TrackKind;

struct Case {
    const char* name;
    std::function<void(movies::Movie&)> bend;
    std::size_t shown;  // its place among the tracks of the file
};

void PrintTo(const Case& row, std::ostream* out) {
    *out << row.name;
}

movies::Box ChaptersIn(std::uint32_t track) {
    return movies::Box("tref").Add(movies::Box("chap").U32(track));
}

movies::VideoFormat Picture(unsigned width, const char* codec = "raw ") {
    movies::VideoFormat format;
    format.codec = codec;
    format.width = width;
    format.height = 8;
    return format;
}

// A track of uncompressed pictures of one grey.
movies::Track Pictures(unsigned width, std::uint64_t count, std::uint8_t grey) {
    movies::Track track = movies::VideoTrack(Picture(width), count, 25, 1, width * 8 * 3);
    track.fill = grey;
    return track;
}

class PictureTracks : public SystemTest, public testing::WithParamInterface<Case> {
protected:
    static constexpr unsigned kWidths[] = {16, 24};
    static constexpr std::uint64_t kCounts[] = {6, 3};
    static constexpr std::uint8_t kGreys[] = {40, 200};
};

TEST_P(PictureTracks, AreDescribedMappedAndDeliveredAsOne) {
    movies::Movie movie;
    for (std::size_t i = 0; i < 2; ++i) {
        movie.tracks.push_back(Pictures(kWidths[i], kCounts[i], kGreys[i]));
    }
    movie.tracks.push_back(movies::SoundTrack(movies::SoundFormat(), 480));
    GetParam().bend(movie);
    const auto file = Write(movie);
    const std::size_t shown = GetParam().shown;

    EXPECT_EQ(RateAndLength(Describe(file)), "25/1 x " + std::to_string(kCounts[shown]));
    Essence essence(session(), file);
    const ClipTrack& track = essence.Track(std::nullopt, TrackKind::Picture);
    ncfUInt64 samples = 0;
    EXPECT_EQ(essence.map().GetNumberOfSamples(track.number, &samples), NCF_OK);
    EXPECT_EQ(samples, kCounts[shown]);
    FrameReader reader(essence, track, "bgra");
    EXPECT_EQ(reader.width(), static_cast<int>(kWidths[shown]));
    EXPECT_EQ(reader.Count(), kCounts[shown]);
    EXPECT_EQ(OneFrame(reader, 0).at(0), kGreys[shown]);
}

INSTANTIATE_TEST_SUITE_P(
    Movies, PictureTracks,
    testing::Values(
        Case{"TheFirst", [](movies::Movie&) {}, 0},
        Case{"TheFirstOfFallingNumbers",
             [](movies::Movie& movie) {
                 movie.tracks[0].id = 9;
                 movie.tracks[1].id = 5;
             },
             0},
        Case{"ChaptersOfTheSound",
             [](movies::Movie& movie) { movie.tracks[2].inTrack = {ChaptersIn(1)}; }, 0},
        Case{"ChaptersOfTheOther",
             [](movies::Movie& movie) { movie.tracks[1].inTrack = {ChaptersIn(1)}; }, 0},
        Case{"ChaptersOfItself",
             [](movies::Movie& movie) { movie.tracks[0].inTrack = {ChaptersIn(1)}; }, 0},
        Case{"BesideAPictureOfAnotherHandler",
             [](movies::Movie& movie) {
                 movie.tracks[0].handler = "pict";
                 movie.tracks[0].descriptions = {Picture(16, "jpeg").ToBox()};
             },
             1},
        Case{"BesideAPictureCalledText",
             [](movies::Movie& movie) {
                 movie.tracks[0].handler = "text";
                 movie.tracks[0].descriptions = {Picture(16, "jpeg").ToBox()};
             },
             1},
        // The header is read, but no clip is made of it.
        Case{"BesideOneWithoutSize",
             [](movies::Movie& movie) {
                 movie.tracks[0].id = 9;
                 movie.tracks[1].id = 5;
                 movie.tracks[0].descriptions = {Picture(0).ToBox()};
             },
             1}),
    [](const auto& test) { return std::string(test.param.name); });

// A chapter image beside sound is a picture track of one picture.
TEST_F(PictureTracks, OfOneChapterImageAreShown) {
    movies::Movie movie;
    movie.tracks = {Pictures(16, 1, 40), movies::SoundTrack(movies::SoundFormat(), 48000)};
    movie.tracks[0].samples[0].duration = 25;
    movie.tracks[1].inTrack = {ChaptersIn(1)};
    const auto picture = folder() / "a.png";
    const CommandResult ran =
        RunCliphost("frame " + Quoted(Write(movie)) + " -o " + Quoted(picture));
    EXPECT_EQ(ran.status, 0) << ran.out;
    EXPECT_TRUE(std::filesystem::exists(picture));
}

}  // namespace
