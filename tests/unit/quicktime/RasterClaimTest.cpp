// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/quicktime/RasterClaim.h"

#include "reference_host/quicktime/HeaderLook.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <string>

#include "reference_host/quicktime/MovieFile.h"
#include "reference_host/quicktime/PictureReader.h"
#include "tests/unit/quicktime/MadeMovie.h"

using namespace quicktime_tests;

namespace {

// The movie with another size in its sample description.
MadeMovie Retold(const MadeMovie& movie, unsigned width, unsigned height) {
    Bytes bytes = movie.Content();
    const std::string table = "stsd";
    const auto at = std::search(bytes.begin(), bytes.end(), table.begin(), table.end());
    EXPECT_GT(bytes.end() - at, 48);
    const unsigned values[] = {width >> 8, width & 255, height >> 8, height & 255};
    for (std::ptrdiff_t i = 0; i < 4; ++i) {
        at[44 + i] = static_cast<std::uint8_t>(values[i]);
    }
    return MadeMovie(bytes, ".mov");
}

std::string ClaimOf(const MadeMovie& movie) {
    const std::string claim = host::FindImpossibleRaster(movie.Path(), 0);
    const auto reader = host::PictureReader::Open(movie.Path(), 0, true);
    if (claim.empty()) {
        EXPECT_TRUE(reader);
    }
    return claim;
}

constexpr const char* kEncoders[] = {"libx264", "prores_ks", "mjpeg", "png",      "qtrle", "smc",
                                     "cinepak", "jpeg2000",  "v210",  "rawvideo", "targa", "mpeg4"};

class EveryRaster : public testing::TestWithParam<const char*> {
protected:
    const MadeMovie movie{
        std::string("-f lavfi -i testsrc=s=64x48:r=25 -frames:v 3 -c:v ") + GetParam(), ".mov"};
};

TEST_P(EveryRaster, IsFineAsItIs) {
    EXPECT_EQ(ClaimOf(movie), "");
    EXPECT_EQ(ClaimOf(Retold(movie, 80, 48)), "") << "a little more";
    EXPECT_EQ(ClaimOf(Retold(movie, 4096, 4096)), "") << "as large as is always fine";
}

TEST_P(EveryRaster, CantBeFarLargerThanTheSamplesHold) {
    const MadeMovie retold = Retold(movie, 16384, 8640);
    const std::string claim = ClaimOf(retold);
    EXPECT_EQ(claim.find("the file claims pictures of 16384 x 8640, "), 0u) << claim;
    EXPECT_FALSE(host::PictureReader::Open(retold.Path(), 0, true));
}

INSTANTIATE_TEST_SUITE_P(RasterClaim, EveryRaster, testing::ValuesIn(kEncoders),
                         [](const auto& each) { return std::string(each.param); });

// One colour packs best.
TEST(RasterClaim, OfLargePicturesOfOneColourIsTrue) {
    for (const char* const encoder :
         {"libx264 -preset ultrafast", "mjpeg", "png -pred none", "qtrle"}) {
        SCOPED_TRACE(encoder);
        const MadeMovie movie(std::string("-f lavfi -i color=s=4112x4100:c=red:r=25 "
                                          "-frames:v 1 -c:v ") +
                              encoder);
        EXPECT_EQ(host::FindImpossibleRaster(movie.Path(), 0), "");
    }
}

TEST(RasterClaim, OfLargePicturesIsSeenInTheHeader) {
    const MadeMovie movie("-f lavfi -i testsrc=s=64x48:r=25 -f lavfi -i sine -t 0.1 -c:v mpeg4",
                          ".mov");
    EXPECT_FALSE(host::TellsLargePictures(movie.Path()));
    EXPECT_FALSE(host::TellsLargePictures(Retold(movie, 4096, 4096).Path()));
    EXPECT_TRUE(host::TellsLargePictures(Retold(movie, 4096, 4097).Path()));
}

// The library would take the size that the samples tell.
TEST(RasterClaim, OfMpeg4IsThatOfItsDescription) {
    const MadeMovie movie("-f lavfi -i testsrc=s=64x48:r=25 -frames:v 3 -c:v mpeg4", ".mov");
    const MadeMovie retold = Retold(movie, 80, 60);
    std::string reason;
    const auto opened = host::MovieFile::Open(retold.Path(), reason);
    ASSERT_TRUE(opened) << reason;
    const auto raster = opened->RasterOf(opened->FirstVideo());
    EXPECT_EQ(raster.width, 80);
    EXPECT_EQ(raster.height, 60);
}

// The decoder is told how much it may ask for, so that nothing is allocated.
TEST(RasterClaim, IsABoundForTheDecoderToo) {
    const MadeMovie movie("-f lavfi -i color=s=4800x4800:r=25 -frames:v 1 -c:v mjpeg");
    const MadeMovie retold = Retold(movie, 64, 48);
    EXPECT_EQ(host::FindImpossibleRaster(retold.Path(), 0),
              "the file claims pictures of 64 x 48, but its samples hold pictures of 4800 x 4800");
    const auto reader = host::PictureReader::Open(retold.Path(), 0, true);
    std::shared_ptr<const AVFrame> frame;
    ASSERT_TRUE(reader);
    EXPECT_EQ(reader->Read(0, frame), NCF_E_FAIL);
}

}  // namespace
