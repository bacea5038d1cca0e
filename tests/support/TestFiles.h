// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <cerrno>
#include <cstdint>
#include <filesystem>
#include <system_error>

#ifdef _WIN32
#include <sys/utime.h>
#else
#include <sys/stat.h>
#include <utime.h>
#endif

inline void ThrowUnlessDone(int result, const std::filesystem::path& file) {
    if (result != 0) {
        throw std::filesystem::filesystem_error("refused by the system", file,
                                                std::error_code(errno, std::generic_category()));
    }
}

// Sets when a file was written last, in seconds since 1970.
inline void SetDate(const std::filesystem::path& file, std::int64_t seconds) {
#ifdef _WIN32
    __utimbuf64 times{seconds, seconds};
    ThrowUnlessDone(_wutime64(file.c_str(), &times), file);
#else
    const utimbuf times{seconds, seconds};
    ThrowUnlessDone(utime(file.c_str(), &times), file);
#endif
}

// False on Windows, where the compiler's library makes no links to files.
inline bool MakeLink([[maybe_unused]] const std::filesystem::path& target,
                     [[maybe_unused]] const std::filesystem::path& place) {
#ifdef _WIN32
    return false;
#else
    std::filesystem::create_symlink(target, place);
    return true;
#endif
}

// False on Windows, where no pipe is in a folder.
inline bool MakePipe([[maybe_unused]] const std::filesystem::path& place) {
#ifdef _WIN32
    return false;
#else
    ThrowUnlessDone(mkfifo(place.c_str(), 0600), place);
    return true;
#endif
}
