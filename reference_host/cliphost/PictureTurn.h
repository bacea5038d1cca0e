// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "reference_host/cliphost/Picture.h"
#include "reference_host/quicktime/DisplayMatrix.h"

namespace cliphost {

// A quarter turn, a mirror, or both: rows may become columns, then each
// direction may be reversed.
struct PictureTurn {
    bool swapsSides = false;
    bool reversesRows = false;     // left becomes right
    bool reversesColumns = false;  // top becomes bottom
};

// What a display matrix asks for, whatever its scale; none for one that turns by
// another angle or shears.
PictureTurn TurnOf(const host::DisplayMatrix& matrix);

Picture Turned(Picture picture, const PictureTurn& turn);

}  // namespace cliphost
