// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <cstdint>
#include <string>

namespace cliphost {

// A share of a list for one of several machines. Which share a path belongs to depends on nothing
// but the path and the number of shares, so that a movie that is added moves no other one.
class Shard {
public:
    Shard() = default;
    // From "I/N", I from 1 to N. Throws a Failure that says what is wrong.
    explicit Shard(const std::string& text);

    bool IsWhole() const { return count_ == 1; }
    // By the first eight bytes of the SHA-256 of the path, as a big-endian number, modulo N: 0 is
    // the first share.
    bool Holds(const std::string& path) const;

private:
    std::uint64_t place_ = 0;
    std::uint64_t count_ = 1;
};

}  // namespace cliphost
