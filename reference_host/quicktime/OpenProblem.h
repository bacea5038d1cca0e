// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <cstdint>
#include <filesystem>
#include <string>

namespace host {

// Why the movie wrapper can't open a file, in a few words; empty when it can.
std::string OpenProblem(const std::filesystem::path& path);

// Why the samples of a track can't be decoded, with the code of their codec;
// nothing when they can, or when there is no such track.
struct CodecProblem {
    std::string sentence;
    std::uint32_t code = 0;  // of the codec; 0 also where nothing tells it

    explicit operator bool() const { return !sentence.empty(); }
};
// `place` counts from 0 among the tracks of its kind.
CodecProblem DecoderProblem(const std::filesystem::path& path, bool ofSound, std::size_t place);
// The same of the track at that place of the file, whatever its kind.
CodecProblem DecoderProblem(const std::filesystem::path& path, std::size_t track);

// Why the first picture track can't have pictures as large as the file tells; empty
// when it can.
std::string RasterProblem(const std::filesystem::path& path);

}  // namespace host
