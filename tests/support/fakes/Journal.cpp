// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "tests/support/fakes/Journal.h"

#include <algorithm>

int Journal::count(const std::string& line) const {
    return static_cast<int>(std::count(lines_.begin(), lines_.end(), line));
}

std::vector<std::string> Journal::startingWith(const std::string& start) const {
    std::vector<std::string> found;
    std::copy_if(
        lines_.begin(), lines_.end(), std::back_inserter(found),
        [&](const std::string& line) { return line.compare(0, start.size(), start) == 0; });
    return found;
}

bool Journal::contains(const std::string& piece) const {
    return std::any_of(lines_.begin(), lines_.end(), [&](const std::string& line) {
        return line.find(piece) != std::string::npos;
    });
}
