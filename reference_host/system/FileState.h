// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <cstdint>
#include <filesystem>
#include <optional>

namespace host::system {

// By what a file that was written again is told from the one before.
struct FileState {
    std::uint64_t size = 0;
    std::int64_t date = 0;  // of its last write, in nanoseconds from 1970-01-01 UTC

    bool operator==(const FileState& other) const {
        return size == other.size && date == other.date;
    }
};

// Links are followed. None where there is no such file, and for folders and devices.
std::optional<FileState> StateOf(const std::filesystem::path& file);

}  // namespace host::system
