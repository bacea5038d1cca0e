// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "reference_host/quicktime/pixels/PictureForm.h"
#include "reference_host/quicktime/pixels/PixelLayout.h"
#include "reference_host/quicktime/pixels/RowKernels.h"

namespace host {

// Converts the stored numbers of a picture to those of a layout.
struct ColorTransform {
    Affine affine;
    // Luma and chroma stay apart: chroma need not have the width of luma.
    bool keepsChromaApart;
    float alphaScale;  // of stored alpha
    float opaque;      // alpha of pictures without
};

ColorTransform TransformFor(const PictureForm& form, PixelLayout layout);

// The matrix in which a layout's Y'CbCr is delivered.
LumaWeights DeliveredWeights(const PictureForm& form, PixelLayout layout);

}  // namespace host
