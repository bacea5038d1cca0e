// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "reference_host/cliphost/ImageFormats.h"
#include "reference_host/cliphost/Picture.h"

namespace cliphost {

// A delivered picture made into one that an image file can hold: Y'CbCr by the
// matrix and range that the format declares, R'G'B' by its range, alpha as
// grey. Empty when the bytes are fewer than the size needs or the layout is not
// one that the program knows.
Picture PixelsToPicture(const ImageFormat& format, int width, int height,
                        const unsigned char* bytes, std::size_t size);

// Gives a picture the alpha of its alpha track; their sizes must be equal.
Picture WithAlpha(const Picture& picture, const Picture& alpha);

}  // namespace cliphost
