// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/essence/AlphaExtraction.h"

#include <gtest/gtest.h>

#include <cmath>

#include "tests/unit/essence/support/FloatValues.h"
#include "tests/unit/essence/support/NoLevels.h"

namespace {

using Bytes = std::vector<ncfUInt8>;

NoLevels levels;

Bytes RandomBytes(std::size_t size) {
    std::mt19937 random(static_cast<unsigned>(size));
    Bytes bytes(size);
    for (ncfUInt8& byte : bytes) {
        byte = static_cast<ncfUInt8>(random());
    }
    return bytes;
}

Bytes FromFloats(const std::vector<float>& alphas, ncfUInt32 width) {
    std::vector<float> pixels;
    for (const float alpha : alphas) {
        pixels.insert(pixels.end(), {alpha, 9.0f, 9.0f, 9.0f});
    }
    Bytes out(alphas.size() * 2, 0xAA);
    ExtractAlpha10FromR4fl(BytesOf(pixels), out.data(), pixels.size() * sizeof(float), out.size(),
                           width, static_cast<ncfUInt32>(alphas.size()) / width, levels);
    return out;
}

// --- eight bits -----------------------------------------------------------------------

TEST(ExtractAlpha8, TakesTheLastByteOfEachPixel) {
    for (std::size_t pixels = 0; pixels < 70; ++pixels) {
        const Bytes source = RandomBytes(pixels * 4);
        Bytes out(pixels);
        ExtractAlpha8(source.data(), out.data(), source.size(), out.size(), 1, 1, levels);
        for (std::size_t i = 0; i < pixels; ++i) {
            ASSERT_EQ(out[i], source[4 * i + 3]);
        }
    }
}

TEST(ExtractAlpha8, StopsWhereEitherSideEnds) {
    const Bytes source = RandomBytes(40 * 4 + 3);
    Bytes out(50, 0xAA);
    ExtractAlpha8(source.data(), out.data(), source.size(), out.size(), 50, 1, levels);
    EXPECT_EQ(out[39], source[159]);
    EXPECT_EQ(out[40], 0xAA) << "three bytes are no pixel";
    Bytes few(33, 0xAA);
    ExtractAlpha8(source.data(), few.data(), source.size(), few.size(), 50, 1, levels);
    EXPECT_EQ(few[32], source[131]);
}

// --- ten bits from words ----------------------------------------------------------------

TEST(ExtractAlpha10FromB64a, SplitsEveryAlphaIntoEightAndTwoBits) {
    Bytes source(65536 * 8, 0x5A);
    for (std::size_t i = 0; i < 65536; ++i) {
        source[8 * i] = static_cast<ncfUInt8>(i >> 8);
        source[8 * i + 1] = static_cast<ncfUInt8>(i);
    }
    Bytes out(65536 * 2);
    ExtractAlpha10FromB64a(source.data(), out.data(), source.size(), out.size(), 256, 256, levels);
    int wrong = 0;
    for (std::size_t i = 0; i < 65536; ++i) {
        const std::size_t value = i >> 6;
        wrong += out[i] != value >> 2 || out[65536 + i] != (value & 3);
    }
    EXPECT_EQ(wrong, 0);
    EXPECT_EQ(out[65535], 255);
    EXPECT_EQ(out[131071], 3);
}

TEST(ExtractAlpha10FromB64a, DoesThePixelsBehindTheLastGroup) {
    for (std::size_t pixels = 1; pixels < 40; ++pixels) {
        const Bytes source = RandomBytes(pixels * 8);
        Bytes out(pixels * 2);
        ExtractAlpha10FromB64a(source.data(), out.data(), source.size(), out.size(),
                               static_cast<ncfUInt32>(pixels), 1, levels);
        for (std::size_t i = 0; i < pixels; ++i) {
            ASSERT_EQ(out[i], source[8 * i]);
            ASSERT_EQ(out[pixels + i], source[8 * i + 1] >> 6);
        }
    }
}

TEST(ExtractAlpha10FromB64a, StaysWithinBothPlanes) {
    const Bytes source(64 * 8, 0xFF);
    struct Case {
        std::size_t size;  // of the destination
        ncfUInt32 width;
        ncfUInt32 height;
        std::size_t count;
    };
    const Case cases[] = {
        {20, 10, 1, 10},       // as it should be
        {20, 4, 2, 8},         // planes of 8 in a buffer that is too large
        {20, 15, 1, 5},        // the second plane is cut
        {20, 30, 1, 0},        // there is no second plane
        {21, 10, 1, 10},       // an odd byte
        {20, 0, 9, 0},         // no picture
        {20, 65536, 65536, 0}  // more than 32 bits
    };
    for (const Case& test : cases) {
        Bytes out(test.size, 0xAA);
        ExtractAlpha10FromB64a(source.data(), out.data(), source.size(), out.size(), test.width,
                               test.height, levels);
        std::size_t written = 0;
        for (const ncfUInt8 byte : out) {
            written += byte != 0xAA;
        }
        EXPECT_EQ(written, 2 * test.count) << test.size << " " << test.width;
        Bytes floats(test.size, 0xAA);
        const std::vector<float> pixels(64 * 4, 1.0f);
        ExtractAlpha10FromR4fl(BytesOf(pixels), floats.data(), pixels.size() * 4, floats.size(),
                               test.width, test.height, levels);
        EXPECT_EQ(floats, out) << "both kinds alike";
    }
}

TEST(ExtractAlpha10FromB64a, StopsWhereTheSourceEnds) {
    const Bytes source(3 * 8 + 7, 0xFF);
    Bytes out(20, 0xAA);
    ExtractAlpha10FromB64a(source.data(), out.data(), source.size(), out.size(), 10, 1, levels);
    EXPECT_EQ(out[2], 255);
    EXPECT_EQ(out[3], 0xAA);
    EXPECT_EQ(out[12], 3);
    EXPECT_EQ(out[13], 0xAA);
}

// --- ten bits from floats -------------------------------------------------------------------

TEST(ExtractAlpha10FromR4fl, HalfIs512) {
    EXPECT_EQ(FromFloats({0.5f}, 1), (Bytes{128, 0}));
    EXPECT_EQ(FromFloats({1.0f}, 1), (Bytes{255, 3}));
    EXPECT_EQ(FromFloats({0.0f}, 1), (Bytes{0, 0}));
}

TEST(ExtractAlpha10FromR4fl, AboveOneIsCutToAByteAndNotClamped) {
    // 1.5 * 1023 + 0.5 = 1535: 383 and 3, of 383 the low byte is 127.
    EXPECT_EQ(FromFloats({1.5f}, 1), (Bytes{127, 3}));
    // -0.5 * 1023 + 0.5 = -511.
    EXPECT_EQ(FromFloats({-0.5f}, 1), (Bytes{0x80, 1}));
}

TEST(ExtractAlpha10FromR4fl, WhatIsNoNumberOf32BitsGivesZeros) {
    const float infinity = std::numeric_limits<float>::infinity();
    for (const float alpha : {infinity, -infinity, std::nanf(""), 3e9f, -3e9f, 1e30f, 2099203.0f}) {
        EXPECT_EQ(FromFloats({alpha}, 1), (Bytes{0, 0})) << alpha;
    }
}

TEST(ExtractAlpha10FromR4fl, AgreesWithAPlainModelInGroupsAndBehindThem) {
    for (const std::size_t count : {1u, 15u, 16u, 17u, 4096u, 100003u}) {
        const std::vector<float> pixels = RandomPixels(count, static_cast<unsigned>(count));
        Bytes out(count * 2);
        ExtractAlpha10FromR4fl(BytesOf(pixels), out.data(), pixels.size() * 4, out.size(),
                               static_cast<ncfUInt32>(count), 1, levels);
        int wrong = 0;
        for (std::size_t i = 0; i < count; ++i) {
            const float scaled = pixels[4 * i] * 1023.0f + 0.5f;
            const bool fits = std::fabs(static_cast<double>(scaled)) < 2147483648.0;
            const auto value = fits ? static_cast<std::int32_t>(scaled) : 0;
            wrong += out[i] != static_cast<ncfUInt8>(value >> 2);
            wrong += out[count + i] != (value & 3);
        }
        EXPECT_EQ(wrong, 0) << count;
    }
}

}  // namespace
