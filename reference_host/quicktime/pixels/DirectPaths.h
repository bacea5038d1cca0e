// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "reference_host/quicktime/pixels/PictureForm.h"
#include "reference_host/quicktime/pixels/PixelLayout.h"

namespace host {

// Writes pictures whose numbers need no arithmetic, or hardly any, as the commonest
// codecs deliver them. False, with nothing written, for other pictures. The results
// equal those of PictureWriter's conversion, but that codes beyond a layout's range stay.
bool WriteDirectly(const AVFrame& frame, const PictureForm& form, PixelLayout layout,
                   std::uint8_t* to);

}  // namespace host
