// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/WebpFile.h"

#include <webp/encode.h>

namespace cliphost {
namespace {

constexpr float kQualities[] = {62, 45, 30, 15, 0};

std::vector<unsigned char> Encoded(const std::vector<unsigned char>& rgb, const Picture& picture,
                                   float quality) {
    std::uint8_t* bytes = nullptr;
    const std::size_t size = WebPEncodeRGB(rgb.data(), picture.width, picture.height,
                                           3 * picture.width, quality, &bytes);
    std::vector<unsigned char> out(bytes, bytes + size);
    WebPFree(bytes);
    return out;
}

}  // namespace

std::vector<unsigned char> ToWebp(const Picture& picture, std::size_t mostBytes) {
    std::vector<unsigned char> out;
    const auto isSide = [](int side) { return side > 0 && side <= WEBP_MAX_DIMENSION; };
    if (picture.channels != 3 || picture.bits != 8 || !isSide(picture.width) ||
        !isSide(picture.height) || picture.samples.size() != 3 * picture.Pixels()) {
        return out;
    }
    const std::vector<unsigned char> rgb(picture.samples.begin(), picture.samples.end());
    for (const float quality : kQualities) {
        out = Encoded(rgb, picture, quality);
        if (out.size() <= mostBytes) {
            break;
        }
    }
    return out;
}

}  // namespace cliphost
