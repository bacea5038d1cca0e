// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/PictureTurn.h"

#include <algorithm>
#include <cmath>

namespace cliphost {
namespace {

// Numbers that were rounded when the file was written still count as zero: less
// than two degrees off.
bool IsNothingBeside(double small, double large) {
    return std::abs(small) * 32 < std::abs(large);
}

}  // namespace

PictureTurn TurnOf(const host::DisplayMatrix& matrix) {
    const auto& [a, b, c, d] = matrix;
    if (IsNothingBeside(b, a) && IsNothingBeside(c, d)) {
        return {false, a < 0, d < 0};
    }
    if (IsNothingBeside(a, b) && IsNothingBeside(d, c)) {
        return {true, c < 0, b < 0};
    }
    return {};
}

Picture Turned(Picture picture, const PictureTurn& turn) {
    if (!turn.swapsSides && !turn.reversesRows && !turn.reversesColumns) {
        return picture;
    }
    Picture out = picture;
    if (turn.swapsSides) {
        std::swap(out.width, out.height);
    }
    const auto channels = static_cast<std::size_t>(picture.channels);
    std::uint16_t* to = out.samples.data();
    for (int row = 0; row < out.height; ++row) {
        for (int column = 0; column < out.width; ++column, to += channels) {
            int x = turn.reversesRows ? out.width - 1 - column : column;
            int y = turn.reversesColumns ? out.height - 1 - row : row;
            if (turn.swapsSides) {
                std::swap(x, y);
            }
            const auto pixel =
                static_cast<std::size_t>(y) * static_cast<std::size_t>(picture.width) +
                static_cast<std::size_t>(x);
            std::copy_n(&picture.samples[pixel * channels], channels, to);
        }
    }
    return out;
}

}  // namespace cliphost
