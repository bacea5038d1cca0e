// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/ContactSheet.h"

#include <algorithm>

namespace cliphost {
namespace {

constexpr int kGap = 8;
constexpr std::uint16_t kPaper = 32;
constexpr int kSquares = 24;  // of the checkerboard, in a line
constexpr int kDark = 102;
constexpr int kLight = 153;

// One pixel as 8-bit R'G'B' over the checkerboard.
void PixelAt(const Picture& picture, int x, int y, int (&rgb)[3]) {
    const std::uint16_t* const from =
        &picture.samples[(static_cast<std::size_t>(y) * static_cast<std::size_t>(picture.width) +
                          static_cast<std::size_t>(x)) *
                         static_cast<std::size_t>(picture.channels)];
    const int shift = picture.bits - 8;
    const int alpha = picture.channels == 4 ? from[3] >> shift : 255;
    // The same squares for a picture that was made smaller before.
    const int squares = std::min(kSquares, picture.width);
    const auto squareAt = [&](int place) {
        return static_cast<int>(std::int64_t{place} * squares / picture.width);
    };
    const int behind = ((squareAt(x) + squareAt(y)) & 1) != 0 ? kDark : kLight;
    for (int c = 0; c < 3; ++c) {
        const int own = from[picture.channels == 1 ? 0 : c] >> shift;
        rgb[c] = (own * alpha + behind * (255 - alpha) + 127) / 255;
    }
}

}  // namespace

Picture Shrunk(const Picture& picture, int width, int height) {
    Picture out{width, height, 3, 8, {}};
    out.samples.resize(out.Pixels() * 3);
    std::uint16_t* to = out.samples.data();
    for (int y = 0; y < height; ++y) {
        const int top = static_cast<int>(std::int64_t{y} * picture.height / height);
        const int bottom =
            std::max(top + 1, static_cast<int>((std::int64_t{y} + 1) * picture.height / height));
        for (int x = 0; x < width; ++x, to += 3) {
            const int left = static_cast<int>(std::int64_t{x} * picture.width / width);
            const int right =
                std::max(left + 1, static_cast<int>((std::int64_t{x} + 1) * picture.width / width));
            std::int64_t sum[3] = {};
            for (int v = top; v < bottom; ++v) {
                for (int u = left; u < right; ++u) {
                    int rgb[3];
                    PixelAt(picture, u, v, rgb);
                    for (int c = 0; c < 3; ++c) {
                        sum[c] += rgb[c];
                    }
                }
            }
            const std::int64_t count = std::int64_t{bottom - top} * (right - left);
            for (int c = 0; c < 3; ++c) {
                to[c] = static_cast<std::uint16_t>((sum[c] + count / 2) / count);
            }
        }
    }
    return out;
}

ContactSheet::ContactSheet(int cells, int columns, int cellWidth, int cellHeight)
    : columns_(std::max(1, std::min(columns, cells))),
      cellWidth_(cellWidth),
      cellHeight_(cellHeight) {
    const int rows = std::max(1, (cells + columns_ - 1) / columns_);
    sheet_ =
        Picture{columns_ * (cellWidth + kGap) + kGap, rows * (cellHeight + kGap) + kGap, 3, 8, {}};
    sheet_.samples.assign(sheet_.Pixels() * 3, kPaper);
}

void ContactSheet::Add(const Picture& picture) {
    const int left = kGap + next_ % columns_ * (cellWidth_ + kGap);
    const int top = kGap + next_ / columns_ * (cellHeight_ + kGap);
    if (top + cellHeight_ > sheet_.height || picture.samples.empty()) {
        ++next_;
        return;
    }
    ++next_;
    const Picture small = Shrunk(picture, cellWidth_, cellHeight_);
    for (int y = 0; y < cellHeight_; ++y) {
        const auto row = static_cast<std::size_t>(cellWidth_) * 3;
        std::copy_n(&small.samples[static_cast<std::size_t>(y) * row], row,
                    &sheet_.samples[(static_cast<std::size_t>(top + y) *
                                         static_cast<std::size_t>(sheet_.width) +
                                     static_cast<std::size_t>(left)) *
                                    3]);
    }
}

}  // namespace cliphost
