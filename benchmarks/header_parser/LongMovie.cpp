// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "benchmarks/header_parser/LongMovie.h"

#include <unistd.h>

#include <stdexcept>

movies::Movie LongMovie(std::uint64_t samples) {
    constexpr std::int32_t kOffsets[] = {100, 300, 0, 0};
    movies::Movie movie;
    movie.timeScale = 12000;
    movie.largeMedia = true;
    movies::VideoFormat format;
    format.codec = "apcn";
    movies::Track track = movies::VideoTrack(format, 0, 12000, 100);
    track.samples.clear();
    track.samples.reserve(samples);
    std::uint32_t random = 1;
    for (std::uint64_t i = 0; i < samples; ++i) {
        random = random * 1664525u + 1013904223u;
        movies::SampleRun run;
        run.size = 1000 + random % 20000;
        run.duration = 100;
        run.displayOffset = kOffsets[i % 4];
        run.sync = i % 12 == 0;
        track.samples.push_back(run);
    }
    track.gapBetweenChunks = 100;
    track.largeOffsets = true;
    movie.tracks.push_back(std::move(track));
    return movie;
}

LongMovieFile::LongMovieFile(std::uint64_t samples)
    : path_(std::filesystem::temp_directory_path() /
            ("long_movie_" + std::to_string(samples) + "_" + std::to_string(getpid()) + ".mov")) {
    const movies::MadeMovie made = movies::Build(LongMovie(samples));
    headerPosition_ = made.headerPosition;
    headerSize_ = made.headerSize;
    if (!made.WriteTo(path_.string())) {
        throw std::runtime_error("cannot write " + path_.string());
    }
}

LongMovieFile::~LongMovieFile() {
    std::error_code ignored;
    std::filesystem::remove(path_, ignored);
}
