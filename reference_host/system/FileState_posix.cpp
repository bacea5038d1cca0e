// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/system/FileState.h"

#include <sys/stat.h>

namespace host::system {

std::optional<FileState> StateOf(const std::filesystem::path& file) {
    constexpr std::int64_t kNanoseconds = 1'000'000'000;
    struct stat found {};
    if (stat(file.c_str(), &found) != 0 || !S_ISREG(found.st_mode)) {
        return std::nullopt;
    }
    return FileState{static_cast<std::uint64_t>(found.st_size),
                     found.st_mtim.tv_sec * kNanoseconds + found.st_mtim.tv_nsec};
}

}  // namespace host::system
