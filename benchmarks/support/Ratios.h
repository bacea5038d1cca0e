// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <string>
#include <vector>

// What a benchmark has to reach.
struct Goal {
    enum class Of {
        Nothing,
        TimeRatio,  // our time divided by the peer's: at most
        RateRatio,  // our rate divided by the peer's: at least
        Time,       // of one run, in seconds: at most
        Rate,       // runs or items a second: at least
        Growth,     // our time divided by our own at half the argument: at most
    };
    Of of = Of::Nothing;
    double bound = 0;
};

constexpr Goal NoGoal{};
constexpr Goal TimesAtMost(double ratio) {
    return {Goal::Of::TimeRatio, ratio};
}
constexpr Goal RateAtLeast(double ratio) {
    return {Goal::Of::RateRatio, ratio};
}
constexpr Goal SecondsAtMost(double seconds) {
    return {Goal::Of::Time, seconds};
}
constexpr Goal ASecondAtLeast(double count) {
    return {Goal::Of::Rate, count};
}
constexpr Goal GrowthAtMost(double ratio) {
    return {Goal::Of::Growth, ratio};
}

// Two benchmarks of one program that do the same work: `ours` beside `peer`, each with every
// argument that both have. Without a peer, ours alone is held to the goal, its growth to itself.
struct Pair {
    std::string ours;
    std::string peer;
    Goal goal;
    long long from = 0;  // smaller arguments are only told
};

// Runs the registered benchmarks, prints them as usual, and behind them a row of a table for
// each pair, of the medians of their runs. To be called from main.
int RunWithRatios(int argc, char** argv, const std::vector<Pair>& pairs);
