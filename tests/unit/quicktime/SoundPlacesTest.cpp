// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include <gtest/gtest.h>

#include <memory>
#include <vector>

#include "reference_host/quicktime/SoundPlaces.h"

namespace {

struct Indexed {
    Indexed(AVRational timeBase, const std::vector<ncfSInt64>& times)
        : input(avformat_alloc_context(), avformat_free_context),
          stream(avformat_new_stream(input.get(), nullptr)) {
        stream->time_base = timeBase;
        for (const ncfSInt64 time : times) {
            av_add_index_entry(stream, time * 10 + 100, time, 10, 0, AVINDEX_KEYFRAME);
        }
    }
    std::unique_ptr<AVFormatContext, void (*)(AVFormatContext*)> input;
    AVStream* stream;
};

constexpr AVRational kUnits48000{1, 48000};

// Of the packet at just this time.
std::optional<ncfSInt64> PlaceOf(const host::SoundPlaces& places, ncfSInt64 time) {
    const auto packet = places.LastAt(time);
    return packet && packet->time == time ? std::optional<ncfSInt64>(packet->place) : std::nullopt;
}

TEST(GapOfStep, IsNothingThatRoundingExplains) {
    // 1024 frames of 44100 are 1114.56 units.
    for (const ncfSInt64 step : {1113, 1114, 1115, 1116}) {
        EXPECT_EQ(host::GapOfStep(step, 1024, kUnits48000, 44100), 0) << step;
    }
    EXPECT_EQ(host::GapOfStep(1115 + 480, 1024, kUnits48000, 44100), 441);
    EXPECT_EQ(host::GapOfStep(1115 - 480, 1024, kUnits48000, 44100), -441);
}

TEST(GapOfStep, IsEveryFrameWhereTimesAreExact) {
    EXPECT_EQ(host::GapOfStep(1024, 1024, AVRational{1, 44100}, 44100), 0);
    EXPECT_EQ(host::GapOfStep(1025, 1024, AVRational{1, 44100}, 44100), 1);
    EXPECT_EQ(host::GapOfStep(1023, 1024, AVRational{1, 44100}, 44100), -1);
}

TEST(SoundPlaces, NeverLetRoundingAddUp) {
    std::vector<ncfSInt64> times;
    for (ncfSInt64 i = 0; i < 1000; ++i) {
        times.push_back(i * 1115);
    }
    const Indexed sound(kUnits48000, times);
    const host::SoundPlaces places(*sound.stream, 1024, 44100, 0);
    ASSERT_FALSE(places.IsEmpty());
    for (ncfSInt64 i = 0; i < 1000; ++i) {
        ASSERT_EQ(PlaceOf(places, i * 1115), i * 1024);
    }
    // Between two packets it is the one before.
    EXPECT_EQ(places.LastAt(1116)->time, 1115);
    EXPECT_EQ(places.LastAt(2229)->time, 1115);
    EXPECT_FALSE(places.LastAt(-1));
}

TEST(SoundPlaces, KeepAGapAndWhatPrimes) {
    const Indexed sound(kUnits48000, {-1115, 0, 1115, 1115 + 4800, 1115 + 4800 + 1114});
    const host::SoundPlaces places(*sound.stream, 1024, 44100, 0);
    EXPECT_EQ(PlaceOf(places, -1115), -1024);
    EXPECT_EQ(PlaceOf(places, 0), 0);
    EXPECT_EQ(PlaceOf(places, 1115), 1024);
    EXPECT_EQ(PlaceOf(places, 1115 + 4800), 1024 + 4410);
    EXPECT_EQ(PlaceOf(places, 1115 + 4800 + 1114), 1024 + 4410 + 1024);
}

TEST(SoundPlaces, TellTheTimeOfThePacketAtAPlace) {
    const Indexed sound(kUnits48000, {0, 1115, 2230});
    const host::SoundPlaces places(*sound.stream, 1024, 44100, 0);
    EXPECT_EQ(places.TimeOf(-5), 0);
    EXPECT_EQ(places.TimeOf(1023), 0);
    EXPECT_EQ(places.TimeOf(1024), 1115);
    EXPECT_EQ(places.TimeOf(999999), 2230);
}

TEST(SoundPlaces, AreNoneWithoutAnIndex) {
    const Indexed none(kUnits48000, {});
    EXPECT_TRUE(host::SoundPlaces(*none.stream, 1024, 44100, 0).IsEmpty());
}

}  // namespace
