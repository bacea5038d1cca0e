// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// The thumbnails of a contact sheet come from another reader than frames do, and are made small
// while they are decoded. They show the same picture.

#include <algorithm>
#include <cmath>
#include <cstdlib>

#include "reference_host/quicktime/Thumbnails.h"
#include "tests/system/EssenceSupport.h"
#include "tests/system/SystemTest.h"

namespace {

// R'G'B', 8 bits.
struct Image {
    std::size_t width = 0;
    std::size_t height = 0;
    EssenceBytes bytes;

    std::uint8_t& At(std::size_t x, std::size_t y, std::size_t c) {
        return bytes[(y * width + x) * 3 + c];
    }
};

Image ReadPng(const std::filesystem::path& file) {
    const EssenceBytes png = ReadFile(file);
    const auto number = [&](std::size_t at) {
        return png.size() < at + 4 ? 0u : std::size_t{png[at + 2]} << 8 | png[at + 3];
    };
    return {number(16), number(20), Decoded(file, "-frames:v 1 -f rawvideo -pix_fmt rgb24")};
}

// Each pixel is the mean of what it covers of the upper `rows` of the image.
Image Shrunk(Image& image, std::size_t width, std::size_t height, std::size_t rows) {
    Image small{width, height, EssenceBytes(width * height * 3)};
    for (std::size_t y = 0; y < height; ++y) {
        for (std::size_t x = 0; x < width; ++x) {
            const std::size_t bottom = std::max(y * rows / height + 1, (y + 1) * rows / height);
            const std::size_t right =
                std::max(x * image.width / width + 1, (x + 1) * image.width / width);
            for (std::size_t c = 0; c < 3; ++c) {
                double sum = 0;
                double count = 0;
                for (std::size_t v = y * rows / height; v < bottom; ++v) {
                    for (std::size_t u = x * image.width / width; u < right; ++u, ++count) {
                        sum += image.At(u, v, c);
                    }
                }
                small.At(x, y, c) = static_cast<std::uint8_t>(std::lround(sum / count));
            }
        }
    }
    return small;
}

Image Cropped(Image& image, std::size_t left, std::size_t top, std::size_t width,
              std::size_t height) {
    Image part{width, height, EssenceBytes(width * height * 3)};
    for (std::size_t y = 0; y < height; ++y) {
        std::copy_n(&image.At(left, top + y, 0), width * 3, &part.At(0, y, 0));
    }
    return part;
}

double MeanDifference(const Image& a, const Image& b) {
    if (a.bytes.size() != b.bytes.size() || a.bytes.empty()) {
        return 255;
    }
    double sum = 0;
    for (std::size_t i = 0; i < a.bytes.size(); ++i) {
        sum += std::abs(int{a.bytes[i]} - int{b.bytes[i]});
    }
    return sum / static_cast<double>(a.bytes.size());
}

constexpr std::size_t kGap = 8;
// Averages are of other numbers: of Y'CbCr, not of R'G'B' that was clipped to its range. A picture
// with channels, levels or shape mistaken differs by more; the test measures that, too.
constexpr double kAlike = 3.0;

class Thumbnails : public SystemTest {
protected:
    Image Sheet(const std::filesystem::path& movie, const std::string& options) {
        const auto file = folder() / "sheet.png";
        const CommandResult ran =
            RunCliphost("contact " + options + " " + Quoted(movie) + " -o " + Quoted(file));
        EXPECT_EQ(ran.status, 0) << ran.out;
        said_ = ran.out;
        return ReadPng(file);
    }
    Image Frame(const std::filesystem::path& movie, std::size_t frame,
                const std::string& options = "") {
        const auto file = folder() / "frame.png";
        const CommandResult ran =
            RunCliphost("frame " + options + " " + Quoted(movie) + " --frame " +
                        std::to_string(frame) + " -o " + Quoted(file));
        EXPECT_EQ(ran.status, 0) << ran.out;
        return ReadPng(file);
    }
    // The only cell of a sheet beside the module's frame.
    void ExpectAlike(const std::filesystem::path& movie, std::size_t frame,
                     const std::string& options) {
        Image whole = Frame(movie, frame);
        const std::size_t width = std::max<std::size_t>(16, whole.width / 4);
        Image sheet = Sheet(movie, options + " --frames 1 --width " + std::to_string(width));
        ASSERT_GT(sheet.height, 2 * kGap);
        const Image cell =
            Cropped(sheet, kGap, kGap, sheet.width - 2 * kGap, sheet.height - 2 * kGap);
        ASSERT_EQ(cell.width, width);
        Image expected = Shrunk(whole, cell.width, cell.height, whole.height);
        EXPECT_LT(MeanDifference(cell, expected), kAlike);
        Image swapped = expected;
        Image levels = expected;
        for (std::size_t i = 0; i < expected.bytes.size(); i += 3) {
            std::swap(swapped.bytes[i], swapped.bytes[i + 2]);
        }
        for (std::uint8_t& value : levels.bytes) {
            value = static_cast<std::uint8_t>(16 + value * 219 / 255);
        }
        EXPECT_GT(MeanDifference(swapped, expected), kAlike);
        EXPECT_GT(MeanDifference(levels, expected), kAlike);
        EXPECT_GT(
            MeanDifference(Shrunk(whole, cell.width, cell.height, whole.height * 9 / 10), expected),
            kAlike);
    }
    std::string said_;
};

// Of movies whose middle frame is a sync sample, and of one that has to be decoded up to it.
TEST_F(Thumbnails, ShowWhatFramesShow) {
    for (const char* const name : {"mjpeg.mov", "dv_pal.mov", "dvcprohd_1080i50.mov", "png.mov",
                                   "raw_rgb.mov", "2vuy.mov", "v210_720.mov", "prores_hq_1080i.mov",
                                   "prores_lt_486i.mov", "prores_4444_720p.mov", "imx50_pal.mov"}) {
        for (const char* const options : {"", "--exact"}) {
            SCOPED_TRACE(std::string(name) + " " + options);
            const auto movie = MadeMovie(name);
            const auto thumbnails = host::OpenThumbnails(movie);
            ASSERT_TRUE(thumbnails);
            ExpectAlike(movie, thumbnails->Count() / 2, options);
        }
    }
    for (const char* const name : {"h264_rec709.mov", "mpeg2.mov", "mpeg4.mov", "animation.mov",
                                   "xdcam_ex_1080i50.mov", "h264_mp4_header_last.mp4"}) {
        SCOPED_TRACE(name);
        const auto movie = MadeMovie(name);
        const auto thumbnails = host::OpenThumbnails(movie);
        ASSERT_TRUE(thumbnails);
        ExpectAlike(movie, thumbnails->Count() / 2, "--exact");
    }
}

// The movie names no matrix, so what the size of its pictures tells holds for its thumbnails, too.
TEST_F(Thumbnails, KeepTheColoursOfLargePictures) {
    const auto movie = Make(
        "-f lavfi -i testsrc2=s=1280x720:r=25:d=0.2 -c:v mjpeg -color_range tv -pix_fmt yuv420p "
        "-strict unofficial",
        "large.mov");
    ExpectAlike(movie, 2, "");
}

// Groups of 60 pictures: the sync samples are 0, 60, 120 ... and the frames asked for are 50,
// 150 and 250.
TEST_F(Thumbnails, ComeFromTheNearestSyncSample) {
    for (const char* const ending : {".mov", ".mp4", ".mkv", ".ts"}) {
        SCOPED_TRACE(ending);
        const std::string fragments =
            std::string(ending) == ".mp4" ? " -movflags frag_keyframe+empty_moov" : "";
        const auto movie = Make(
            "-f lavfi -i testsrc2=s=320x180:r=25:d=12 -c:v libx264 -preset veryfast "
            "-g 60 -keyint_min 60 -sc_threshold 0 -bf 2 -pix_fmt yuv420p" +
                fragments,
            std::string("groups") + ending);
        const auto cellsOf = [&](const std::string& options) {
            Image sheet = Sheet(movie, options + "--frames 3 --columns 3 --width 80");
            std::vector<Image> cells;
            for (std::size_t i = 0; i < 3 && sheet.width == 3 * 88 + 8; ++i) {
                cells.push_back(Cropped(sheet, kGap + i * 88, kGap, 80, 45));
            }
            return cells;
        };
        std::vector<Image> nearest = cellsOf("");
        std::vector<Image> exact = cellsOf("--exact ");
        ASSERT_EQ(nearest.size(), 3u);
        ASSERT_EQ(exact.size(), 3u);
        const std::size_t syncs[] = {60, 120, 240};
        const std::size_t frames[] = {50, 150, 250};
        for (std::size_t i = 0; i < 3; ++i) {
            Image sync = Frame(movie, syncs[i]);
            Image frame = Frame(movie, frames[i]);
            Image smallSync = Shrunk(sync, 80, 45, sync.height);
            Image smallFrame = Shrunk(frame, 80, 45, frame.height);
            EXPECT_LT(MeanDifference(nearest[i], smallSync), kAlike) << i;
            EXPECT_LT(MeanDifference(exact[i], smallFrame), kAlike) << i;
            EXPECT_GT(MeanDifference(smallSync, smallFrame), 2 * kAlike) << i;
        }
    }
}

// One sync sample, and pictures that differ: a sheet of it alone would say nothing.
TEST_F(Thumbnails, OfAShortMovieAreItsFrames) {
    const auto movie =
        Make("-f lavfi -i testsrc2=s=320x180:r=25:d=4 -c:v libx264 -g 250 -bf 2 -pix_fmt yuv420p",
             "short.mov");
    Image sheet = Sheet(movie, "--frames 2 --columns 2 --width 80");
    ASSERT_EQ(sheet.width, 2 * 88u + 8u);
    for (std::size_t i = 0; i < 2; ++i) {
        Image frame = Frame(movie, 25 + 50 * i);
        EXPECT_LT(MeanDifference(Cropped(sheet, kGap + i * 88, kGap, 80, 45),
                                 Shrunk(frame, 80, 45, frame.height)),
                  kAlike);
    }
}

// The levels that the user asks for are made by the module.
TEST_F(Thumbnails, HaveTheLevelsOfTheParameters) {
    const auto movie = MadeMovie("raw_rgb.mov");
    for (const char* const options :
         {"", "--set 'Level Remapping=Expand'", "--set 'Level Remapping=Compress'"}) {
        SCOPED_TRACE(options);
        Image whole = Frame(movie, 0, options);
        Image sheet = Sheet(movie, std::string(options) + " --frames 1 --width 64");
        const Image cell = Cropped(sheet, kGap, kGap, 64, sheet.height - 2 * kGap);
        EXPECT_LT(MeanDifference(cell, Shrunk(whole, cell.width, cell.height, whole.height)),
                  kAlike);
    }
}

TEST_F(Thumbnails, ShowTheAlphaWhereItIsAskedFor) {
    for (const char* const name : {"png_alpha.mov", "prores_4444_alpha.mov"}) {
        SCOPED_TRACE(name);
        const auto movie = MadeMovie(name);
        const std::string size = "--frames 1 --width 96";  // whole squares behind
        Image opaque = Sheet(movie, size);
        Image clear = Sheet(movie, "--use-alpha " + size);
        if (std::string(name) != "png_alpha.mov") {  // which is opaque
            EXPECT_GT(MeanDifference(opaque, clear), 2 * kAlike);
        }
        // What the module delivers, as a parameter that changes nothing makes it do.
        const std::string delivered = " --use-alpha --reset ";
        EXPECT_LT(MeanDifference(clear, Sheet(movie, delivered + size)), kAlike);
    }
}

}  // namespace
