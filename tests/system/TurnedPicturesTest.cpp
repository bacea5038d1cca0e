// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// Pictures for people are the way up that the movie's display matrix says; what
// other programs get, and the user who asks for it, is as it is stored. What is
// expected comes from the picture before it was turned, and from FFmpeg.

#include "tests/system/EssenceSupport.h"
#include "tests/system/SystemTest.h"

namespace {

// A filter that stores the picture turned, and by how much, counter-clockwise,
// ffmpeg is told that it is to be turned for that.
struct Turn {
    const char* filter;
    const char* degrees;
};
constexpr Turn kTurns[] = {
    {"null", "0"}, {"transpose=1", "90"}, {"hflip,vflip", "180"}, {"transpose=2", "270"}};

// A movie whose headers are read, and one that takes the wrapper.
struct Container {
    const char* ending;
    const char* options;
};
constexpr Container kContainers[] = {{".mov", ""}, {".mp4", "-movflags frag_keyframe+empty_moov"}};

class TurnedPictures : public SystemTest {
protected:
    // Six pictures without loss, 48 x 32, turned by the filter.
    std::filesystem::path Film(const std::string& name, const std::string& filter,
                               const std::string& more = "") {
        return Make("-f lavfi -i testsrc2=s=48x32:r=25:d=0.24,format=rgb24 -vf '" + filter +
                        "' -c:v png -pix_fmt rgb24 " + more,
                    name);
    }
    // The same with a display matrix, which only a copied track takes.
    std::filesystem::path MakeTurned(const Turn& turn, const Container& container) {
        const auto stored = Film("stored.mov", turn.filter);
        return Make("-i " + Quoted(stored) + " -c copy -metadata:s:v rotate=" + turn.degrees + " " +
                        container.options,
                    std::string("turned") + container.ending);
    }
    // A picture file as R'G'B'.
    EssenceBytes Pixels(const std::filesystem::path& file) {
        return Decoded(file, "-frames:v 1 -f rawvideo -pix_fmt rgb24");
    }
    // What a verb writes.
    EssenceBytes Written(const std::string& verb, const std::filesystem::path& movie,
                         const std::string& ending = ".png") {
        const auto file = folder() / ("written" + ending);
        const CommandResult ran = RunCliphost(verb + " " + Quoted(movie) + " -o " + Quoted(file));
        EXPECT_EQ(ran.status, 0) << ran.out;
        said_ = ran.out;
        return ending == ".png" ? Pixels(file) : ReadFile(file);
    }

