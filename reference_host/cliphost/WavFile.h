// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <cstdint>
#include <vector>

namespace cliphost {

// PCM as a WAV file holds it: little-endian, interleaved.
struct WavForm {
    unsigned channels = 0;
    unsigned rate = 0;  // frames a second
    unsigned bits = 24;

    unsigned FrameBytes() const { return channels * (bits / 8); }
};

// All bytes before the samples, for a file of so many frames. When its sizes do not
// fit 32 bits it is an RF64, which has 64-bit sizes. Empty for a form or a length
// that no file can have.
std::vector<unsigned char> WavHeader(const WavForm& form, std::uint64_t frames);

// A chunk has an even number of bytes; whether one more must follow these.
bool WavNeedsPadding(const WavForm& form, std::uint64_t frames);

}  // namespace cliphost
