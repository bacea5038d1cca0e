// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/aaf/AAFNumbers.h"

// Enumerations that tell of pictures and sound: each has 32 bits.

// Values of aafFrameLayout_t.
using aafFrameLayout_t = aafInt32;
enum : aafInt32 {
    kAAFFullFrame = 0,
    kAAFSeparateFields = 1,
    kAAFOneField = 2,
    kAAFMixedFields = 3,
    kAAFSegmentedFrame = 4,
};

// Values of aafColorSiting_t.
using aafColorSiting_t = aafInt32;
enum : aafInt32 {
    kAAFCoSiting = 0,
    kAAFAveraging = 1,
    kAAFThreeTap = 2,
    kAAFQuincunx = 3,
    kAAFRec601 = 4,
    kAAFUnknownSiting = 255,
};

// Values of aafRGBAComponentKind_t.
using aafRGBAComponentKind_t = aafInt32;
enum : aafInt32 {
    kAAFCompNone = 48,
    kAAFCompAlpha = 65,
    kAAFCompBlue = 66,
    kAAFCompFill = 70,
    kAAFCompGreen = 71,
    kAAFCompPalette = 80,
    kAAFCompRed = 82,
    kAAFCompNull = 0,
};

// Values of aafAlphaTransparency_t.
using aafAlphaTransparency_t = aafInt32;
enum : aafInt32 {
    kAAFMinValueTransparent = 0,
    kAAFMaxValueTransparent = 1,
};

// Values of aafFieldNumber_t.
using aafFieldNumber_t = aafInt32;
enum : aafInt32 {
    kAAFUnspecifiedField = 0,
    kAAFFieldOne = 1,
    kAAFFieldTwo = 2,
};

// Values of aafSignalStandard_t.
using aafSignalStandard_t = aafInt32;
enum : aafInt32 {
    kAAFSignalStandard_None = 0,
    kAAFSignalStandard_ITU601 = 1,
    kAAFSignalStandard_ITU1358 = 2,
    kAAFSignalStandard_SMPTE347M = 3,
    kAAFSignalStandard_SMPTE274M = 4,
    kAAFSignalStandard_SMPTE296M = 5,
    kAAFSignalStandard_SMPTE349M = 6,
};

// Values of aafScanningDirection_t.
using aafScanningDirection_t = aafInt32;
enum : aafInt32 {
    kAAFScanningDirection_LeftToRightTopToBottom = 0,
    kAAFScanningDirection_RightToLeftTopToBottom = 1,
    kAAFScanningDirection_LeftToRightBottomToTop = 2,
    kAAFScanningDirection_RightToLeftBottomToTop = 3,
    kAAFScanningDirection_TopToBottomLeftToRight = 4,
    kAAFScanningDirection_TopToBottomRightToLeft = 5,
    kAAFScanningDirection_BottomToTopLeftToRight = 6,
    kAAFScanningDirection_BottomToTopRightToLeft = 7,
};

// Values of aafContentScanningType_t.
using aafContentScanningType_t = aafInt32;
enum : aafInt32 {
    kAAFContentScanning_NotKnown = 0,
    kAAFContentScanning_Progressive = 1,
    kAAFContentScanning_Interlace = 2,
    kAAFContentScanning_Mixed = 3,
};

// Values of aafElectroSpatialFormulation_t.
using aafElectroSpatialFormulation_t = aafInt32;
enum : aafInt32 {
    kAAFElectroSpatialFormulation_Default = 0,
    kAAFElectroSpatialFormulation_TwoChannelMode = 1,
    kAAFElectroSpatialFormulation_SingleChannelMode = 2,
    kAAFElectroSpatialFormulation_PrimarySecondaryMode = 3,
    kAAFElectroSpatialFormulation_StereophonicMode = 4,
    kAAFElectroSpatialFormulation_SingleChannelDoubleSamplingFrequencyMode = 7,
    kAAFElectroSpatialFormulation_StereoLeftChannelDoubleSamplingFrequencyMode = 8,
    kAAFElectroSpatialFormulation_StereoRightChannelDoubleSamplingFrequencyMode = 9,
    kAAFElectroSpatialFormulation_MultiChannelMode = 15,
};

// Values of aafEmphasisType_t.
using aafEmphasisType_t = aafInt32;
enum : aafInt32 {
    kAAFEmphasis_Unknown = 0,
    kAAFEmphasis_Reserved0 = 1,
    kAAFEmphasis_Reserved1 = 2,
    kAAFEmphasis_Reserved2 = 3,
    kAAFEmphasis_None = 4,
    kAAFEmphasis_Reserved3 = 5,
    kAAFEmphasis_15and50 = 6,
    kAAFEmphasis_ITU = 7,
};

// Values of aafAuxBitsModeType_t.
using aafAuxBitsModeType_t = aafInt32;
enum : aafInt32 {
    kAAFAuxBitsMode_NotDefined = 0,
    kAAFAuxBitsMode_MainAudioSampleData = 1,
    kAAFAuxBitsMode_SingleCoordinationSignal = 2,
    kAAFAuxBitsMode_UserDefined = 3,
    kAAFAuxBitsMode_Reserved0 = 4,
    kAAFAuxBitsMode_Reserved1 = 5,
    kAAFAuxBitsMode_Reserved2 = 6,
    kAAFAuxBitsMode_Reserved3 = 7,
};

// Values of aafChannelStatusModeType_t.
using aafChannelStatusModeType_t = aafInt32;
enum : aafInt32 {
    kAAFChannelStatusMode_None = 0,
    kAAFChannelStatusMode_Minimum = 1,
    kAAFChannelStatusMode_Standard = 2,
    kAAFChannelStatusMode_Fixed = 3,
    kAAFChannelStatusMode_Stream = 4,
    kAAFChannelStatusMode_Essence = 5,
};

// Values of aafUserDataModeType_t.
using aafUserDataModeType_t = aafInt32;
enum : aafInt32 {
    kAAFUserDataMode_NotDefined = 0,
    kAAFUserDataMode_192BitBlockStructure = 1,
    kAAFUserDataMode_AES18 = 2,
    kAAFUserDataMode_UserDefined = 3,
    kAAFUserDataMode_IEC = 4,
    kAAFUserDataMode_Metadata = 5,
    kAAFUserDataMode_Reserved0 = 6,
    kAAFUserDataMode_Reserved1 = 7,
    kAAFUserDataMode_Reserved2 = 8,
    kAAFUserDataMode_Reserved3 = 9,
    kAAFUserDataMode_Reserved4 = 10,
    kAAFUserDataMode_Reserved5 = 11,
    kAAFUserDataMode_Reserved6 = 12,
    kAAFUserDataMode_Reserved7 = 13,
    kAAFUserDataMode_Reserved8 = 14,
    kAAFUserDataMode_Reserved9 = 15,
};

// Values of aafVideoSignalType_t.
using aafVideoSignalType_t = aafInt32;
enum : aafInt32 {
    kAAFVideoSignalNull = 0,
    kAAFNTSCSignal = 1,
    kAAFPALSignal = 2,
    kAAFSECAMSignal = 3,
};
