// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// Pictures of palette numbers. Containers give a palette once, or where it
// changes; every frame must have its own wherever reading begins.
#include <gtest/gtest.h>

#include <algorithm>
#include <numeric>
#include <random>

#include "reference_host/movie_writer/Movie.h"
#include "tests/unit/quicktime/MadeMovie.h"

using namespace quicktime_tests;

namespace {

constexpr std::size_t kWidth = 64, kHeight = 48, kFrames = 9;
constexpr std::size_t kFrameBytes = kWidth * kHeight * 4;

Bytes WantedFrames(const MadeMovie& movie) {
    Bytes frames = movie.Decoded("-f rawvideo -pix_fmt bgra -vsync passthrough");
    for (std::size_t i = 3; i < frames.size(); i += 4) {
        frames[i] = 255;
    }
    return frames;
}

void ExpectFrame(QTWrapper::IQTVideoReader& reader, std::size_t number, const Bytes& wanted) {
    const Bytes got = Picture(reader, number);
    ASSERT_EQ(got.size(), kFrameBytes) << "frame " << number;
    EXPECT_TRUE(std::equal(got.begin(), got.end(),
                           wanted.begin() + static_cast<std::ptrdiff_t>(number * kFrameBytes)))
        << "frame " << number;
}

// Forward, backward, at random, after a new start, and each one alone.
void ExpectFramesOfFfmpeg(const MadeMovie& movie) {
    const Bytes wanted = WantedFrames(movie);
    ASSERT_EQ(wanted.size(), kFrames * kFrameBytes);
    ASSERT_GT(std::count_if(wanted.begin(), wanted.end(),
                            [](std::uint8_t byte) { return byte != 0 && byte != 255; }),
              kFrames)
        << "black and white would tell nothing";
    std::vector<std::size_t> order(kFrames);
    std::iota(order.begin(), order.end(), std::size_t{0});
    std::vector<std::size_t> orders = order;
    orders.insert(orders.end(), order.rbegin(), order.rend());
    std::shuffle(order.begin(), order.end(), std::minstd_rand(3));
    orders.insert(orders.end(), order.begin(), order.end());
    const auto reader = OpenVideo(movie.Path(), Code("BGRA"));
    ASSERT_TRUE(reader);
    for (const std::size_t number : orders) {
        ExpectFrame(*reader, number, wanted);
    }
    for (const std::size_t number : order) {
        ASSERT_EQ(reader->ReleaseQT(), NCF_OK);
        ASSERT_EQ(reader->InitQT(QTWrapper::kUseDecompressionSession), NCF_OK);
        ExpectFrame(*reader, number, wanted);
        const auto other = OpenVideo(movie.Path(), Code("BGRA"));
        ASSERT_TRUE(other);
        ExpectFrame(*other, number, wanted);
    }
}

// --- made by FFmpeg -------------------------------------------------------------------

struct Made {
    const char* name;
    const char* encoder;
    const char* ending;
};
void PrintTo(const Made& made, std::ostream* to) {
    *to << made.name;
}

constexpr Made kMade[] = {
    {"SmcInMov", "-c:v smc", ".mov"},      {"RawInMov", "-c:v rawvideo", ".mov"},
    {"RawInAvi", "-c:v rawvideo", ".avi"}, {"PngInMov", "-c:v png", ".mov"},
    {"TiffInMov", "-c:v tiff", ".mov"},    {"TargaInMov", "-c:v targa", ".mov"},
    {"GifInMov", "-c:v gif", ".mov"},      {"Jpeg2000InMov", "-c:v jpeg2000", ".mov"},
    {"ZmbvInAvi", "-c:v zmbv", ".avi"},    {"Gif", "-c:v gif", ".gif"},
};

class MadePalettes : public testing::TestWithParam<Made> {};

// AVI alone can change the palette from frame to frame; in the other containers
// the pictures keep the first or carry their own.
TEST_P(MadePalettes, AreThoseOfFfmpegInEveryOrder) {
    const MadeMovie movie(std::string("-f lavfi -i testsrc2=s=64x48:r=5 -filter_complex "
                                      "\"split[a][b];[a]palettegen=stats_mode=single[p];"
                                      "[b][p]paletteuse=new=1\" -pix_fmt pal8 -frames:v 9 ") +
                              GetParam().encoder,
                          GetParam().ending);
    ExpectFramesOfFfmpeg(movie);
}

INSTANTIATE_TEST_SUITE_P(Palettes, MadePalettes, testing::ValuesIn(kMade),
                         [](const auto& each) { return std::string(each.param.name); });

// --- of codecs that FFmpeg only reads ---------------------------------------------------

std::uint8_t NumberAt(std::size_t frame, std::size_t x, std::size_t y) {
    return static_cast<std::uint8_t>(frame * 37 + x * 3 + y * 5);
}

void Append(Bytes& to, std::initializer_list<std::size_t> bytes) {
    for (const std::size_t byte : bytes) {
        to.push_back(static_cast<std::uint8_t>(byte));
    }
}

// Numbers of `bits` each, line by line.
Bytes Raw(std::size_t frame, std::size_t bits) {
    Bytes out;
    for (std::size_t y = 0; y < kHeight; ++y) {
        for (std::size_t x = 0; x < kWidth; x += 8 / bits) {
            std::size_t byte = 0;
            for (std::size_t i = 0; i < 8 / bits; ++i) {
                byte = byte << bits | (NumberAt(frame, x + i, y) & ((1u << bits) - 1));
            }
            Append(out, {byte});
        }
    }
    return out;
}

// Each line: nothing skipped, sixteen times four numbers, the end of the line.
Bytes Animation(std::size_t frame, std::size_t) {
    Bytes lines;
    for (std::size_t y = 0; y < kHeight; ++y) {
        Append(lines, {1, kWidth / 4});
        for (std::size_t x = 0; x < kWidth; ++x) {
            lines.push_back(NumberAt(frame, x, y));
        }
        Append(lines, {0xFF});
    }
    Append(lines, {0});
    const std::size_t size = lines.size() + 6;
    Bytes out;
    Append(out, {0, 0, size >> 8, size & 0xFF, 0, 0});
    out.insert(out.end(), lines.begin(), lines.end());
    return out;
}

// The lengths of all lines, then each as one run of plain numbers.
Bytes Planar(std::size_t frame, std::size_t) {
    Bytes out;
    for (std::size_t y = 0; y < kHeight; ++y) {
        Append(out, {0, kWidth + 1});
    }
    for (std::size_t y = 0; y < kHeight; ++y) {
        Append(out, {kWidth - 1});
        for (std::size_t x = 0; x < kWidth; ++x) {
            out.push_back(NumberAt(frame, x, y));
        }
    }
    return out;
}

// Blocks of 4 x 4 in one number each.
Bytes Blocks(std::size_t frame, std::size_t) {
    Bytes out;
    for (std::size_t block = 0; block < kWidth * kHeight / 16; ++block) {
        Append(out, {static_cast<std::size_t>(NumberAt(frame, block, 0)), 0x80});
    }
    Append(out, {0, 0});
    return out;
}

// One strip: a book of 256 vectors of one number each, and a vector of the book
// for each block of 4 x 4.
Bytes Vectors(std::size_t frame, std::size_t) {
    constexpr std::size_t kBlocks = kWidth * kHeight / 16;
    constexpr std::size_t kBook = 4 + 256 * 4, kChosen = 4 + kBlocks;
    constexpr std::size_t kStrip = 12 + kBook + kChosen, kAll = 10 + kStrip;
    Bytes out;
    Append(out, {0, 0, kAll >> 8, kAll & 0xFF, 0, kWidth, 0, kHeight, 0, 1});
    Append(out, {0x10, 0, kStrip >> 8, kStrip & 0xFF, 0, 0, 0, 0, 0, kHeight, 0, kWidth});
    Append(out, {0x26, 0, kBook >> 8, kBook & 0xFF});
    for (std::size_t i = 0; i < 256; ++i) {
        Append(out, {i, i, i, i});
    }
    Append(out, {0x32, 0, kChosen >> 8, kChosen & 0xFF});
    for (std::size_t block = 0; block < kBlocks; ++block) {
        out.push_back(NumberAt(frame, block, 0));
    }
    return out;
}

struct Written {
    const char* name;
    const char* codec;
    unsigned bits;
    Bytes (*frame)(std::size_t number, std::size_t bits);
};
void PrintTo(const Written& written, std::ostream* to) {
    *to << written.name;
}

constexpr Written kWritten[] = {
    {"Animation", "rle ", 8, Animation},
    {"Planar", "8BPS", 8, Planar},
    {"Blocks", "msvc", 8, Blocks},
    {"Vectors", "cvid", 8, Vectors},
    {"Raw8", "raw ", 8, Raw},
    {"Raw4", "raw ", 4, Raw},
    {"Raw2", "raw ", 2, Raw},
};

class WrittenPalettes : public testing::TestWithParam<Written> {};

TEST_P(WrittenPalettes, AreThoseOfFfmpegInEveryOrder) {
    movies::VideoFormat format;
    format.codec = GetParam().codec;
    format.width = kWidth;
    format.height = kHeight;
    format.depth = GetParam().bits;
    movies::Track track = movies::VideoTrack(format, 0, 25, 1);
    track.samples.clear();
    for (std::size_t i = 0; i < kFrames; ++i) {
        const Bytes frame = GetParam().frame(i, GetParam().bits);
        movies::SampleRun run;
        run.size = static_cast<std::uint32_t>(frame.size());
        track.samples.push_back(run);
        track.data.insert(track.data.end(), frame.begin(), frame.end());
    }
    movies::Movie movie;
    movie.tracks.push_back(track);
    ExpectFramesOfFfmpeg(MadeMovie(movies::Build(movie).ToBytes(), ".mov"));
}

INSTANTIATE_TEST_SUITE_P(Palettes, WrittenPalettes, testing::ValuesIn(kWritten),
                         [](const auto& each) { return std::string(each.param.name); });

}  // namespace
