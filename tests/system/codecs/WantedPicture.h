// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "tests/system/codecs/PlainPicture.h"

// What the formats should deliver of FFmpeg's pictures, before it is rounded:
// Y'CbCr as numbers of 8 bits in video range, all else from 0 to 1.
class WantedPicture {
public:
    explicit WantedPicture(const PlainPictures& plain) : plain_(plain) {}

    double Luma(std::size_t frame, int x, int y) const;
    // For 4:2:2, at an even pixel of a line. Where the decoder has chroma at other
    // places it lies on the line between its neighbours, in its own field.
    double Chroma(std::size_t frame, int component, int x, int y) const;
    bool HasChromaThere() const;
    // At a pixel where the decoder has it.
    double StoredChroma(std::size_t frame, int component, int x, int y) const;
    bool HasStoredChroma(int x) const;
    double Rgb(std::size_t frame, int component, int x, int y) const;
    double Alpha(std::size_t frame, int x, int y) const { return Rgb(frame, 3, x, y); }

private:
    struct Place {
        int first;
        int second;
        double share;
    };
    Place ChromaLines(std::size_t frame, int y) const;
    double ChromaInLine(std::size_t frame, int component, int x, int row) const;

    const PlainPictures& plain_;
};
