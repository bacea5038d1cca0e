// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/OutputFile.h"

#include <fcntl.h>
#include <unistd.h>

#include <cerrno>
#include <charconv>
#include <csignal>
#include <string_view>
#include <system_error>
#include <utility>

#include "reference_host/cliphost/Failure.h"
#include "reference_host/cliphost/OutputProblem.h"

namespace cliphost {
std::optional<int> OutputFile::DescriptorOf(const std::filesystem::path& path) {
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
        const char* const end = name.data() + name.size();
        if (name.substr(0, folder.size()) == folder) {
            const auto read = std::from_chars(name.data() + folder.size(), end, number);
            return read.ec == std::errc() && read.ptr == end && number >= 0 ? std::optional(number)
                                                                            : std::nullopt;
        }
    }
    return std::nullopt;
}

bool OutputFile::IsDevice(const std::filesystem::path& path) {
    std::error_code ignored;
    const auto there = std::filesystem::status(path, ignored);
    return DescriptorOf(path) ||
           (std::filesystem::exists(there) && !std::filesystem::is_regular_file(there) &&
            !std::filesystem::is_directory(there));
}

OutputFile::OutputFile(std::filesystem::path path) : path_(std::move(path)) {
    // A reader that goes away shows itself as a failed write, not as the end of
    // this program.
    std::signal(SIGPIPE, SIG_IGN);
    if (const std::optional<int> open = DescriptorOf(path_)) {
        descriptor_ = fcntl(*open, F_DUPFD_CLOEXEC, STDERR_FILENO + 1);
        if (descriptor_ < 0) {
            Fail(errno);
        }
        return;
    }
    std::error_code error;
    const auto status = std::filesystem::status(path_, error);
    if (status.type() == std::filesystem::file_type::none) {
        Fail(error.value());  // such as links in a circle
    }
    if (std::filesystem::is_directory(status)) {
        Fail(EISDIR);
    }
    // Another file would take the place of one that is closed to us.
    if (std::filesystem::is_regular_file(status) && access(path_.c_str(), W_OK) != 0) {
        Fail(errno);
    }
    if (!std::filesystem::exists(status) || std::filesystem::is_regular_file(status)) {
        unfinished_.emplace(path_);
    }
    const std::filesystem::path& opened = unfinished_ ? unfinished_->path() : path_;
    descriptor_ = open(opened.c_str(), O_WRONLY | O_CREAT | O_TRUNC | O_CLOEXEC, 0666);
    if (descriptor_ < 0) {
        const int reason = errno;
        unfinished_.reset();
        Fail(reason);
    }
}

OutputFile::~OutputFile() {
    if (descriptor_ >= 0) {
        close(descriptor_);
    }
}

void OutputFile::Write(const void* bytes, std::size_t size) {
    const char* from = static_cast<const char*>(bytes);
    while (size > 0) {
        const ssize_t done = write(descriptor_, from, size);
        if (done < 0 && errno == EINTR) {
            continue;
        }
        if (done < 0 && errno == EPIPE) {
            throw ReaderGone();
        }
        if (done <= 0) {
            Fail(done < 0 ? errno : EIO);
        }
        from += done;
        size -= static_cast<std::size_t>(done);
    }
}

void OutputFile::Finish() {
    // Some systems tell of a full disk only here.
    if (descriptor_ >= 0 && close(std::exchange(descriptor_, -1)) != 0) {
        Fail(errno);
    }
    if (unfinished_) {
        std::error_code error;
        unfinished_->TakePlace(error);
        if (error) {
            Fail(error.value());
        }
    }
}

const std::filesystem::path& OutputFile::LeaveToOther() {
    std::error_code ignored;
    close(std::exchange(descriptor_, -1));
    std::filesystem::remove(unfinished_->path(), ignored);
    return unfinished_->path();
}

void OutputFile::Fail(int error) {
    const bool isOwn = IsStandardOutput(path_);
    throw Failure(kExitCaller,
                  NotWritten(isOwn ? std::filesystem::path("standard output") : path_, error));
}

}  // namespace cliphost
