// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <vector>

#include "host_interfaces/framework/Types.h"
#include "reference_host/quicktime/AvOwners.h"

namespace host {

// What a decoder's pixels can be delivered as.
struct CodecPixels {
    std::vector<ncfUInt32> layouts;  // in the order of preference
    ncfUInt32 storage = 0;           // 0 Y'CbCr, 1 R'G'B'
};
CodecPixels PixelsOf(AVPixelFormat format);

// Whether the format has an alpha component. A palette's entries have one
// always, so that says nothing.
bool HasAlphaComponent(AVPixelFormat format);

// Whether a decoded picture has alpha; a palette is looked through.
bool ShowsAlpha(const AVFrame& frame);

// The first picture of a stream that decodes, null when none does.
FrameOwner DecodeFirstPicture(AVFormatContext& input, int stream);

}  // namespace host
