// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "reference_host/quicktime/AvOwners.h"
#include "reference_host/quicktime/pixels/PixelLayout.h"

namespace host {

// Writes a decoded picture in a layout: exactly PictureBytes of the size given,
// tightly. A picture of another size, as a stream may hold in its middle, is
// brought to that size. False when the decoder's format can't be understood.
bool WritePicture(const AVFrame& frame, PixelLayout layout, ncfUInt32 width, ncfUInt32 height,
                  std::uint8_t* to);

struct SmallPicture {
    int fullWidth;  // of the movie's pictures; the decoder may have given a smaller one already
    int fullHeight;
    int width = 0;
    int height = 0;
    // Taken for that of pictures in Rec. 601 or 709; unspecified: they keep theirs.
    AVColorSpace matrix = AVCOL_SPC_UNSPECIFIED;
};

// The same at a smaller size, in bytes B G R A of full range; each pixel is the mean of what it
// covers.
bool WriteSmallPicture(const AVFrame& frame, const SmallPicture& small, std::uint8_t* to);

}  // namespace host
