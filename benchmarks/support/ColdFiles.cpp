// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "benchmarks/support/ColdFiles.h"

#include <fcntl.h>
#include <unistd.h>

#include <algorithm>
#include <string_view>

namespace {

bool isCold = false;

void DropPages(const std::filesystem::path& file) {
    const int descriptor = open(file.c_str(), O_RDONLY | O_CLOEXEC);
    if (descriptor >= 0) {
        fdatasync(descriptor);  // pages that are not yet written are not dropped
        posix_fadvise(descriptor, 0, 0, POSIX_FADV_DONTNEED);
        close(descriptor);
    }
}

}  // namespace

void TakeColdOption(int* argc, char** argv) {
    char** const end = argv + *argc;
    char** const kept = std::remove_if(
        argv, end, [](const char* argument) { return std::string_view(argument) == "--cold"; });
    isCold = kept != end;
    *argc = static_cast<int>(kept - argv);
    argv[*argc] = nullptr;
}

void MakeCold(benchmark::State& state, const std::filesystem::path& file) {
    if (isCold) {
        state.PauseTiming();
        DropPages(file);
        state.ResumeTiming();
    }
}

void MakeFolderCold(benchmark::State& state, const std::filesystem::path& folder) {
    if (isCold) {
        state.PauseTiming();
        for (const auto& entry : std::filesystem::directory_iterator(folder)) {
            DropPages(entry.path());
        }
        state.ResumeTiming();
    }
}
