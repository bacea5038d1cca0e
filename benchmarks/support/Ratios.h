// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <string>
#include <vector>

// Two benchmarks of one program whose times are compared: `ours` beside
// `peer`, each with every argument that both have.
struct Pair {
    std::string ours;
    std::string peer;
    std::string wanted;  // in words, such as "at most 2 times"
};

// Runs the registered benchmarks, prints them as usual, and behind them the
// ratio ours / peer of the medians for each pair. To be called from main.
int RunWithRatios(int argc, char** argv, const std::vector<Pair>& pairs);
