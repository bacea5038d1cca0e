// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/PngFile.h"

#include <gtest/gtest.h>
#include <png.h>

#include <cstring>

using cliphost::Picture;
using cliphost::ToPng;

namespace {

// A PNG as the library reads it: 8-bit files through its simple interface, the
// head by hand.
struct Head {
    unsigned width, height, bits, colorType;
};
Head ReadHead(const std::vector<unsigned char>& png) {
    const auto number = [&](std::size_t at) {
        return static_cast<unsigned>(png.at(at) << 24 | png.at(at + 1) << 16 | png.at(at + 2) << 8 |
                                     png.at(at + 3));
    };
    return {number(16), number(20), png.at(24), png.at(25)};
}

struct Source {
    const std::vector<unsigned char>* png;
    std::size_t at = 0;
};

// All samples of a file; empty when the library refuses it.
std::vector<std::uint16_t> ReadSamples(const std::vector<unsigned char>& bytes) {
    std::vector<std::uint16_t> samples;
    std::vector<unsigned char> row;
    Source source{&bytes};
    png_structp png = png_create_read_struct(PNG_LIBPNG_VER_STRING, nullptr, nullptr, nullptr);
    png_infop info = png_create_info_struct(png);
    if (setjmp(png_jmpbuf(png))) {
        png_destroy_read_struct(&png, &info, nullptr);
        return {};
    }
    png_set_read_fn(png, &source, [](png_structp from, png_bytep to, png_size_t size) {
        auto& state = *static_cast<Source*>(png_get_io_ptr(from));
        if (state.at + size > state.png->size()) {
            png_error(from, "end");
        }
        std::memcpy(to, state.png->data() + state.at, size);
        state.at += size;
    });
    png_read_info(png, info);
    row.resize(png_get_rowbytes(png, info));
    const bool isDeep = png_get_bit_depth(png, info) == 16;
    const png_uint_32 height = png_get_image_height(png, info);
    for (png_uint_32 y = 0; y < height; ++y) {
        png_read_row(png, row.data(), nullptr);
        for (std::size_t i = 0; i < row.size(); i += isDeep ? 2 : 1) {
            samples.push_back(
                static_cast<std::uint16_t>(isDeep ? row[i] << 8 | row[i + 1] : row[i]));
        }
    }
    png_destroy_read_struct(&png, &info, nullptr);
    return samples;
}

Picture Ramp(int width, int height, int channels, int bits) {
    Picture picture{width, height, channels, bits, {}};
    picture.samples.resize(picture.Pixels() * static_cast<std::size_t>(channels));
    unsigned value = 1;
    for (std::uint16_t& sample : picture.samples) {
        value = value * 69069 + 1;
        sample = static_cast<std::uint16_t>((value >> 8) & (bits == 16 ? 0xFFFFu : 0xFFu));
    }
    return picture;
}

}  // namespace

TEST(PngFile, ReadsBackAsItWasForEveryKindAndDepth) {
    for (const int bits : {8, 16}) {
        for (const int channels : {1, 3, 4}) {
            const Picture picture = Ramp(13, 7, channels, bits);
            const auto png = ToPng(picture);
            ASSERT_FALSE(png.empty());
            const Head head = ReadHead(png);
            EXPECT_EQ(head.width, 13u);
            EXPECT_EQ(head.height, 7u);
            EXPECT_EQ(head.bits, static_cast<unsigned>(bits));
            EXPECT_EQ(head.colorType, channels == 1 ? 0u : channels == 3 ? 2u : 6u);
            EXPECT_EQ(ReadSamples(png), picture.samples) << channels << " channels, " << bits;
        }
    }
}

TEST(PngFile, IsNotMadeOfAPictureThatIsNone) {
    EXPECT_TRUE(ToPng(Picture()).empty());
    EXPECT_TRUE(ToPng(Ramp(2, 2, 2, 8)).empty());
    Picture tooShort = Ramp(4, 4, 3, 8);
    tooShort.samples.pop_back();
    EXPECT_TRUE(ToPng(tooShort).empty());
    Picture noHeight = Ramp(4, 4, 3, 8);
    noHeight.height = 0;
    EXPECT_TRUE(ToPng(noHeight).empty());
    // Wider than the format allows: the library refuses, and that is no crash.
    EXPECT_TRUE(ToPng(Ramp(1000001, 1, 1, 8)).empty());
}
