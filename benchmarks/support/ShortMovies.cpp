// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "benchmarks/support/ShortMovies.h"

#include <string>

#include "reference_host/movie_writer/Movie.h"

void WriteShortMovies(const std::filesystem::path& folder, int count) {
    for (int i = 0; i < count; ++i) {
        movies::Movie movie;
        movies::VideoFormat format;
        format.codec = "apcn";
        movie.tracks.push_back(
            movies::VideoTrack(format, 48u + static_cast<unsigned>(i) % 100, 25, 1));
        movie.tracks.push_back(movies::SoundTrack(movies::SoundFormat(), 96000));
        movies::Build(movie).WriteTo((folder / (std::to_string(i) + ".mov")).string());
    }
}
