// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "tests/system/codecs/KnownDifferences.h"

#include <fnmatch.h>

namespace {

struct KnownDifference {
    const char* names;  // a pattern
    const char* aspect;
    const char* why;
};

constexpr const char* kNoAlpha =
    "ffmpeg writes a depth without alpha into the header, and a clip shows alpha where it is told";

constexpr KnownDifference kKnown[] = {
    {"avui_*", "alpha", kNoAlpha},
    {"cfhd_*", "alpha", kNoAlpha},
    {"dpx_*", "alpha", kNoAlpha},
    {"exr_*", "alpha", kNoAlpha},
    {"ffv1_*", "alpha", kNoAlpha},
    {"ffvhuff_yuva*", "alpha", kNoAlpha},
    {"ffvhuff_gbrap*", "alpha", kNoAlpha},
    {"gif_*", "alpha", kNoAlpha},
    {"jpeg2000_*", "alpha", kNoAlpha},
    {"ljpeg_*", "alpha", kNoAlpha},
    {"magicyuv_*", "alpha", kNoAlpha},
    {"png_rgba_mp4", "alpha", kNoAlpha},
    {"png_rgba64be_*", "alpha", kNoAlpha},
    {"png_ya*", "alpha", kNoAlpha},
    {"prores_aw_*", "alpha", kNoAlpha},
    {"prores_plain_*", "alpha", kNoAlpha},
    {"sgi_*", "alpha", kNoAlpha},
    {"targa_*", "alpha", kNoAlpha},
    {"tiff_*", "alpha", kNoAlpha},
    {"magicyuv_gray_*", "pictures",
     "the decoder marks its frames as of video range; ffprobe does not tell it of the stream"},
};

}  // namespace

const char* WhyItDiffers(const std::string& name, const std::string& aspect) {
    for (const KnownDifference& known : kKnown) {
        if (aspect == known.aspect && fnmatch(known.names, name.c_str(), 0) == 0) {
            return known.why;
        }
    }
    return nullptr;
}
