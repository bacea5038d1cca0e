// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "tests/unit/quicktime/MadeMovie.h"

namespace quicktime_tests {

// H.264 whose pictures are stored as two fields, 16 x 32 in size. The top field
// of picture i has the luminance 16 + 4 i all over, the bottom field 2 more.
Bytes FieldCodedVideo(int pictures);

constexpr int kGroupOfFieldCodedVideo = 5;  // pictures from one start to the next

}  // namespace quicktime_tests
