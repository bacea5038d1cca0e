// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/plugin/PixelEnums.h"

#include <gtest/gtest.h>

#include <string>

namespace {

TEST(PixelEnums, NameEveryComponentType) {
    const std::pair<ncfUInt32, const wchar_t*> rows[] = {
        {1, L"CT_UCHAR"},
        {2, L"CT_10Bit"},
        {4, L"CT_USHORT_10_6"},
        {8, L"CT_SHORT_2_14"},
        {16, L"CT_USHORT"},
        {1024, L"CT_V210"},
        {2048, L"CT_UCHAR_FullRange"},
        {4096, L"CT_USHORT_BE_VideoRange"},
        {8192, L"CT_USHORT_BE_FullRange"},
        {16384, L"CT_101010_2Bit_BE_VideoRange"},
        {32768, L"CT_101010_2Bit_BE_FullRange"},
        {65536, L"CT_101010_2Bit_LE_FullRange"},
        {0, L"CT_UNDEFINED"},
        {3, L"CT_UNDEFINED"},
        {0x7FFFFFFF, L"CT_UNDEFINED"},
    };
    for (const auto& [value, text] : rows) {
        EXPECT_STREQ(ComponentTypeToString(value), text) << value;
    }
}

TEST(PixelEnums, NameEveryPixelLayout) {
    const std::pair<ncfUInt32, const wchar_t*> rows[] = {
        {2, L"PF_CbYCrY"},  {4, L"PF_ARGB"},    {8, L"PF_BGRA"},      {64, L"PF_RGB"},
        {1024, L"PF_Mono"}, {2048, L"PF_RGBA"}, {1, L"PF_UNDEFINED"}, {0x7FFFFFFF, L"PF_UNDEFINED"},
    };
    for (const auto& [value, text] : rows) {
        EXPECT_STREQ(PixelLayoutToString(value), text) << value;
    }
}

TEST(PixelEnums, NameEveryLevelConversion) {
    EXPECT_STREQ(LevelConversionToString(1), L"Expand_Levels");
    EXPECT_STREQ(LevelConversionToString(2), L"Compress_Levels");
    EXPECT_STREQ(LevelConversionToString(16), L"Default_Levels");
    EXPECT_STREQ(LevelConversionToString(0), L"DesiredPixelFormat_UNDEFINED");
}

TEST(PixelEnums, NameEveryColourSpace) {
    EXPECT_STREQ(ColorSpaceToString(1), "CS_MONO");
    EXPECT_STREQ(ColorSpaceToString(2), "CS_RGB");
    EXPECT_STREQ(ColorSpaceToString(4), "CS_YCbCr_601");
    EXPECT_STREQ(ColorSpaceToString(8), "CS_YCbCr_709");
    EXPECT_STREQ(ColorSpaceToString(0x7FFFFFFF), "CS_UNDEFINED");
}

}  // namespace
