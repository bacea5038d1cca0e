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
constexpr const char* kFault = "a fault, being mended";

constexpr KnownDifference kKnown[] = {
    {"avui_*", "alpha", kNoAlpha},         {"cfhd_*", "alpha", kNoAlpha},
    {"dpx_*", "alpha", kNoAlpha},          {"exr_*", "alpha", kNoAlpha},
    {"ffv1_*", "alpha", kNoAlpha},         {"ffvhuff_*", "alpha", kNoAlpha},
    {"gif_*", "alpha", kNoAlpha},          {"jpeg2000_*", "alpha", kNoAlpha},
    {"png_rgba64be_*", "alpha", kNoAlpha}, {"png_ya*", "alpha", kNoAlpha},
    {"adpcm_ima_wav_*", "map", kFault},    {"adpcm_ms_*", "map", kFault},
    {"smc_*", "pictures", kFault},
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
