// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/plugin/PixelEnums.h"

#include <cstddef>

namespace {

template <class Text>
struct NamedValue {
    ncfUInt32 value;
    Text text;
};

template <class Text, std::size_t N>
Text Find(const NamedValue<Text> (&table)[N], ncfUInt32 value, Text otherwise) {
    for (const NamedValue<Text>& row : table) {
        if (row.value == value) {
            return row.text;
        }
    }
    return otherwise;
}

using Wide = NamedValue<const wchar_t*>;

constexpr Wide kComponentTypes[] = {
    {CT_UCHAR, L"CT_UCHAR"},
    {CT_10Bit, L"CT_10Bit"},
    {CT_USHORT_10_6, L"CT_USHORT_10_6"},
    {CT_SHORT_2_14, L"CT_SHORT_2_14"},
    {CT_USHORT, L"CT_USHORT"},
    {CT_V210, L"CT_V210"},
    {CT_UCHAR_FullRange, L"CT_UCHAR_FullRange"},
    {CT_USHORT_BE_VideoRange, L"CT_USHORT_BE_VideoRange"},
    {CT_USHORT_BE_FullRange, L"CT_USHORT_BE_FullRange"},
    {CT_101010_2Bit_BE_VideoRange, L"CT_101010_2Bit_BE_VideoRange"},
    {CT_101010_2Bit_BE_FullRange, L"CT_101010_2Bit_BE_FullRange"},
    {CT_101010_2Bit_LE_FullRange, L"CT_101010_2Bit_LE_FullRange"},
};

constexpr Wide kPixelLayouts[] = {
    {PF_CbYCrY, L"PF_CbYCrY"}, {PF_ARGB, L"PF_ARGB"}, {PF_BGRA, L"PF_BGRA"},
    {PF_RGB, L"PF_RGB"},       {PF_Mono, L"PF_Mono"}, {PF_RGBA, L"PF_RGBA"},
};

constexpr Wide kLevelConversions[] = {
    {Expand_Levels, L"Expand_Levels"},
    {Compress_Levels, L"Compress_Levels"},
    {Default_Levels, L"Default_Levels"},
};

constexpr NamedValue<const char*> kColorSpaces[] = {
    {CS_MONO, "CS_MONO"},
    {CS_RGB, "CS_RGB"},
    {CS_YCbCr_601, "CS_YCbCr_601"},
    {CS_YCbCr_709, "CS_YCbCr_709"},
};

}  // namespace

const wchar_t* ComponentTypeToString(ncfUInt32 value) {
    return Find(kComponentTypes, value, L"CT_UNDEFINED");
}

const wchar_t* PixelLayoutToString(ncfUInt32 value) {
    return Find(kPixelLayouts, value, L"PF_UNDEFINED");
}

const wchar_t* LevelConversionToString(ncfUInt32 value) {
    return Find(kLevelConversions, value, L"DesiredPixelFormat_UNDEFINED");
}

const char* ColorSpaceToString(ncfUInt32 value) {
    return Find(kColorSpaces, value, "CS_UNDEFINED");
}
