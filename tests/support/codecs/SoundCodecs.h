// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <ostream>
#include <string>
#include <vector>

// Sound that the ffmpeg command writes into a movie and reads again.
struct SoundCase {
    std::string name;
    std::string encoder;  // its options
    std::string ending;   // of the file
    std::string rate;
    std::string layout;
    // Options of ffmpeg's decoder under which it gives the library's sound.
    std::string reading;
    // A range that is read alone equals that of the whole, bit for bit.
    bool isExactAnywhere;
    bool isBroad;  // tested by CI, not by thorough runs alone
};

inline std::ostream& operator<<(std::ostream& stream, const SoundCase& each) {
    return stream << each.encoder;
}

// Every codec in every ending, rate and layout that it takes.
const std::vector<SoundCase>& SoundCases();

// A filter graph of tones and noise, so that no two channels and no two ranges
// are alike.
std::string SoundSource(const std::string& rate, const std::string& layout, double seconds);

int ChannelsOf(const std::string& layout);
