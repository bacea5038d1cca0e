// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include <gtest/gtest.h>

#include <limits>

#include "reference_host/quicktime/SoundWords.h"

namespace {

template <class Value>
std::vector<ncfSInt32> WordsOf(AVSampleFormat format, std::vector<Value> values) {
    const host::FrameOwner frame(av_frame_alloc());
    frame->format = format;
    frame->nb_samples = static_cast<int>(values.size());
    frame->ch_layout.nb_channels = 1;
    frame->data[0] = reinterpret_cast<ncfUInt8*>(values.data());
    frame->extended_data = frame->data;
    std::vector<ncfSInt32> words;
    EXPECT_TRUE(host::AppendSoundWords(*frame, 1, words));
    EXPECT_FALSE(host::AppendSoundWords(*frame, 2, words));
    return words;
}

TEST(SoundWords, ShiftWholeNumbersUp) {
    EXPECT_EQ(WordsOf<ncfUInt8>(AV_SAMPLE_FMT_U8, {0, 128, 255}),
              (std::vector<ncfSInt32>{INT32_MIN, 0, 127 << 24}));
    EXPECT_EQ(WordsOf<ncfSInt16>(AV_SAMPLE_FMT_S16, {-32768, 1}),
              (std::vector<ncfSInt32>{INT32_MIN, 65536}));
    EXPECT_EQ(WordsOf<ncfSInt64>(AV_SAMPLE_FMT_S64, {INT64_MIN, ncfSInt64{5} << 32}),
              (std::vector<ncfSInt32>{INT32_MIN, 5}));
}

TEST(SoundWords, RoundAndHoldFloatingPoint) {
    const float inf = std::numeric_limits<float>::infinity();
    EXPECT_EQ(WordsOf<float>(AV_SAMPLE_FMT_FLT, {1.0f, -1.0f, 2.0f, -inf, inf, 0.5f,
                                                 std::numeric_limits<float>::quiet_NaN()}),
              (std::vector<ncfSInt32>{INT32_MAX, INT32_MIN, INT32_MAX, INT32_MIN, INT32_MAX,
                                      1 << 30, 0}));
    EXPECT_EQ(WordsOf<double>(AV_SAMPLE_FMT_DBL, {1.5 / 2147483648.0, 2.5 / 2147483648.0}),
              (std::vector<ncfSInt32>{2, 2}));
}

TEST(SoundWords, StoreTheirUpperBytesInEitherOrder) {
    const ncfSInt32 words[] = {0x12345678, -2};
    ncfUInt8 bytes[6] = {};
    host::StoreSoundWords(words, 2, 3, true, bytes);
    EXPECT_EQ(std::vector<int>(bytes, bytes + 6),
              (std::vector<int>{0x56, 0x34, 0x12, 255, 255, 255}));
    host::StoreSoundWords(words, 2, 3, false, bytes);
    EXPECT_EQ(std::vector<int>(bytes, bytes + 3), (std::vector<int>{0x12, 0x34, 0x56}));
}

}  // namespace
