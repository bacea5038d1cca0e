// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <ostream>
#include <string>
#include <vector>

namespace quicktime_tests {

// A way of writing sound into a movie: all encoders of the ffmpeg command whose
// sound .mov or .mp4 takes and that the library decodes again.
struct SoundEncoder {
    const char* name;
    const char* arguments;
    const char* ending;
    int rate = 48000;
    int channels = 2;
    // A range that is read alone equals that of the whole, bit for bit.
    bool isExactAnywhere = true;
};
void PrintTo(const SoundEncoder& encoder, std::ostream* out);

const std::vector<SoundEncoder>& SoundEncoders();

// The arguments that make its source: tones and noise, so that no two ranges
// are alike.
std::string SoundOf(const SoundEncoder& encoder, double seconds);

}  // namespace quicktime_tests
