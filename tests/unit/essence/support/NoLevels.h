// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "source/essence/FormatEnums.h"
#include "source/essence/PixelLevels.h"

// For conversions alone: changes nothing.
class NoLevels {
public:
    operator LevelPass&() { return pass_; }

private:
    LevelPass pass_{PF_Mono, CT_UCHAR, nullptr, 0, Default_Levels};
};
