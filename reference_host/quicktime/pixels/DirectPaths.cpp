// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "reference_host/quicktime/pixels/DirectPaths.h"

#include <cmath>
#include <cstring>
#include <vector>

#include "reference_host/quicktime/pixels/ChromaRows.h"
#include "reference_host/quicktime/pixels/RowKernels.h"

namespace host {
namespace {

const std::uint8_t* Line(const AVFrame& frame, int plane, int line) {
    return frame.data[plane] + static_cast<std::ptrdiff_t>(line) * frame.linesize[plane];
}

// Eight bits in planes, with half the chroma in a line.
void WriteUyvy(const AVFrame& frame, const PictureForm& form, std::uint8_t* to) {
    const int half = (form.width + 1) / 2;
    const int chromaHeight = -((-form.height) >> form.chromaShiftY);
    std::vector<std::uint8_t> blended(static_cast<std::size_t>(half) * 2);
    for (int line = 0; line < form.height; ++line) {
        const ChromaLines lines = ChromaLinesFor(form, line, chromaHeight);
        const int weight = static_cast<int>(std::lround(lines.weightOfSecond * 8.0f));
        const std::uint8_t* chroma[2];
        for (int i = 0; i < 2; ++i) {
            chroma[i] = Line(frame, i + 1, lines.first);
            if (weight != 0 && lines.first != lines.second) {
                std::uint8_t* const out = blended.data() + static_cast<std::ptrdiff_t>(i) * half;
                BlendBytes(chroma[i], Line(frame, i + 1, lines.second), weight, half, out);
                chroma[i] = out;
            }
        }
        StoreUyvyFromBytes(Line(frame, 0, line), chroma[0], chroma[1], form.width, to);
        to += LineBytes(PixelLayout::Uyvy8, static_cast<ncfUInt32>(form.width));
    }
}

void WriteV210(const AVFrame& frame, const PictureForm& form, std::uint8_t* to) {
    for (int line = 0; line < form.height; ++line) {
        const std::uint16_t* const rows[3] = {
            reinterpret_cast<const std::uint16_t*>(Line(frame, 0, line)),
            reinterpret_cast<const std::uint16_t*>(Line(frame, 1, line)),
            reinterpret_cast<const std::uint16_t*>(Line(frame, 2, line))};
        StoreV210(rows[0], rows[1], rows[2], form.width, to);
        to += LineBytes(PixelLayout::Yuv10, static_cast<ncfUInt32>(form.width));
    }
}

void CopyLines(const AVFrame& frame, const PictureForm& form, std::size_t bytes, std::uint8_t* to) {
    for (int line = 0; line < form.height; ++line) {
        std::memcpy(to, Line(frame, 0, line), bytes);
        to += bytes;
    }
}

}  // namespace

bool WriteDirectly(const AVFrame& frame, const PictureForm& form, PixelLayout layout,
                   std::uint8_t* to) {
    const bool isDelivered = !form.isRgb && !form.isFullRange && form.isStandardMatrix;
    const bool isUyvySource =
        frame.format == AV_PIX_FMT_YUV422P || frame.format == AV_PIX_FMT_YUV420P;
    if (layout == PixelLayout::Uyvy8 && isDelivered && isUyvySource) {
        WriteUyvy(frame, form, to);
        return true;
    }
    if (layout == PixelLayout::Uyvy8 && isDelivered && frame.format == AV_PIX_FMT_UYVY422) {
        CopyLines(frame, form, LineBytes(layout, static_cast<ncfUInt32>(form.width)), to);
        return true;
    }
    if (layout == PixelLayout::Yuv10 && isDelivered && frame.format == AV_PIX_FMT_YUV422P10LE) {
        WriteV210(frame, form, to);
        return true;
    }
    if (layout == PixelLayout::Bgra8 && frame.format == AV_PIX_FMT_BGRA) {
        CopyLines(frame, form, LineBytes(layout, static_cast<ncfUInt32>(form.width)), to);
        return true;
    }
    return false;
}

}  // namespace host
