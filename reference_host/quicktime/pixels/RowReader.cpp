// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "reference_host/quicktime/pixels/RowReader.h"

#include <algorithm>
#include <cstring>

#include "reference_host/quicktime/pixels/RowKernels.h"

extern "C" {
#include <libavutil/intreadwrite.h>
}

namespace host {
namespace {

int RoundedUp(int value, int shift) {
    return -((-value) >> shift);
}

}  // namespace

int RowReader::Width(int component) const {
    return component == 1 || component == 2 ? RoundedUp(form_.width, form_.chromaShiftX)
                                            : form_.width;
}

int RowReader::Height(int component) const {
    return component == 1 || component == 2 ? RoundedUp(form_.height, form_.chromaShiftY)
                                            : form_.height;
}

void RowReader::ReadPalette(int component, int line, float* to) const {
    constexpr int kShift[] = {16, 8, 0, 24};
    const std::uint8_t* const row =
        frame_.data[0] + static_cast<std::ptrdiff_t>(line) * frame_.linesize[0];
    for (int x = 0; x < form_.width; ++x) {
        std::uint32_t entry = 0;
        std::memcpy(&entry, frame_.data[1] + std::size_t{4} * row[x], sizeof entry);
        to[x] = static_cast<float>(entry >> kShift[component] & 0xFF);
    }
}

void RowReader::Read(int component, int line, float* to) const {
    if (form_.isPalette) {
        ReadPalette(component, line, to);
        return;
    }
    if (form_.isGrey) {
        component = component == 3 ? 1 : 0;
    }
    const AVComponentDescriptor& part = form_.description->comp[component];
    const int width = form_.isGrey ? form_.width : Width(component);
    const std::uint8_t* const row =
        frame_.data[part.plane] + static_cast<std::ptrdiff_t>(line) * frame_.linesize[part.plane] +
        part.offset;
    const bool isBigEndian = (form_.description->flags & AV_PIX_FMT_FLAG_BE) != 0;
    if (form_.isFloat) {
        for (int x = 0; x < width; ++x) {
            float value = 0.0f;
            std::memcpy(&value, row + static_cast<std::ptrdiff_t>(x) * part.step, sizeof value);
            // What is no number counts as 0.
            to[x] = value > 0.0f ? std::min(value, 1.0f) * 65535.0f : 0.0f;
        }
    } else if (part.depth == 8 && part.shift == 0) {
        part.step == 1 ? WidenBytes(row, width, to) : WidenStridedBytes(row, part.step, width, to);
    } else if (part.step == 2 && !isBigEndian && part.offset % 2 == 0) {
        WidenWords(row, part.shift, part.depth, width, to);
    } else if (part.depth == 16 && part.shift == 0) {
        for (int x = 0; x < width; ++x) {
            const std::uint8_t* const at = row + static_cast<std::ptrdiff_t>(x) * part.step;
            to[x] = static_cast<float>(isBigEndian ? AV_RB16(at) : AV_RL16(at));
        }
    } else {  // packed into odd bits: the library knows them all
        const std::uint8_t* planes[4] = {frame_.data[0], frame_.data[1], frame_.data[2],
                                         frame_.data[3]};
        for (int x = 0; x < width; ++x) {
            std::uint16_t value = 0;
            av_read_image_line2(&value, planes, frame_.linesize, form_.description, x, line,
                                component, 1, 0, sizeof value);
            to[x] = static_cast<float>(value);
        }
    }
    // Components of one picture may differ in depth, such as 5, 6 and 5 bits.
    if (part.depth != form_.depth && !form_.isFloat) {
        const float scale =
            static_cast<float>((1 << form_.depth) - 1) / static_cast<float>((1 << part.depth) - 1);
        for (int x = 0; x < width; ++x) {
            to[x] *= scale;
        }
    }
}

}  // namespace host
