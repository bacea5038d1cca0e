// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "source/plugin/Rational.h"

// A rectangle in the coordinates of the picture's raster; 0/0 is not given.
struct BoundsBox {
    Rational positionX;
    Rational positionY;
    Rational width;
    Rational height;
};
static_assert(sizeof(BoundsBox) == 32, "saved as eight 32-bit numbers");
