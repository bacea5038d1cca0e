// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>

namespace fuzz {

// What one input may cost at most.
constexpr int kMostSeconds = 5;  // of the processor: waiting for others costs nothing
constexpr std::size_t kMostMegabytes = 512;

// Ends the process when what follows takes longer than an input may.
class TimeLimit {
public:
    TimeLimit();
    ~TimeLimit();
    TimeLimit(const TimeLimit&) = delete;
    TimeLimit& operator=(const TimeLimit&) = delete;
};

// The most memory that the process ever held.
std::size_t PeakMegabytes();
// Not under the thread sanitizer, which takes many times the memory and time.
bool LimitsCount();

}  // namespace fuzz
