// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "tests/system/codecs/PlainPicture.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <cstring>
#include <regex>

namespace {

using Colours = PlainForm::Colours;

std::string Depth(int bits) {
    return bits == 8 ? "" : std::to_string(bits) + "le";
}

PlainForm YCbCr(int kind, int bits, bool isFullRange, bool hasAlpha = false) {
    PlainForm form;
    form.bits = bits;
    form.isFullRange = isFullRange;
    form.hasAlpha = hasAlpha;
    form.shiftX = kind == 444 || kind == 440 ? 0 : kind == 410 || kind == 411 ? 2 : 1;
    form.shiftY = kind == 410 ? 2 : kind == 420 || kind == 440 ? 1 : 0;
    const bool hasOldName = isFullRange && bits == 8 && kind >= 420 && !hasAlpha;
    form.name = (hasAlpha     ? "yuva"
                 : hasOldName ? "yuvj"
                              : "yuv") +
                std::to_string(kind) + "p" + Depth(bits);
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
    const auto is = [&](const char* form) {
        return std::regex_match(pixels, found, std::regex(form));
    };
    const auto bits = [&](std::size_t group) {
        return found[group].length() == 0 ? 8 : std::stoi(found[group]);
    };
    if (is("yuv(a|j)?(4\\d\\d)p(\\d*)(le|be)?")) {
        return YCbCr(std::stoi(found[2]), bits(3), isFull || found[1] == "j", found[1] == "a");
    }
    PlainForm form;
    if (is("grayf32(le|be)")) {
        form.colours = Colours::Grey;
        form.isFullRange = true;
        form.isFloat = true;
        form.bits = 16;
        form.name = "grayf32le";
        return form;
    }
    if (is("(gray|ya)(\\d*)(le|be)?")) {
        form.colours = Colours::Grey;
        form.hasAlpha = found[1] == "ya";
        form.isInterleaved = form.hasAlpha;
        form.bits = pixels == "ya8" ? 8 : bits(2);
        form.isFullRange = range != "tv";
        form.name = pixels == "ya8" ? pixels : found[1].str() + Depth(form.bits);
        return form;
    }
    form.colours = Colours::Rgb;
    form.isFullRange = true;
    if (is("gbr(a?)pf32(le|be)")) {
        form.isFloat = true;
        form.hasAlpha = found[1].length() > 0;
        form.bits = 16;
        form.name = form.hasAlpha ? "gbrapf32le" : "gbrpf32le";
        return form;
    }
    if (is("gbr(a?)p(9|1\\d)(le|be)")) {
        form.hasAlpha = found[1].length() > 0;
        form.bits = std::stoi(found[2]);
    } else if (is("(rgb48|(rgba64)|bgr48|(bgra64))(le|be)")) {
        form.hasAlpha = found[2].matched || found[3].matched;
        form.bits = 16;
    } else if (is("rgb24|bgr24|0rgb|rgb0|0bgr|bgr0|gbrp|pal8|mono[bw]|"
                  "(rgba|argb|bgra|abgr|gbrap)|((?:rgb|bgr)(?:555|565|444)(?:le|be))")) {
        form.isInterleaved = true;
        form.hasAlpha = found[1].matched;
        form.isCoarse = found[2].matched;
        form.name = "bgra";
        return form;
    } else {
        return form;
    }
    form.name = (form.hasAlpha ? "gbrap" : "gbrp") + Depth(form.bits);
    return form;
}

PlainPictures::PlainPictures(const std::filesystem::path& movie) {
    const CommandResult probed = RunCommand(
        "ffprobe -v error -select_streams v:0 -show_entries "
        "stream=width,height,pix_fmt,color_range,color_space,chroma_location -of "
        "default=nw=1:nk=1 " +
        Quoted(movie));
    std::istringstream lines(probed.out);
    std::string range;
    if (!(lines >> width_ >> height_ >> decoded_ >> range >> matrix_ >> location_)) {
        ADD_FAILURE() << movie << ": " << probed.out;
        return;
    }
    form_ = PlainFormOf(decoded_, range);
    if (form_.name.empty()) {
        return;
    }
    const bool hasChroma = form_.colours == Colours::YCbCr;
    chromaWidth_ = (width_ + (std::size_t{1} << form_.shiftX) - 1) >> form_.shiftX;
    chromaHeight_ = (height_ + (std::size_t{1} << form_.shiftY) - 1) >> form_.shiftY;
    const std::size_t all = width_ * height_, chroma = chromaWidth_ * chromaHeight_;
    const std::size_t colours = form_.colours == Colours::Grey ? all
                                : hasChroma                    ? all + 2 * chroma
                                                               : all * 3;
    const bool hasFourth = form_.hasAlpha || (form_.isInterleaved && !hasChroma);
    frameBytes_ = (colours + (hasFourth ? all : 0)) * BytesOfOne();
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

double PlainPictures::At(std::size_t frame, int component, int x, int y) const {
    const bool isGrey = form_.colours == Colours::Grey;
    const bool isChroma = form_.colours == Colours::YCbCr && (component == 1 || component == 2);
    const std::size_t width = isChroma ? chromaWidth_ : width_;
    const std::size_t height = isChroma ? chromaHeight_ : height_;
    const auto column =
        std::clamp<std::size_t>(x < 0 ? 0 : static_cast<std::size_t>(x), 0, width - 1);
    const auto row =
        std::clamp<std::size_t>(y < 0 ? 0 : static_cast<std::size_t>(y), 0, height - 1);
    std::size_t place = row * width + column;
    if (form_.isInterleaved && isGrey) {
        place = place * 2 + (component == 3 ? 1 : 0);
    } else if (form_.isInterleaved) {
        constexpr std::size_t kBgra[] = {2, 1, 0, 3};
        place = place * 4 + kBgra[component];
    } else if (!isGrey) {
        // Planes of R'G'B' lie as G, B, R.
        const int plane =
            form_.colours == Colours::Rgb && component < 3 ? (component + 2) % 3 : component;
        place += plane == 0 ? 0
                            : width_ * height_ + static_cast<std::size_t>(plane - 1) *
                                                     chromaWidth_ * chromaHeight_;
    }
    const std::uint8_t* const from = bytes_.data() + frame * frameBytes_ + place * BytesOfOne();
    if (form_.isFloat) {
        float value = 0;
        std::memcpy(&value, from, sizeof value);
        return static_cast<double>(std::clamp(value, 0.0f, 1.0f)) * 65535;
    }
    return form_.bits > 8 ? from[0] | from[1] << 8 : from[0];
}
