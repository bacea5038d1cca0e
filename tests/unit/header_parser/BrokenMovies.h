// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <ostream>
#include <string>
#include <vector>

#include "host_interfaces/framework/ResultCodes.h"
#include "reference_host/movie_writer/Movie.h"

// A file with one defect. The name says which; the fuzzer's corpus keeps the
// file under it.
struct BrokenMovie {
    std::string name;
    movies::Bytes bytes;
    NCFRESULT expected;
};

// How a test that fails calls it.
inline void PrintTo(const BrokenMovie& movie, std::ostream* out) {
    *out << movie.name;
}

std::vector<BrokenMovie> BrokenMovies();

// Movies of many kinds without a defect, likewise named.
std::vector<BrokenMovie> WholeMovies();
