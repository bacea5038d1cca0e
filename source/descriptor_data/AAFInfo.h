// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <vector>

#include "host_interfaces/aaf/AAFPlainTypes.h"
#include "host_interfaces/framework/Types.h"

// All picture values of one video format: what a data-file record says about
// the stored essence. Made by the caller and filled field by field by the
// retriever; a value that the record may leave out, and does, keeps its default.
struct AAFInfo {
    aafUID_t essenceContainerLabel = {
        0x060E2B34, 0x0401, 0x0101, {0x0E, 0x04, 0x04, 0x01, 0x02, 0x01, 0x01, 0x00}};
    ncfUInt32 frameLayout = 0;
    ncfUInt32 storedWidth = 0;
    ncfUInt32 sampledWidth = 0;
    ncfUInt32 storedHeight = 0;
    ncfUInt32 displayWidth = 0;
    ncfUInt32 displayHeight = 0;
    ncfUInt32 displayYOffset = 0;
    ncfUInt32 aspectNumerator = 0;
    ncfUInt32 aspectDenominator = 0;
    aafUID_t pictureEssenceCoding = {0, 0, 0, {0, 0, 0, 0, 0, 0, 0, 0}};
    ncfUInt32 ImageStartOffset = 0;
    ncfUInt32 imageAlignmentOffset = 0;  // read, but no descriptor carries it
    ncfUInt32 componentDepth = 8;
    std::vector<ncfSInt32> videoLineMapVect;
    ncfUInt32 horizontalSubsampling = 1;
    ncfUInt32 verticalSubsampling = 1;
    ncfUInt32 colorSiting = 0;
    ncfUInt32 colorRange = 0;
    ncfUInt32 blackRefLevel = 0;    // unless the clip's colour details replace it
    ncfUInt32 whiteRefLevel = 255;  // the same
    ncfUInt32 sliceCounter = 0;
    ncfUInt32 maxGOP = 0;
    ncfUInt32 bitRate = 0;
    ncfUInt8 levelAndProfile = 0;
    // When set, the bin column shows the aspect with its two values exchanged.
    bool swapAspectRatio = false;
    // Handed to the AAF library as it lies in memory.
    std::vector<aafRGBAComponent_t> pixelLayout;
};
