// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/WavFile.h"

#include <gtest/gtest.h>

#include <cstring>
#include <limits>

using cliphost::WavForm;
using cliphost::WavHeader;
using cliphost::WavNeedsPadding;

namespace {

using Bytes = std::vector<unsigned char>;

std::uint64_t Number(const Bytes& bytes, std::size_t at, int size) {
    std::uint64_t value = 0;
    for (int i = size - 1; i >= 0; --i) {
        value = value << 8 | bytes.at(at + static_cast<std::size_t>(i));
    }
    return value;
}
std::string Text(const Bytes& bytes, std::size_t at) {
    return std::string(bytes.begin() + static_cast<std::ptrdiff_t>(at),
                       bytes.begin() + static_cast<std::ptrdiff_t>(at) + 4);
}

constexpr WavForm kStereo{2, 48000, 24};
constexpr std::uint64_t kFourGiB = std::uint64_t{1} << 32;

}  // namespace

TEST(WavFile, TellsFormAndSizesOfAShortFile) {
    const Bytes header = WavHeader(kStereo, 1000);
    ASSERT_EQ(header.size(), 68u);
    EXPECT_EQ(Text(header, 0), "RIFF");
    EXPECT_EQ(Number(header, 4, 4), 68u - 8 + 6000);
    EXPECT_EQ(Text(header, 8), "WAVE");
    EXPECT_EQ(Text(header, 12), "fmt ");
    EXPECT_EQ(Number(header, 16, 4), 40u);
    EXPECT_EQ(Number(header, 20, 2), 0xFFFEu);
    EXPECT_EQ(Number(header, 22, 2), 2u);
    EXPECT_EQ(Number(header, 24, 4), 48000u);
    EXPECT_EQ(Number(header, 28, 4), 288000u);
    EXPECT_EQ(Number(header, 32, 2), 6u);
    EXPECT_EQ(Number(header, 34, 2), 24u);
    EXPECT_EQ(Number(header, 40, 4), 3u) << "left and right";
    EXPECT_EQ(Number(header, 44, 2), 1u) << "PCM";
    EXPECT_EQ(Text(header, 60), "data");
    EXPECT_EQ(Number(header, 64, 4), 6000u);
}

TEST(WavFile, CountsThePaddingInTheFileButNotInTheSamples) {
    constexpr WavForm mono{1, 44100, 24};
    EXPECT_TRUE(WavNeedsPadding(mono, 5));
    EXPECT_FALSE(WavNeedsPadding(mono, 4));
    EXPECT_FALSE(WavNeedsPadding(kStereo, 5));
    const Bytes header = WavHeader(mono, 5);
    EXPECT_EQ(Number(header, 64, 4), 15u);
    EXPECT_EQ(Number(header, 4, 4), 60u + 16);
}

TEST(WavFile, KeepsTheClassicFormUpToTheLastSizeThatFits) {
    // 60 bytes of header count, so the largest samples end 60 before 2^32 - 1.
    constexpr WavForm form{1, 48000, 8};
    const std::uint64_t largest = kFourGiB - 1 - 60;
    const Bytes fits = WavHeader(form, largest - 1);  // an even number of bytes
    EXPECT_EQ(Text(fits, 0), "RIFF");
    EXPECT_EQ(Number(fits, 4, 4), kFourGiB - 2);
    EXPECT_EQ(Number(fits, 64, 4), largest - 1);
    EXPECT_EQ(Text(WavHeader(form, largest), 0), "RF64") << "its padding does not fit";
    EXPECT_EQ(Text(WavHeader(form, largest + 1), 0), "RF64");
}

TEST(WavFile, TellsSizesPastFourGiBIn64Bits) {
    const std::uint64_t frames = std::uint64_t{48000} * 3600 * 24 * 10;  // ten days
    const Bytes header = WavHeader(kStereo, frames);
    ASSERT_EQ(header.size(), 68u + 36);
    EXPECT_EQ(Text(header, 0), "RF64");
    EXPECT_EQ(Number(header, 4, 4), 0xFFFFFFFFu);
    EXPECT_EQ(Text(header, 12), "ds64");
    EXPECT_EQ(Number(header, 16, 4), 28u);
    EXPECT_EQ(Number(header, 20, 8), 68 + 36 - 8 + frames * 6);
    EXPECT_EQ(Number(header, 28, 8), frames * 6);
    EXPECT_EQ(Number(header, 36, 8), frames);
    EXPECT_EQ(Number(header, 44, 4), 0u);
    EXPECT_EQ(Text(header, 48), "fmt ");
    EXPECT_EQ(Text(header, 96), "data");
    EXPECT_EQ(Number(header, 100, 4), 0xFFFFFFFFu);
}

TEST(WavFile, LeavesTheSpeakersOfManyChannelsOpen) {
    EXPECT_EQ(Number(WavHeader({1, 48000, 24}, 2), 40, 4), 4u);
    EXPECT_EQ(Number(WavHeader({6, 48000, 24}, 2), 40, 4), 0u);
}

TEST(WavFile, RefusesFormsAndLengthsThatNoFileHas) {
    EXPECT_TRUE(WavHeader({0, 48000, 24}, 1).empty());
    EXPECT_TRUE(WavHeader({2, 0, 24}, 1).empty());
    EXPECT_TRUE(WavHeader({2, 48000, 20}, 1).empty());
    EXPECT_TRUE(WavHeader({30000, 48000, 24}, 1).empty()) << "a frame has 16 bits for its size";
    EXPECT_TRUE(WavHeader({20000, 4000000000u, 24}, 1).empty());
    EXPECT_TRUE(WavHeader(kStereo, std::numeric_limits<std::uint64_t>::max() / 6).empty());
    EXPECT_FALSE(WavHeader(kStereo, 0).empty());
}
