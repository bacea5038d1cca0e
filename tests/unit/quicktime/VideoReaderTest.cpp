// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include <gtest/gtest.h>

#include <algorithm>
#include <cstring>
#include <filesystem>
#include <iterator>
#include <numeric>
#include <random>
#include <thread>
#include <tuple>

#include "tests/support/Planes.h"
#include "tests/unit/quicktime/MadeMovie.h"

using namespace quicktime_tests;

namespace {

constexpr char kFilm[] = "-f lavfi -i testsrc2=s=96x64:r=25:d=1 ";
// The library's own conversion is exact between lines for planes alone.
constexpr char kLinearPlanes[] =
    "-vf scale=flags=bilinear+accurate_rnd+full_chroma_int+full_chroma_inp";

// Planes of green, blue and red as B G R A.
Bytes InterleavedRgb(const Bytes& planes, std::size_t pixels) {
    Bytes out;
    for (std::size_t frame = 0; frame + pixels * 3 <= planes.size(); frame += pixels * 3) {
        for (std::size_t i = 0; i < pixels; ++i) {
            out.push_back(planes[frame + pixels + i]);
            out.push_back(planes[frame + i]);
            out.push_back(planes[frame + 2 * pixels + i]);
            out.push_back(255);
        }
    }
    return out;
}

void ExpectEqual(const Bytes& got, const Bytes& wanted) {
    ASSERT_EQ(got.size(), wanted.size());
    ASSERT_FALSE(got.empty());
    for (std::size_t i = 0; i < got.size(); ++i) {
        ASSERT_EQ(got[i], wanted[i]) << "byte " << i;
    }
}

Bytes AllOf(const MadeMovie& movie, const char (&layout)[5], ncfUInt64* count = nullptr) {
    const auto reader = OpenVideo(movie.Path(), Code(layout));
    return reader ? AllPictures(*reader, count) : Bytes();
}

TEST(VideoReader, DeliversEightBit422AsItWasStored) {
    const MadeMovie movie(std::string(kFilm) + "-c:v mpeg2video -pix_fmt yuv422p -q:v 2 -bf 2");
    ncfUInt64 count = 0;
    ExpectEqual(AllOf(movie, "2vuy", &count), movie.Decoded("-f rawvideo -pix_fmt uyvy422"));
    EXPECT_EQ(count, 25u);
}

TEST(VideoReader, DeliversTenBit422AsItWasStored) {
    const MadeMovie movie("-f lavfi -i testsrc2=s=100x64:r=25:d=0.4 -c:v prores_ks -profile:v 3");
    ExpectEqual(AllOf(movie, "v210"), movie.Decoded("-f rawvideo -c:v v210"));
}

TEST(VideoReader, DeliversUncompressedFilesAsTheyWereStored) {
    const MadeMovie v210(std::string(kFilm) + "-c:v v210");
    ExpectEqual(AllOf(v210, "v210"), v210.Decoded("-f rawvideo -c:v v210"));
    const MadeMovie uyvy(std::string(kFilm) + "-c:v rawvideo -pix_fmt uyvy422");
    ExpectEqual(AllOf(uyvy, "2vuy"), uyvy.Decoded("-f rawvideo -pix_fmt uyvy422"));
}

TEST(VideoReader, DeliversEightBitRgbAsItWasStored) {
    for (const char* codec :
         {"-c:v png -pix_fmt rgba", "-c:v png -pix_fmt rgb24", "-c:v qtrle -pix_fmt argb",
          "-c:v qtrle -pix_fmt rgb24", "-c:v rawvideo -pix_fmt rgb24"}) {
        const MadeMovie movie(
            "-f lavfi -i testsrc2=s=97x63:r=25:d=0.2,format=rgba,geq=r='X*2':g='Y*3':b='X+Y':"
            "a='X+2*Y' " +
            std::string(codec));
        SCOPED_TRACE(codec);
        ExpectEqual(AllOf(movie, "BGRA"), movie.Decoded("-f rawvideo -pix_fmt bgra"));
    }
}

TEST(VideoReader, BringsSixteenBitRgbToVideoRangeWithFullAlpha) {
    const MadeMovie movie(
        "-f lavfi -i testsrc2=s=40x30:r=25:d=0.08,format=rgba64le,geq=r='X*1638':g='Y*2184':"
        "b='(X+Y)*900':a='X*1000+Y' -c:v png -pix_fmt rgba64be");
    const Bytes stored = movie.Decoded("-f rawvideo -pix_fmt rgba64be");
    const Bytes got = AllOf(movie, "b64a");
    ASSERT_EQ(got.size(), stored.size());
    const auto number = [](const Bytes& bytes, std::size_t at) {
        return bytes[at] * 256 + bytes[at + 1];
    };
    for (std::size_t pixel = 0; pixel < got.size(); pixel += 8) {
        EXPECT_EQ(number(got, pixel), number(stored, pixel + 6));
        for (std::size_t i = 0; i < 3; ++i) {
            const double exact = 4096.0 + number(stored, pixel + 2 * i) * 56064.0 / 65535.0;
            EXPECT_NEAR(number(got, pixel + 2 + 2 * i), exact, 0.51);
        }
    }
}

// Twelve bits with alpha, nothing lost on the way into floating point.
TEST(VideoReader, DeliversProRes4444WithAlphaInFloat) {
    const MadeMovie movie(
        "-f lavfi -i testsrc2=s=48x32:r=25:d=0.12,format=yuva444p10,geq=lum='64+X*15':"
        "cb='200+Y*10':cr='900-Y*10':a='X*21' -c:v prores_ks -profile:v 4 -pix_fmt yuva444p10");
    const Bytes planes = movie.Decoded("-f rawvideo -pix_fmt yuva444p12le");
    const Bytes got = AllOf(movie, "r4fl");
    constexpr std::size_t kPixels = 48 * 32;
    ASSERT_EQ(got.size() / 16, planes.size() / 8);
    for (std::size_t i = 0; i < got.size() / 16; ++i) {
        const std::size_t frame = i / kPixels;
        float pixel[4];
        std::memcpy(pixel, got.data() + i * 16, sizeof pixel);
        const auto stored = [&](std::size_t plane) {
            const std::size_t at = (frame * 4 + plane) * kPixels + i % kPixels;
            return planes[at * 2] + planes[at * 2 + 1] * 256;
        };
        ASSERT_NEAR(pixel[0], stored(3) / 4095.0, 1e-6);
        ASSERT_NEAR(pixel[1], (stored(0) - 256) / 4080.0, 1e-6);
        ASSERT_NEAR(pixel[2], stored(1) / 4080.0, 1e-6);
        ASSERT_NEAR(pixel[3], stored(2) / 4080.0, 1e-6);
    }
}

TEST(VideoReader, MakesChromaBetweenLinesOfProgressivePicturesLinearly) {
    const MadeMovie movie(std::string(kFilm) + "-c:v libx264 -pix_fmt yuv420p -bf 2 -g 12");
    const Bytes planes =
        movie.Decoded(std::string(kLinearPlanes) + " -f rawvideo -pix_fmt yuv422p");
    EXPECT_GT(Psnr(AllOf(movie, "2vuy"), Interleaved422(planes, 96, 64)), 60.0);
}

TEST(VideoReader, MakesChromaOfInterlacedPicturesFieldByField) {
    const MadeMovie movie(std::string(kFilm) +
                          "-vf interlace=lowpass=0 -c:v mpeg2video -flags +ildct+ilme -q:v 2 "
                          "-pix_fmt yuv420p -top 1");
    const Bytes got = AllOf(movie, "2vuy");
    const std::string raw = " -f rawvideo -pix_fmt yuv422p";
    const Bytes fields = movie.Decoded(std::string(kLinearPlanes) + ":interl=1" + raw);
    const Bytes frames = movie.Decoded(std::string(kLinearPlanes) + ":interl=0" + raw);
    EXPECT_GT(Psnr(got, Interleaved422(fields, 96, 64)), 58.0);
    EXPECT_LT(Psnr(got, Interleaved422(frames, 96, 64)), 50.0);
}

TEST(VideoReader, TurnsYuvIntoRgbByTheStreamsMatrix) {
    Bytes last;
    for (const char* matrix : {"smpte170m", "bt709"}) {
        SCOPED_TRACE(matrix);
        const MadeMovie movie(std::string(kFilm) + "-c:v libx264 -pix_fmt yuv444p -colorspace " +
                              matrix + " -qp 10");
        const Bytes got = AllOf(movie, "BGRA");
        const Bytes planes =
            movie.Decoded(std::string(kLinearPlanes) + " -f rawvideo -pix_fmt gbrp");
        EXPECT_GT(Psnr(got, InterleavedRgb(planes, 96 * 64)), 60.0);
        EXPECT_LT(Psnr(got, last), 40.0);
        last = got;
    }
}

// Rec. 601 for pictures of this size.
TEST(VideoReader, TurnsRgbIntoYuv) {
    struct Row {
        const char* color;
        int y, cb, cr;
    };
    for (const Row& row : {Row{"0xFF0000", 81, 90, 240}, Row{"0x00FF00", 145, 54, 34},
                           Row{"0x0000FF", 41, 240, 110}, Row{"0xFFFFFF", 235, 128, 128}}) {
        SCOPED_TRACE(row.color);
        const MadeMovie movie(std::string("-f lavfi -i color=") + row.color +
                              ":s=64x48:r=25:d=0.08,format=rgb24 -c:v qtrle");
        const Bytes got = AllOf(movie, "2vuy");
        ASSERT_FALSE(got.empty());
        EXPECT_NEAR(got[0], row.cb, 1);
        EXPECT_NEAR(got[1], row.y, 1);
        EXPECT_NEAR(got[2], row.cr, 1);
    }
}

// Five bits a component, packed into words.
TEST(VideoReader, BringsFewBitsToWholeBytes) {
    for (const auto& [color, blue, green, red] :
         {std::tuple("0xFF0000", 0, 0, 255), std::tuple("0x00FF00", 0, 255, 0),
          std::tuple("0x0000FF", 255, 0, 0), std::tuple("0xFFFFFF", 255, 255, 255)}) {
        SCOPED_TRACE(color);
        const MadeMovie movie(std::string("-f lavfi -i color=") + color +
                              ":s=64x48:r=25:d=0.08,format=rgb24 -c:v qtrle -pix_fmt rgb555be");
        const Bytes got = AllOf(movie, "BGRA");
        ASSERT_FALSE(got.empty());
        EXPECT_EQ(Bytes(got.begin(), got.begin() + 4),
                  (Bytes{static_cast<std::uint8_t>(blue), static_cast<std::uint8_t>(green),
                         static_cast<std::uint8_t>(red), 255}));
    }
}

TEST(VideoReader, BringsFullRangeToVideoRange) {
    const MadeMovie movie("-f lavfi -i color=white:s=64x64:r=25:d=0.08,format=yuvj422p -c:v mjpeg");
    const Bytes got = AllOf(movie, "2vuy");
    ASSERT_FALSE(got.empty());
    EXPECT_EQ(got[0], 128);
    EXPECT_EQ(got[1], 235);
    EXPECT_EQ(AllOf(movie, "BGRA")[0], 255);
    EXPECT_EQ(AllOf(movie, "NVZ2")[0], 235);
}

// Three of ten bits in each word, in the order of eight bits: Cb Y Cr Y.
std::vector<int> TenBitNumbers(const Bytes& packed) {
    std::vector<int> numbers;
    for (std::size_t i = 0; i + 4 <= packed.size(); i += 4) {
        std::uint32_t word = 0;
        std::memcpy(&word, packed.data() + i, sizeof word);
        for (int shift = 0; shift < 30; shift += 10) {
            numbers.push_back(static_cast<int>(word >> shift & 1023));
        }
    }
    return numbers;
}

// Full range, chroma between lines, and RGB: none is delivered as it is stored.
TEST(VideoReader, ConvertsToTenBitsAsToEight) {
    for (const char* codec : {"-c:v mjpeg -pix_fmt yuvj422p -q:v 2", "-c:v mjpeg -pix_fmt yuvj420p",
                              "-c:v qtrle -pix_fmt rgb24"}) {
        const MadeMovie movie(std::string(kFilm) + "-frames:v 2 " + codec);
        const Bytes eight = AllOf(movie, "2vuy");
        const std::vector<int> ten = TenBitNumbers(AllOf(movie, "v210"));
        ASSERT_EQ(eight.size(), 2u * 96 * 64 * 2) << codec;
        ASSERT_EQ(ten.size(), eight.size()) << "96 pixels are whole groups";
        for (std::size_t i = 0; i < ten.size(); ++i) {
            ASSERT_NEAR(ten[i], 4 * eight[i], 3) << codec << " number " << i;
        }
    }
}

TEST(VideoReader, EndsAnOddLineWithBlueDifferenceAndLuma) {
    const MadeMovie movie(
        "-f lavfi -i color=red:s=34x17:r=25:d=0.08,format=rgb24,crop=33:17:0:0:exact=1 -c:v png "
        "-pix_fmt rgb24");
    const auto reader = OpenVideo(movie.Path(), Code("2vuy"));
    ASSERT_TRUE(reader);
    EXPECT_EQ(Picture(*reader, 0).size(), 33u * 17u * 2u);
}

TEST(VideoReader, GivesTheSizeOfEachFormat) {
    const MadeMovie movie("-f lavfi -i testsrc2=s=98x50:r=25:d=0.08 -c:v libx264 -pix_fmt yuv420p");
    const auto reader = OpenVideo(movie.Path(), Code("2vuy"));
    ASSERT_TRUE(reader);
    struct Row {
        const char (&code)[5];
        ncfUInt32 bytes;
    };
    for (const Row& row :
         {Row{"2vuy", 98 * 50 * 2}, Row{"v210", 3 * 128 * 50}, Row{"BGRA", 98 * 50 * 4},
          Row{"NVZ2", 98 * 50 * 4}, Row{"b64a", 98 * 50 * 8}, Row{"r4fl", 98 * 50 * 16}}) {
        EXPECT_EQ(reader->SetOutputPixelFormat(Code(row.code), 0, 0), NCF_OK);
        EXPECT_EQ(reader->GetFrameBufferSize(0xFFFFFFFF, 0, 0), row.bytes) << row.code;
        EXPECT_EQ(Picture(*reader, 1).size(), row.bytes) << row.code;
    }
    EXPECT_LT(reader->SetOutputPixelFormat(Code("zzzz"), 0, 0), 0);
    EXPECT_EQ(reader->GetFrameBufferSize(0xFFFFFFFF, 0, 0), 98u * 50u * 16u);
}

TEST(VideoReader, StartsAndStopsAgain) {
    const MadeMovie movie(std::string(kFilm) + "-c:v mpeg4");
    const auto reader = OpenVideo(movie.Path(), Code("2vuy"));
    ASSERT_TRUE(reader);
    const Bytes first = Picture(*reader, 3);
    EXPECT_EQ(reader->InitQT(0), NCF_OK);
    EXPECT_EQ(reader->InitQT(7), NCF_E_INVALIDARG);
    EXPECT_EQ(reader->ReleaseQT(), NCF_OK);
    EXPECT_EQ(reader->ReleaseQT(), NCF_OK);
    NCFRESULT result = NCF_OK;
    Picture(*reader, 3, &result);
    EXPECT_EQ(result, NMA_E_NOTINITIALIZED);
    EXPECT_EQ(reader->InitQT(0), NCF_OK);
    EXPECT_EQ(Picture(*reader, 3), first);
    EXPECT_EQ(reader->ReservedVideoReaderOperation(), NCF_E_NOTIMPL);
    EXPECT_EQ(reader->ReadFrame(0, nullptr, 0, 0, 0), NCF_E_POINTER);
    Picture(*reader, 25, &result);
    EXPECT_EQ(result, NMA_E_NODATA);
    Picture(*reader, ~ncfUInt64{0}, &result);
    EXPECT_EQ(result, NMA_E_NODATA);
}

std::ptrdiff_t ThreadsRunning() {
    return std::distance(std::filesystem::directory_iterator("/proc/self/task"), {});
}

// A decoder has threads of its own where there are several processors.
TEST(VideoReader, HoldsNoDecoderWhileReleased) {
    if (std::thread::hardware_concurrency() < 2) {
        GTEST_SKIP() << "one processor, no threads to count";
    }
    const MadeMovie movie(std::string(kFilm) + "-c:v libx264 -pix_fmt yuv420p");
    std::thread([] {}).join();  // with the first a sanitizer starts one of its own
    const auto before = ThreadsRunning();
    const auto reader = OpenVideo(movie.Path(), Code("2vuy"));
    ASSERT_TRUE(reader);
    const Bytes first = Picture(*reader, 3);
    EXPECT_GT(ThreadsRunning(), before);
    EXPECT_EQ(reader->ReleaseQT(), NCF_OK);
    EXPECT_EQ(ThreadsRunning(), before);
    EXPECT_EQ(reader->InitQT(0), NCF_OK);
    EXPECT_EQ(Picture(*reader, 3), first);
    EXPECT_GT(ThreadsRunning(), before);
}

struct Made {
    const char* name;
    const char* arguments;
    const char* ending;
    double likeness = 58.0;  // less where chroma of other sitings is made otherwise
};
void PrintTo(const Made& made, std::ostream* out) {
    *out << made.name;
}

class EveryCodec : public testing::TestWithParam<Made> {
protected:
    static std::string Arguments() {
        return "-f lavfi -i testsrc2=s=96x64:r=25:d=2 " + std::string(GetParam().arguments);
    }
};

// The same pictures by any road: compared with those of the ffmpeg command.
TEST_P(EveryCodec, GivesEachPictureInAnyOrder) {
    const MadeMovie movie(Arguments(), GetParam().ending);
    ncfUInt64 count = 0;
    const Bytes all = AllOf(movie, "2vuy", &count);
    const Bytes reference =
        Interleaved422(movie.Decoded("-map 0:v:0 -vsync 0 " + std::string(kLinearPlanes) +
                                     " -f rawvideo -pix_fmt yuv422p"),
                       96, 64);
    ASSERT_EQ(all.size(), reference.size());
    EXPECT_GT(Psnr(all, reference), GetParam().likeness);
    ASSERT_GT(count, 1u);
    const std::size_t size = all.size() / count;
    const auto reader = OpenVideo(movie.Path(), Code("2vuy"));
    ASSERT_TRUE(reader);
    std::vector<ncfUInt64> order(count * 2);
    for (std::size_t i = 0; i < order.size(); ++i) {
        order[i] = i % count;
    }
    std::shuffle(order.begin(), order.end(), std::mt19937(7));
    for (ncfUInt64 i = count; i-- > 0;) {
        order.push_back(i);  // and straight back
    }
    for (const ncfUInt64 number : order) {
        const Bytes one = Picture(*reader, number);
        ASSERT_EQ(one.size(), size) << number;
        ASSERT_EQ(std::memcmp(one.data(), all.data() + number * size, size), 0) << number;
    }
}

INSTANTIATE_TEST_SUITE_P(
    VideoReader, EveryCodec,
    testing::Values(
        Made{"H264Closed", "-c:v libx264 -bf 2 -g 12 -pix_fmt yuv420p", ".mov"},
        Made{"H264Open", "-c:v libx264 -bf 3 -g 12 -x264-params open-gop=1 -pix_fmt yuv420p",
             ".mov"},
        Made{"H264OneGroup", "-c:v libx264 -bf 2 -g 250 -pix_fmt yuv420p", ".mov"},
        Made{"H264TenBit", "-c:v libx264 -bf 2 -g 12 -pix_fmt yuv422p10le", ".mov", 50.0},
        Made{"HevcOpen",
             "-c:v libx265 -x265-params log-level=none:keyint=12:open-gop=1 -pix_fmt "
             "yuv420p -tag:v hvc1",
             ".mov"},
        Made{"Mpeg2", "-c:v mpeg2video -bf 2 -g 12 -q:v 3 -pix_fmt yuv420p", ".mov"},
        Made{"Mpeg4", "-c:v mpeg4 -bf 2 -g 12 -q:v 3", ".mov"},
        Made{"Mjpeg", "-c:v mjpeg -q:v 2 -pix_fmt yuvj420p", ".mov"},
        Made{"ProRes", "-c:v prores_ks", ".mov", 50.0},
        Made{"Vp9", "-c:v libvpx-vp9 -deadline realtime -cpu-used 8 -g 12", ".mp4"},
        Made{"Animation", "-c:v qtrle -pix_fmt rgb24", ".mov", 25.0},
        Made{"Cinepak", "-c:v cinepak", ".mov", 25.0},
        Made{"Svq1", "-c:v svq1 -q:v 3", ".mov", 25.0},
        Made{"Fragmented",
             "-c:v libx264 -bf 2 -g 12 -pix_fmt yuv420p -movflags frag_keyframe+empty_moov",
             ".mp4"},
        Made{"Avi", "-c:v mpeg4 -g 12 -q:v 3", ".avi"},
        Made{"TransportStream", "-c:v libx264 -bf 2 -g 12 -pix_fmt yuv420p", ".ts"},
        Made{"ProgramStream", "-c:v mpeg2video -bf 2 -g 12 -q:v 3", ".mpg"},
        Made{"Matroska", "-c:v libx264 -bf 2 -g 12 -pix_fmt yuv420p", ".mkv"},
        Made{"Gif", "", ".gif", 25.0}),
    [](const auto& made) { return std::string(made.param.name); });

// Copying from the middle leaves an edit list that hides what comes before.
TEST(VideoReader, NumbersFromTheFirstPictureThatTheEditListShows) {
    const MadeMovie whole(
        "-f lavfi -i testsrc2=s=96x64:r=25:d=2 -c:v libx264 -bf 2 -g 25 -pix_fmt yuv420p");
    const MadeMovie cut("-ss 0.6 -i " + whole.Quoted() + " -c copy");
    ncfUInt64 count = 0;
    const Bytes shown = AllOf(cut, "2vuy", &count);
    EXPECT_EQ(count, 35u);
    const auto reader = OpenVideo(whole.Path(), Code("2vuy"));
    ASSERT_TRUE(reader);
    const Bytes first = Picture(*reader, 15);
    ASSERT_GE(shown.size(), first.size());
    EXPECT_TRUE(std::equal(first.begin(), first.end(), shown.begin()));
}

// Without a list of them all samples count as sync, though they are reordered.
TEST(VideoReader, NumbersAsShownWhereNoSyncSamplesAreListed) {
    const MadeMovie listed(
        "-f lavfi -i testsrc2=s=96x64:r=25:d=2 -c:v libx264 -bf 2 -g 12 -pix_fmt yuv420p");
    Bytes content = listed.Content();
    const char name[] = {'s', 't', 's', 's'};
    const auto at = std::search(content.begin(), content.end(), name, name + 4);
    ASSERT_NE(at, content.end());
    std::copy_n("free", 4, at);
    const MadeMovie movie(content, ".mov");
    ncfUInt64 count = 0;
    const Bytes wanted = AllOf(listed, "2vuy");
    EXPECT_EQ(AllOf(movie, "2vuy", &count), wanted);
    ASSERT_EQ(count, 50u);
    const std::size_t size = wanted.size() / count;
    const auto reader = OpenVideo(movie.Path(), Code("2vuy"));
    ASSERT_TRUE(reader);
    for (const ncfUInt64 number : {40, 3, 17, 49, 0, 11}) {
        const Bytes one = Picture(*reader, number);
        ASSERT_EQ(one.size(), size) << number;
        EXPECT_EQ(std::memcmp(one.data(), wanted.data() + number * size, size), 0) << number;
    }
    host::Ref<QTWrapper::IQTWSampleTable> table;
    ASSERT_EQ(OpenWrapper(movie.Path())->GetSampleTable(table.Out()), NCF_OK);
    EXPECT_NE(table->HasOutOfOrderFrameDependencies(1), 0);
}

TEST(VideoReader, ServesAStillPictureInAMovie) {
    const MadeMovie movie("-f lavfi -i testsrc2=s=64x48 -frames:v 1 -c:v png -pix_fmt rgb24");
    ncfUInt64 count = 0;
    ExpectEqual(AllOf(movie, "BGRA", &count), movie.Decoded("-f rawvideo -pix_fmt bgra"));
    EXPECT_EQ(count, 1u);
}

TEST(VideoReader, BringsPicturesOfAnotherSizeToTheStreamsOwn) {
    const MadeMovie small("-f lavfi -i color=red:s=32x32:r=25:d=0.2 -c:v mjpeg -q:v 1", ".mjpeg");
    const MadeMovie large("-f lavfi -i color=red:s=64x64:r=25:d=0.2 -c:v mjpeg -q:v 1", ".mjpeg");
    Bytes joined = large.Content();
    const Bytes tail = small.Content();
    joined.insert(joined.end(), tail.begin(), tail.end());
    const MadeMovie movie(joined, ".mjpeg");
    ncfUInt64 count = 0;
    const Bytes all = AllOf(movie, "BGRA", &count);
    EXPECT_EQ(count, 10u);
    ASSERT_EQ(all.size(), 10u * 64u * 64u * 4u);
    for (const std::size_t picture : {0u, 9u}) {
        const std::size_t middle = picture * 64 * 64 * 4 + (32 * 64 + 32) * 4;
        EXPECT_NEAR(all[middle + 2], 254, 4) << picture;
        EXPECT_NEAR(all[middle + 1], 0, 4) << picture;
    }
}

TEST(VideoReader, FailsForABrokenPictureAlone) {
    const MadeMovie whole("-f lavfi -i testsrc2=s=96x64:r=25:d=0.4 -c:v prores_ks");
    const auto packets = whole.Probed("-show_entries packet=pos,size");
    ASSERT_EQ(packets.size(), 10u);
    const std::string fourth = packets[4];  // size, then place
    const std::size_t size = std::stoul(fourth);
    const std::size_t place = std::stoul(fourth.substr(fourth.find(',') + 1));
    Bytes content = whole.Content();
    std::fill_n(content.begin() + static_cast<std::ptrdiff_t>(place + 4), size - 4,
                std::uint8_t{0x55});
    const MadeMovie broken(content, ".mov");
    const auto good = OpenVideo(whole.Path(), Code("v210"));
    const auto reader = OpenVideo(broken.Path(), Code("v210"));
    ASSERT_TRUE(good && reader);
    for (const ncfUInt64 number : {0u, 3u, 4u, 5u, 4u, 9u, 4u, 3u}) {
        NCFRESULT result = NCF_OK;
        const Bytes one = Picture(*reader, number, &result);
        if (number == 4) {
            EXPECT_EQ(result, NCF_E_FAIL);
        } else {
            EXPECT_EQ(result, NCF_OK) << number;
            EXPECT_EQ(one, Picture(*good, number)) << number;
        }
    }
}

TEST(VideoReader, ServesWhatACutFileStillHolds) {
    const MadeMovie whole(
        "-f lavfi -i testsrc2=s=96x64:r=25:d=1 -c:v prores_ks -movflags +faststart");
    Bytes content = whole.Content();
    content.resize(content.size() / 2);
    const MadeMovie cut(content, ".mov");
    const auto good = OpenVideo(whole.Path(), Code("v210"));
    const auto reader = OpenVideo(cut.Path(), Code("v210"));
    ASSERT_TRUE(good && reader);
    NCFRESULT result = NCF_OK;
    Picture(*reader, 20, &result);
    EXPECT_LT(result, 0);
    EXPECT_EQ(Picture(*reader, 3), Picture(*good, 3));
}

}  // namespace
