// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/ReportSamples.h"

#include <gtest/gtest.h>

#include <nlohmann/json.hpp>

using cliphost::Interleaving;
using cliphost::PlayedRuns;

namespace {

// Runs of a second of each track, in the order of `tracks`, which names them by their numbers.
std::vector<PlayedRuns> Seconds(const std::vector<ncfUInt32>& tracks) {
    std::vector<PlayedRuns> played = {{0, 0, 25, 0, {}}, {1, 0, 48000, 0, {}}};
    std::uint64_t position = 100;
    for (const ncfUInt32 track : tracks) {
        PlayedRuns& one = played[track];
        const auto count = static_cast<std::uint64_t>(one.rate);
        one.runs.push_back({one.samples, count, position, 1000});
        one.samples += count;
        position += 1000;
    }
    return played;
}

TEST(InterleavingOfSamples, IsGoodWhereTracksTakeTurns) {
    const auto found = Interleaving(Seconds({0, 1, 0, 1, 0, 1}));
    EXPECT_EQ(found["widest"], 1.0);
    EXPECT_TRUE(found["breaks"].empty());
}

TEST(InterleavingOfSamples, BreaksWhereOneTrackRunsAhead) {
    const auto found = Interleaving(Seconds({0, 1, 0, 0, 0, 1, 1, 1}));
    EXPECT_EQ(found["widest"], 3.0);
    EXPECT_EQ(found["count"], 1u);
    ASSERT_EQ(found["breaks"].size(), 1u);
    EXPECT_EQ(found["breaks"][0].dump(),
              R"({"position":5100,"track":1,"from":0,"at":1.0,"seconds":3.0})");
}

TEST(InterleavingOfSamples, BreaksWhereSoundLiesBehindAllPictures) {
    const auto found = Interleaving(Seconds({0, 0, 0, 0, 0, 1, 1, 1, 1, 1}));
    EXPECT_EQ(found["widest"], 5.0);
    ASSERT_EQ(found["breaks"].size(), 1u);
    EXPECT_EQ(found["breaks"][0]["position"], 3100);
}

TEST(InterleavingOfSamples, NeedsNothingOfATrackThatHasEnded) {
    const auto found = Interleaving(Seconds({0, 1, 1, 1, 1, 1, 1}));
    EXPECT_EQ(found["widest"], 1.0);
    EXPECT_TRUE(found["breaks"].empty());
}

// As with a pause at its beginning.
TEST(InterleavingOfSamples, CountsWhenEachTrackIsPlayed) {
    std::vector<PlayedRuns> late = Seconds({0, 0, 0, 0, 1, 0, 1, 0, 1});
    EXPECT_EQ(Interleaving(late)["widest"], 4.0);
    late[1].begin = 4;
    EXPECT_EQ(Interleaving(late)["widest"], 1.0);
    late = Seconds({1, 0, 1, 0});
    late[1].begin = -1;
    EXPECT_EQ(Interleaving(late)["widest"], 1.0);
}

TEST(InterleavingOfSamples, TellsTheFirstBreaksAndTheNumberOfAll) {
    std::vector<ncfUInt32> tracks;
    for (int i = 0; i < 40; ++i) {
        tracks.insert(tracks.end(), {0, 0, 0, 0, 1, 1, 1, 1});
    }
    const auto found = Interleaving(Seconds(tracks));
    EXPECT_EQ(found["breaks"].size(), 8u);
    EXPECT_EQ(found["count"], 40u);
}

}  // namespace
