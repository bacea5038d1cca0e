// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include <gtest/gtest.h>

#include <algorithm>
#include <random>

#include "tests/unit/quicktime/MadeMovie.h"
#include "tests/unit/quicktime/SoundEncoders.h"

using namespace quicktime_tests;

namespace {

// A reader of one track, opened anew, as an editor does that jumps into a movie.
struct Reader {
    explicit Reader(const std::filesystem::path& path) {
        wrapper = OpenWrapper(path);
        if (wrapper) {
            wrapper->GetQTAudioReader(reader.Out());
        }
        if (!reader || reader->SetParams(1, 4, 1, 48000.0, channels) != NCF_OK) {
            ADD_FAILURE() << "no sound of " << path;
        }
    }
    Bytes Read(ncfUInt64 place, ncfUInt64 count) {
        Bytes bytes(count * channels * 4, 0xEE);
        ncfUInt64 got = count;
        if (!reader ||
            reader->ReadSamples(1, place, &got, bytes.data(), bytes.size(), 0, 0) != NCF_OK) {
            return {};
        }
        bytes.resize(got * channels * 4);
        return bytes;
    }
    host::Ref<QTWrapper::IQuickTimeWrapper> wrapper;
    host::Ref<QTWrapper::IQTAudioReader> reader;
    ncfUInt32 channels = 0;
};

// Longer than what any decoder is given before a place to settle.
constexpr int kSeconds = 4;

class EverySoundEncoder : public testing::TestWithParam<SoundEncoder> {};

TEST_P(EverySoundEncoder, GivesAnyRangeAloneAsInTheWhole) {
    NEEDS_FFMPEG();
    const SoundEncoder& encoder = GetParam();
    const MadeMovie movie(SoundOf(encoder, kSeconds) + encoder.arguments, encoder.ending);
    const std::size_t frame = static_cast<std::size_t>(encoder.channels) * 4;
    Reader sequential(movie.Path());
    ASSERT_EQ(sequential.channels, static_cast<ncfUInt32>(encoder.channels));
    Bytes whole;
    for (;;) {
        const Bytes piece = sequential.Read(whole.size() / frame, 5003);
        whole.insert(whole.end(), piece.begin(), piece.end());
        if (piece.size() < 5003 * frame) {
            break;
        }
    }
    const std::size_t frames = whole.size() / frame;
    ASSERT_GT(frames, static_cast<std::size_t>(encoder.rate) * (kSeconds - 1));
    ASSERT_GT(std::count_if(whole.begin(), whole.end(), [](auto byte) { return byte != 0; }),
              static_cast<std::ptrdiff_t>(frames));
    std::mt19937 random(7);
    std::size_t differing = 0;
    std::string example;
    for (int i = 0; i < 14; ++i) {
        const std::size_t place = random() % frames;
        const std::size_t count = std::min<std::size_t>(1 + random() % 2000, frames - place);
        Reader alone(movie.Path());
        const Bytes piece = alone.Read(place, count);
        ASSERT_EQ(piece.size(), count * frame);
        const bool isSame = std::equal(piece.begin(), piece.end(),
                                       whole.begin() + static_cast<std::ptrdiff_t>(place * frame));
        differing += !isSame;
        example = isSame || !example.empty()
                      ? example
                      : std::to_string(count) + " from " + std::to_string(place);
    }
    if (encoder.isExactAnywhere) {
        EXPECT_EQ(differing, 0u) << example;
    } else {
        EXPECT_GT(differing, 0u) << "is exact: say so, and in docs/essence.md";
    }
}

INSTANTIATE_TEST_SUITE_P(AudioReader, EverySoundEncoder, testing::ValuesIn(SoundEncoders()),
                         [](const auto& row) { return std::string(row.param.name); });

}  // namespace
