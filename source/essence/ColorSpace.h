// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "source/clips/BaseClip.h"
#include "source/plugin/Tr1Memory.h"

// From this size on a picture counts as high definition and is Rec. 709.
inline constexpr ncfUInt32 kHighDefinitionWidth = 960;
inline constexpr ncfUInt32 kHighDefinitionHeight = 720;

inline bool IsHighDefinition(ncfUInt32 width, ncfUInt32 height) {
    return width >= kHighDefinitionWidth && height >= kHighDefinitionHeight;
}

// Colour space by the size of the picture, for clips that don't tell theirs.
NCFRESULT InferColorSpaceFromStandard(const std::tr1::shared_ptr<BaseClip>& media,
                                      ncfUInt32* colorSpace);
