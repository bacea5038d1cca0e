// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// Writes the movie builder's broken movies into a folder, each named after its defect:
//
//     header_parser_corpus FOLDER
//
// What the fuzzer finds is put beside them under a name of its own.

#include <cstdio>
#include <filesystem>
#include <fstream>

#include "tests/unit/header_parser/BrokenMovies.h"

namespace {

constexpr std::size_t kLargest = 16 * 1024;

bool Write(const std::filesystem::path& folder, const std::vector<BrokenMovie>& movies) {
    for (const BrokenMovie& movie : movies) {
        if (movie.bytes.size() > kLargest) {
            continue;
        }
        std::ofstream stream(folder / movie.name, std::ios::binary);
        stream.write(reinterpret_cast<const char*>(movie.bytes.data()),
                     static_cast<std::streamsize>(movie.bytes.size()));
        if (!stream.flush()) {
            std::fprintf(stderr, "cannot write %s\n", movie.name.c_str());
            return false;
        }
    }
    return true;
}

}  // namespace

int main(int argc, char** argv) {
    if (argc != 2) {
        std::fprintf(stderr, "usage: header_parser_corpus FOLDER\n");
        return 2;
    }
    std::filesystem::create_directories(argv[1]);
    return Write(argv[1], BrokenMovies()) && Write(argv[1], WholeMovies()) ? 0 : 1;
}
