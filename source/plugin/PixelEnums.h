// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/framework/Types.h"

// Values that describe pixels at the border to the host, and their texts for
// logs. The numbers are part of the host's interface.

inline constexpr ncfUInt32 kNotSet = 0x7FFFFFFF;

enum ComponentType : ncfUInt32 {
    CT_UCHAR = 1,
    CT_10Bit = 2,
    CT_USHORT_10_6 = 4,
    CT_SHORT_2_14 = 8,
    CT_USHORT = 16,
    CT_V210 = 1024,
    CT_UCHAR_FullRange = 2048,
    CT_USHORT_BE_VideoRange = 4096,
    CT_USHORT_BE_FullRange = 8192,
    CT_101010_2Bit_BE_VideoRange = 16384,
    CT_101010_2Bit_BE_FullRange = 32768,
    CT_101010_2Bit_LE_FullRange = 65536,
};

enum PixelLayout : ncfUInt32 {
    PF_CbYCrY = 2,
    PF_ARGB = 4,
    PF_BGRA = 8,
    PF_RGB = 64,
    PF_Mono = 1024,
    PF_RGBA = 2048,
    PF_UNDEFINED = kNotSet,
};

enum LevelConversion : ncfUInt32 {
    Expand_Levels = 1,
    Compress_Levels = 2,
    Default_Levels = 16,
};

enum : ncfUInt32 {  // colour space
    CS_MONO = 1,
    CS_RGB = 2,
    CS_YCbCr_601 = 4,
    CS_YCbCr_709 = 8,
    CS_UNDEFINED = kNotSet,
};

const wchar_t* ComponentTypeToString(ncfUInt32 value);
const wchar_t* PixelLayoutToString(ncfUInt32 value);
const wchar_t* LevelConversionToString(ncfUInt32 value);
const char* ColorSpaceToString(ncfUInt32 value);
