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

constexpr KnownDifference kKnown[] = {
    {"ac3_*", "ranges", "the decoder fills empty bands with noise that goes on from call to call"},
    {"eac3_*", "ranges", "the decoder fills empty bands with noise that goes on from call to call"},
    {"g723_1_*", "ranges", "the decoder's filters remember more than a packet"},
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
