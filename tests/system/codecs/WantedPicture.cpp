// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "tests/system/codecs/WantedPicture.h"

#include <algorithm>
#include <cmath>

namespace {

using Colours = PlainForm::Colours;

double InVideoRange(const PlainForm& form, int component, double value) {
    const double most = (1 << form.bits) - 1;
    if (!form.isFullRange) {
        return value / (1 << (form.bits - 8));
    }
    if (component == 0) {
        return 16 + value / most * 219;
    }
    return 128 + (value - (1 << (form.bits - 1))) / most * 224;
}

}  // namespace

double WantedPicture::Luma(std::size_t frame, int x, int y) const {
    return InVideoRange(plain_.form(), 0, plain_.At(frame, 0, x, y));
}

double WantedPicture::Chroma(std::size_t frame, int component, int x, int y) const {
    if (plain_.form().colours == Colours::Grey) {
        return 128;
    }
    const Place lines = ChromaLines(frame, y);
    const double value = (1 - lines.share) * ChromaInLine(frame, component, x, lines.first) +
                         lines.share * ChromaInLine(frame, component, x, lines.second);
    return InVideoRange(plain_.form(), component, value);
}

bool WantedPicture::HasChromaThere() const {
    return plain_.form().colours == Colours::Grey ||
           (plain_.form().shiftX == 1 && plain_.form().shiftY == 0);
}

double WantedPicture::StoredChroma(std::size_t frame, int component, int x, int y) const {
    return InVideoRange(plain_.form(), component,
                        plain_.At(frame, component, x >> plain_.form().shiftX, y));
}

bool WantedPicture::HasStoredChroma(int x) const {
    const PlainForm& form = plain_.form();
    return form.shiftY == 0 && form.shiftX <= 1 && x % (1 << form.shiftX) == 0;
}

double WantedPicture::Rgb(std::size_t frame, int component, int x, int y) const {
    const PlainForm& form = plain_.form();
    const double most = (1 << form.bits) - 1;
    const double value = plain_.At(frame, component, x, y);
    if (form.isFullRange || component == 3) {
        return value / most;
    }
    return (InVideoRange(form, 0, value) - 16) / 219;  // grey
}

// The two chroma lines about a line of the picture, and how near to the second.
WantedPicture::Place WantedPicture::ChromaLines(std::size_t frame, int y) const {
    const int shift = plain_.form().shiftY;
    if (shift == 0) {
        return {y, y, 0};
    }
    const int step = 1 << shift;
    const int lines = (static_cast<int>(plain_.height()) + step - 1) / step;
    const auto held = [](int line, int count) { return std::clamp(line, 0, count - 1); };
    const double between = plain_.HasChromaOnTop() ? 0 : 1;
    if (!plain_.IsInterlaced(frame)) {
        const double at = (y - between * (step - 1) / 2.0) / step;
        const int above = static_cast<int>(std::floor(at));
        return {held(above, lines), held(above + 1, lines), at - above};
    }
    const int field = y & 1;
    const double at = ((y >> 1) - between * (field == 0 ? 0.25 : 0.75)) / step;
    const int above = static_cast<int>(std::floor(at));
    const int count = (lines + 1 - field) / 2;
    return {held(above, count) * 2 + field, held(above + 1, count) * 2 + field, at - above};
}

double WantedPicture::ChromaInLine(std::size_t frame, int component, int x, int row) const {
    const auto at = [&](int column) { return plain_.At(frame, component, column, row); };
    switch (plain_.form().shiftX) {
        case 0:
            return (at(x - 1) + 2 * at(x) + at(x + 1)) / 4.0;
        case 1:
            return at(x / 2);
        default:
            return (at(x / 4) + at(x % 4 == 0 ? x / 4 : x / 4 + 1)) / 2.0;
    }
}
