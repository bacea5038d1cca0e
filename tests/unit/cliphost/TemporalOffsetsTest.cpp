// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/TemporalOffsets.h"
#include "tests/support/fakes/StubSampleMapping.h"

#include <gtest/gtest.h>

#include <chrono>
#include <random>

using cliphost::SampleTime;
using cliphost::TemporalOffsets;
using cliphost::WorkOutOffsets;

namespace {

using Offset = std::optional<std::int64_t>;
using Times = std::vector<SampleTime>;

// The search as the module makes it: outward, one sample after the other. Past the
// first sample it goes two steps on and gives up.
Offset Outward(const Times& times, std::int64_t sample, std::uint64_t* steps = nullptr) {
    const auto count = static_cast<std::int64_t>(times.size());
    const auto at = [&](std::int64_t i) { return times[static_cast<std::size_t>(i)]; };
    const std::int64_t duration = at(sample).duration, tolerance = duration / 10;
    if (duration < 0) {
        return std::nullopt;
    }
    if (std::abs(at(sample).displayOffset) <= tolerance) {
        return 0;
    }
    for (std::int64_t step = 1; step <= std::max(sample + 1, count - sample); ++step) {
        if (steps) {
            ++*steps;
        }
        if (duration == 0) {
            return std::nullopt;
        }
        if (sample + step < count &&
            step == (tolerance - at(sample + step).displayOffset) / duration) {
            return step;
        }
        if (step > sample + 1 && sample + step < count) {
            return std::nullopt;
        }
        if (step <= sample && step == (at(sample - step).displayOffset + tolerance) / duration) {
            return -step;
        }
    }
    return std::nullopt;
}

void ExpectAsOutward(const Times& times, const std::string& which) {
    const std::vector<Offset> got = WorkOutOffsets(times);
    ASSERT_EQ(got.size(), times.size());
    for (std::size_t i = 0; i < times.size(); ++i) {
        ASSERT_EQ(got[i], Outward(times, static_cast<std::int64_t>(i)))
            << which << ", sample " << i << " of " << times.size();
    }
}

// Pictures of plain groups, shown in the order I B B P.
Times Groups(std::size_t count) {
    Times times(count, {512, 0});
    for (std::size_t i = 1; i + 2 < count; i += 3) {
        times[i].displayOffset = 2 * 512;
        times[i + 1].displayOffset = times[i + 2].displayOffset = -512;
    }
    return times;
}

// No sample is displayed in its place, and none at another's.
Times Nowhere(std::size_t count) {
    return Times(count, {1, static_cast<std::int64_t>(count) + 5});
}

// Each is displayed at the place of one half the track away.
Times FarAway(std::size_t count) {
    return Times(count, {100, static_cast<std::int64_t>(count) * 50});
}

class FakeTimes final : public StubSampleMapping {
public:
    explicit FakeTimes(Times times) : times_(std::move(times)) {}

    NCFRESULT GetSampleTemporalOffset(ncfUInt32, ncfUInt64 sample, ncfSInt64* offset) override {
        ++asked;
        const Offset found = Outward(times_, static_cast<std::int64_t>(sample), &steps);
        *offset = found.value_or(99);
        return found ? NCF_OK : NCF_E_FAIL;
    }
    std::uint64_t steps = 0, asked = 0;

private:
    Times times_;
};

}  // namespace

TEST(TemporalOffsets, AreThoseOfTheSearchOutward) {
    ExpectAsOutward({}, "none");
    for (const std::size_t count : {1u, 2u, 3u, 4u, 5u, 10u, 101u}) {
        ExpectAsOutward(Groups(count), "groups");
        ExpectAsOutward(Nowhere(count), "nowhere");
        ExpectAsOutward(FarAway(count), "far away");
        ExpectAsOutward(Times(count, {0, 1}), "no duration");
        ExpectAsOutward(Times(count, {-1, 1}), "duration below zero");
    }
    std::minstd_rand random(7);
    const auto upTo = [&](std::int64_t most) {
        return static_cast<std::int64_t>(random()) % (most + 1);
    };
    for (int turn = 0; turn < 4000; ++turn) {
        // One duration, a few, or many; offsets of a few samples or of all.
        const std::int64_t durations = std::int64_t{1} << upTo(7), reach = 1 + upTo(60);
        Times times(static_cast<std::size_t>(1 + upTo(60)));
        for (SampleTime& time : times) {
            time.duration = 20 * upTo(durations);
            time.displayOffset = (upTo(2 * reach) - reach) * (turn % 2 == 0 ? 20 : 13);
        }
        ExpectAsOutward(times, "turn " + std::to_string(turn));
    }
}

TEST(TemporalOffsets, AskTheModuleWhereItIsNear) {
    const Times times = Groups(3000);
    FakeTimes map(times);
    bool isRead = false;
    TemporalOffsets offsets(map, 0, [&] {
        isRead = true;
        return times;
    });
    for (std::size_t i = 0; i < times.size(); ++i) {
        ASSERT_EQ(offsets.Of(i), Outward(times, static_cast<std::int64_t>(i)));
    }
    EXPECT_EQ(map.asked, times.size());
    EXPECT_FALSE(isRead) << "nothing is far";
}

// Ten times the samples may take ten times the steps.
TEST(TemporalOffsets, TakeTheModuleAFewStepsForEachSample) {
    for (const auto make : {Nowhere, FarAway, Groups}) {
        for (const std::size_t count : {2000u, 20000u}) {
            const Times times = make(count);
            FakeTimes map(times);
            TemporalOffsets offsets(map, 0, [&] { return times; });
            for (std::size_t i = 0; i < count; ++i) {
                offsets.Of(i);
            }
            EXPECT_LT(map.steps, 40 * count);
        }
    }
}

TEST(TemporalOffsets, ComeFromTheModuleAloneWhereTheTablesSayOtherwise) {
    const Times times = FarAway(400);
    for (const Times& others : {Times(), Times(3, {1, 1}), Groups(400), Nowhere(400)}) {
        FakeTimes map(times);
        TemporalOffsets offsets(map, 0, [&] { return others; });
        for (std::size_t i = 0; i < times.size(); ++i) {
            ASSERT_EQ(offsets.Of(i), Outward(times, static_cast<std::int64_t>(i))) << i;
        }
        EXPECT_LE(map.asked, times.size() + 8) << "and a few to compare";
    }
}

TEST(TemporalOffsets, OfManyDurationsCostNoMoreThanTheirReach) {
    // Every sample lasts its own time; each is displayed two places on.
    Times times(200000);
    for (std::size_t i = 0; i < times.size(); ++i) {
        times[i] = {static_cast<std::int64_t>(1000000 + i), 2000000};
    }
    const auto begin = std::chrono::steady_clock::now();
    EXPECT_EQ(WorkOutOffsets(times)[1000], Outward(times, 1000));
    EXPECT_LT(std::chrono::steady_clock::now() - begin, std::chrono::seconds(10));
}
