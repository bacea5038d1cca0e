// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include <gtest/gtest.h>

#include <algorithm>
#include <vector>

#include "reference_host/quicktime/SoundConverter.h"

namespace {

host::FrameOwner Block(int channels, int rate, int frames) {
    host::FrameOwner frame(av_frame_alloc());
    frame->format = AV_SAMPLE_FMT_S16;
    frame->sample_rate = rate;
    frame->nb_samples = frames;
    av_channel_layout_default(&frame->ch_layout, channels);
    EXPECT_EQ(av_frame_get_buffer(frame.get(), 0), 0);
    auto* const words = reinterpret_cast<ncfSInt16*>(frame->extended_data[0]);
    std::fill_n(words, channels * frames, ncfSInt16{8192});
    return frame;
}

TEST(SoundConverter, RefusesRatiosThatNoStreamHas) {
    std::vector<ncfSInt32> words;
    for (const int rate : {100, 1499, 48000 * 33}) {
        EXPECT_FALSE(host::SoundConverter(1, 48000).Append(*Block(1, rate, 1000), words)) << rate;
    }
    EXPECT_TRUE(words.empty());
    for (const int rate : {1500, 8000, 192000, 48000 * 32}) {
        EXPECT_TRUE(host::SoundConverter(1, 48000).Append(*Block(1, rate, 1000), words)) << rate;
    }
    EXPECT_FALSE(host::SoundConverter(1, 100).Append(*Block(1, 60000, 1000), words));
}

// Every form costs a filter of its own.
TEST(SoundConverter, TakesOnlySomeFormsSinceDecodingBegan) {
    host::SoundConverter converter(1, 48000);
    std::vector<ncfSInt32> words;
    int taken = 0;
    for (int i = 0; i < 100; ++i) {
        taken += converter.Append(*Block(1, 44101 + i, 1000), words);
        converter.AppendRest(words);
    }
    EXPECT_EQ(taken, 8);
    // Those go on to be taken, and after a jump others are.
    EXPECT_TRUE(converter.Append(*Block(1, 44101, 1000), words));
    EXPECT_FALSE(converter.Append(*Block(1, 44150, 1000), words));
    converter.Forget();
    EXPECT_TRUE(converter.Append(*Block(1, 44150, 1000), words));
}

// What a form gives does not hang on what stood before it.
TEST(SoundConverter, GivesTheSameWhenAFormComesBack) {
    host::SoundConverter converter(2, 48000);
    const auto give = [&](int rate) {
        std::vector<ncfSInt32> words;
        EXPECT_TRUE(converter.Append(*Block(1, rate, 1000), words));
        converter.AppendRest(words);
        return words;
    };
    const std::vector<ncfSInt32> first = give(44100);
    const std::vector<ncfSInt32> other = give(32000);
    EXPECT_NEAR(static_cast<double>(first.size()), 2 * 1088, 80);
    EXPECT_NEAR(static_cast<double>(other.size()), 2 * 1500, 80);
    EXPECT_EQ(give(44100), first);
    EXPECT_EQ(give(32000), other);
    EXPECT_EQ(give(48000).size(), 2000u);
    EXPECT_EQ(give(44100), first);
}

TEST(SoundConverter, TellsHowFarItMayBeBehind) {
    host::SoundConverter converter(1, 48000);
    std::vector<ncfSInt32> words;
    EXPECT_TRUE(converter.Append(*Block(2, 48000, 100), words));
    EXPECT_EQ(converter.MostHeldBack(), 0);
    for (const int rate : {96000, 44100, 8000, 1500}) {
        host::SoundConverter one(1, 48000);
        words.clear();
        EXPECT_TRUE(one.Append(*Block(1, rate, 4000), words));
        const double behind = 4000.0 * 48000 / rate - static_cast<double>(words.size());
        EXPECT_GT(behind, 0) << rate;
        EXPECT_LE(behind, one.MostHeldBack()) << rate;
        EXPECT_LE(one.MostHeldBack(), 64 * 32) << rate;
    }
}

}  // namespace
