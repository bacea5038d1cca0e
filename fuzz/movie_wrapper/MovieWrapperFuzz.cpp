// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// Any bytes as a file of any kind for the movie wrapper, its sample table and
// its readers. They open files by their names, so the bytes go into one.

#include <unistd.h>

#include <cstdint>
#include <cstdio>
#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <string>

#include "tests/unit/quicktime/AskEverything.h"

namespace {

// Larger inputs only cost time.
constexpr std::size_t kMostBytes = 65536;

// One file for the whole run, removed at its end.
struct InputFile {
    InputFile() {
        const auto name = "movie_wrapper_fuzz_" + std::to_string(getpid());
        const std::filesystem::path memory = "/dev/shm";
        path = (std::filesystem::is_directory(memory) ? memory
                                                      : std::filesystem::temp_directory_path()) /
               name;
    }
    ~InputFile() {
        std::error_code ignored;
        std::filesystem::remove(path, ignored);
    }
    std::filesystem::path path;
};

}  // namespace

extern "C" void av_log_set_level(int level);

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    static const InputFile file;
    constexpr int kQuiet = -8;
    av_log_set_level(kQuiet);
    if (size > kMostBytes) {
        return 0;
    }
    std::ofstream(file.path, std::ios::binary)
        .write(reinterpret_cast<const char*>(data), static_cast<std::streamsize>(size));
    if (const char* const problem = quicktime_tests::AskEverything(file.path)) {
        std::fprintf(stderr, "%s\n", problem);
        std::abort();
    }
    return 0;
}
