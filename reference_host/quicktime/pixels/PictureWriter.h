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

}  // namespace host
