// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "reference_host/quicktime/pixels/PictureForm.h"

namespace host {

// Reads lines of a decoded picture as plain numbers, whatever its layout.
class RowReader {
public:
    RowReader(const AVFrame& frame, const PictureForm& form) : frame_(frame), form_(form) {}

    // Numbers of one component as they are stored: 0 to 2 are Y' Cb Cr or
    // R' G' B', 3 is alpha. `line` counts the component's own lines.
    void Read(int component, int line, float* to) const;
    int Width(int component) const;
    int Height(int component) const;

private:
    void ReadPalette(int component, int line, float* to) const;

    const AVFrame& frame_;
    const PictureForm& form_;
};

}  // namespace host
