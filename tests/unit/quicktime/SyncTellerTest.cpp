// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/quicktime/SyncTeller.h"

#include <gtest/gtest.h>

#include <cstdint>
#include <vector>

namespace {

using Bytes = std::vector<std::uint8_t>;

struct FreeContext {
    void operator()(AVFormatContext* context) const { avformat_free_context(context); }
};

// Whether a sample of runs of pixels stands alone, in pictures of 4 x 2 of 24 bits.
bool StandsAlone(const Bytes& sample, int bits = 24, int width = 4) {
    const std::unique_ptr<AVFormatContext, FreeContext> context(avformat_alloc_context());
    AVStream* const stream = avformat_new_stream(context.get(), nullptr);
    stream->codecpar->codec_id = AV_CODEC_ID_QTRLE;
    stream->codecpar->width = width;
    stream->codecpar->height = 2;
    stream->codecpar->bits_per_coded_sample = bits;
    const auto teller = host::SyncTeller::Of(*stream);
    const host::PacketOwner packet(av_packet_alloc());
    EXPECT_EQ(av_new_packet(packet.get(), static_cast<int>(sample.size())), 0);
    std::copy(sample.begin(), sample.end(), packet->data);
    return teller && teller->StandsAlone(*packet);
}

Bytes Joined(const std::vector<Bytes>& parts) {
    Bytes all;
    for (const Bytes& part : parts) {
        all.insert(all.end(), part.begin(), part.end());
    }
    return all;
}

const Bytes kAllLines = {0, 0, 0, 0, 0, 0};
const Bytes kRepeated = {1, 0xFC, 9, 9, 9, 0xFF};                            // four times one pixel
const Bytes kLiteral = {1, 2, 1, 1, 1, 2, 2, 2, 2, 3, 3, 3, 4, 4, 4, 0xFF};  // two and two

Bytes SomeLines(std::uint8_t first, std::uint8_t count) {
    return {0, 0, 0, 0, 0, 8, 0, first, 0, 0, 0, count, 0, 0};
}

TEST(SyncTeller, TakesRunsThatWriteEveryPixel) {
    EXPECT_TRUE(StandsAlone(Joined({kAllLines, kRepeated, kLiteral})));
    EXPECT_TRUE(StandsAlone(Joined({SomeLines(0, 2), kRepeated, kRepeated})));
}

TEST(SyncTeller, TakesNoRunsThatLeavePixelsAsTheyAre) {
    EXPECT_FALSE(StandsAlone(Joined({kAllLines, kRepeated, {2, 0xFD, 9, 9, 9, 0xFF}})));
    EXPECT_FALSE(StandsAlone(Joined({kAllLines, kRepeated, {1, 0xFD, 9, 9, 9, 0xFF}})));
    EXPECT_FALSE(
        StandsAlone(Joined({kAllLines, kRepeated, {1, 0xFE, 9, 9, 9, 0, 2, 0xFF, 9, 9, 9, 0xFF}})));
    EXPECT_FALSE(StandsAlone(Joined({SomeLines(1, 1), kRepeated})));
    EXPECT_FALSE(StandsAlone(Joined({SomeLines(0, 1), kRepeated})));
}

TEST(SyncTeller, TakesNoRunsThatTheDecoderRefuses) {
    EXPECT_FALSE(StandsAlone(Joined({SomeLines(0, 3), kRepeated, kRepeated, kRepeated})));
    EXPECT_FALSE(StandsAlone(Joined({kAllLines, kRepeated, {1, 0xFB, 9, 9, 9, 0xFF}})));
    EXPECT_FALSE(StandsAlone(Joined({kAllLines, kRepeated})));
    EXPECT_FALSE(StandsAlone(Joined({kAllLines, kRepeated, {1, 0xFC, 9}})));
    EXPECT_FALSE(StandsAlone({0, 0, 0}));
    EXPECT_FALSE(StandsAlone({}));
}

TEST(SyncTeller, CountsFourPixelsOfAByteEachAsOne) {
    const Bytes line = {1, 0xFE, 1, 2, 3, 4, 0xFF};
    EXPECT_TRUE(StandsAlone(Joined({kAllLines, line, line}), 8, 8));
    EXPECT_TRUE(StandsAlone(Joined({kAllLines, line, line}), 40, 7));
    EXPECT_FALSE(StandsAlone(Joined({kAllLines, line, line}), 8, 9));
    EXPECT_FALSE(StandsAlone(Joined({kAllLines, line, line}), 4, 8));  // not told
}

}  // namespace
