// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// The kernels against a plain model of their formulas, one number at a time.

#include "source/essence/FloatConversion.h"

#include <gtest/gtest.h>

#include <array>
#include <cmath>

#include "source/essence/Avx2Kernels.h"
#include "tests/unit/essence/support/FloatValues.h"
#include "tests/unit/essence/support/NoLevels.h"

namespace {

using Bytes = std::vector<ncfUInt8>;
using Words = std::array<ncfUInt16, 4>;  // A R G B

NoLevels levels;

struct Weights {
    float Kr;
    float Kg;
    float Kb;
};
const Weights kModel601 = {0.299f, 0.587f, 0.114f};
const Weights kModel709 = {0.2126f, 0.7152f, 0.0722f};

// To the nearest, ties to even, within 0 to 65535; no number is 0.
ncfUInt16 Saturated(float value) {
    if (!(value > 0.0f)) {
        return 0;
    }
    return value >= 65535.0f ? 65535 : static_cast<ncfUInt16>(std::nearbyint(value));
}

Words VectorModel(const Weights& w, const float* pixel) {
    const float scale = 56064.0f;
    const float offset = 4096.0f;
    const float y = pixel[1] / (219.0f / 255.0f);
    const float cb = (pixel[2] - 128.0f / 255.0f) / (224.0f / 255.0f);
    const float cr = (pixel[3] - 128.0f / 255.0f) / (224.0f / 255.0f);
    const float crR = scale * 2.0f * (1.0f - w.Kr);
    const float cbG = scale * 2.0f * (w.Kb - 1.0f) * w.Kb / w.Kg;
    const float crG = scale * 2.0f * (w.Kr - 1.0f) * w.Kr / w.Kg;
    const float cbB = scale * 2.0f * (1.0f - w.Kb);
    return {Saturated(pixel[0] * 65535.0f), Saturated(y * scale + cr * crR + offset),
            Saturated(y * scale + cb * cbG + cr * crG + offset),
            Saturated(y * scale + cb * cbB + offset)};
}

ncfUInt16 CutOff(float value) {
    const double raised = static_cast<double>(value) + 0.5;
    if (std::isnan(raised) || std::fabs(raised) >= std::ldexp(1.0, 63)) {
        return 0;
    }
    return static_cast<ncfUInt16>(static_cast<std::int64_t>(raised));
}

ncfUInt16 ClampedAndCutOff(float value) {
    return std::isnan(value) ? 0 : CutOff(std::fmin(std::fmax(value, 0.0f), 65535.0f));
}

Words ScalarModel(const Weights& w, const float* pixel) {
    const float y = pixel[1] / (219.0f / 255.0f);
    const float cb = (pixel[2] - 128.0f / 255.0f) / (224.0f / 255.0f);
    const float cr = (pixel[3] - 128.0f / 255.0f) / (224.0f / 255.0f);
    const float b = cb / (0.5f / (1.0f - w.Kb)) + y;
    const float r = cr / (0.5f / (1.0f - w.Kr)) + y;
    const float g = (y - w.Kb * b - w.Kr * r) / w.Kg;
    return {CutOff(pixel[0] * 65535.0f), ClampedAndCutOff(r * 56064.0f + 4096.0f),
            ClampedAndCutOff(g * 56064.0f + 4096.0f), ClampedAndCutOff(b * 56064.0f + 4096.0f)};
}

Words PixelOf(const Bytes& frame, std::size_t pixel) {
    Words words;
    for (std::size_t i = 0; i < 4; ++i) {
        words[i] =
            static_cast<ncfUInt16>(frame[8 * pixel + 2 * i] << 8 | frame[8 * pixel + 2 * i + 1]);
    }
    return words;
}

Bytes Converted(const std::vector<float>& pixels, ncfUInt32 width, ncfUInt32 height) {
    Bytes out(std::size_t{width} * height * 8, 0xAA);
    ConvertR4flToB64a(BytesOf(pixels), out.data(), pixels.size() * 4, out.size(), width, height,
                      levels);
    return out;
}

// Pixels of the frame that differ from the model: groups of four by the vector
// rule, the rest of each row by the scalar rule.
int Differences(const std::vector<float>& pixels, const Bytes& frame, ncfUInt32 width,
                ncfUInt32 height, const Weights& weights) {
    int wrong = 0;
    for (std::size_t row = 0; row < height; ++row) {
        for (std::size_t x = 0; x < width; ++x) {
            const std::size_t at = row * width + x;
            const float* const pixel = &pixels[at * 4];
            const Words expected =
                x < width / 4 * 4 ? VectorModel(weights, pixel) : ScalarModel(weights, pixel);
            wrong += PixelOf(frame, at) != expected;
        }
    }
    return wrong;
}

TEST(FloatConversion, AgreesWithTheModelOverRandomAndEdgePixels) {
    for (ncfUInt32 width = 1; width <= 67; ++width) {
        const std::vector<float> pixels = RandomPixels(std::size_t{width} * 60, width);
        EXPECT_EQ(Differences(pixels, Converted(pixels, width, 60), width, 60, kModel601), 0)
            << width;
    }
    const std::vector<float> pixels = RandomPixels(963 * 720, 5);
    EXPECT_EQ(Differences(pixels, Converted(pixels, 963, 720), 963, 720, kModel709), 0);
}

TEST(FloatConversion, AgreesWithTheModelOverEveryPairOfEdges) {
    const std::vector<float> edges = EdgeFloats();
    std::vector<float> pixels;
    for (const float first : edges) {
        for (const float second : edges) {
            pixels.insert(pixels.end(), {first, second, first, second});
            pixels.insert(pixels.end(), {second, 0.5f, first, second});
        }
    }
    const auto count = static_cast<ncfUInt32>(pixels.size() / 4);
    EXPECT_EQ(Differences(pixels, Converted(pixels, count, 1), count, 1, kModel601), 0);
    EXPECT_EQ(Differences(pixels, Converted(pixels, 1, count), 1, count, kModel601), 0)
        << "one pixel a row: all scalar";
}

TEST(FloatConversion, MatrixGoesByTheSizeOfThePicture) {
    struct Case {
        ncfUInt32 width;
        ncfUInt32 height;
        const Weights& weights;
    };
    const Case cases[] = {{960, 720, kModel709},
                          {959, 720, kModel601},
                          {960, 719, kModel601},
                          {1920, 1080, kModel709},
                          {959, 1080, kModel601}};
    for (const Case& size : cases) {
        std::vector<float> pixels(std::size_t{size.width} * size.height * 4, 0.25f);
        const Bytes frame = Converted(pixels, size.width, size.height);
        EXPECT_EQ(PixelOf(frame, 0), VectorModel(size.weights, pixels.data()));
        EXPECT_NE(VectorModel(kModel601, pixels.data()), VectorModel(kModel709, pixels.data()));
        EXPECT_EQ(PixelOf(frame, size.width * size.height - 1),
                  size.width % 4 == 0 ? VectorModel(size.weights, pixels.data())
                                      : ScalarModel(size.weights, pixels.data()));
    }
}

TEST(FloatConversion, NeutralAndWhiteOnEitherPath) {
    const float neutral = 128.0f / 255.0f;
    for (const ncfUInt32 width : {3u, 4u}) {
        std::vector<float> pixels;
        for (ncfUInt32 i = 0; i < width; ++i) {
            pixels.insert(pixels.end(), {0.5f, 0.0f, neutral, neutral});
        }
        EXPECT_EQ(PixelOf(Converted(pixels, width, 1), 0), (Words{32768, 4096, 4096, 4096}));
        for (ncfUInt32 i = 0; i < width; ++i) {
            pixels[4 * i + 1] = 219.0f / 255.0f;
        }
        EXPECT_EQ(PixelOf(Converted(pixels, width, 1), 0), (Words{32768, 60160, 60160, 60160}));
    }
}

TEST(FloatConversion, AlphaSaturatesInGroupsOfFourAndWrapsInTheRest) {
    const auto alpha = [](float value, ncfUInt32 width) {
        const std::vector<float> pixels(width * 4, value);
        return PixelOf(Converted(pixels, width, 1), 0)[0];
    };
    EXPECT_EQ(alpha(1.5f, 4), 65535);
    EXPECT_EQ(alpha(1.5f, 3), 32767);
    EXPECT_EQ(alpha(-0.5f, 4), 0);
    EXPECT_EQ(alpha(-0.5f, 3), 32769);
    EXPECT_EQ(alpha(3e9f, 4), 65535) << "too large for 32 bits still saturates";
    EXPECT_EQ(alpha(std::nanf(""), 4), 0);
    EXPECT_EQ(alpha(std::nanf(""), 3), 0);
    EXPECT_EQ(alpha(std::numeric_limits<float>::infinity(), 4), 65535);
    EXPECT_EQ(alpha(std::numeric_limits<float>::infinity(), 3), 0);
    EXPECT_EQ(alpha(1e30f, 3), 0);
}

TEST(FloatConversion, TiesGoToEvenInGroupsOfFourAndUpInTheRest) {
    // An alpha that scales to exactly 0.5, and one to 2.5.
    for (const float half : {0.5f, 2.5f}) {
        const float alpha = half / 65535.0f;
        ASSERT_EQ(alpha * 65535.0f, half);
        const std::vector<float> pixels(16, alpha);
        EXPECT_EQ(PixelOf(Converted(pixels, 4, 1), 0)[0], half - 0.5f);
        EXPECT_EQ(PixelOf(Converted(pixels, 2, 1), 0)[0], half + 0.5f);
    }
}

TEST(FloatConversion, PathsDifferInFewWordsAndByOne) {
    const std::size_t count = 250000;
    std::mt19937 random(11);
    std::uniform_real_distribution<float> part(0.0f, 1.0f);
    std::vector<float> pixels(count * 4);
    for (float& value : pixels) {
        value = part(random);
    }
    Bytes vector(count * 8);
    Bytes scalar(count * 8);
    EXPECT_EQ(ConvertRowSse41(kRec709, BytesOf(pixels), vector.data(), count), count);
    ConvertRowScalar(kRec709, BytesOf(pixels), scalar.data(), count);
    int different = 0;
    for (std::size_t i = 0; i < count; ++i) {
        const Words one = PixelOf(vector, i);
        const Words other = PixelOf(scalar, i);
        for (std::size_t word = 0; word < 4; ++word) {
            different += one[word] != other[word];
            EXPECT_LE(std::abs(one[word] - other[word]), 1);
        }
    }
    EXPECT_GT(different, 0);
    EXPECT_LT(different, 5000) << "of a million";
}

// --- each vector kernel by itself ---------------------------------------------------------

struct VectorKernel {
    const char* name;
    RowKernel convert;
    std::size_t group;  // pixels
};

void PrintTo(const VectorKernel& kernel, std::ostream* out) {
    *out << kernel.name;
}

std::vector<VectorKernel> VectorKernels() {
    std::vector<VectorKernel> kernels = {{"SSE4.1", &ConvertRowSse41, 4}};
    if (const Avx2Kernels* const wide = FindAvx2Kernels()) {
        kernels.push_back({"AVX2", wide->convertRow, 8});
    }
    return kernels;
}

class VectorKernelTest : public testing::TestWithParam<VectorKernel> {
protected:
    static Bytes Row(const std::vector<float>& pixels) {
        Bytes out(pixels.size() * 2, 0xAA);
        const std::size_t count = pixels.size() / 4;
        EXPECT_EQ(GetParam().convert(kRec709, BytesOf(pixels), out.data(), count),
                  count / GetParam().group * GetParam().group);
        return out;
    }
};
INSTANTIATE_TEST_SUITE_P(FloatConversion, VectorKernelTest, testing::ValuesIn(VectorKernels()));

TEST_P(VectorKernelTest, AgreesWithTheModelOverRandomAndEdgePixels) {
    const std::vector<float> pixels = RandomPixels(100000, 8);
    const Bytes row = Row(pixels);
    int wrong = 0;
    for (std::size_t i = 0; i < 100000; ++i) {
        wrong += PixelOf(row, i) != VectorModel(kModel709, &pixels[4 * i]);
    }
    EXPECT_EQ(wrong, 0);
}

// Floats of every exponent and both signs, of no number and of numbers too small
// to be normal, in the place of each component.
TEST_P(VectorKernelTest, AgreesWithTheModelOverFloatsOfAllKinds) {
    for (std::size_t component = 0; component < 4; ++component) {
        std::vector<float> pixels;
        for (std::uint64_t bits = 0; bits < (std::uint64_t{1} << 32); bits += 32749) {
            float value = 0.0f;
            const auto low = static_cast<std::uint32_t>(bits);
            std::memcpy(&value, &low, sizeof value);
            const std::size_t at = pixels.size() + component;
            pixels.insert(pixels.end(), {0.25f, 0.5f, 0.75f, 0.375f});
            pixels[at] = value;
        }
        pixels.resize(pixels.size() / 32 * 32);
        const Bytes row = Row(pixels);
        int wrong = 0;
        for (std::size_t i = 0; i < pixels.size() / 4; ++i) {
            wrong += PixelOf(row, i) != VectorModel(kModel709, &pixels[4 * i]);
        }
        EXPECT_EQ(wrong, 0) << component;
    }
}

TEST_P(VectorKernelTest, WhatIsNoNumberIs0AndWhatIsTooLargeIs65535InEveryWord) {
    const float infinity = std::numeric_limits<float>::infinity();
    const auto word = [](float value) {
        const std::vector<float> pixels(8 * 4, value);
        const Bytes row = Row(pixels);
        const Words first = PixelOf(row, 0);
        for (std::size_t i = 1; i < 8; ++i) {
            EXPECT_EQ(PixelOf(row, i), first);
        }
        return first[0];
    };
    EXPECT_EQ(word(std::nanf("")), 0);
    EXPECT_EQ(word(-std::nanf("")), 0);
    EXPECT_EQ(word(std::numeric_limits<float>::signaling_NaN()), 0);
    EXPECT_EQ(word(3e9f), 65535);
    EXPECT_EQ(word(infinity), 65535);
    EXPECT_EQ(word(-3e9f), 0);
    EXPECT_EQ(word(-infinity), 0);
    EXPECT_EQ(word(-0.0f), 0);
    EXPECT_EQ(word(std::numeric_limits<float>::denorm_min()), 0);
}

TEST_P(VectorKernelTest, AlignmentChangesNoWord) {
    const std::vector<float> pixels = RandomPixels(64, 3);
    alignas(32) ncfUInt8 source[64 * 16 + 32];
    alignas(32) ncfUInt8 destination[64 * 8 + 32];
    const Bytes expected = Row(pixels);
    for (std::size_t from = 0; from < 32; ++from) {
        for (std::size_t to = 0; to < 32; ++to) {
            std::memcpy(source + from, pixels.data(), 64 * 16);
            ASSERT_EQ(GetParam().convert(kRec709, source + from, destination + to, 64), 64u);
            ASSERT_EQ(Bytes(destination + to, destination + to + 64 * 8), expected);
        }
    }
}

TEST_P(VectorKernelTest, DoesWholeGroupsOnly) {
    const std::vector<float> pixels(31 * 4, 0.5f);
    for (std::size_t count = 0; count <= 31; ++count) {
        const std::size_t done = count / GetParam().group * GetParam().group;
        Bytes out(31 * 8, 0xAA);
        EXPECT_EQ(GetParam().convert(kRec601, BytesOf(pixels), out.data(), count), done);
        EXPECT_EQ(Bytes(out.begin() + static_cast<std::ptrdiff_t>(done * 8), out.end()),
                  Bytes((31 - done) * 8, 0xAA));
    }
}

// --- the frame ----------------------------------------------------------------------------

// In parts of a row, the last of which may be a single pixel, and with rows
// that the source lacks.
TEST(FloatConversion, LevelsSetOnTheWayAreThoseSetBehindIt) {
    for (const ncfUInt32 width : {1u, 3u, 255u, 256u, 257u, 600u}) {
        for (const ncfUInt32 mode : {Default_Levels, Expand_Levels, Compress_Levels}) {
            const std::vector<float> pixels = RandomPixels(std::size_t{width} * 3, width);
            const std::size_t size = std::size_t{width} * 8 * 5;
            Bytes behind(size, 0x55);
            ConvertR4flToB64a(BytesOf(pixels), behind.data(), pixels.size() * 4, size, width, 5,
                              levels);
            RemapPixelLevels(PF_ARGB, CT_USHORT_BE_VideoRange, behind.data(), size, &mode);
            Bytes onTheWay(size, 0x55);
            LevelPass pass(PF_ARGB, CT_USHORT_BE_VideoRange, onTheWay.data(), size, mode);
            ConvertR4flToB64a(BytesOf(pixels), onTheWay.data(), pixels.size() * 4, size, width, 5,
                              pass);
            pass.Finish();
            EXPECT_TRUE(onTheWay == behind) << width << " " << mode;
        }
    }
}

TEST(FloatConversion, RowsThatOneSideLacksAreLeftOut) {
    const std::vector<float> pixels(5 * 4 * 4, 0.5f);
    const std::size_t rowIn = 5 * 16;
    const std::size_t rowOut = 5 * 8;
    struct Case {
        std::size_t in;
        std::size_t out;
        ncfUInt32 height;
        std::size_t rows;
    };
    const Case cases[] = {{4 * rowIn, 4 * rowOut, 4, 4},     {4 * rowIn, 4 * rowOut, 3, 3},
                          {4 * rowIn, 4 * rowOut, 9, 4},     {4 * rowIn - 1, 4 * rowOut, 4, 3},
                          {4 * rowIn, 4 * rowOut - 1, 4, 3}, {rowIn - 1, rowOut, 1, 0},
                          {4 * rowIn, 4 * rowOut, 0, 0}};
    for (const Case& test : cases) {
        Bytes out(test.out, 0xAA);
        ConvertR4flToB64a(BytesOf(pixels), out.data(), test.in, test.out, 5, test.height, levels);
        Bytes expected(test.out, 0xAA);
        const Bytes whole = Converted(pixels, 5, 4);
        std::copy(whole.begin(), whole.begin() + static_cast<std::ptrdiff_t>(test.rows * rowOut),
                  expected.begin());
        EXPECT_EQ(out, expected) << test.in << " " << test.out << " " << test.height;
    }
}

TEST(FloatConversion, PictureWithoutWidthOrBeyondAllMemoryIsNothing) {
    const std::vector<float> pixels(16, 0.5f);
    Bytes out(32, 0xAA);
    ConvertR4flToB64a(BytesOf(pixels), out.data(), 64, 32, 0, 4, levels);
    ConvertR4flToB64a(BytesOf(pixels), out.data(), 64, 32, 0xFFFFFFFF, 0xFFFFFFFF, levels);
    ConvertR4flToB64a(BytesOf(pixels), out.data(), 64, 32, 0x10000000, 1, levels);
    EXPECT_EQ(out, Bytes(32, 0xAA));
}

}  // namespace
