// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <vector>

#include "reference_host/quicktime/pixels/RowReader.h"

namespace host {

// From which two chroma lines a line of the picture takes its chroma, and how much
// of the second. Lines of interlaced pictures only take it from their own field.
struct ChromaLines {
    int first;
    int second;
    float weightOfSecond;
};
ChromaLines ChromaLinesFor(const PictureForm& form, int line, int chromaHeight);

// Chroma of a picture at the width and on the lines where it is wanted, made
// linearly from the samples beside.
class ChromaRows {
public:
    ChromaRows(const RowReader& reader, const PictureForm& form);

    // Chroma of a line of the picture, one number for each 1 << `shift` pixels;
    // `shift` is 0 or 1. Component 1 or 2.
    void Read(int component, int line, int shift, float* to);

private:
    const float* AtLine(int component, int line);
    void Resample(const float* from, int shift, float* to) const;

    const RowReader& reader_;
    const PictureForm& form_;
    int width_;
    int height_;
    // Lines read last, for each component; one number before and three behind.
    struct Line {
        int number = -1;
        std::vector<float> values;
    };
    const Line& Stored(int component, int line, int keep);
    Line lines_[2][2];
    std::vector<float> blended_;
};

}  // namespace host
