// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <cstdlib>

// How much to measure with. The test of a benchmark asks only whether it still
// works: it sets CLIPHOST_BENCH_BRIEF and gets the smaller number.
template <class Number>
Number Sized(Number whole, Number brief) {
    return std::getenv("CLIPHOST_BENCH_BRIEF") != nullptr ? brief : whole;
}
