// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include <limits>

#include "tests/unit/clips/ClipFixture.h"

namespace {

class QuickTimeClipGeometry : public ClipTest {
protected:
    QuickTimeClipGeometry() { parser->AddVideoTrack(1); }

    BoundsBox SourceOf(ncfUInt16 width, ncfUInt16 height, ncfUInt32 numerator,
                       ncfUInt32 denominator) {
        Picture().width = width;
        Picture().height = height;
        Picture().aspectNumerator = numerator;
        Picture().aspectDenominator = denominator;
        Load();
        GeometryDetails details;
        EXPECT_EQ(clip->GetGeometryDetails(&details), NCF_OK);
        for (const BoundsBox* box : {&details.framing, &details.valid, &details.essence}) {
            EXPECT_EQ(box->positionX, details.source.positionX);
            EXPECT_EQ(box->positionY, details.source.positionY);
            EXPECT_EQ(box->width, details.source.width);
            EXPECT_EQ(box->height, details.source.height);
        }
        return details.source;
    }
    void ExpectSize(const BoundsBox& box, Rational width, Rational height) {
        EXPECT_EQ(box.width.numerator, width.numerator);
        EXPECT_EQ(box.width.denominator, width.denominator);
        EXPECT_EQ(box.height.numerator, height.numerator);
        EXPECT_EQ(box.height.denominator, height.denominator);
    }
};

}  // namespace

TEST_F(QuickTimeClipGeometry, CentresHighDefinitionOnTheOrigin) {
    const BoundsBox box = SourceOf(1920, 1080, 16, 9);
    ExpectSize(box, {1600, 1}, {900, 1});
    EXPECT_EQ(box.positionX, (Rational{-800, 1}));
    EXPECT_EQ(box.positionY, (Rational{-450, 1}));
}

TEST_F(QuickTimeClipGeometry, ScalesEveryHighDefinitionRaster) {
    ExpectSize(SourceOf(1280, 720, 16, 9), {1600, 1}, {900, 1});
    ExpectSize(SourceOf(1440, 1080, 16, 9), {1600, 1}, {900, 1});
    ExpectSize(SourceOf(1280, 1080, 16, 9), {1600, 1}, {900, 1});
}

TEST_F(QuickTimeClipGeometry, ScalesStandardRasters) {
    ExpectSize(SourceOf(720, 486, 4, 3), {1200, 1}, {900, 1});
    ExpectSize(SourceOf(720, 576, 4, 3), {1200, 1}, {900, 1});
    ExpectSize(SourceOf(720, 576, 16, 9), {1600, 1}, {900, 1});
    // In proportion to a width of 720.
    ExpectSize(SourceOf(704, 576, 16, 9), {6758400, 4320}, {880, 1});
}

TEST_F(QuickTimeClipGeometry, LeavesOtherRastersUnscaled) {
    ExpectSize(SourceOf(1920, 1080, 4, 3), {1600, 1}, {1200, 1});
    ExpectSize(SourceOf(320, 240, 4, 3), {1600, 6}, {200, 1});
    ExpectSize(SourceOf(3840, 2160, 16, 9), {3200, 1}, {1800, 1});
}

TEST_F(QuickTimeClipGeometry, TellsStandardRastersByTheirAreaWithin15PerCent) {
    // 640 x 480 is 0.889 of 720 x 480, 640 x 450 is 0.833 of it.
    ExpectSize(SourceOf(640, 480, 4, 3), {1200, 1}, {900, 1});
    ExpectSize(SourceOf(640, 450, 4, 3), {3200, 6}, {400, 1});
    // From 487 lines on the area is that of 720 x 576.
    ExpectSize(SourceOf(720, 487, 4, 3), {600, 1}, {450, 1});   // 0.845
    ExpectSize(SourceOf(720, 490, 4, 3), {1200, 1}, {900, 1});  // 0.851
    // Upwards too.
    ExpectSize(SourceOf(768, 576, 4, 3), {1200, 1}, {900, 1});  // 1.067
    ExpectSize(SourceOf(800, 600, 4, 3), {4000, 6}, {500, 1});  // 1.157
}

