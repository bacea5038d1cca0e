// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "reference_host/quicktime/pixels/ChromaRows.h"

#include <algorithm>
#include <cmath>

#include "reference_host/quicktime/pixels/RowKernels.h"

namespace host {
namespace {

ChromaLines Between(double place, int count) {
    const int below = static_cast<int>(std::floor(place));
    const auto held = [count](int line) { return std::clamp(line, 0, count - 1); };
    return {held(below), held(below + 1), static_cast<float>(place - below)};
}

}  // namespace

ChromaLines ChromaLinesFor(const PictureForm& form, int line, int chromaHeight) {
    if (form.chromaShiftY == 0) {
        return {line, line, 0.0f};
    }
    const int step = 1 << form.chromaShiftY;
    if (!form.isInterlaced || chromaHeight < 2) {
        return Between((line - form.chromaSiteY) / step, chromaHeight);
    }
    // Seen in its own field the chroma of the upper one stands a quarter of the
    // way between the field's lines, that of the lower one three quarters.
    const int field = line & 1;
    const double site = form.chromaSiteY == 0.0 ? 0.0 : field == 0 ? 0.25 : 0.75;
    const int fieldLines = (chromaHeight + 1 - field) / 2;
    ChromaLines lines = Between(((line >> 1) - site) / step, fieldLines);
    lines.first = lines.first * 2 + field;
    lines.second = lines.second * 2 + field;
    return lines;
}

ChromaRows::ChromaRows(const RowReader& reader, const PictureForm& form)
    : reader_(reader),
      form_(form),
      width_(reader.Width(1)),
      height_(reader.Height(1)),
      blended_(static_cast<std::size_t>(width_) + 4) {}

const ChromaRows::Line& ChromaRows::Stored(int component, int line, int keep) {
    Line* const pair = lines_[component - 1];
    for (int i = 0; i < 2; ++i) {
        if (pair[i].number == line) {
            return pair[i];
        }
    }
    Line& place = pair[0].number == keep && keep >= 0 ? pair[1] : pair[0];
    place.values.resize(static_cast<std::size_t>(width_) + 4);
    float* const values = place.values.data() + 1;
    reader_.Read(component, line, values);
    values[-1] = values[0];
    values[width_] = values[width_ + 1] = values[width_ + 2] = values[width_ - 1];
    place.number = line;
    return place;
}

const float* ChromaRows::AtLine(int component, int line) {
    const ChromaLines lines = ChromaLinesFor(form_, line, height_);
    if (lines.first == lines.second || lines.weightOfSecond == 0.0f) {
        return Stored(component, lines.first, lines.second).values.data() + 1;
    }
    const Line& first = Stored(component, lines.first, lines.second);
    const Line& second = Stored(component, lines.second, lines.first);
    BlendRows(first.values.data(), second.values.data(), lines.weightOfSecond, width_ + 4,
              blended_.data());
    return blended_.data() + 1;
}

void ChromaRows::Read(int component, int line, int shift, float* to) {
    if (shift == form_.chromaShiftX && form_.chromaShiftY == 0) {
        reader_.Read(component, line, to);
        return;
    }
    const float* const from = AtLine(component, line);
    const int count = shift == 0 ? form_.width : (form_.width + 1) / 2;
    if (shift == form_.chromaShiftX) {
        std::copy_n(from, count, to);
    } else if (shift == 1 && form_.chromaShiftX == 0) {
        HalveChroma(from, form_.width, to);
    } else if (shift == 0 && form_.chromaShiftX == 1) {
        const float site = static_cast<float>(form_.chromaSiteX) * 0.5f;
        DoubleChroma(from, site, 0.5f - site, form_.width, to);
    } else {
        Resample(from, shift, to);
    }
}

void ChromaRows::Resample(const float* from, int shift, float* to) const {
    const int count = shift == 0 ? form_.width : (form_.width + 1) / 2;
    const double scale = 1.0 / (1 << form_.chromaShiftX);
    for (int i = 0; i < count; ++i) {
        const double place = ((i << shift) - form_.chromaSiteX) * scale;
        const int left = std::min(static_cast<int>(std::floor(place)), width_);
        const float weight = static_cast<float>(place - left);
        to[i] = from[left] + (from[left + 1] - from[left]) * weight;
    }
}

}  // namespace host
