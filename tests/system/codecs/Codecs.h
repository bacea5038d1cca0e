// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <ostream>
#include <string>
#include <vector>

// When a movie is tested: at every run, by CI, or by thorough runs alone.
enum class TestSet { kAlways, kBroad, kThorough };

// A short movie to be made by FFmpeg.
struct CodecCase {
    std::string name;     // of the test
    std::string source;   // what is encoded, as a filter graph
    std::string options;  // of the encoder
    std::string ending;   // of the file
    TestSet set = TestSet::kThorough;
    // Copies the packets into a second movie, with these options before and
    // behind its input; not done when both are empty.
    std::string copyBefore;
    std::string copyBehind;
    std::string reading = {};  // options of ffmpeg's decoder
    // See SoundCase.
    bool isExactAnywhere = true;
};

inline std::ostream& operator<<(std::ostream& stream, const CodecCase& each) {
    return stream << each.options;
}

// One for each combination of what a codec takes.
std::vector<CodecCase> PictureCodecCases();
std::vector<CodecCase> SoundCodecCases();
