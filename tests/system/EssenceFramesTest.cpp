// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// Frames of movies of each codec, through the module, beside FFmpeg's decode of
// the same file: byte for byte where the layouts agree, within rounding where
// they differ.

#include <algorithm>
#include <cmath>
#include <random>

#include "tests/support/Planes.h"
#include "tests/system/EssenceSupport.h"
#include "tests/system/SystemTest.h"

namespace {

using cliphost::ClipTrack;
using cliphost::Essence;
using cliphost::FrameReader;
using cliphost::TrackKind;

constexpr double kRounding = 60.0;  // decibels

class EssenceFrames : public SystemTest {};

TEST_F(EssenceFrames, OfEightBits422AreTheDecodersBytes) {
    for (const char* const name :
         {"2vuy.mov", "2vuy_ntsc.mov", "dvcpro50_ntsc.mov", "dvcpro50_pal.mov",
          "dvcprohd_1080i50.mov", "dvcprohd_1080i60.mov", "dvcprohd_720p60.mov",
          "xdcam_hd422_1080i50.mov", "xdcam_hd422_720p50.mov"}) {
        SCOPED_TRACE(name);
        Essence essence(session(), MadeMovie(name));
        const EssenceBytes got = AllFrames(essence, TrackKind::Picture, "2vuy");
        const EssenceBytes wanted =
            Decoded(MadeMovie(name), "-f rawvideo -pix_fmt uyvy422 -vsync passthrough");
        ASSERT_FALSE(got.empty());
        EXPECT_TRUE(got == wanted) << got.size() << " and " << wanted.size() << " bytes, "
                                   << SignalToNoise(got, wanted) << " dB";
    }
}

// D-10 codes the lines of the vertical interval above the picture; they are not part
// of the picture that the movie describes.
TEST_F(EssenceFrames, OfD10LeaveTheVerticalIntervalOut) {
    struct Interval {
        const char* name;
        const char* crop;
    };
    for (const Interval& movie : {Interval{"imx50_pal.mov", "crop=720:576:0:32"},
                                  Interval{"imx50_ntsc.mov", "crop=720:486:0:26"}}) {
        SCOPED_TRACE(movie.name);
        Essence essence(session(), MadeMovie(movie.name));
        const EssenceBytes got = AllFrames(essence, TrackKind::Picture, "2vuy");
        const EssenceBytes wanted =
            Decoded(MadeMovie(movie.name), std::string("-vf ") + movie.crop +
                                               " -f rawvideo -pix_fmt uyvy422 -vsync passthrough");
        ASSERT_FALSE(got.empty());
        EXPECT_TRUE(got == wanted) << SignalToNoise(got, wanted) << " dB";
    }
}

struct Sized {
    const char* name;
    std::size_t width;
    std::size_t height;
};

// Chroma between two lines is made by both, each in its own arithmetic.
TEST_F(EssenceFrames, OfEightBits420DifferInRoundingAlone) {
    for (const Sized& movie :
         {Sized{"h264_bframes.mov", 640, 360}, Sized{"h264_rec709.mov", 1280, 720},
          Sized{"h264_mp4_header_last.mp4", 640, 360}, Sized{"mpeg4.mov", 352, 288},
          Sized{"xdcam_ex_1080p25.mov", 1920, 1080}}) {
        SCOPED_TRACE(movie.name);
        Essence essence(session(), MadeMovie(movie.name));
        const EssenceBytes got = AllFrames(essence, TrackKind::Picture, "2vuy");
        const EssenceBytes wanted = Interleaved422(
            Decoded(MadeMovie(movie.name),
                    "-vf scale=flags=bilinear+accurate_rnd+full_chroma_int+full_chroma_inp "
                    "-f rawvideo -pix_fmt yuv422p -vsync passthrough"),
            movie.width, movie.height);
        EXPECT_GT(SignalToNoise(got, wanted), kRounding);
    }
}

TEST_F(EssenceFrames, OfRgbAreTheDecodersBytesAndOpaque) {
    for (const char* const name : {"png.mov", "png_alpha.mov", "animation.mov",
                                   "animation_alpha.mov", "raw_rgb.mov", "one_picture.mov"}) {
        SCOPED_TRACE(name);
        Essence essence(session(), MadeMovie(name));
        const EssenceBytes got = AllFrames(essence, TrackKind::Picture, "bgra");
        EssenceBytes wanted =
            Decoded(MadeMovie(name), "-f rawvideo -pix_fmt bgra -vsync passthrough");
        for (std::size_t i = 3; i < wanted.size(); i += 4) {
            wanted[i] = 255;
        }
        ASSERT_FALSE(got.empty());
        EXPECT_TRUE(got == wanted) << SignalToNoise(got, wanted) << " dB";
    }
}

// --- alpha ----------------------------------------------------------------------------

class EssenceAlpha : public SystemTest {
protected:
    void SetUp() override {
        options.host.ignoreAlpha = false;
        Start();
    }
};

TEST_F(EssenceAlpha, OfEightBitsIsTheDecoders) {
    for (const char* const codec : {"png -pix_fmt rgba", "qtrle -pix_fmt argb"}) {
        SCOPED_TRACE(codec);
        const auto movie = Make(
            "-f lavfi -i testsrc2=s=96x64:r=25:d=0.2 "
            "-vf 'format=rgba,geq=r=r(X\\,Y):g=g(X\\,Y):b=b(X\\,Y):a=X*2+N' -c:v " +
                std::string(codec),
            "ramp.mov");
        Essence essence(session(), movie);
        const EssenceBytes got = AllFrames(essence, TrackKind::Alpha, "a8");
        const EssenceBytes wanted =
            Decoded(movie, "-vf alphaextract -f rawvideo -pix_fmt gray -vsync passthrough");
        ASSERT_EQ(got.size(), 96u * 64 * 5);
        EXPECT_TRUE(got == wanted);
        EXPECT_NE(*std::min_element(got.begin(), got.end()),
                  *std::max_element(got.begin(), got.end()));
    }
}

TEST_F(EssenceAlpha, OfTenBitsIsTheUpperEightThenTheLowerTwo) {
    const auto movie = MadeMovie("prores_4444_alpha.mov");
    Essence essence(session(), movie);
    const EssenceBytes got = AllFrames(essence, TrackKind::Alpha, "a10");
    constexpr std::size_t kPixels = 1280 * 720;
    ASSERT_EQ(got.size(), kPixels * 2 * 2);
    // Planes of 12 bits: Y, Cb, Cr, A.
    const EssenceBytes planes =
        Decoded(movie, "-f rawvideo -pix_fmt yuva444p12le -vsync passthrough");
    ASSERT_EQ(planes.size(), kPixels * 8 * 2);
    for (std::size_t frame = 0; frame < 2; ++frame) {
        const std::uint8_t* const alpha = planes.data() + frame * kPixels * 8 + kPixels * 6;
        const std::uint8_t* const own = got.data() + frame * kPixels * 2;
        for (std::size_t i = 0; i < kPixels; ++i) {
            const int stored = alpha[2 * i] | alpha[2 * i + 1] << 8;
            const int wanted = static_cast<int>(stored / 4095.0 * 1023.0 + 0.5);
            ASSERT_NEAR(own[i] << 2 | own[kPixels + i], wanted, 1) << "pixel " << i;
        }
    }
}

TEST_F(EssenceAlpha, AndItsPictureCanBeReadInTurn) {
    for (const char* const name : {"prores_4444_alpha.mov", "png_alpha.mov"}) {
        SCOPED_TRACE(name);
        EssenceBytes pictures, alphas;
        {
            Essence alone(session(), MadeMovie(name));
            pictures = AllFrames(alone, TrackKind::Picture, "");
            alphas = AllFrames(alone, TrackKind::Alpha, "");
        }
        Essence essence(session(), MadeMovie(name));
        FrameReader picture(essence, *essence.First(TrackKind::Picture), "");
        FrameReader alpha(essence, *essence.First(TrackKind::Alpha), "");
        EssenceBytes turnPictures, turnAlphas;
        for (std::uint64_t frame = 0; frame < picture.Count(); ++frame) {
            const EssenceBytes one = OneFrame(picture, frame);
            const EssenceBytes other = OneFrame(alpha, frame);
            turnPictures.insert(turnPictures.end(), one.begin(), one.end());
            turnAlphas.insert(turnAlphas.end(), other.begin(), other.end());
        }
        EXPECT_TRUE(turnPictures == pictures);
        EXPECT_TRUE(turnAlphas == alphas);
    }
}

// --- deep pictures ----------------------------------------------------------------------

struct Weights {
    double red, green, blue;
};

// The words A R G B of planes in 4:4:4 of 12 bits or 4:2:2 of 10, worked out in
// double precision from the definition of the matrix.
std::vector<std::uint16_t> WordsOf(const EssenceBytes& planes, const Sized& size, bool is422) {
    const Weights k = size.width < 960 || size.height < 720 ? Weights{0.299, 0.587, 0.114}
                                                            : Weights{0.2126, 0.7152, 0.0722};
    const double one = is422 ? 4.0 : 16.0;  // steps in one of 8 bits
    const std::size_t chromaWidth = is422 ? size.width / 2 : size.width;
    const std::size_t luma = size.width * size.height;
    const std::size_t chroma = chromaWidth * size.height;
    std::vector<std::uint16_t> words;
    const auto at = [&](std::size_t index) {
        return static_cast<double>(planes[2 * index] | planes[2 * index + 1] << 8) / one;
    };
    for (std::size_t frame = 0; (frame + luma + 2 * chroma) * 2 <= planes.size();
         frame += luma + 2 * chroma) {
        for (std::size_t i = 0; i < luma; ++i) {
            const std::size_t x = i % size.width, line = i / size.width;
            const auto chromaAt = [&](std::size_t plane) {
                const std::size_t row = frame + luma + plane * chroma + line * chromaWidth;
                if (!is422) {
                    return at(row + x);
                }
                const std::size_t next = std::min(x / 2 + x % 2, chromaWidth - 1);
                return (at(row + x / 2) + at(row + next)) / 2;
            };
            const double y = (at(frame + i) - 16) / 219;
            const double cb = (chromaAt(0) - 128) / 224, cr = (chromaAt(1) - 128) / 224;
            const double r = y + 2 * (1 - k.red) * cr, b = y + 2 * (1 - k.blue) * cb;
            const double g = (y - k.red * r - k.blue * b) / k.green;
            words.push_back(65535);
            for (const double c : {r, g, b}) {
                words.push_back(static_cast<std::uint16_t>(
                    std::lround(std::clamp(c * 56064 + 4096, 0.0, 65535.0))));
            }
        }
    }
    return words;
}

std::vector<std::uint16_t> BigEndianWords(const EssenceBytes& bytes) {
    std::vector<std::uint16_t> words;
    for (std::size_t i = 0; i + 1 < bytes.size(); i += 2) {
        words.push_back(static_cast<std::uint16_t>(bytes[i] << 8 | bytes[i + 1]));
    }
    return words;
}

TEST_F(EssenceFrames, OfDeepPicturesLoseNothingButRounding) {
    struct Deep {
        Sized size;
        bool is422;
    };
    for (const Deep& deep :
         {Deep{{"prores_hq_480p.mov", 720, 480}, true},
          Deep{{"prores_hq_1080p.mov", 1920, 1080}, true}, Deep{{"v210_720.mov", 1280, 720}, true},
          Deep{{"prores_4444_720p.mov", 1280, 720}, false},
          Deep{{"prores_4444_576p.mov", 720, 576}, false}}) {
        SCOPED_TRACE(deep.size.name);
        Essence essence(session(), MadeMovie(deep.size.name));
        const auto got = BigEndianWords(AllFrames(essence, TrackKind::Picture, "b64a"));
        const auto wanted =
            WordsOf(Decoded(MadeMovie(deep.size.name),
                            std::string("-f rawvideo -vsync passthrough -pix_fmt ") +
                                (deep.is422 ? "yuv422p10le" : "yuv444p12le")),
                    deep.size, deep.is422);
        EXPECT_GT(SignalToNoise16(got, wanted), 90.0) << "of 16 bits";
    }
}

TEST_F(EssenceFrames, OfTenBitsAreRoundedToEightInTheirByteLayout) {
    for (const Sized& movie :
         {Sized{"prores_hq_480p.mov", 720, 480}, Sized{"v210_720.mov", 1280, 720}}) {
        SCOPED_TRACE(movie.name);
        Essence essence(session(), MadeMovie(movie.name));
        const EssenceBytes got = AllFrames(essence, TrackKind::Picture, "2vuy");
        const EssenceBytes deep =
            Decoded(MadeMovie(movie.name), "-f rawvideo -vsync passthrough -pix_fmt yuv422p10le");
        EssenceBytes eight;
        for (std::size_t i = 0; i + 1 < deep.size(); i += 2) {
            const int value = deep[i] | deep[i + 1] << 8;
            eight.push_back(static_cast<std::uint8_t>(std::min(255, (value + 2) >> 2)));
        }
        EXPECT_GT(SignalToNoise(got, Interleaved422(eight, movie.width, movie.height)), kRounding);
    }
}

// --- order ------------------------------------------------------------------------------

TEST_F(EssenceFrames, AreTheSameInAnyOrder) {
    for (const char* const name : {"h264_bframes.mov", "mpeg2.mov", "mpeg4.mov", "mjpeg.mov",
                                   "prores_with_pcm.mov", "animation.mov"}) {
        SCOPED_TRACE(name);
        Essence essence(session(), MadeMovie(name));
        FrameReader reader(essence, *essence.First(TrackKind::Picture), "");
        std::vector<EssenceBytes> inOrder;
        for (std::uint64_t frame = 0; frame < reader.Count(); ++frame) {
            inOrder.push_back(OneFrame(reader, frame));
        }
        const unsigned seed = std::random_device()();
        SCOPED_TRACE("seed " + std::to_string(seed));
        std::mt19937 random(seed);
        for (int i = 0; i < 30; ++i) {
            const std::size_t frame = random() % inOrder.size();
            ASSERT_TRUE(OneFrame(reader, frame) == inOrder[frame]) << "frame " << frame;
        }
        for (std::size_t frame = inOrder.size(); frame-- > 0;) {
            ASSERT_TRUE(OneFrame(reader, frame) == inOrder[frame]) << "backward " << frame;
        }
    }
}

TEST_F(EssenceFrames, EndWithNoData) {
    Essence essence(session(), MadeMovie("h264_bframes.mov"));
    FrameReader reader(essence, *essence.First(TrackKind::Picture), "");
    EXPECT_EQ(reader.Count(), 10u);
    EXPECT_EQ(reader.Read(10), NMA_E_NODATA);
    EXPECT_EQ(reader.Read(~std::uint64_t{0}), NMA_E_NODATA);
    EXPECT_EQ(reader.Read(9), NCF_OK);
}

TEST_F(EssenceFrames, OfAMovieOfOneAreAlwaysThatOne) {
    Essence essence(session(), MadeMovie("one_picture.mov"));
    FrameReader reader(essence, *essence.First(TrackKind::Picture), "");
    EXPECT_EQ(reader.Count(), 1u);
    const EssenceBytes first = OneFrame(reader, 0);
    ASSERT_EQ(first.size(), 400u * 300 * 4);
    EXPECT_TRUE(OneFrame(reader, 1000) == first);
}

TEST_F(EssenceFrames, FollowAChangeOfFormatBetweenThem) {
    const auto movie = MadeMovie("prores_with_pcm.mov");
    EssenceBytes small, deep;
    {
        Essence alone(session(), movie);
        small = AllFrames(alone, TrackKind::Picture, "2vuy");
        deep = AllFrames(alone, TrackKind::Picture, "b64a");
    }
    Essence essence(session(), movie);
    const ClipTrack& track = *essence.First(TrackKind::Picture);
    for (std::size_t frame = 0; frame < 5; ++frame) {
        const bool isDeep = frame % 2 == 1;
        FrameReader reader(essence, track, isDeep ? "b64a" : "2vuy");
        const EssenceBytes& all = isDeep ? deep : small;
        const std::size_t size = all.size() / 5;
        const auto start = all.begin() + static_cast<std::ptrdiff_t>(frame * size);
        EXPECT_TRUE(OneFrame(reader, frame) ==
                    EssenceBytes(start, start + static_cast<std::ptrdiff_t>(size)))
            << frame;
    }
}

// A stream may change its size and its chroma on the way; all frames come in
// the size that the movie tells.
TEST_F(EssenceFrames, OfAStreamThatChangesItsSizeComeInOneSize) {
    const auto make = [&](const char* size, const char* pixels, const char* name) {
        return RunCommand("ffmpeg -nostdin -v error -f lavfi -i testsrc2=s=" + std::string(size) +
                          ":r=25:d=0.12 -c:v mjpeg -q:v 2 -pix_fmt " + pixels + " " +
                          Quoted(folder() / name))
            .status;
    };
    ASSERT_EQ(make("160x120", "yuvj420p", "a.mov"), 0);
    ASSERT_EQ(make("80x60", "yuvj444p", "b.mov"), 0);
    Write(movies::Bytes{'f', 'i', 'l', 'e', ' ', 'a', '.', 'm', 'o', 'v', '\n',
                        'f', 'i', 'l', 'e', ' ', 'b', '.', 'm', 'o', 'v', '\n'},
          "list.txt");
    const auto movie =
        Make("-f concat -i " + Quoted(folder() / "list.txt") + " -c copy", "changes.mov");
    EssenceBytes before;
    {
        Essence alone(session(), folder() / "a.mov");
        before = AllFrames(alone, TrackKind::Picture, "2vuy");
    }
    Essence essence(session(), movie);
    const EssenceBytes all = AllFrames(essence, TrackKind::Picture, "2vuy");
    constexpr std::size_t kFrame = 160 * 120 * 2;
    ASSERT_EQ(before.size(), kFrame * 3);
    ASSERT_EQ(all.size(), kFrame * 6);
    EXPECT_TRUE(std::equal(before.begin(), before.end(), all.begin()));
    // The same picture, at half the size and back: alike, and not empty.
    const EssenceBytes enlarged(all.begin() + kFrame * 3, all.begin() + kFrame * 4);
    const EssenceBytes first(all.begin(), all.begin() + kFrame);
    EXPECT_GT(SignalToNoise(enlarged, first), 12.0);
}

}  // namespace
