// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <cstdint>
#include <filesystem>
#include <iterator>
#include <random>
#include <string>
#include <vector>

#include "reference_host/movie_writer/Movie.h"

namespace validate {

// A movie that a check gives to the module, and what is special about it.
struct SampleMovie {
    std::string about;  // "picture, sound and timecode"
    std::filesystem::path file;
};

// Sound movies, written into a folder.
std::vector<SampleMovie> WriteSoundMovies(const std::filesystem::path& folder);
// The first of them alone.
SampleMovie WriteSoundMovie(const std::filesystem::path& folder);
// Its bytes, for checks that change them.
movies::Bytes BytesOfSoundMovie();

// Files that end too early or hold something else.
std::vector<SampleMovie> WriteBrokenMovies(const std::filesystem::path& folder);
// Files that say what is not so, on purpose.
std::vector<SampleMovie> WriteHostileMovies(const std::filesystem::path& folder);
// Movies beyond what 32 bits count; nearly all of it are holes that take no room.
std::vector<SampleMovie> WriteHugeMovies(const std::filesystem::path& folder);
// Sound movies under names that few programs expect, but for those that the file system refuses.
std::vector<SampleMovie> WriteOddlyNamedMovies(const std::filesystem::path& folder);

// The bytes with a few changes that the numbers choose.
movies::Bytes Changed(movies::Bytes bytes, std::mt19937_64& numbers);

// All that writes throws CannotWrite where it can't.
void WriteBytes(const movies::Bytes& bytes, const std::filesystem::path& file);
void MakeFolder(const std::filesystem::path& folder);
void CutFile(const std::filesystem::path& file, std::uintmax_t size);

}  // namespace validate
