// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "source/plugin/PixelEnums.h"

// Numbers that describe an offered format at the border to the host, beside
// those of PixelEnums.h, and the codes of the reader's pixel formats.

inline constexpr ncfUInt32 CT_UNDEFINED = kNotSet;

enum ChromaSubSampling : ncfUInt32 {
    CSS_4220 = 1,
    CSS_4444 = 4,
    CSS_None = 128,
};

enum ComponentRangeType : ncfUInt32 {
    CRT_VideoRange = 1,
    CRT_FullRange = 2,
    CRT_UNDEFINED = kNotSet,
};

// PCM of the byte order in the last letter.
inline constexpr ncfUInt32 SF_PCM_INT_LE = 0x4132434C;  // 'A2CL'
inline constexpr ncfUInt32 SF_PCM_INT_BE = 0x41324342;  // 'A2CB'

namespace QuickTime {

inline constexpr ncfUInt32 k2vuyPixelFormat = 0x32767579;  // 8-bit Cb Y Cr Y
inline constexpr ncfUInt32 kv210PixelFormat = 0x76323130;  // 10-bit Cb Y Cr Y, packed
inline constexpr ncfUInt32 kBGRAPixelFormat = 0x42475241;
inline constexpr ncfUInt32 kRGBAPixelFormat = 0x52474241;
inline constexpr ncfUInt32 k32ARGBPixelFormat = 32;  // the classic number, no letters
inline constexpr ncfUInt32 kNVZ1PixelFormat = 0x4E565A31;
inline constexpr ncfUInt32 kNVZ2PixelFormat = 0x4E565A32;  // BGRA in video range
inline constexpr ncfUInt32 kb64aPixelFormat = 0x62363461;  // 16-bit A R G B, big-endian
inline constexpr ncfUInt32 kb48rPixelFormat = 0x62343872;
inline constexpr ncfUInt32 kr4flPixelFormat = 0x7234666C;  // float A Y Cb Cr

}  // namespace QuickTime
