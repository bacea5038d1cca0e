// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/system/FileState.h"
#include "reference_host/system/WindowsCalls.h"

namespace host::system {

std::optional<FileState> StateOf(const std::filesystem::path& file) {
    // A file time counts tenths of a microsecond from 1601.
    constexpr std::int64_t kNanosecondsOfTick = 100;
    constexpr std::int64_t kTicksFrom1601To1970 = 116'444'736'000'000'000;
    const OwnedHandle opened = OpenThere(file, FILE_READ_ATTRIBUTES);
    BY_HANDLE_FILE_INFORMATION facts{};
    if (!opened.IsOpen() || GetFileType(opened.get()) != FILE_TYPE_DISK ||
        !GetFileInformationByHandle(opened.get(), &facts) ||
        (facts.dwFileAttributes & FILE_ATTRIBUTE_DIRECTORY) != 0) {
        return std::nullopt;
    }
    const std::int64_t ticks = std::int64_t{facts.ftLastWriteTime.dwHighDateTime} << 32 |
                               facts.ftLastWriteTime.dwLowDateTime;
    return FileState{std::uint64_t{facts.nFileSizeHigh} << 32 | facts.nFileSizeLow,
                     (ticks - kTicksFrom1601To1970) * kNanosecondsOfTick};
}

}  // namespace host::system
