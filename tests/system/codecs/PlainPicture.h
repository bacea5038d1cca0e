// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <filesystem>
#include <string>
#include <vector>

#include "tests/system/EssenceSupport.h"

// Pictures as FFmpeg decodes them, in a form that is plain to read and that the
// decoder's own becomes without arithmetic.
struct PlainForm {
    enum class Colours { YCbCr, Rgb, Grey };
    Colours colours = Colours::YCbCr;
    int bits = 8;    // of floats 16, into which 0 to 1 is brought
    int shiftX = 0;  // of chroma
    int shiftY = 0;
    bool isFullRange = false;
    bool isFloat = false;
    bool hasAlpha = false;
    bool isInterleaved = false;  // else in planes
    bool isCoarse = false;       // less than 8 bits, which ffmpeg repeats to fill them
    std::string name;            // as ffmpeg calls it; empty: there is none
};
// `range` is ffprobe's word.
PlainForm PlainFormOf(const std::string& pixels, const std::string& range);

class PlainPictures {
public:
    explicit PlainPictures(const std::filesystem::path& movie);

    const PlainForm& form() const { return form_; }
    const std::string& decoded() const { return decoded_; }  // the decoder's own form
    // As ffprobe calls it, "unknown" where the stream tells none.
    const std::string& matrix() const { return matrix_; }
    // Whether chroma stands on the upper line of two, not between them.
    bool HasChromaOnTop() const { return location_ == "topleft" || location_ == "top"; }
    bool IsInterlaced(std::size_t frame) const {
        return frame < interlaced_.size() && interlaced_[frame];
    }
    std::size_t width() const { return width_; }
    std::size_t height() const { return height_; }
    std::size_t Count() const { return frameBytes_ == 0 ? 0 : bytes_.size() / frameBytes_; }

    // Component 0 to 2 is Y, Cb, Cr or R, G, B, and 3 alpha; `x` and `y` count the
    // component's own samples and may lie beside them.
    double At(std::size_t frame, int component, int x, int y) const;

private:
    std::size_t BytesOfOne() const { return form_.isFloat ? 4 : form_.bits > 8 ? 2 : 1; }

    PlainForm form_;
    std::string decoded_;
    std::string matrix_;
    std::string location_;  // of chroma
    std::vector<bool> interlaced_;
    std::size_t width_ = 0;
    std::size_t height_ = 0;
    std::size_t chromaWidth_ = 0;
    std::size_t chromaHeight_ = 0;
    std::size_t frameBytes_ = 0;
    EssenceBytes bytes_;
};
