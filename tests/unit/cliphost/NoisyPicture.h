// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <cstdint>

#include "reference_host/cliphost/Picture.h"

// Of no order, which takes the most bytes.
inline cliphost::Picture NoisyPicture(int width, int height) {
    cliphost::Picture picture{width, height, 3, 8, {}};
    std::uint32_t number = 1;
    for (int i = 0; i < width * height * 3; ++i) {
        number = number * 1664525 + 1013904223;
        picture.samples.push_back(static_cast<std::uint16_t>(number >> 24));
    }
    return picture;
}
