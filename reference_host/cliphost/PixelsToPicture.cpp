// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/PixelsToPicture.h"

#include <algorithm>
#include <cmath>

namespace cliphost {
namespace {

std::uint16_t Rounded(double value, double most) {
    return static_cast<std::uint16_t>(std::lround(std::clamp(value, 0.0, most)));
}

// Weights of red, green and blue in luma.
struct Weights {
    double red, green, blue;
};
constexpr Weights kWeights601 = {0.299, 0.587, 0.114};
constexpr Weights kWeights709 = {0.2126, 0.7152, 0.0722};

void StoreRgb(double luma, double cb, double cr, const Weights& weights, std::uint16_t* to) {
    const double y = (luma - 16.0) / 219.0;
    const double b = 2.0 * (cb - 128.0) / 224.0 * (1.0 - weights.blue);
    const double r = 2.0 * (cr - 128.0) / 224.0 * (1.0 - weights.red);
    to[0] = Rounded(255.0 * (y + r), 255.0);
    to[1] = Rounded(255.0 * (y - (weights.blue * b + weights.red * r) / weights.green), 255.0);
    to[2] = Rounded(255.0 * (y + b), 255.0);
}

// Even pixels have chroma; pixels between them get the mean of their neighbours. An
// odd last pixel has no Cr of its own.
void FromCbYCrY(const ImageFormat& format, const unsigned char* bytes, Picture& picture) {
    const Weights& weights = format.colorSpace == format::kRec709 ? kWeights709 : kWeights601;
    const int width = picture.width;
    std::uint16_t* to = picture.samples.data();
    for (int line = 0; line < picture.height; ++line, bytes += std::ptrdiff_t{2} * width) {
        const auto cbAt = [&](int pair) -> double { return bytes[4 * pair]; };
        const auto crAt = [&](int pair) -> double {
            const int place = 4 * pair + 2;
            if (place < 2 * width) {
                return bytes[place];
            }
            return pair > 0 ? bytes[place - 4] : 128.0;
        };
        for (int x = 0; x < width; ++x, to += 3) {
            const int pair = x / 2;
            const int next = std::min(pair + x % 2, (width - 1) / 2);
            StoreRgb(bytes[2 * x + 1], (cbAt(pair) + cbAt(next)) / 2, (crAt(pair) + crAt(next)) / 2,
                     weights, to);
        }
    }
}

// The levels of a range, from its black to its white.
struct Levels {
    double black, white;
};

void FromRgb8(const ImageFormat& format, const unsigned char* bytes, Picture& picture) {
    const Levels levels = format.range == format::kVideoRange ? Levels{16, 235} : Levels{0, 255};
    std::uint16_t* to = picture.samples.data();
    for (std::size_t i = 0; i < picture.Pixels(); ++i, bytes += 4, to += 3) {
        for (int c = 0; c < 3; ++c) {
            to[c] = Rounded((bytes[2 - c] - levels.black) * 255.0 / (levels.white - levels.black),
                            255.0);
        }
    }
}

void FromArgb16(const ImageFormat& format, const unsigned char* bytes, Picture& picture) {
    const Levels levels =
        format.range == format::kVideoRange ? Levels{4096, 60160} : Levels{0, 65535};
    std::uint16_t* to = picture.samples.data();
    for (std::size_t i = 0; i < picture.Pixels(); ++i, bytes += 8, to += 3) {
        for (int c = 0; c < 3; ++c) {
            const int word = bytes[2 * c + 2] << 8 | bytes[2 * c + 3];
            to[c] =
                Rounded((word - levels.black) * 65535.0 / (levels.white - levels.black), 65535.0);
        }
    }
}

void FromAlpha8(const ImageFormat&, const unsigned char* bytes, Picture& picture) {
    std::copy_n(bytes, picture.Pixels(), picture.samples.begin());
}

void FromAlpha10(const ImageFormat&, const unsigned char* bytes, Picture& picture) {
    const std::size_t count = picture.Pixels();
    for (std::size_t i = 0; i < count; ++i) {
        const int value = bytes[i] << 2 | (bytes[count + i] & 3);
        picture.samples[i] = Rounded(value * 65535.0 / 1023.0, 65535.0);
    }
}

struct Reader {
    PictureBytes bytes;
    int channels;
    int bits;
    void (*read)(const ImageFormat&, const unsigned char*, Picture&);
};
constexpr Reader kReaders[] = {
    {PictureBytes::CbYCrY8, 3, 8, FromCbYCrY},   {PictureBytes::Bgra8, 3, 8, FromRgb8},
    {PictureBytes::Argb16, 3, 16, FromArgb16},   {PictureBytes::Alpha8, 1, 8, FromAlpha8},
    {PictureBytes::Alpha10, 1, 16, FromAlpha10},
};

std::uint16_t Scaled(std::uint16_t value, int fromBits, int toBits) {
    if (fromBits == toBits) {
        return value;
    }
    return toBits == 16 ? static_cast<std::uint16_t>(value * 257)
                        : static_cast<std::uint16_t>((value * 255 + 32767) / 65535);
}

}  // namespace

Picture PixelsToPicture(const ImageFormat& format, int width, int height,
                        const unsigned char* bytes, std::size_t size) {
    const ImageLayout* const layout = LayoutOf(format);
    for (const Reader& reader : kReaders) {
        if (!layout || reader.bytes != layout->bytes || width <= 0 || height <= 0) {
            continue;
        }
        Picture picture{width, height, reader.channels, reader.bits, {}};
        if (size / static_cast<std::size_t>(layout->bytesPerPixel) < picture.Pixels()) {
            return {};
        }
        picture.samples.resize(picture.Pixels() * static_cast<std::size_t>(reader.channels));
        reader.read(format, bytes, picture);
        return picture;
    }
    return {};
}

Picture WithAlpha(const Picture& picture, const Picture& alpha) {
    if (picture.channels != 3 || alpha.channels != 1 || picture.width != alpha.width ||
        picture.height != alpha.height) {
        return picture;
    }
    Picture out{picture.width, picture.height, 4, picture.bits, {}};
    out.samples.reserve(picture.Pixels() * 4);
    for (std::size_t i = 0; i < picture.Pixels(); ++i) {
        out.samples.insert(out.samples.end(), &picture.samples[3 * i], &picture.samples[3 * i] + 3);
        out.samples.push_back(Scaled(alpha.samples[i], alpha.bits, picture.bits));
    }
    return out;
}

}  // namespace cliphost
