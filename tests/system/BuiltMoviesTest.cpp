// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// Movies that FFmpeg can't make: their headers come from the tests' movie
// builder, and what is expected stands beside what is built.

#include "tests/system/Facts.h"
#include "tests/system/SystemTest.h"

namespace {

class BuiltMovies : public SystemTest {
protected:
    // Ten seconds of 25 frames, with sound of 48 kHz.
    static movies::Movie Plain() {
        movies::Movie movie;
        movie.tracks.push_back(movies::VideoTrack(movies::VideoFormat(), 250, 25, 1, 64));
        movie.tracks.push_back(movies::SoundTrack(movies::SoundFormat(), 480000));
        return movie;
    }
    static movies::VideoFormat ProRes() {
        movies::VideoFormat format;
        format.codec = "apcn";
        format.fields = {1u, 0u};
        return format;
    }
};

constexpr const char* kNativePicture =
    "native {04010202-0306-0300-060E-2B340401010D} stored 1920x1080 shows 1920x1080 FullFrame 16/9";

TEST_F(BuiltMovies, WithACompressedHeaderAreDescribedAsWithAPlainOne) {
    const cliphost::TreeNode plain = Describe(Write(Plain(), "a.mov"));
    movies::Movie movie = Plain();
    movie.compressed = true;
    const cliphost::TreeNode compressed = Describe(Write(movie, "b.mov"));
    EXPECT_EQ(PictureLine(compressed), PictureLine(plain));
    EXPECT_EQ(SoundLine(compressed), SoundLine(plain));
    EXPECT_EQ(SlotList(compressed, kSourceMob), "1 TC1, 2 AuxTC1, 3 picture, 4 sound, 5 sound");
    EXPECT_EQ(RateAndLength(compressed), "25/1 x 250");
}

TEST_F(BuiltMovies, InEveryLayoutAreDescribedAlike) {
    std::vector<movies::Movie> layouts(8, Plain());
    layouts[1].header = movies::Place::kBeforeMedia;
    layouts[2].brand = "";
    layouts[3].largeMedia = true;
    layouts[4].largeHeader = true;
    layouts[5].headerToEnd = true;
    layouts[6].header = movies::Place::kBeforeMedia;
    layouts[6].mediaToEnd = true;
    layouts[7].headerVersion = 1;
    layouts[7].tracks[0].headerVersion = 1;
    for (std::size_t i = 0; i < layouts.size(); ++i) {
        SCOPED_TRACE(i);
        const cliphost::TreeNode tree = Describe(layouts[i]);
        EXPECT_EQ(RateAndLength(tree), "25/1 x 250");
        EXPECT_EQ(PictureLine(tree),
                  "provider H.264 stored 1920x1080 shows 1920x1080 FullFrame 16/9");
        EXPECT_EQ(SlotList(tree, kMasterMob), "3 picture, 4 sound, 5 sound");
    }
}

TEST_F(BuiltMovies, OfFiveGigabytesAreDescribed) {
    movies::Movie movie = Plain();
    movie.filler = 5ull << 30;
    movie.largeMedia = true;
    for (movies::Track& track : movie.tracks) {
        track.largeOffsets = true;
    }
    EXPECT_EQ(RateAndLength(Describe(movie)), "25/1 x 250");
}

// A native picture is one that the host reads from the movie's own bytes.
TEST_F(BuiltMovies, WithMediaInAnotherFileTakeTheProvider) {
    movies::Movie movie;
    movie.tracks.push_back(movies::VideoTrack(ProRes(), 50, 25, 1, 64));
    EXPECT_EQ(PictureLine(Describe(movie)), kNativePicture);
    movie.tracks[0].dataReferences[0].selfContained = false;
    movie.tracks[0].dataReferences[0].text = "file:///elsewhere/media.mov";
    EXPECT_EQ(PictureLine(Describe(movie)).substr(0, 8), "provider");
}

TEST_F(BuiltMovies, WithSeveralEditsTakeTheLengthOfTheTrack) {
    movies::Movie movie = Plain();
    // 2 seconds from the start and 3 from the middle, at 600 units a second.
    for (movies::Track& track : movie.tracks) {
        const auto scale = static_cast<std::int64_t>(track.mediaTimeScale);
        track.edits = {{1200, 0, 1.0}, {1800, 5 * scale, 1.0}};
    }
    const cliphost::TreeNode tree = Describe(movie);
    EXPECT_EQ(RateAndLength(tree), "25/1 x 125");
    // Sound that is not played through is decoded by the provider.
    EXPECT_EQ(SoundLine(tree).substr(0, 8), "provider");
}

TEST_F(BuiltMovies, WithAnEmptyEditInFrontAreDescribed) {
    movies::Movie movie = Plain();
    movie.tracks[0].edits = {{600, -1, 1.0}, {6000, 0, 1.0}};
    EXPECT_EQ(RateAndLength(Describe(movie)), "25/1 x 275");
}

TEST_F(BuiltMovies, WithSeveralDescriptionsTakeTheFirst) {
    movies::Movie movie;
    movies::Track track = movies::VideoTrack(ProRes(), 50, 25, 1, 64);
    movies::VideoFormat second = ProRes();
    second.codec = "apch";
    second.width = 1280;
    second.height = 720;
    track.descriptions.push_back(second.ToBox());
    track.samples[0].count = 40;
    track.samples.push_back(track.samples[0]);
    track.samples[1].count = 10;
    track.samples[1].description = 2;
    movie.tracks.push_back(track);
    const std::string line = PictureLine(Describe(movie));
    EXPECT_NE(line.find("stored 1920x1080"), std::string::npos) << line;
}

TEST_F(BuiltMovies, WithTwoPictureTracksShowTheFirst) {
    movies::Movie movie = Plain();
    movies::VideoFormat second;
    second.width = 640;
    second.height = 360;
    movie.tracks.push_back(movies::VideoTrack(second, 250, 25, 1, 64));
    const cliphost::TreeNode tree = Describe(movie);
    EXPECT_EQ(Pictures(tree).size(), 1u);
    EXPECT_EQ(PictureLine(tree), "provider H.264 stored 1920x1080 shows 1920x1080 FullFrame 16/9");
    EXPECT_EQ(SlotList(tree, kMasterMob), "3 picture, 4 sound, 5 sound");
}

struct Clock {
    std::uint32_t timeScale;
    std::uint32_t frameDuration;
    unsigned numFrames;
    unsigned flags;
    std::int64_t start;
    const char* timecode;
    const char* rateAndLength;
};

// Start frames are of the timecode track; the clip enters at the same frame
// where both count alike.
constexpr Clock kClocks[] = {
    {24, 1, 24, 0, 86400, "24 fps, clip enters at 86400", "24/1 x 120"},
    {24000, 1001, 24, 0, 86400, "24 fps, clip enters at 86400", "24000/1001 x 120"},
    {25, 1, 25, 0, 90000, "25 fps, clip enters at 90000", "25/1 x 120"},
    {30000, 1001, 30, 0, 108000, "30 fps, clip enters at 108000", "30000/1001 x 120"},
    {30000, 1001, 30, movies::kTimecodeDrop, 107892, "30 fps drop, clip enters at 107892",
     "30000/1001 x 120"},
    {30, 1, 30, 0, 108000, "30 fps, clip enters at 108000", "30/1 x 120"},
    {50, 1, 50, 0, 180000, "50 fps, clip enters at 180000", "50/1 x 120"},
    {60000, 1001, 60, 0, 216000, "60 fps, clip enters at 216000", "60000/1001 x 120"},
    {60000, 1001, 60, movies::kTimecodeDrop, 215784, "60 fps drop, clip enters at 215784",
     "60000/1001 x 120"},
    {60, 1, 60, 0, 216000, "60 fps, clip enters at 216000", "60/1 x 120"},
};

TEST_F(BuiltMovies, WithATimecodeTrackOfAnyRateEnterAtItsStart) {
    for (const Clock& clock : kClocks) {
        for (const bool wideReserve : {false, true}) {
            SCOPED_TRACE(clock.timecode);
            movies::TimecodeFormat format;
            format.timeScale = clock.timeScale;
            format.frameDuration = clock.frameDuration;
            format.numFrames = clock.numFrames;
            format.flags = clock.flags | movies::kTimecode24Hours;
            format.wideReserve = wideReserve;
            movies::Movie movie;
            movie.timeScale = clock.timeScale;
            movie.tracks.push_back(movies::VideoTrack(movies::VideoFormat(), 120, clock.timeScale,
                                                      clock.frameDuration, 64));
            movie.tracks.push_back(movies::TimecodeTrack(format, clock.start, 120));
            const cliphost::TreeNode tree = Describe(movie);
            EXPECT_EQ(TimecodeLine(tree), clock.timecode);
            EXPECT_EQ(RateAndLength(tree), clock.rateAndLength);
            EXPECT_EQ(SlotList(tree, kSourceMob), "1 TC1, 2 picture");
        }
    }
}

TEST_F(BuiltMovies, WithATimecodeOfAnotherRateEnterAtTheSameTime) {
    movies::TimecodeFormat format;
    format.timeScale = 30;
    format.numFrames = 30;
    movies::Movie movie;
    movie.tracks.push_back(movies::VideoTrack(movies::VideoFormat(), 100, 25, 1, 64));
    movie.tracks.push_back(movies::TimecodeTrack(format, 108000, 120));
    // An hour of 30 is an hour of 25.
    EXPECT_EQ(TimecodeLine(Describe(movie)), "25 fps, clip enters at 90000");
}

TEST_F(BuiltMovies, WithSeveralTimecodeTracksHaveASlotForEach) {
    movies::Movie movie;
    movie.tracks.push_back(movies::VideoTrack(movies::VideoFormat(), 100, 25, 1, 64));
    for (const std::int64_t start : {90000, 180000}) {
        movie.tracks.push_back(movies::TimecodeTrack(movies::TimecodeFormat(), start, 100));
    }
    const cliphost::TreeNode tree = Describe(movie);
    EXPECT_EQ(SlotList(tree, kSourceMob), "1 TC1, 2 AuxTC1, 3 picture");
    EXPECT_EQ(TimecodeLine(tree).substr(0, 7), "25 fps,");
    const auto& second = Parts(Mob(tree, kSourceMob), "Slots").at(1);
    const auto& parts = Parts(Parts(second, "Segment").at(0), "Components");
    ASSERT_EQ(parts.size(), 3u);
    EXPECT_EQ(parts[0].title, "Filler");
    EXPECT_EQ(Fact(parts[0], "Length"), "0");
    EXPECT_EQ(Fact(parts[1], "Length"), "2160000");
    EXPECT_EQ(Fact(parts[2], "Length"), "0");
}

TEST_F(BuiltMovies, WithBoundsOfTheirOwnShowThem) {
    movies::VideoFormat format;
    format.rasterText =
        "<Raster><Bounds>"
        "<Framing><PositionX><Numerator>-1</Numerator><Denominator>2</Denominator></PositionX>"
        "<PositionY><Numerator>-3</Numerator><Denominator>4</Denominator></PositionY>"
        "<Height><Numerator>5</Numerator><Denominator>6</Denominator></Height>"
        "<Width><Numerator>7</Numerator><Denominator>8</Denominator></Width></Framing>"
        "</Bounds>";
    movies::Movie movie;
    movie.tracks.push_back(movies::VideoTrack(format, 100, 25, 1, 64));
    const auto pictures = Pictures(Describe(movie));
    ASSERT_EQ(pictures.size(), 1u);
    EXPECT_EQ(Fact(pictures[0], "BoundsBox"),
              "PositionX -1/2, PositionY -3/4, Width 7/8, Height 5/6");
}

TEST_F(BuiltMovies, WithBrokenBoundsHaveTheDefault) {
    movies::VideoFormat format;
    format.rasterText = "<Bounds><Framing><PositionX>";
    movies::Movie movie;
    movie.tracks.push_back(movies::VideoTrack(format, 100, 25, 1, 64));
    EXPECT_EQ(BoxesLine(Describe(movie)), "-800/1 -450/1 1600/1 900/1");
}

TEST_F(BuiltMovies, WithAResolutionAtomAreNativeByIt) {
    movies::VideoFormat format = ProRes();
    format.width = 2048;
    format.height = 1080;
    movies::Movie movie;
    movie.tracks.push_back(movies::VideoTrack(format, 100, 25, 1, 64));
    EXPECT_EQ(PictureLine(Describe(movie)).substr(0, 8), "provider");
    format.resolutionId = 10950;
    movie.tracks[0] = movies::VideoTrack(format, 100, 25, 1, 64);
    const std::string line = PictureLine(Describe(movie));
    EXPECT_EQ(line.substr(0, 46), "native {04010202-0306-0300-060E-2B340401010D} ") << line;
    EXPECT_NE(line.find("stored 2048x1080"), std::string::npos) << line;
}

TEST_F(BuiltMovies, OfAnUnknownCodecSayUnknownCompression) {
    movies::VideoFormat format;
    format.codec = "qqq7";
    movies::Movie movie;
    movie.tracks.push_back(movies::VideoTrack(format, 100, 25, 1, 64));
    const cliphost::TreeNode tree = Describe(movie);
    EXPECT_EQ(Pictures(tree).size(), 1u);
    EXPECT_EQ(Column(tree, "Video").size(), 1u);
}

TEST_F(BuiltMovies, TakeTheMoviesColourIntoTheDescriptor) {
    const auto described = [this](unsigned primaries, unsigned transfer, unsigned matrix) {
        movies::VideoFormat format = ProRes();
        format.nclc = {primaries, transfer, matrix};
        movies::Movie movie;
        movie.tracks.push_back(movies::VideoTrack(format, 100, 25, 1, 64));
        return Pictures(Describe(movie)).at(0);
    };
    // Names of the built-in definitions; what no label stands for is left out.
    const cliphost::TreeNode rec709 = described(1, 1, 1);
    EXPECT_EQ(Fact(rec709, "ColorPrimaries").substr(0, 22), "ColorPrimaries_ITU709 ");
    EXPECT_EQ(Fact(rec709, "TransferCharacteristic").substr(0, 30),
              "TransferCharacteristic_ITU709 ");
    EXPECT_EQ(Fact(rec709, "CodingEquations"), "-");
    EXPECT_NE(Fact(described(6, 1, 6), "ColorPrimaries"), Fact(rec709, "ColorPrimaries"));
}

struct PcmForm {
    const char* codec;
    unsigned version;
    unsigned bits;
    bool wave;
    bool little;
    const char* sound;
};

constexpr PcmForm kPcm[] = {
    {"sowt", 0, 16, false, true, "little-endian 2 x 48000/1 Hz 16 bit, 48000 samples"},
    {"twos", 0, 16, false, false, "big-endian 2 x 48000/1 Hz 16 bit, 48000 samples"},
    {"in24", 1, 24, true, true, "little-endian 2 x 48000/1 Hz 24 bit, 48000 samples"},
    {"in24", 1, 24, true, false, "big-endian 2 x 48000/1 Hz 24 bit, 48000 samples"},
    {"lpcm", 2, 24, false, true, "little-endian 2 x 48000/1 Hz 24 bit, 48000 samples"},
    {"lpcm", 2, 16, false, true, "little-endian 2 x 48000/1 Hz 16 bit, 48000 samples"},
};

TEST_F(BuiltMovies, WithPcmInEveryFormOfDescription) {
    for (const PcmForm& form : kPcm) {
        SCOPED_TRACE(form.sound);
        movies::SoundFormat format;
        format.codec = form.codec;
        format.version = form.version;
        format.bits = form.bits;
        format.bytesPerSample = form.bits / 8;
        format.wave = form.wave;
        if (form.wave) {
            format.littleEndian = form.little;
        }
        movies::Movie movie;
        movie.tracks.push_back(movies::SoundTrack(format, 48000));
        const std::string line = SoundLine(Describe(movie));
        EXPECT_EQ(line.substr(0, std::string(form.sound).size()), form.sound) << line;
    }
}

}  // namespace
