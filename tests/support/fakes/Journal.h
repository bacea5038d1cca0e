// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <string>
#include <vector>

// One list of lines that all fakes of a test append to, so that order across
// objects is checked by comparing lists.
class Journal {
public:
    void add(std::string line) { lines_.push_back(std::move(line)); }
    void clear() { lines_.clear(); }

    const std::vector<std::string>& lines() const { return lines_; }
    int count(const std::string& line) const;
    // Lines that begin with a text.
    std::vector<std::string> startingWith(const std::string& start) const;
    bool contains(const std::string& piece) const;

private:
    std::vector<std::string> lines_;
};