TEST_F(QuickTimeClipGeometry, KeepsFractionsThatDoNotDivide) {
    const BoundsBox box = SourceOf(1000, 1000, 1, 1);
    ExpectSize(box, {5000, 6}, {5000, 6});
    EXPECT_EQ(box.positionX, (Rational{-5000, 12}));
    EXPECT_EQ(box.positionY, (Rational{-5000, 12}));
}

TEST_F(QuickTimeClipGeometry, TakesTheRatioByItsTwoNumbersOnly) {
    // 32/18 is the same ratio, but not the same numbers.
    ExpectSize(SourceOf(720, 576, 32, 18), {600, 1}, {10800, 32});
    ExpectSize(SourceOf(720, 576, 8, 6), {600, 1}, {450, 1});
    // One of the two alone is not enough.
    const std::pair<ncfUInt32, ncfUInt32> kHalves[] = {{16, 15}, {5, 9}, {4, 5}, {5, 3}};
    for (const auto& [numerator, denominator] : kHalves) {
        EXPECT_EQ(SourceOf(720, 576, numerator, denominator).width, (Rational{600, 1}))
            << numerator << ":" << denominator;
    }
}

TEST_F(QuickTimeClipGeometry, SwapsWidthAndHeightOfRotatedMovies) {
    Video().matrix[0] = 0;
    Video().matrix[1] = 1;
    const BoundsBox box = SourceOf(1920, 1080, 16, 9);
    // The ratio stays as it is.
    ExpectSize(box, {900, 1}, {8100, 16});
    ncfUInt32 width = 0;
    ncfUInt32 height = 0;
    clip->GetEncodedWidthAndHeight(&width, &height);
    EXPECT_EQ(width, 1920u);
    EXPECT_EQ(height, 1080u);
}

TEST_F(QuickTimeClipGeometry, RoundsTheMatrixToTellRotation) {
    struct {
        float a;
        float b;
        bool rotated;
    } const kMatrices[] = {
        {0.4f, 0.6f, true},  {0.0f, 0.5f, true},
        {0.0f, 1.0f, true},  {-1.4f, 1.4f, true},  // cutting towards zero
        {0.5f, 1.0f, false}, {0.0f, 0.4f, false},
        {0.0f, 1.5f, false}, {0.0f, -1.0f, false},  // the other way round
        {1.0f, 0.0f, false}, {1e30f, 1.0f, false},
    };
    for (const auto& matrix : kMatrices) {
        Video().matrix[0] = matrix.a;
        Video().matrix[1] = matrix.b;
        const BoundsBox box = SourceOf(1920, 1080, 16, 9);
        EXPECT_EQ(box.width.numerator == 900, matrix.rotated) << matrix.a << ", " << matrix.b;
    }
    Video().results["GetTrackMatrix"] = NCF_E_FAIL;
    EXPECT_EQ(SourceOf(1920, 1080, 16, 9).width.numerator, 1600) << "without a matrix";
}

TEST_F(QuickTimeClipGeometry, WrapsLargeNumbersAt32Bits) {
    // 65535 * 5 * 60001 leaves the range and comes back negative.
    const BoundsBox box = SourceOf(65535, 65535, 70001, 60001);
    ExpectSize(box, {327675, 6}, {-1814008805, 420006});
    EXPECT_EQ(box.positionY, (Rational{1814008805, 840012}));
}

TEST_F(QuickTimeClipGeometry, DoesNotDivideTheLeastNumberByMinusOne) {
    // 1600 * 2^25 wraps to the least number there is; its opposite has no
    // place.
    const BoundsBox box = SourceOf(1920, 1080, 0xFFFFFFFFu, 1u << 25);
    ExpectSize(box, {1600, 1}, {std::numeric_limits<ncfSInt32>::min(), -1});
    EXPECT_EQ(box.positionY, (Rational{1 << 30, 1}));
}

TEST_F(QuickTimeClipGeometry, ChecksItsOutput) {
    Load();
    EXPECT_EQ(clip->GetGeometryDetails(nullptr), NCF_E_INVALIDARG);
}
