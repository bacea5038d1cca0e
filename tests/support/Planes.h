// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <cstdint>
#include <vector>

// Frames in planes of 4:2:2 and 8 bits as Cb Y Cr Y.
inline std::vector<std::uint8_t> Interleaved422(const std::vector<std::uint8_t>& planes,
                                                std::size_t width, std::size_t height) {
    std::vector<std::uint8_t> out;
    const std::size_t luma = width * height;
    for (std::size_t frame = 0; frame + luma * 2 <= planes.size(); frame += luma * 2) {
        for (std::size_t i = 0; i < luma / 2; ++i) {
            out.push_back(planes[frame + luma + i]);
            out.push_back(planes[frame + 2 * i]);
            out.push_back(planes[frame + luma + luma / 2 + i]);
            out.push_back(planes[frame + 2 * i + 1]);
        }
    }
    return out;
}
