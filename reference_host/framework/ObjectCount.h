// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <cstdint>

namespace host {

// Objects of the host that are alive in this process, over all hosts. A test
// compares the number before and after.
std::int64_t LiveObjectCount();

// A member of every component: counts it while it lives.
class CountedObject {
public:
    CountedObject();
    ~CountedObject();
    CountedObject(const CountedObject&) = delete;
    CountedObject& operator=(const CountedObject&) = delete;
};

}  // namespace host
