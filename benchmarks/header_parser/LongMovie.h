// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <cstdint>
#include <filesystem>

#include "reference_host/movie_writer/Movie.h"

// A movie of `samples` pictures, 120 a second so that no length goes beyond a day, that makes the
// tables long: a size and a display offset for each sample, ten samples in a chunk, a sync sample
// in twelve. Its media are a hole.
movies::Movie LongMovie(std::uint64_t samples);

// The same as a sparse file in the temporary folder, deleted with the object.
class LongMovieFile {
public:
    explicit LongMovieFile(std::uint64_t samples);
    ~LongMovieFile();
    LongMovieFile(const LongMovieFile&) = delete;
    LongMovieFile& operator=(const LongMovieFile&) = delete;

    const std::filesystem::path& Path() const { return path_; }
    std::uint64_t HeaderPosition() const { return headerPosition_; }
    std::uint64_t HeaderSize() const { return headerSize_; }

private:
    std::filesystem::path path_;
    std::uint64_t headerPosition_ = 0;
    std::uint64_t headerSize_ = 0;
};
