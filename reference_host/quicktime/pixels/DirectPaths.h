// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "reference_host/quicktime/pixels/PictureForm.h"
#include "reference_host/quicktime/pixels/PixelLayout.h"

namespace host {

// Writes pictures whose numbers need no arithmetic, or next to none, which the
// commonest codecs give. False when the picture is not such a one; nothing is
// written then. The results equal those of the general way.
bool WriteDirectly(const AVFrame& frame, const PictureForm& form, PixelLayout layout,
                   std::uint8_t* to);

}  // namespace host
