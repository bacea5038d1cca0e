// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "tests/system/codecs/PlainPicture.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <regex>

namespace {

using Colours = PlainForm::Colours;

std::string Depth(int bits) {
    return bits == 8 ? "" : std::to_string(bits) + "le";
}

PlainForm YCbCr(int kind, int bits, bool isFullRange) {
    PlainForm form;
    form.bits = bits;
    form.isFullRange = isFullRange;
    form.shiftX = kind == 444 || kind == 440 ? 0 : kind == 410 || kind == 411 ? 2 : 1;
    form.shiftY = kind == 410 ? 2 : kind == 420 || kind == 440 ? 1 : 0;
    form.name = (isFullRange && bits == 8 && kind >= 420 ? "yuvj" : "yuv") + std::to_string(kind) +
                "p" + Depth(bits);
    return form;
}

struct Packed {
    const char* pixels;
    int kind;
    int bits;
};

constexpr Packed kPacked[] = {
    {"uyvy422", 422, 8}, {"yuyv422", 422, 8}, {"yvyu422", 422, 8}, {"uyyvyy411", 411, 8},
    {"nv12", 420, 8},    {"nv21", 420, 8},    {"nv16", 422, 8},    {"p010le", 420, 10},
    {"y210le", 422, 10}, {"vuya", 444, 8},
};

}  // namespace

PlainForm PlainFormOf(const std::string& pixels, const std::string& range) {
    const bool isFull = range == "pc";
    for (const Packed& packed : kPacked) {
        if (pixels == packed.pixels) {
            return YCbCr(packed.kind, packed.bits, isFull);
        }
    }
    std::smatch found;
    const auto bits = [&found](std::size_t group) {
        return found[group].length() == 0 ? 8 : std::stoi(found[group]);
    };
    if (std::regex_match(pixels, found, std::regex("yuv(a|j)?(4\\d\\d)p(\\d*)(le|be)?"))) {
        return YCbCr(std::stoi(found[2]), bits(3), isFull || found[1] == "j");
    }
    PlainForm form;
    if (std::regex_match(pixels, found, std::regex("(gray|ya)(\\d*)(le|be)?"))) {
        form.colours = Colours::Grey;
        form.bits = bits(2);
        form.isFullRange = range != "tv";
        form.name = "gray" + Depth(form.bits);
        return form;
    }
    form.colours = Colours::Rgb;
    form.isFullRange = true;
    if (std::regex_match(pixels, found, std::regex("gbra?p(9|1\\d)(le|be)"))) {
        form.bits = std::stoi(found[1]);
        form.name = "gbrp" + Depth(form.bits);
    } else if (std::regex_match(pixels, found, std::regex("(rgb48|rgba64|bgr48|bgra64)(le|be)"))) {
        form.bits = 16;
        form.name = "gbrp16le";
    } else {
        form.isBgra = true;
        form.isCoarse = std::regex_match(pixels, std::regex("(rgb|bgr)(555|565|444)(le|be)"));
        form.name = "bgra";
    }
    return form;
}

PlainPictures::PlainPictures(const std::filesystem::path& movie) {
    const CommandResult probed = RunCommand(
        "ffprobe -v error -select_streams v:0 -show_entries "
        "stream=width,height,pix_fmt,color_range,chroma_location -of "
        "default=nw=1:nk=1 " +
        Quoted(movie));
    std::istringstream lines(probed.out);
    std::string range;
    if (!(lines >> width_ >> height_ >> decoded_ >> range >> location_)) {
        ADD_FAILURE() << movie << ": " << probed.out;
        return;
    }
    form_ = PlainFormOf(decoded_, range);
    if (form_.name.empty()) {
        return;
    }
    const std::size_t all = width_ * height_;
    const std::size_t chroma = ((width_ + (std::size_t{1} << form_.shiftX) - 1) >> form_.shiftX) *
                               ((height_ + (std::size_t{1} << form_.shiftY) - 1) >> form_.shiftY);
    frameBytes_ = form_.isBgra ? all * 4 : form_.colours == Colours::Grey ? all : all + 2 * chroma;
    frameBytes_ *= form_.bits > 8 ? 2 : 1;
    std::istringstream frames(RunCommand("ffprobe -v error -select_streams v:0 -show_entries "
                                         "frame=interlaced_frame -of default=nw=1:nk=1 " +
                                         Quoted(movie))
                                  .out);
    for (int isInterlaced = 0; frames >> isInterlaced;) {
        interlaced_.push_back(isInterlaced != 0);
    }
    bytes_ = Decoded(movie, "-map 0:v:0 -f rawvideo -vsync passthrough -pix_fmt " + form_.name,
                     "-noautorotate");
}

int PlainPictures::At(std::size_t frame, int component, int x, int y) const {
    const std::uint8_t* const from = bytes_.data() + frame * frameBytes_;
    if (form_.colours == Colours::Grey && component > 0) {
        component = 0;
    }
    const bool isChroma = form_.colours == Colours::YCbCr && component > 0;
    const int shiftX = isChroma ? form_.shiftX : 0, shiftY = isChroma ? form_.shiftY : 0;
    const int width = (static_cast<int>(width_) + (1 << shiftX) - 1) >> shiftX;
    const int height = (static_cast<int>(height_) + (1 << shiftY) - 1) >> shiftY;
    const auto at = static_cast<std::size_t>(std::clamp(y, 0, height - 1) * width +
                                             std::clamp(x, 0, width - 1));
    if (form_.isBgra) {
        return from[at * 4 + static_cast<std::size_t>(2 - component)];
    }
    // Planes of R'G'B' lie as G, B, R.
    const int plane = form_.colours == Colours::Rgb ? (component + 2) % 3 : component;
    const std::size_t before = plane == 0 ? 0
                                          : width_ * height_ + static_cast<std::size_t>(plane - 1) *
                                                                   static_cast<std::size_t>(width) *
                                                                   static_cast<std::size_t>(height);
    const std::size_t place = before + at;
    return form_.bits > 8 ? from[place * 2] | from[place * 2 + 1] << 8 : from[place];
}
