// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// Headers, edits and tables that tell different lengths: what is described is what
// is delivered.

#include <functional>

#include "reference_host/cliphost/SoundReader.h"
#include "tests/system/EssenceSupport.h"
#include "tests/system/Facts.h"
#include "tests/system/SystemTest.h"

namespace {

using cliphost::Essence;
using cliphost::FrameReader;
using cliphost::TrackKind;

class Lengths : public SystemTest {
protected:
    // Thirty pictures in a second, and movie units of a millisecond.
    static movies::Movie Pictures() {
        movies::VideoFormat format;
        format.codec = "raw ";
        format.width = format.height = 8;
        movies::Movie movie;
        movie.timeScale = 1000;
        movie.tracks = {movies::VideoTrack(format, 30, 30, 1, 192)};
        return movie;
    }
};

TEST_F(Lengths, OfPicturesAreThoseDelivered) {
    const struct {
        const char* name;
        std::function<void(movies::Track&)> bend;
        std::uint64_t frames;
    } kMovies[] = {
        {"true", [](movies::Track&) {}, 30},
        {"headers too long",
         [](movies::Track& track) {
             track.mediaDuration = 100;
             track.trackDuration = 3333;
         },
         30},
        {"an edit too long",
         [](movies::Track& track) {
             track.mediaDuration = 100;
             track.trackDuration = 3333;
             track.edits = {{3333, 0, 1.0}};
         },
         30},
        {"an edit as long as can be",
         [](movies::Track& track) {
             track.edits = {{0xFFFFFFFF, 0, 1.0}};
         },
         30},
        {"an edit that begins later and ends behind",
         [](movies::Track& track) {
             track.edits = {{1000, 10, 1.0}};
         },
         20},
        {"edits that show pictures twice",
         [](movies::Track& track) {
             track.edits = {{500, 0, 1.0}, {500, 0, 1.0}, {500, 0, 1.0}};
         },
         45},
    };
    for (const auto& each : kMovies) {
        SCOPED_TRACE(each.name);
        movies::Movie movie = Pictures();
        each.bend(movie.tracks[0]);
        const auto file = Write(movie);
        EXPECT_EQ(RateAndLength(Describe(file)), "30/1 x " + std::to_string(each.frames));
        Essence essence(session(), file);
        FrameReader reader(essence, essence.Track(std::nullopt, TrackKind::Picture), "bgra");
        EXPECT_EQ(reader.Count(), each.frames);
        EXPECT_EQ(reader.Read(each.frames - 1), NCF_OK);
        EXPECT_EQ(reader.Read(each.frames), NMA_E_NODATA);
    }
}

// The last of the pictures that are shown twice, and the first that is not there.
TEST_F(Lengths, OfPicturesShownTwiceEndTheFrames) {
    movies::Movie movie = Pictures();
    movie.tracks[0].edits = {{500, 0, 1.0}, {500, 0, 1.0}, {500, 0, 1.0}};
    const std::string call = "frame " + Quoted(Write(movie)) + " -o " + Quoted(folder() / "a.png");
    EXPECT_EQ(RunCliphost(call + " --frame 44").status, 0);
    const CommandResult past = RunCliphost(call + " --frame 45");
    EXPECT_EQ(past.status, 2) << past.out;
    EXPECT_NE(past.out.find("there is no frame 45"), std::string::npos) << past.out;
}

// A gap in front is time of the clip that no picture of the reader fills.
TEST_F(Lengths, OfAGapAreNoFrames) {
    movies::Movie movie = Pictures();
    movie.tracks[0].edits = {{500, -1, 1.0}, {1000, 0, 1.0}};
    Essence essence(session(), Write(movie));
    FrameReader reader(essence, essence.Track(std::nullopt, TrackKind::Picture), "bgra");
    EXPECT_EQ(reader.Count(), 30u);
}

TEST_F(Lengths, OfTracksThatShowNothingAreNoFramesAndNoSheet) {
    movies::Movie movie = Pictures();
    for (const movies::Edit& edit : {movies::Edit{1000, -1, 1.0}, movies::Edit{1000, 40, 1.0}}) {
        movie.tracks[0].edits = {edit};
        const auto file = Write(movie);
        for (const char* const verb : {"frame", "frame --range 0:", "contact"}) {
            const CommandResult ran = RunCliphost(std::string(verb) + " " + Quoted(file) + " -o " +
                                                  Quoted(folder() / "a.png"));
            EXPECT_EQ(ran.status, 1) << verb;
            EXPECT_NE(ran.out.find("its edits show none of its 30 samples"), std::string::npos)
                << ran.out;
            EXPECT_FALSE(std::filesystem::exists(folder() / "a.png"));
        }
    }
}

// Hosts go on reading plain sound by themselves, and no further than it goes.
TEST_F(Lengths, OfPlainSoundAreThoseOfItsSamples) {
    movies::Movie movie;
    movie.timeScale = 1000;
    movie.tracks = {movies::SoundTrack(movies::SoundFormat(), 48000)};
    movie.tracks[0].fill = 1;
    for (const bool isEdited : {false, true}) {
        movie.tracks[0].mediaDuration = 60000;
        movie.tracks[0].trackDuration = 1250;
        if (isEdited) {
            movie.tracks[0].edits = {{1250, 0, 1.0}};
        }
        const auto file = Write(movie);
        const cliphost::TreeNode tree = Describe(file);
        EXPECT_EQ(RateAndLength(tree), "25/1 x 25");
        EXPECT_EQ(SoundLine(tree),
                  "little-endian 2 x 48000/1 Hz 16 bit, 48000 samples, 1536000 a second, block 4");
        const auto wave = folder() / "a.wav";
        EXPECT_EQ(RunCliphost("audio " + Quoted(file) + " -o " + Quoted(wave)).status, 0);
        EXPECT_EQ(Decoded(wave, "-f s16le").size(), 48000u * 2 * 2);
    }
}

// A clip that is made of the header, and one that only the wrapper reads: the
// picture's description lacks a size there.
TEST_F(Lengths, HaveOneRateOnBothRoutes) {
    const auto jpeg = Make("-f lavfi -i testsrc2=s=64x48 -frames:v 1", "a.jpg");
    const struct {
        std::vector<movies::SampleRun> samples;
        std::uint64_t told;
    } kMovies[] = {{{{30, 192, 1}}, 31},
                   {{{29, 192, 1}, {1, 192, 200}}, 100},
                   {{{29, 192, 1}, {1, 192, 200}}, 30},
                   {{{1, 192, 100}, {29, 192, 1}}, 30},
                   {{{30, 192, 1}}, 300}};
    for (const auto& each : kMovies) {
        SCOPED_TRACE(each.told);
        std::string rates[2];
        for (const bool isSecond : {false, true}) {
            movies::VideoFormat format;
            format.width = isSecond ? 0 : 64;
            format.height = 48;
            format.codec = "jpeg";
            movies::Movie movie;
            movie.tracks = {movies::VideoTrack(format, 30, 30, 1, 192)};
            movie.tracks[0].samples = each.samples;
            movie.tracks[0].mediaDuration = each.told;
            movie.tracks[0].data = ReadFile(jpeg);
            movie.tracks[0].samples[0].size =
                static_cast<std::uint32_t>(movie.tracks[0].data.size());
            rates[isSecond] = RateAndLength(Describe(Write(movie)));
        }
        EXPECT_EQ(rates[0].substr(0, rates[0].find(' ')), rates[1].substr(0, rates[1].find(' ')));
    }
}

}  // namespace
