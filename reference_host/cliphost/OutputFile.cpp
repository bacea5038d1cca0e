// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/OutputFile.h"

#include <fcntl.h>
#include <fmt/format.h>
#include <unistd.h>

#include <cerrno>
#include <csignal>
#include <system_error>
#include <utility>

#include "reference_host/cliphost/Failure.h"
#include "reference_host/framework/HostPath.h"

namespace cliphost {

OutputFile::OutputFile(std::filesystem::path path) : path_(std::move(path)) {
    // A reader that goes away shows itself as a failed write, not as the end of
    // this program.
    std::signal(SIGPIPE, SIG_IGN);
    if (IsStandardOutput(path_)) {
        descriptor_ = STDOUT_FILENO;
        return;
    }
    std::error_code ignored;
    const auto status = std::filesystem::status(path_, ignored);
    if (std::filesystem::is_directory(status)) {
        Fail(EISDIR);
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
    Close();
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
    if (descriptor_ > STDERR_FILENO && close(std::exchange(descriptor_, -1)) != 0) {
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

void OutputFile::Fail(int error) {
    throw Failure(kExitCaller, IsStandardOutput(path_) ? "standard output" : path_,
                  "not written: " + std::generic_category().message(error));
}

void OutputFile::Close() {
    if (descriptor_ > STDERR_FILENO) {
        close(descriptor_);
    }
    descriptor_ = -1;
}

}  // namespace cliphost