    std::string said_;  // by the verb that ran last
};

TEST_F(TurnedPictures, OfFramesAreTheRightWayUp) {
    const EssenceBytes upright = Pixels(Film("upright.mov", "null"));
    for (const Container& container : kContainers) {
        for (const Turn& turn : kTurns) {
            SCOPED_TRACE(std::string(turn.degrees) + container.ending);
            const auto movie = MakeTurned(turn, container);
            const EssenceBytes picture = Written("frame", movie);
            EXPECT_EQ(picture, upright);
            EXPECT_EQ(picture, Pixels(movie)) << "FFmpeg turns it as well";
            EXPECT_NE(said_.find("48 x 32"), std::string::npos) << said_;
        }
    }
}

TEST_F(TurnedPictures, StayAsTheyAreStoredForWhoAsksAndForPrograms) {
    for (const Container& container : kContainers) {
        for (const Turn& turn : kTurns) {
            SCOPED_TRACE(std::string(turn.degrees) + container.ending);
            const auto movie = MakeTurned(turn, container);
            EXPECT_EQ(Written("frame --as-stored", movie), Pixels(folder() / "stored.mov"));
            const EssenceBytes raw = Written("frame --format bgra", movie, ".raw");
            EXPECT_EQ(raw,
                      Decoded(folder() / "stored.mov", "-frames:v 1 -f rawvideo -pix_fmt bgra"));
            EXPECT_EQ(Written("frame --format bgra --as-stored", movie, ".raw"), raw);
        }
    }
}

TEST_F(TurnedPictures, OfAFolderAreTurnedEach) {
    const auto movie = MakeTurned(kTurns[1], kContainers[0]);
    const auto pictures = folder() / "pictures";
    ASSERT_EQ(RunCliphost("frame --range 0: " + Quoted(movie) + " -o " + Quoted(pictures)).status,
              0);
    const EssenceBytes all = Decoded(folder() / "turned.mov", "-f rawvideo -pix_fmt rgb24");
    ASSERT_EQ(all.size(), 6u * 48u * 32u * 3u);
    for (std::size_t i = 0; i < 6; ++i) {
        const auto first = all.begin() + static_cast<std::ptrdiff_t>(i * 48 * 32 * 3);
        EXPECT_EQ(Pixels(pictures / ("turned_00000" + std::to_string(i) + ".png")),
                  EssenceBytes(first, first + 48 * 32 * 3));
    }
}

TEST_F(TurnedPictures, OfASheetHaveCellsOfTheirShape) {
    const std::string verb = "contact --frames 4 --columns 2 --width 64";
    const auto uprightMovie = Film("upright.mov", "null");
    const EssenceBytes upright = Written(verb, uprightMovie);
    ASSERT_EQ(upright.size(), (2u * 72u + 8u) * (2u * 51u + 8u) * 3u);
    for (const Container& container : kContainers) {
        for (const Turn& turn : kTurns) {
            SCOPED_TRACE(std::string(turn.degrees) + container.ending);
            const auto movie = MakeTurned(turn, container);
            EXPECT_EQ(Written(verb, movie), upright);
            EXPECT_EQ(Written(verb + " --as-stored", movie),
                      Written(verb, folder() / "stored.mov"));
        }
    }
}

constexpr std::size_t kWidth = 16;
constexpr std::size_t kHeight = 8;

std::uint8_t Grey(std::size_t x, std::size_t y) {
    return static_cast<std::uint8_t>(10 * x + 5 * y);
}

// Two uncompressed pictures whose greys tell where they are; with an alpha of
// those greys where they have 32 bits.
movies::Track Greys(const movies::Matrix& matrix, unsigned depth = 24,
                    std::optional<std::pair<std::uint32_t, std::uint32_t>> pixelAspect = {}) {
    movies::VideoFormat format;
    format.codec = "raw ";
    format.width = kWidth;
    format.height = kHeight;
    format.depth = depth;
    format.pixelAspect = pixelAspect;
    movies::Track track = movies::VideoTrack(format, 2, 25, 1, kWidth * kHeight * depth / 8);
    for (std::size_t i = 0; i < 2 * kWidth * kHeight; ++i) {
        track.data.insert(track.data.end(), depth / 8, Grey(i % kWidth, i / kWidth % kHeight));
    }
    track.matrix = matrix;
    return track;
}

// Mirrors, which FFmpeg writes nowhere; and what is no quarter turn.
TEST_F(TurnedPictures, FollowEachDisplayMatrix) {
    const struct {
        movies::Matrix matrix;
        std::size_t width;
        std::uint8_t corners[2];  // left and right of the first line
    } kCases[] = {
        {movies::kIdentity, 16, {Grey(0, 0), Grey(15, 0)}},
        {movies::kRotated90, 8, {Grey(0, 7), Grey(0, 0)}},
        {movies::kRotated180, 16, {Grey(15, 7), Grey(0, 7)}},
        {movies::kRotated270, 8, {Grey(15, 0), Grey(15, 7)}},
        {{-1, 0, 0, 0, 1, 0, 16, 0, 1}, 16, {Grey(15, 0), Grey(0, 0)}},
        {{1, 0, 0, 0, -1, 0, 0, 8, 1}, 16, {Grey(0, 7), Grey(15, 7)}},
        {{0, 1, 0, 1, 0, 0, 0, 0, 1}, 8, {Grey(0, 0), Grey(0, 7)}},
        {{0, -1, 0, -1, 0, 0, 8, 16, 1}, 8, {Grey(15, 7), Grey(15, 0)}},
        {{0, 2, 0, -2, 0, 0, 0, 0, 1}, 8, {Grey(0, 7), Grey(0, 0)}},  // shown larger
        {{0.7, 0.7, 0, -0.7, 0.7, 0, 0, 0, 1}, 16, {Grey(0, 0), Grey(15, 0)}},
    };
    for (const auto& one : kCases) {
        SCOPED_TRACE(testing::PrintToString(one.matrix));
        movies::Movie movie;
        movie.tracks = {Greys(one.matrix)};
        const EssenceBytes picture = Written("frame", Write(movie));
        ASSERT_EQ(picture.size(), 16u * 8u * 3u);
        EXPECT_EQ(picture[0], one.corners[0]);
        EXPECT_EQ(picture[(one.width - 1) * 3], one.corners[1]);
        const std::string size =
            std::to_string(one.width) + " x " + std::to_string(128 / one.width);
        EXPECT_NE(said_.find(size), std::string::npos) << said_;
    }
}

// Points go through the track's matrix first.
TEST_F(TurnedPictures, FollowTheMatrixOfTheMovieBehindThatOfTheTrack) {
    constexpr movies::Matrix kMirrored = {-1, 0, 0, 0, 1, 0, 16, 0, 1};
    const struct {
        movies::Matrix track;
        movies::Matrix movie;
        std::size_t width;
        std::uint8_t corners[2];
    } kCases[] = {
        {movies::kIdentity, movies::kRotated90, 8, {Grey(0, 7), Grey(0, 0)}},
        {movies::kRotated90, movies::kRotated90, 16, {Grey(15, 7), Grey(0, 7)}},
        {movies::kRotated90, movies::kRotated270, 16, {Grey(0, 0), Grey(15, 0)}},
        {kMirrored, movies::kRotated90, 8, {Grey(15, 7), Grey(15, 0)}},
        {movies::kRotated90, kMirrored, 8, {Grey(0, 0), Grey(0, 7)}},
    };
    for (const auto& one : kCases) {
        SCOPED_TRACE(testing::PrintToString(one.movie));
        movies::Movie movie;
        movie.matrix = one.movie;
        movie.tracks = {Greys(one.track)};
        const EssenceBytes picture = Written("frame", Write(movie));
        ASSERT_EQ(picture.size(), kWidth * kHeight * 3);
        EXPECT_EQ(picture[0], one.corners[0]);
        EXPECT_EQ(picture[(one.width - 1) * 3], one.corners[1]);
    }
}

// Neither the sound in front nor the second picture is asked.
TEST_F(TurnedPictures, FollowTheTrackThatIsShown) {
    movies::Movie movie;
    movie.tracks = {movies::SoundTrack(movies::SoundFormat(), 480), Greys(movies::kRotated90),
                    Greys(movies::kRotated180)};
    const EssenceBytes picture = Written("frame", Write(movie));
    ASSERT_EQ(picture.size(), kWidth * kHeight * 3);
    EXPECT_EQ(picture[0], Grey(0, 7));
    EXPECT_EQ(picture[7 * 3], Grey(0, 0));
}

TEST_F(TurnedPictures, TurnTheirAlphaWithThem) {
    movies::Movie movie;
    movie.tracks = {Greys(movies::kRotated90, 32)};
    const auto file = folder() / "alpha.png";
    ASSERT_EQ(
        RunCliphost("frame --with-alpha " + Quoted(Write(movie)) + " -o " + Quoted(file)).status,
        0);
    const EssenceBytes alpha =
        Decoded(file, "-frames:v 1 -vf alphaextract -f rawvideo -pix_fmt gray");
    ASSERT_EQ(alpha.size(), kWidth * kHeight);
    for (std::size_t y = 0; y < kWidth; ++y) {
        for (std::size_t x = 0; x < kHeight; ++x) {
            EXPECT_EQ(alpha[y * kHeight + x], Grey(y, kHeight - 1 - x)) << x << " " << y;
        }
    }
}

// Pixels twice as wide as high make a shape of four to one.
TEST_F(TurnedPictures, OfASheetKeepTheShapeOfTheirPixels) {
    const struct {
        movies::Matrix matrix;
        std::size_t cellHeight;
    } kCases[] = {{movies::kIdentity, 16}, {movies::kRotated180, 16}, {movies::kRotated90, 256}};
    for (const auto& one : kCases) {
        movies::Movie movie;
        movie.tracks = {Greys(one.matrix, 24, std::pair<std::uint32_t, std::uint32_t>(2, 1))};
        const EssenceBytes sheet =
            Written("contact --frames 2 --columns 2 --width 64", Write(movie));
        EXPECT_EQ(sheet.size(), (2u * 72u + 8u) * (one.cellHeight + 16u) * 3u) << one.cellHeight;
    }
}

TEST_F(TurnedPictures, AreToldOfInTheHelp) {
    for (const char* const verb : {"frame", "contact"}) {
        const CommandResult help = RunCliphost(std::string(verb) + " --help");
        EXPECT_EQ(help.status, 0);
        EXPECT_NE(help.out.find("--as-stored"), std::string::npos) << verb;
        EXPECT_NE(help.out.find("display matrix"), std::string::npos) << verb;
    }
}

}  // namespace
