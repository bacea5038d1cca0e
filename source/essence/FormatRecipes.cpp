// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/essence/FormatRecipes.h"

#include "source/essence/AlphaExtraction.h"
#include "source/essence/FloatConversion.h"
#include "source/essence/FormatEnums.h"

namespace {

using namespace QuickTime;

// clang-format off
const FormatRow kAlpha8 = {
    PF_Mono, CSS_None, CS_MONO, CT_UCHAR, CRT_UNDEFINED,
    {kBGRAPixelFormat, {4, 1}, {1, 1}, &ExtractAlpha8},
    "AddImagePixelFormat(alpha_track, PF_Mono, CSS_None, CS_MONO, CT_UCHAR, CRT_UNDEFINED, "
    "qt_params)",
    "Adding support for a8.\n"};

const FormatRow kAlpha10FromB64a = {
    PF_Mono, CSS_None, CS_MONO, CT_10Bit, CRT_UNDEFINED,
    {kb64aPixelFormat, {8, 1}, {2, 1}, &ExtractAlpha10FromB64a},
    "AddImagePixelFormat(alpha_track, PF_Mono, CSS_None, CS_MONO, CT_10Bit, CRT_UNDEFINED, "
    "qt_params)",
    "Adding support for a10.\n"};

const FormatRow kAlpha10FromR4fl = {
    PF_Mono, CSS_None, CS_MONO, CT_10Bit, CRT_UNDEFINED,
    {kr4flPixelFormat, {16, 1}, {2, 1}, &ExtractAlpha10FromR4fl},
    "AddImagePixelFormat(alpha_track, PF_Mono, CSS_None, CS_MONO, CT_10Bit, CRT_UNDEFINED, "
    "qt_params)",
    "Adding support for a10.\n"};

const RGBRecipe kBGRAFullRange = {
    {PF_BGRA, CSS_4444, CS_RGB, CT_UCHAR, CRT_FullRange,
     {kBGRAPixelFormat, {4, 1}, {4, 1}, nullptr},
     "AddImagePixelFormat(video_track, PF_BGRA, CSS_4444, CS_RGB, CT_UCHAR, CRT_FullRange, "
     "qt_params)",
     "Adding support for BGRA.\n"},
    &kAlpha8};

const RGBRecipe kBGRAVideoRange = {
    {PF_BGRA, CSS_4444, CS_RGB, CT_UCHAR, CRT_VideoRange,
     {kBGRAPixelFormat, {4, 1}, {4, 1}, nullptr},
     "AddImagePixelFormat(video_track, PF_BGRA, CSS_4444, CS_RGB, CT_UCHAR, CRT_VideoRange, "
     "qt_params)",
     "Adding support for BGRA.\n"},
    &kAlpha8};

const RGBRecipe kNVZ2 = {
    {PF_BGRA, CSS_4444, CS_RGB, CT_UCHAR, CRT_VideoRange,
     {kNVZ2PixelFormat, {4, 1}, {4, 1}, nullptr},
     "AddImagePixelFormat(video_track, PF_BGRA, CSS_4444, CS_RGB, CT_UCHAR, CRT_VideoRange, "
     "qt_params)",
     "Adding support for BGRA video range.\n"},
    nullptr};

const RGBRecipe kB64a = {
    {PF_ARGB, CSS_4444, CS_RGB, CT_USHORT_BE_VideoRange, CRT_VideoRange,
     {kb64aPixelFormat, {8, 1}, {8, 1}, nullptr},
     "AddImagePixelFormat(video_track, PF_ARGB, CSS_4444, CS_RGB, CT_USHORT_BE_VideoRange, "
     "CRT_VideoRange, qt_params)",
     "Adding support for 'b64a'.\n"},
    &kAlpha10FromB64a};

const RGBRecipe kR4fl = {
    {PF_ARGB, CSS_4444, CS_RGB, CT_USHORT_BE_VideoRange, CRT_VideoRange,
     {kr4flPixelFormat, {16, 1}, {8, 1}, &ConvertR4flToB64a},
     "AddImagePixelFormat(video_track, PF_ARGB, CSS_4444, CS_RGB, CT_USHORT_BE_VideoRange, "
     "CRT_VideoRange, qt_params)",
     "Adding support for 'r4fl'.\n"},
    &kAlpha10FromR4fl};
// clang-format on

struct Entry {
    ncfUInt32 fourCC;
    const RGBRecipe* fullRange;
    const RGBRecipe* videoRange;
};
const Entry kEntries[] = {
    {kBGRAPixelFormat, &kBGRAFullRange, &kBGRAVideoRange},
    {kRGBAPixelFormat, &kBGRAFullRange, &kBGRAVideoRange},
    {k32ARGBPixelFormat, &kBGRAFullRange, &kBGRAVideoRange},
    {kNVZ2PixelFormat, &kNVZ2, &kNVZ2},
    {kb64aPixelFormat, &kB64a, &kB64a},
    {kr4flPixelFormat, &kR4fl, &kR4fl},
};

}  // namespace

const RGBRecipe* FindRGBRecipe(ncfUInt32 fourCC, bool videoRange) {
    for (const Entry& entry : kEntries) {
        if (entry.fourCC == fourCC) {
            return videoRange ? entry.videoRange : entry.fullRange;
        }
    }
    return nullptr;
}
