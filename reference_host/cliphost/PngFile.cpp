// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/PngFile.h"

#include <png.h>

namespace cliphost {
namespace {

void Append(png_structp png, png_bytep bytes, png_size_t size) {
    auto& out = *static_cast<std::vector<unsigned char>*>(png_get_io_ptr(png));
    out.insert(out.end(), bytes, bytes + size);
}
void FlushNothing(png_structp) {}

int ColorTypeOf(int channels) {
    switch (channels) {
        case 1:
            return PNG_COLOR_TYPE_GRAY;
        case 3:
            return PNG_COLOR_TYPE_RGB;
        case 4:
            return PNG_COLOR_TYPE_RGB_ALPHA;
        default:
            return -1;
    }
}

// Samples of a line as the file has them: bytes, or big-endian words.
void PackLine(const Picture& picture, int line, std::vector<unsigned char>& to) {
    const std::size_t count =
        static_cast<std::size_t>(picture.width) * static_cast<std::size_t>(picture.channels);
    const std::uint16_t* const from =
        picture.samples.data() + static_cast<std::size_t>(line) * count;
    for (std::size_t i = 0; i < count; ++i) {
        if (picture.bits == 16) {
            to[2 * i] = static_cast<unsigned char>(from[i] >> 8);
            to[2 * i + 1] = static_cast<unsigned char>(from[i]);
        } else {
            to[i] = static_cast<unsigned char>(from[i]);
        }
    }
}

// The library fails by a long jump, which runs no destructors: no object that needs
// one may be alive across a call.
bool WriteAll(png_structp png, png_infop info, const Picture& picture, int colorType,
              std::vector<unsigned char>& line) {
    if (setjmp(png_jmpbuf(png))) {
        return false;
    }
    png_set_IHDR(png, info, static_cast<png_uint_32>(picture.width),
                 static_cast<png_uint_32>(picture.height), picture.bits, colorType,
                 PNG_INTERLACE_NONE, PNG_COMPRESSION_TYPE_DEFAULT, PNG_FILTER_TYPE_DEFAULT);
    png_set_compression_level(png, 3);  // moving pictures gain little from more
    png_write_info(png, info);
    for (int y = 0; y < picture.height; ++y) {
        PackLine(picture, y, line);
        png_write_row(png, line.data());
    }
    png_write_end(png, nullptr);
    return true;
}

void Quiet(png_structp, png_const_charp) {}

}  // namespace

std::vector<unsigned char> ToPng(const Picture& picture) {
    std::vector<unsigned char> out;
    const int colorType = ColorTypeOf(picture.channels);
    if (colorType < 0 || picture.width <= 0 || picture.height <= 0 ||
        picture.samples.size() != picture.Pixels() * static_cast<std::size_t>(picture.channels)) {
        return out;
    }
    png_structp png = png_create_write_struct(PNG_LIBPNG_VER_STRING, nullptr, nullptr, Quiet);
    png_infop info = png ? png_create_info_struct(png) : nullptr;
    std::vector<unsigned char> line(static_cast<std::size_t>(picture.width) *
                                    static_cast<std::size_t>(picture.channels) *
                                    static_cast<std::size_t>(picture.bits / 8));
    if (info) {
        png_set_write_fn(png, &out, Append, FlushNothing);
        if (!WriteAll(png, info, picture, colorType, line)) {
            out.clear();
        }
    }
    png_destroy_write_struct(&png, &info);
    return out;
}

}  // namespace cliphost
