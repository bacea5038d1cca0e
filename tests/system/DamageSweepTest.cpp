// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// Movies whose headers are cut at every byte, or have bits turned over: each is
// answered within a second, by a description or by a failure that names the
// file, and nothing is left behind.

#include <algorithm>
#include <chrono>

#include "host_interfaces/quicktime/QuickTimeWrapper.h"
#include "reference_host/cliphost/AafTree.h"
#include "reference_host/cliphost/Describe.h"
#include "reference_host/cliphost/RouteTaken.h"
#include "tests/system/Facts.h"
#include "tests/system/SystemTest.h"

namespace {

// With every kind of track and most of the optional atoms.
movies::Movie SmallMovie(movies::Place header) {
    movies::VideoFormat picture;
    picture.codec = "apcn";
    picture.fields = {1u, 0u};
    picture.nclc = {1u, 1u, 1u};
    picture.pixelAspect = {1u, 1u};
    movies::SoundFormat sound;
    sound.codec = "in24";
    sound.version = 1;
    sound.bits = 24;
    sound.wave = true;
    sound.littleEndian = true;
    movies::Movie movie;
    movie.header = header;
    movie.tracks.push_back(movies::VideoTrack(picture, 20, 25, 1, 64));
    movie.tracks[0].edits = {{480, 0, 1.0}};
    movie.tracks.push_back(movies::SoundTrack(sound, 4800));
    movie.tracks.push_back(movies::TimecodeTrack(movies::TimecodeFormat(), 90000, 20));
    return movie;
}

class DamageSweep : public SystemTest {
protected:
    // Answers a damaged movie; true when it could be described all the same.
    bool Survives(const movies::Bytes& bytes, const std::string& what) {
        SCOPED_TRACE(what);
        const auto file = Write(bytes, "damaged.mov");
        const auto start = std::chrono::steady_clock::now();
        const cliphost::Description description = cliphost::DescribeMovie(session(), file);
        const auto taken = std::chrono::steady_clock::now() - start;
        EXPECT_LT(taken, std::chrono::seconds(1));
        EXPECT_EQ(description.result >= 0, static_cast<bool>(description.file));
        if (description.file) {
            EXPECT_EQ(Parts(cliphost::ReadTree(description.file.get()), "Mobs").size(), 3u);
            return true;
        }
        const std::string line = LineOf(description.problem);
        EXPECT_NE(line.find(file.string()), std::string::npos);
        // Why the header parser refuses it is never withheld.
        if (!cliphost::RouteOf(file).reason.empty()) {
            EXPECT_EQ(line.find("does not say why"), std::string::npos) << line;
        }
        return false;
    }

    // Cuts within the header; counts what is described all the same.
    int CutEverywhere(const movies::Bytes& whole, std::size_t from, std::size_t to) {
        EXPECT_TRUE(Survives(whole, "whole"));
        int described = 0;
        for (std::size_t size = from; size < to && !HasFailure(); ++size) {
            const movies::Bytes cut(whole.begin(),
                                    whole.begin() + static_cast<std::ptrdiff_t>(size));
            described += Survives(cut, "cut at " + std::to_string(size));
        }
        EXPECT_TRUE(ModuleIsIdle());
        return described;
    }

    // Leaves the header parser alone with the movies.
    void RefuseTheWrapper() {
        session().host().factory().SetRule([](const host::CreationCall& call) {
            return call.component == QTWrapper::CompID_QuickTimeWrapper ? NCF_E_OUTOFMEMORY
                                                                        : NCF_OK;
        });
    }

