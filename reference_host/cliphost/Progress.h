// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <string>

namespace cliphost {

// A progress line on standard error while long work runs; nothing when that is
// no terminal. Gone when the object is.
class Progress {
public:
    Progress(std::string what, std::size_t count);
    ~Progress();
    Progress(const Progress&) = delete;
    Progress& operator=(const Progress&) = delete;

    // Begins the next of `count` pieces.
    void Step(const std::string& name);

private:
    std::string what_;
    std::size_t count_;
    std::size_t done_ = 0;
    bool shown_;
};

}  // namespace cliphost
