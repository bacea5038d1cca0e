// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <cstdint>
#include <vector>

namespace cliphost {

// A picture for people and image files: 1 grey, 3 R'G'B' or 4 R'G'B'A samples a
// pixel in full range, line by line.
struct Picture {
    int width = 0;
    int height = 0;
    int channels = 0;
    int bits = 8;  // 8 or 16, of a sample
    std::vector<std::uint16_t> samples;

    int Most() const { return bits == 16 ? 65535 : 255; }
    std::size_t Pixels() const {
        return static_cast<std::size_t>(width) * static_cast<std::size_t>(height);
    }
};

}  // namespace cliphost
