// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include <fcntl.h>
#include <unistd.h>

#include <cerrno>
#include <string_view>
#include <utility>

#include "reference_host/system/DelayedSignals.h"
#include "reference_host/system/OutputStream.h"
#include "reference_host/util/text/Number.h"

namespace host::system {

std::optional<int> DescriptorOf(const std::filesystem::path& path) {
    struct Row {
        std::string_view name;
        int descriptor;
    };
    static constexpr Row kNames[] = {
        {"-", STDOUT_FILENO}, {"/dev/stdout", STDOUT_FILENO}, {"/dev/stderr", STDERR_FILENO}};
    const std::string_view name = path.native();
    for (const Row& row : kNames) {
        if (name == row.name) {
            return row.descriptor;
        }
    }
    for (const std::string_view folder : {"/dev/fd/", "/proc/self/fd/"}) {
        int number = 0;
        if (name.substr(0, folder.size()) == folder) {
            return text::ReadNumber(name.substr(folder.size()), number) && number >= 0
                       ? std::optional(number)
                       : std::nullopt;
        }
    }
    return std::nullopt;
}

bool IsStandardOutput(const std::filesystem::path& path) {
    return DescriptorOf(path) == STDOUT_FILENO;
}

int StandardOutputError(int error) {
    return error;
}

int OutputStream::Open(const std::filesystem::path& path) {
    descriptor_ = open(path.c_str(), O_WRONLY | O_CREAT | O_TRUNC | O_CLOEXEC, 0666);
    return descriptor_ < 0 ? errno : 0;
}

int OutputStream::OpenCopyOf(int descriptor) {
    descriptor_ = fcntl(descriptor, F_DUPFD_CLOEXEC, STDERR_FILENO + 1);
    return descriptor_ < 0 ? errno : 0;
}

int OutputStream::Write(const void* bytes, std::size_t size) {
    const char* from = static_cast<const char*>(bytes);
    while (size > 0) {
        const ssize_t done = write(descriptor_, from, size);
        if (done < 0 && errno == EINTR && !DelayedSignals::HaveCome()) {
            continue;
        }
        if (done <= 0) {
            return done < 0 ? errno : EIO;
        }
        from += done;
        size -= static_cast<std::size_t>(done);
    }
    return 0;
}

int OutputStream::Close() {
    const int open = std::exchange(descriptor_, -1);
    return open >= 0 && close(open) != 0 ? errno : 0;
}

}  // namespace host::system
