// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>

namespace host::system {

// What this process holds now. 0 where the system can't tell.
struct ProcessFacts {
    std::size_t threads = 0;
    std::size_t handles = 0;  // open files, pipes and connections
    std::size_t memory = 0;   // bytes that were allocated and not given back
};

ProcessFacts OwnFacts();

}  // namespace host::system
