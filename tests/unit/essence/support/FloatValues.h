// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <cstring>
#include <limits>
#include <random>
#include <vector>

#include "host_interfaces/framework/Types.h"

// Components that a decoder should and should not deliver.
inline std::vector<float> EdgeFloats() {
    const float infinity = std::numeric_limits<float>::infinity();
    const float nan = std::numeric_limits<float>::quiet_NaN();
    std::vector<float> values = {0.0f,
                                 -0.0f,
                                 0.5f,
                                 1.0f,
                                 1.5f,
                                 2.0f,
                                 100.0f,
                                 128.0f / 255.0f,
                                 219.0f / 255.0f,
                                 65535.0f,
                                 65536.0f,
                                 3e9f,
                                 1e15f,
                                 2.1e6f,
                                 1e30f,
                                 std::numeric_limits<float>::max(),
                                 std::numeric_limits<float>::min(),
                                 std::numeric_limits<float>::denorm_min(),
                                 infinity,
                                 nan};
    const std::size_t positive = values.size();
    for (std::size_t i = 0; i < positive; ++i) {
        values.push_back(-values[i]);
    }
    // Alphas that land on or beside a half.
    for (int i = 0; i < 64; ++i) {
        values.push_back((static_cast<float>(i) + 0.5f) / 65535.0f);
        values.push_back((static_cast<float>(i) + 0.5f) / 1023.0f);
    }
    return values;
}

// Pixels of four floats: mostly near the range of pictures, some edges, some
// of any bits at all.
inline std::vector<float> RandomPixels(std::size_t pixels, unsigned seed) {
    std::mt19937 random(seed);
    const std::vector<float> edges = EdgeFloats();
    std::uniform_real_distribution<float> picture(-0.25f, 1.25f);
    std::vector<float> values(pixels * 4);
    for (float& value : values) {
        const unsigned kind = random() % 16;
        if (kind == 0) {
            value = edges[random() % edges.size()];
        } else if (kind == 1) {
            const std::uint32_t bits = static_cast<std::uint32_t>(random());
            std::memcpy(&value, &bits, sizeof value);
        } else {
            value = picture(random);
        }
    }
    return values;
}

inline const ncfUInt8* BytesOf(const std::vector<float>& values) {
    return reinterpret_cast<const ncfUInt8*>(values.data());
}
