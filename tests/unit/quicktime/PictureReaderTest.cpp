// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include <gtest/gtest.h>

#include <algorithm>
#include <filesystem>
#include <fstream>

#include "reference_host/quicktime/OpenInput.h"
#include "reference_host/quicktime/PictureReader.h"
#include "tests/support/Quoted.h"
#include "tests/unit/quicktime/MadeMovie.h"

using namespace quicktime_tests;

namespace {

std::unique_ptr<host::PictureReader> Open(const MadeMovie& movie) {
    return host::PictureReader::Open(movie.Path(), 0, true);
}

// Decoders look ahead by their threads and their reordering.
constexpr ncfUInt64 kAhead = 80;

TEST(PictureReader, DecodesEachPacketOnceGoingForward) {
    const MadeMovie movie("-f lavfi -i testsrc2=s=64x48:r=25:d=8 -c:v libx264 -bf 2 -g 50");
    const auto reader = Open(movie);
    ASSERT_TRUE(reader);
    std::shared_ptr<const AVFrame> frame;
    for (std::size_t i = 0; i < 200; ++i) {
        ASSERT_EQ(reader->Read(i, frame), NCF_OK);
    }
    EXPECT_EQ(reader->DecodedPackets(), 200u);
}

TEST(PictureReader, DecodesAGroupOnceForStepsBackWithinIt) {
    const MadeMovie movie("-f lavfi -i testsrc2=s=64x48:r=25:d=8 -c:v libx264 -bf 2 -g 200");
    const auto reader = Open(movie);
    ASSERT_TRUE(reader);
    std::shared_ptr<const AVFrame> frame;
    ASSERT_EQ(reader->Read(150, frame), NCF_OK);
    const ncfUInt64 before = reader->DecodedPackets();
    for (std::size_t i = 150; i-- > 0;) {
        ASSERT_EQ(reader->Read(i, frame), NCF_OK);
    }
    EXPECT_LE(reader->DecodedPackets() - before, 150 + kAhead);
}

TEST(PictureReader, JumpsToTheNearestSyncSample) {
    const MadeMovie movie(
        "-f lavfi -i testsrc2=s=64x48:r=25:d=20 -c:v libx264 -bf 2 -g 25 -threads 1");
    const auto reader = Open(movie);
    ASSERT_TRUE(reader);
    std::shared_ptr<const AVFrame> frame;
    ASSERT_EQ(reader->Read(455, frame), NCF_OK);
    EXPECT_LE(reader->DecodedPackets(), 6 + kAhead);
    EXPECT_EQ(reader->Read(500, frame), NMA_E_NODATA);
    EXPECT_FALSE(frame);
}

// Luma alone tells pictures apart.
Bytes Luma(const AVFrame& frame) {
    Bytes bytes;
    for (int y = 0; y < frame.height; ++y) {
        const std::uint8_t* const line = frame.data[0] + std::ptrdiff_t{y} * frame.linesize[0];
        bytes.insert(bytes.end(), line, line + frame.width);
    }
    return bytes;
}

// Pictures on the way that no other leans on are passed over, which must change nothing.
TEST(PictureReader, GivesTheSamePictureAfterAJumpAsInSequence) {
    for (const char* const codec :
         {"libx264 -bf 3 -x264-params b-pyramid=none", "libx264 -bf 3 -flags +ildct+ilme",
          "libx265 -bf 3 -x265-params log-level=none", "mpeg2video -bf 2", "mpeg4 -bf 2",
          "libx264 -x264-params open-gop=1"}) {
        SCOPED_TRACE(codec);
        const MadeMovie movie("-f lavfi -i testsrc2=s=96x64:r=25:d=4 -g 40 -pix_fmt yuv420p -c:v " +
                              std::string(codec));
        const auto inSequence = Open(movie);
        const auto jumping = Open(movie);
        ASSERT_TRUE(inSequence && jumping);
        std::vector<Bytes> pictures;
        std::shared_ptr<const AVFrame> frame;
        for (std::size_t i = 0; i < 100; ++i) {
            ASSERT_EQ(inSequence->Read(i, frame), NCF_OK) << i;
            pictures.push_back(Luma(*frame));
        }
        for (const std::size_t i :
             {36u, 37u, 20u, 75u, 99u, 98u, 30u, 31u, 39u, 40u, 79u, 5u, 38u}) {
            ASSERT_EQ(jumping->Read(i, frame), NCF_OK) << i;
            EXPECT_EQ(Luma(*frame), pictures[i]) << i;
        }
    }
}

// The same movie without its list of sync samples, which claims that all are.
MadeMovie ClaimingAllSync(const MadeMovie& movie) {
    Bytes bytes = movie.Content();
    const std::string list = "stss";
    const auto at = std::search(bytes.begin(), bytes.end(), list.begin(), list.end());
    std::copy_n("free", at == bytes.end() ? 0 : list.size(), at);
    return MadeMovie(bytes, ".mov");
}

// Where decoding can begin, content tells, and nothing for some codecs.
TEST(PictureReader, GivesTheSamePictureAfterAJumpWhereAllSamplesClaimToBeSync) {
    for (const char* const codec :
         {"libx264 -bf 0 -pix_fmt yuv420p",
          "libx264 -bf 3 -pix_fmt yuv420p",
          "libx264 -x264-params open-gop=1 -pix_fmt yuv420p",
          "libx264 -bf 0 -x264-params intra-refresh=1:keyint=40 -pix_fmt yuv420p",
          "libx265 -bf 0 -x265-params log-level=none",
          "libx265 -bf 3 -x265-params log-level=none",
          "mpeg2video",
          "mpeg2video -bf 2",
          "mpeg1video",
          "mpeg4",
          "mpeg4 -bf 2",
          "h263 -s 352x288",
          "libvpx-vp9 -f mp4",
          "qtrle",
          "qtrle -pix_fmt argb",
          "qtrle -pix_fmt rgb555be",
          "qtrle -pix_fmt gray",
          "rpza -s 480x272",
          "cinepak",
          "svq1 -s 352x288"}) {
        SCOPED_TRACE(codec);
        const MadeMovie movie("-f lavfi -i testsrc2=s=96x64:r=25:d=3 -g 20 -c:v " +
                              std::string(codec));
        const MadeMovie claiming = ClaimingAllSync(movie);
        const auto inSequence = Open(movie);
        const auto jumping = Open(claiming);
        ASSERT_TRUE(inSequence && jumping);
        ASSERT_EQ(jumping->Count(), inSequence->Count());
        std::vector<Bytes> pictures;
        std::shared_ptr<const AVFrame> frame;
        for (std::size_t i = 0; i < inSequence->Count(); ++i) {
            ASSERT_EQ(inSequence->Read(i, frame), NCF_OK) << i;
            pictures.push_back(Luma(*frame));
        }
        for (const std::size_t i :
             {36u, 37u, 50u, 20u, 70u, 69u, 30u, 31u, 39u, 40u, 5u, 38u, 41u, 6u, 42u}) {
            ASSERT_EQ(jumping->Read(i, frame), NCF_OK) << i;
            EXPECT_EQ(Luma(*frame), pictures[i]) << i;
        }
    }
}

TEST(PictureReader, KnowsReorderedPicturesFarBehindTheFirst) {
    const std::string source = "-f lavfi -i testsrc2=s=96x64:r=25:d=2 -g 20 -pix_fmt yuv420p ";
    const MadeMovie plain(source + "-c:v libx264 -bf 0");
    const MadeMovie reordered(source + "-c:v libx264 -bf 2");
    const TestFolder folder;
    std::filesystem::copy_file(plain.Path(), folder.path() / "1.mov");
    std::filesystem::copy_file(reordered.Path(), folder.path() / "2.mov");
    std::ofstream(folder.path() / "list") << "ffconcat version 1.0\nfile 1.mov\nfile 2.mov\n";
    const MadeMovie both("-f concat -i " + Quoted(folder.path() / "list") + " -c copy");
    const MadeMovie claiming = ClaimingAllSync(both);
    const auto known = Open(both);
    const auto reader = Open(claiming);
    ASSERT_TRUE(known && reader);
    std::shared_ptr<const AVFrame> frame, expected;
    for (const std::size_t i : {62u, 63u, 65u, 80u, 99u, 10u}) {
        ASSERT_EQ(known->Read(i, expected), NCF_OK) << i;
        ASSERT_EQ(reader->Read(i, frame), NCF_OK) << i;
        EXPECT_EQ(Luma(*frame), Luma(*expected)) << i;
    }
}

// An empty sample shows the picture before it on.
TEST(PictureReader, ShowsThePictureBeforeWhereASampleIsEmpty) {
    const MadeMovie movie("-f lavfi -i testsrc2=s=96x64:r=25:d=1 -c:v mjpeg -g 1");
    Bytes bytes = movie.Content();
    const std::string sizes = "stsz";
    const auto table = std::search(bytes.begin(), bytes.end(), sizes.begin(), sizes.end());
    ASSERT_NE(table, bytes.end());
    // Its name, version, common size, count, and 24 sizes before the last.
    std::fill_n(table + 4 + 4 + 4 + 4 + 24 * 4, 4, std::uint8_t{0});
    const MadeMovie emptied(bytes, ".mov");
    const auto reader = Open(emptied);
    ASSERT_TRUE(reader);
    ASSERT_EQ(reader->Count(), 25u);
    std::shared_ptr<const AVFrame> last, before;
    ASSERT_EQ(reader->Read(24, last), NCF_OK);
    ASSERT_EQ(reader->Read(23, before), NCF_OK);
    EXPECT_EQ(Luma(*last), Luma(*before));
}

// Of pictures that are shown in another order all are looked at.
TEST(PacketList, KnowsTheSyncSamplesOfReorderedPicturesByContent) {
    const auto syncs = [](const MadeMovie& movie) {
        const host::InputOwner input =
            host::OpenForStream(movie.Path(), host::InputView::AsPresented, 0);
        std::vector<std::size_t> numbers;
        const auto packets = host::ListPackets(*input, 0, true);
        for (std::size_t i = 0; i < packets.size(); ++i) {
            if (packets[i].isSync) {
                numbers.push_back(i);
            }
        }
        return numbers;
    };
    for (const char* const codec :
         {"libx264", "libx265 -x265-params log-level=none", "mpeg2video", "mpeg4"}) {
        SCOPED_TRACE(codec);
        const MadeMovie movie(
            "-f lavfi -i testsrc2=s=96x64:r=25:d=3 -g 20 -bf 2 -pix_fmt yuv420p -c:v " +
            std::string(codec));
        EXPECT_EQ(syncs(ClaimingAllSync(movie)), syncs(movie));
        EXPECT_LT(syncs(movie).size(), 10u);
    }
}

TEST(PictureReader, LooksAtEachSampleOnceForTheClaim) {
    const MadeMovie movie(
        "-f lavfi -i testsrc2=s=64x48:r=25:d=12 -c:v libx264 -bf 0 -g 300 -sc_threshold 0 "
        "-pix_fmt yuv420p -threads 1");
    const MadeMovie claiming = ClaimingAllSync(movie);
    const auto reader = Open(claiming);
    ASSERT_TRUE(reader);
    std::shared_ptr<const AVFrame> frame;
    ASSERT_EQ(reader->Read(0, frame), NCF_OK);
    EXPECT_EQ(reader->PacketsLookedAt(), 0u);
    for (const std::size_t i : {290u, 30u, 270u, 150u, 280u, 20u, 299u, 10u}) {
        ASSERT_EQ(reader->Read(i, frame), NCF_OK) << i;
        EXPECT_LE(reader->PacketsLookedAt(), 299u);
    }
}

TEST(PictureReader, BelievesTheClaimWhereItIsTrue) {
    for (const char* const codec :
         {"libx264 -pix_fmt yuv420p -tune zerolatency -threads 1", "mpeg2video -threads 1", "qtrle",
          "qtrle -pix_fmt argb", "prores_ks -threads 1"}) {
        SCOPED_TRACE(codec);
        const MadeMovie movie("-f lavfi -i testsrc2=s=96x64:r=25:d=12 -g 1 -c:v " +
                              std::string(codec));
        const MadeMovie claiming = ClaimingAllSync(movie);
        const auto reader = Open(claiming);
        ASSERT_TRUE(reader);
        std::shared_ptr<const AVFrame> frame;
        for (const std::size_t i : {290u, 100u, 200u}) {
            ASSERT_EQ(reader->Read(i, frame), NCF_OK) << i;
        }
        EXPECT_LE(reader->DecodedPackets(), 3 + kAhead);
    }
}

// Reading begins at the sync sample, not a group before it.
TEST(PictureReader, ReadsNoGroupForNothing) {
    const MadeMovie movie(
        "-f lavfi -i testsrc2=s=64x48:r=25:d=20 -c:v libx264 -bf 2 -g 100 -threads 1");
    const auto reader = Open(movie);
    ASSERT_TRUE(reader);
    std::shared_ptr<const AVFrame> frame;
    for (const std::size_t picture : {301u, 101u, 401u, 201u}) {
        ASSERT_EQ(reader->Read(picture, frame), NCF_OK);
        EXPECT_EQ(reader->PacketsPassed(), 0u) << picture;
    }
}

TEST(PictureCache, KeepsThoseNearestWithinItsMemory) {
    const MadeMovie movie("-f lavfi -i testsrc2=s=64x48:r=25:d=1 -c:v prores_ks");
    const auto reader = Open(movie);
    std::shared_ptr<const AVFrame> frame;
    ASSERT_EQ(reader->Read(0, frame), NCF_OK);
    host::PictureCache one(std::size_t{1} << 30);
    one.Keep(0, frame, 0, 10);
    const std::size_t bytes = one.Bytes();
    ASSERT_GT(bytes, 0u);
    host::PictureCache cache(bytes * 3);
    for (std::size_t i = 0; i < 20; ++i) {
        cache.Keep(i, frame, 10, 100);
        EXPECT_LE(cache.Bytes(), bytes * 3);
    }
    EXPECT_TRUE(cache.Find(10));
    EXPECT_FALSE(cache.Find(0));
    cache.Keep(10, frame, 10, 1);
    EXPECT_EQ(cache.Count(), 1u);
    cache.Clear();
    EXPECT_EQ(cache.Bytes(), 0u);
}

TEST(PictureReader, GivesDecoderAndKeptPicturesBackAndMakesThemAnew) {
    const MadeMovie movie(
        "-f lavfi -i testsrc2=s=96x64:r=25:d=1 -c:v libx264 -bf 2 -g 12 -pix_fmt yuv420p");
    const auto reader = Open(movie);
    std::shared_ptr<const AVFrame> frame;
    std::vector<std::weak_ptr<const AVFrame>> kept;
    for (const std::size_t picture : {3u, 4u, 5u}) {
        ASSERT_EQ(reader->Read(picture, frame), NCF_OK);
        kept.push_back(frame);
    }
    const Bytes before(frame->data[0], frame->data[0] + frame->linesize[0] * frame->height);
    frame.reset();
    EXPECT_FALSE(kept.back().expired());
    EXPECT_TRUE(reader->HoldsDecoder());
    reader->Release();
    EXPECT_FALSE(reader->HoldsDecoder());
    for (const auto& each : kept) {
        EXPECT_TRUE(each.expired());
    }
    const auto decoded = reader->DecodedPackets();
    ASSERT_EQ(reader->Read(5, frame), NCF_OK);
    EXPECT_TRUE(reader->HoldsDecoder());
    EXPECT_GT(reader->DecodedPackets(), decoded);
    EXPECT_EQ(Bytes(frame->data[0], frame->data[0] + frame->linesize[0] * frame->height), before);
    reader->Release();
    reader->Release();
    EXPECT_EQ(reader->Read(25, frame), NMA_E_NODATA);
    EXPECT_FALSE(reader->HoldsDecoder()) << "nothing to decode";
    EXPECT_EQ(reader->Read(24, frame), NCF_OK);
}

}  // namespace
