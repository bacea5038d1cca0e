// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/essence/PixelLevels.h"

#include <gtest/gtest.h>

#include <random>
#include <vector>

#include "source/essence/Avx2Kernels.h"
#include "source/essence/FormatEnums.h"
#include "source/essence/LevelTables.h"

namespace {

using Bytes = std::vector<ncfUInt8>;

// The pass over a block that ends exactly where the pixels end.
Bytes Remapped(ncfUInt32 pixelFormat, ncfUInt32 componentType, const Bytes& pixels,
               ncfUInt32 mode) {
    Bytes done(pixels);
    RemapPixelLevels(pixelFormat, componentType, done.data(), done.size(), &mode);
    return done;
}

const ncfUInt32 kModes[] = {Default_Levels, Expand_Levels, Compress_Levels, 0, 3, 0xFFFFFFFF};

ncfUInt8 Mapped8(ncfUInt8 value, ncfUInt32 mode) {
    const LevelTables& tables = LevelTables::Get();
    return mode == Expand_Levels     ? tables.expand8[value]
           : mode == Compress_Levels ? tables.compress8[value]
                                     : value;
}
ncfUInt16 Mapped16(ncfUInt16 value, ncfUInt32 mode) {
    const LevelTables& tables = LevelTables::Get();
    return mode == Expand_Levels     ? tables.expand16[value]
           : mode == Compress_Levels ? tables.compress16[value]
                                     : value;
}

TEST(PixelLevels, DefaultKeepsColourAndMakesOpaque) {
    EXPECT_EQ(Remapped(PF_BGRA, CT_UCHAR, {1, 2, 3, 4, 5, 6, 7, 8}, Default_Levels),
              (Bytes{1, 2, 3, 255, 5, 6, 7, 255}));
}

TEST(PixelLevels, ExpandTurnsVideoRangeIntoFullRange) {
    EXPECT_EQ(Remapped(PF_BGRA, CT_UCHAR, {16, 16, 16, 7, 235, 235, 235, 7}, Expand_Levels),
              (Bytes{0, 0, 0, 255, 255, 255, 255, 255}));
}

TEST(PixelLevels, CompressTurnsFullRangeIntoVideoRange) {
    EXPECT_EQ(Remapped(PF_BGRA, CT_UCHAR, {0, 0, 0, 7, 255, 255, 255, 7}, Compress_Levels),
              (Bytes{16, 16, 16, 255, 235, 235, 235, 255}));
}

TEST(PixelLevels, BigEndianWordsAreLookedUpAsNumbers) {
    EXPECT_EQ(Remapped(PF_ARGB, CT_USHORT_BE_VideoRange, {1, 2, 0x10, 0, 0x10, 1, 0xEB, 0},
                       Expand_Levels),
              (Bytes{255, 255, 0, 0, 0, 1, 0xFF, 0xFA}));
}

TEST(PixelLevels, LittleEndianWordsHaveAlphaLast) {
    EXPECT_EQ(Remapped(PF_BGRA, CT_USHORT_10_6, {0, 0x10, 1, 0x10, 0, 0xEB, 1, 2}, Expand_Levels),
              (Bytes{0, 0, 1, 0, 0xFA, 0xFF, 255, 255}));
}

TEST(PixelLevels, EveryEightBitValueInEveryPlaceAndMode) {
    for (const ncfUInt32 type : {CT_UCHAR, CT_UCHAR_FullRange}) {
        for (const ncfUInt32 mode : kModes) {
            Bytes pixels;
            for (int value = 0; value < 256; ++value) {
                for (int byte = 0; byte < 4; ++byte) {
                    pixels.push_back(static_cast<ncfUInt8>(value * (byte * 2 + 1)));
                }
            }
            const Bytes done = Remapped(PF_BGRA, type, pixels, mode);
            for (std::size_t i = 0; i < pixels.size(); ++i) {
                ASSERT_EQ(done[i], i % 4 == 3 ? 255 : Mapped8(pixels[i], mode)) << i << " " << mode;
            }
        }
    }
}

TEST(PixelLevels, EverySixteenBitValueInEveryPlaceAndMode) {
    struct Layout {
        ncfUInt32 pixelFormat;
        ncfUInt32 componentType;
        std::size_t alpha;
        bool bigEndian;
    };
    const Layout layouts[] = {{PF_BGRA, CT_USHORT_10_6, 3, false},
                              {PF_ARGB, CT_USHORT_BE_VideoRange, 0, true},
                              {PF_ARGB, CT_USHORT_BE_FullRange, 0, true}};
    for (const Layout& layout : layouts) {
        for (const ncfUInt32 mode : kModes) {
            Bytes pixels(65536 * 8);
            for (std::size_t word = 0; word < 65536 * 4; ++word) {
                const auto value = static_cast<ncfUInt16>(word / 4 * (word % 4 * 2 + 1));
                pixels[2 * word + !layout.bigEndian] = static_cast<ncfUInt8>(value >> 8);
                pixels[2 * word + layout.bigEndian] = static_cast<ncfUInt8>(value);
            }
            const Bytes done = Remapped(layout.pixelFormat, layout.componentType, pixels, mode);
            int wrong = 0;
            for (std::size_t word = 0; word < 65536 * 4; ++word) {
                const auto value = static_cast<ncfUInt16>(word / 4 * (word % 4 * 2 + 1));
                const ncfUInt16 got = static_cast<ncfUInt16>(
                    done[2 * word + !layout.bigEndian] << 8 | done[2 * word + layout.bigEndian]);
                wrong += got != (word % 4 == layout.alpha ? 65535 : Mapped16(value, mode));
            }
            EXPECT_EQ(wrong, 0) << layout.componentType << " " << mode;
        }
    }
}

// A single pixel is no whole block: the tables do it.
TEST(PixelLevels, EveryValueOfASinglePixelOrLess) {
    for (const ncfUInt32 mode : {ncfUInt32{Expand_Levels}, ncfUInt32{Compress_Levels}}) {
        for (int value = 0; value < 256; ++value) {
            const auto byte = static_cast<ncfUInt8>(value);
            const ncfUInt8 mapped = Mapped8(byte, mode);
            ASSERT_EQ(Remapped(PF_BGRA, CT_UCHAR, {byte, byte, byte, byte}, mode),
                      (Bytes{mapped, mapped, mapped, 255}));
        }
        for (int value = 0; value < 65536; ++value) {
            const auto high = static_cast<ncfUInt8>(value >> 8);
            const auto low = static_cast<ncfUInt8>(value);
            const ncfUInt16 mapped = Mapped16(static_cast<ncfUInt16>(value), mode);
            const auto mappedHigh = static_cast<ncfUInt8>(mapped >> 8);
            const auto mappedLow = static_cast<ncfUInt8>(mapped);
            ASSERT_EQ(Remapped(PF_ARGB, CT_USHORT_BE_VideoRange, {1, 2, high, low}, mode),
                      (Bytes{255, 255, mappedHigh, mappedLow}));
            ASSERT_EQ(Remapped(PF_BGRA, CT_USHORT_10_6, {low, high, 1}, mode),
                      (Bytes{mappedLow, mappedHigh, 1}));
        }
    }
}

TEST(PixelLevels, OtherLayoutsPassUntouchedInEveryMode) {
    const Bytes pixels = {16, 0, 235, 9, 16, 0, 235, 9};
    const std::pair<ncfUInt32, ncfUInt32> others[] = {
        {PF_CbYCrY, CT_UCHAR},    {PF_CbYCrY, CT_V210},   {PF_Mono, CT_UCHAR},
        {PF_Mono, CT_10Bit},      {PF_ARGB, CT_UCHAR},    {PF_BGRA, CT_USHORT_BE_VideoRange},
        {PF_BGRA, CT_USHORT},     {PF_RGBA, CT_UCHAR},    {PF_ARGB, CT_USHORT_10_6},
        {PF_UNDEFINED, CT_UCHAR}, {PF_BGRA, CT_UNDEFINED}};
    for (const auto& other : others) {
        for (const ncfUInt32 mode : kModes) {
            EXPECT_EQ(Remapped(other.first, other.second, pixels, mode), pixels);
        }
    }
}

// The block ends where the buffer ends, so that a sanitizer sees a write past
// it.
TEST(PixelLevels, OfACutPixelWhatIsThereIsDone) {
    for (const ncfUInt32 mode : {ncfUInt32{Default_Levels}, ncfUInt32{Expand_Levels}}) {
        for (std::size_t size = 0; size <= 40; ++size) {
            const Bytes pixels(size, 40);
            Bytes eight(size);
            Bytes big(pixels);
            Bytes little(pixels);
            for (std::size_t i = 0; i < size; ++i) {
                eight[i] = i % 4 == 3 ? 255 : Mapped8(40, mode);
                if (i / 2 * 2 + 1 < size) {
                    const ncfUInt16 word = Mapped16(40 << 8 | 40, mode);
                    const auto high = static_cast<ncfUInt8>(word >> 8);
                    const auto low = static_cast<ncfUInt8>(word);
                    big[i] = i / 2 % 4 == 0 ? 255 : i % 2 == 0 ? high : low;
                    little[i] = i / 2 % 4 == 3 ? 255 : i % 2 == 0 ? low : high;
                }
            }
            EXPECT_EQ(Remapped(PF_BGRA, CT_UCHAR, pixels, mode), eight) << size;
            EXPECT_EQ(Remapped(PF_ARGB, CT_USHORT_BE_FullRange, pixels, mode), big) << size;
            EXPECT_EQ(Remapped(PF_BGRA, CT_USHORT_10_6, pixels, mode), little) << size;
        }
    }
}

TEST(PixelLevels, NothingAtAllIsFine) {
    const ncfUInt32 mode = Expand_Levels;
    RemapPixelLevels(PF_BGRA, CT_UCHAR, nullptr, 0, &mode);
    RemapPixelLevels(PF_ARGB, CT_USHORT_BE_VideoRange, nullptr, 0, &mode);
}

TEST(PixelLevels, RandomPixelsAtEveryAlignment) {
    std::mt19937 random(7);
    for (std::size_t at = 0; at < 16; ++at) {
        Bytes block(at + 4096);
        for (ncfUInt8& byte : block) {
            byte = static_cast<ncfUInt8>(random());
        }
        Bytes done(block);
        const ncfUInt32 mode = Compress_Levels;
        RemapPixelLevels(PF_BGRA, CT_UCHAR, done.data() + at, 4096, &mode);
        for (std::size_t i = 0; i < 4096; ++i) {
            ASSERT_EQ(done[at + i], i % 4 == 3 ? 255 : Mapped8(block[at + i], mode));
        }
    }
}

TEST(LevelPass, InPartsItIsTheSameAsAtOnce) {
    std::mt19937 random(9);
    Bytes pixels(4096);
    for (ncfUInt8& byte : pixels) {
        byte = static_cast<ncfUInt8>(random());
    }
    const std::pair<ncfUInt32, ncfUInt32> layouts[] = {
        {PF_BGRA, CT_UCHAR}, {PF_BGRA, CT_USHORT_10_6}, {PF_ARGB, CT_USHORT_BE_FullRange}};
    for (const auto& layout : layouts) {
        for (const ncfUInt32 mode : kModes) {
            Bytes parts(pixels);
            LevelPass pass(layout.first, layout.second, parts.data(), parts.size(), mode);
            pass.UpTo(0);
            for (std::size_t end = 0; end < 4000; end += 8 * (random() % 12)) {
                pass.UpTo(end);
            }
            pass.Finish();
            EXPECT_EQ(parts, Remapped(layout.first, layout.second, pixels, mode)) << mode;
        }
    }
}

TEST(LevelPass, TouchesNothingBehindWhatItIsAskedFor) {
    Bytes pixels(64, 100);
    LevelPass pass(PF_BGRA, CT_UCHAR, pixels.data(), pixels.size(), Expand_Levels);
    pass.UpTo(36);
    EXPECT_EQ(pixels[35], 255);
    EXPECT_EQ(Bytes(pixels.begin() + 36, pixels.end()), Bytes(28, 100));
}

// --- each set of kernels by itself ----------------------------------------------------------

struct KernelSet {
    const char* name;
    const LevelKernels* kernels;
    std::size_t block;
};

void PrintTo(const KernelSet& set, std::ostream* out) {
    *out << set.name;
}

std::vector<KernelSet> KernelSets() {
    std::vector<KernelSet> sets = {{"SSE2", &kLevelKernelsSse2, 16}};
    if (const Avx2Kernels* const wide = FindAvx2Kernels()) {
        sets.push_back({"AVX2", &wide->levels, 32});
    }
    return sets;
}

class LevelKernelTest : public testing::TestWithParam<KernelSet> {};
INSTANTIATE_TEST_SUITE_P(PixelLevels, LevelKernelTest, testing::ValuesIn(KernelSets()));

TEST_P(LevelKernelTest, EveryByteInEveryPlaceOfABlockAndMode) {
    const std::size_t block = GetParam().block;
    for (const ncfUInt32 mode : kModes) {
        for (int value = 0; value < 256; ++value) {
            Bytes pixels(block);
            for (std::size_t i = 0; i < block; ++i) {
                pixels[i] = static_cast<ncfUInt8>(static_cast<std::size_t>(value) * (2 * i + 1));
            }
            Bytes done(pixels);
            ASSERT_EQ(GetParam().kernels->bytes(done.data(), block, mode), block);
            for (std::size_t i = 0; i < block; ++i) {
                ASSERT_EQ(done[i], i % 4 == 3 ? 255 : Mapped8(pixels[i], mode)) << i << " " << mode;
            }
        }
    }
}

TEST_P(LevelKernelTest, EveryWordInEveryPlaceOfABlockAndMode) {
    struct Layout {
        LevelKernels::Kernel remap;
        std::size_t alpha;
        bool bigEndian;
    };
    const Layout layouts[] = {{GetParam().kernels->littleWords, 3, false},
                              {GetParam().kernels->bigWords, 0, true}};
    const std::size_t words = GetParam().block / 2;
    for (const Layout& layout : layouts) {
        for (const ncfUInt32 mode : kModes) {
            // Odd factors: each place of a block meets every word.
            const auto valueAt = [&](std::size_t word) {
                return static_cast<ncfUInt16>(word / words * (word % words * 2 + 1));
            };
            Bytes pixels(65536 * words * 2);
            for (std::size_t word = 0; word < 65536 * words; ++word) {
                pixels[2 * word + !layout.bigEndian] = static_cast<ncfUInt8>(valueAt(word) >> 8);
                pixels[2 * word + layout.bigEndian] = static_cast<ncfUInt8>(valueAt(word));
            }
            ASSERT_EQ(layout.remap(pixels.data(), pixels.size(), mode), pixels.size());
            int wrong = 0;
            for (std::size_t word = 0; word < 65536 * words; ++word) {
                const auto got = static_cast<ncfUInt16>(pixels[2 * word + !layout.bigEndian] << 8 |
                                                        pixels[2 * word + layout.bigEndian]);
                wrong += got != (word % 4 == layout.alpha ? 65535 : Mapped16(valueAt(word), mode));
            }
            EXPECT_EQ(wrong, 0) << layout.alpha << " " << mode;
        }
    }
}

TEST_P(LevelKernelTest, DoesWholeBlocksOnly) {
    const LevelKernels& kernels = *GetParam().kernels;
    for (const auto kernel : {kernels.bytes, kernels.littleWords, kernels.bigWords}) {
        for (const ncfUInt32 mode : kModes) {
            for (std::size_t size = 0; size <= 100; ++size) {
                const std::size_t whole = size / GetParam().block * GetParam().block;
                Bytes pixels(size, 100);
                ASSERT_EQ(kernel(pixels.data(), size, mode), whole);
                ASSERT_EQ(Bytes(pixels.begin() + static_cast<std::ptrdiff_t>(whole), pixels.end()),
                          Bytes(size - whole, 100));
            }
        }
    }
}

}  // namespace
