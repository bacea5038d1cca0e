// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include <gtest/gtest.h>

#include <algorithm>
#include <random>

#include "tests/support/codecs/SoundCodecs.h"
#include "tests/unit/quicktime/MadeMovie.h"

using namespace quicktime_tests;

namespace {

// A reader of one track.
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

class EverySoundEncoder : public testing::TestWithParam<SoundCase> {};

TEST_P(EverySoundEncoder, GivesAnyRangeAloneAsInTheWhole) {
    const SoundCase& encoder = GetParam();
    const MadeMovie movie("-f lavfi -i \"" + SoundSource(encoder.rate, encoder.layout, kSeconds) +
                              "\" " + encoder.encoder,
                          "." + encoder.ending);
    const auto channels = static_cast<std::size_t>(ChannelsOf(encoder.layout));
    const std::size_t frame = channels * 4;
    Reader sequential(movie.Path());
    ASSERT_EQ(sequential.channels, channels);
    Bytes whole;
    for (;;) {
        const Bytes piece = sequential.Read(whole.size() / frame, 5003);
        whole.insert(whole.end(), piece.begin(), piece.end());
        if (piece.size() < 5003 * frame) {
            break;
        }
    }
    const std::size_t frames = whole.size() / frame;
    ASSERT_GT(frames, std::stoul(encoder.rate) * (kSeconds - 1));
    ASSERT_GT(std::count_if(whole.begin(), whole.end(), [](auto byte) { return byte != 0; }),
              static_cast<std::ptrdiff_t>(frames / 2));
    std::mt19937 random(7);
    std::size_t differing = 0;
    std::string example;
    Reader jumping(movie.Path());
    for (int i = 0; i < 14; ++i) {
        const std::size_t place = random() % frames;
        const std::size_t count = std::min<std::size_t>(1 + random() % 2000, frames - place);
        Reader alone(movie.Path());
        const Bytes piece = alone.Read(place, count);
        ASSERT_EQ(piece.size(), count * frame);
        EXPECT_TRUE(!encoder.isExactAnywhere || jumping.Read(place, count) == piece)
            << "after a jump: " << count << " from " << place;
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

std::vector<SoundCase> BroadCases() {
    std::vector<SoundCase> broad;
    std::copy_if(SoundCases().begin(), SoundCases().end(), std::back_inserter(broad),
                 [](const SoundCase& row) { return row.isBroad; });
    return broad;
}

INSTANTIATE_TEST_SUITE_P(Broad, EverySoundEncoder, testing::ValuesIn(BroadCases()),
                         [](const auto& row) {
                             std::string name = row.param.name;
                             std::replace(name.begin(), name.end(), '.', '_');
                             return name;
                         });

}  // namespace
