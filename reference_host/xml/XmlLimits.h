// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>

namespace host {

// What documents may ask for. Real ones have a few levels and a few kilobytes;
// readers of the tree recurse, so depth is bounded first.
struct XmlLimits {
    static constexpr int kDeepest = 256;
    static constexpr std::size_t kLongestText = std::size_t{64} << 20;
    static constexpr std::size_t kLargestDocument = std::size_t{256} << 20;
};

}  // namespace host