    void TurnBits(movies::Bytes bytes, std::size_t from, std::size_t to, std::size_t step,
                  bool all) {
        int described = 0, refused = 0;
        for (std::size_t i = from; i < to; i += step) {
            for (unsigned bit = 0; bit < 8; ++bit) {
                if (!all && bit != i * 5 % 8) {
                    continue;
                }
                bytes[i] ^= static_cast<std::uint8_t>(1u << bit);
                const std::string what =
                    "byte " + std::to_string(i) + " bit " + std::to_string(bit);
                ++(Survives(bytes, what) ? described : refused);
                bytes[i] ^= static_cast<std::uint8_t>(1u << bit);
                ASSERT_FALSE(HasFailure());
            }
        }
        EXPECT_TRUE(ModuleIsIdle());
        // Some fields matter, some do not.
        EXPECT_GT(described, 0);
        EXPECT_GT(refused, 0);
    }
};

TEST_F(DamageSweep, HeaderInFrontCutAtEveryByte) {
    RefuseTheWrapper();
    const movies::MadeMovie made = movies::Build(SmallMovie(movies::Place::kBeforeMedia));
    EXPECT_EQ(CutEverywhere(made.ToBytes(), 0, made.headerPosition + made.headerSize), 0);
}

// What the header parser gives up the wrapper may still open, as far as it goes.
TEST_F(DamageSweep, CutHeadersMayBeOpenedByTheWrapper) {
    const movies::MadeMovie made = movies::Build(SmallMovie(movies::Place::kBeforeMedia));
    const auto end = made.headerPosition + made.headerSize;
    const int described = CutEverywhere(made.ToBytes(), 0, end);
    EXPECT_GT(described, 0);
    EXPECT_LT(described, static_cast<int>(end));
}

// The module reads whole sectors and does not tell the parser where the file
// ends in the last of them: what is cut there reads as zeros. So a movie may
// lose its last track, the timecode's, and still be described; never more.
TEST_F(DamageSweep, HeaderBehindCutAtEveryByte) {
    RefuseTheWrapper();
    movies::Movie movie = SmallMovie(movies::Place::kBehindMedia);
    const movies::MadeMovie made = movies::Build(movie);
    movie.tracks.pop_back();
    const auto lastTrack = made.headerSize - movies::Build(movie).headerSize;
    EXPECT_EQ(CutEverywhere(made.ToBytes(), made.headerPosition, made.size - lastTrack), 0);
    EXPECT_LT(CutEverywhere(made.ToBytes(), made.size - lastTrack, made.size),
              static_cast<int>(lastTrack));
}

TEST_F(DamageSweep, CompressedHeaderCutAtEveryByte) {
    movies::Movie movie = SmallMovie(movies::Place::kBeforeMedia);
    movie.compressed = true;
    const movies::MadeMovie made = movies::Build(movie);
    EXPECT_EQ(
        CutEverywhere(made.ToBytes(), made.headerPosition, made.headerPosition + made.headerSize),
        0);
}

TEST_F(DamageSweep, OneBitOfEveryByteOfTheHeaderTurned) {
    const movies::MadeMovie made = movies::Build(SmallMovie(movies::Place::kBeforeMedia));
    TurnBits(made.ToBytes(), made.headerPosition, made.headerPosition + made.headerSize, 1, false);
}

TEST_F(DamageSweep, EveryBitOfSomeBytesOfTheHeaderTurned) {
    const movies::MadeMovie made = movies::Build(SmallMovie(movies::Place::kBehindMedia));
    TurnBits(made.ToBytes(), made.headerPosition, made.size, 13, true);
}

TEST_F(DamageSweep, BitsOfACompressedHeaderTurned) {
    movies::Movie movie = SmallMovie(movies::Place::kBeforeMedia);
    movie.compressed = true;
    const movies::MadeMovie made = movies::Build(movie);
    TurnBits(made.ToBytes(), made.headerPosition, made.headerPosition + made.headerSize, 1, false);
}

// Sound of this movie is asked of FFmpeg, which reads the damage too.
TEST_F(DamageSweep, BitsOfAMovieByFfmpegTurned) {
    const movies::Bytes bytes = ReadFile(MadeMovie("h264_with_aac.mov"));
    const std::string mark = "moov";
    const auto moov = std::search(bytes.begin(), bytes.end(), mark.begin(), mark.end());
    ASSERT_NE(moov, bytes.end());
    TurnBits(bytes, static_cast<std::size_t>(moov - bytes.begin()), bytes.size(), 3, false);
}

}  // namespace
