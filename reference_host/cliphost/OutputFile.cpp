// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/OutputFile.h"

#include <cerrno>
#include <system_error>
#include <utility>

#include "reference_host/cliphost/Failure.h"
#include "reference_host/cliphost/FileAccess.h"
#include "reference_host/cliphost/OutputProblem.h"
#include "reference_host/system/Access.h"
#include "reference_host/system/Paths.h"

namespace cliphost {

using host::system::DescriptorOf;
using host::system::IsStandardOutput;

void RefuseName(const std::filesystem::path& output) {
    if (Problem problem = WhyNoPath(output, "take another name")) {
        throw Failure(kExitCaller, std::move(problem));
    }
}

bool OutputFile::IsDevice(const std::filesystem::path& path) {
    std::error_code ignored;
    const auto there = std::filesystem::status(path, ignored);
    return DescriptorOf(path) ||
           (std::filesystem::exists(there) && !std::filesystem::is_regular_file(there) &&
            !std::filesystem::is_directory(there));
}

OutputFile::OutputFile(std::filesystem::path path, Writer writer) : path_(std::move(path)) {
    if (const std::optional<int> open = DescriptorOf(path_)) {
        Check(stream_.OpenCopyOf(*open));
        return;
    }
    RefuseName(path_);
    std::error_code error;
    const auto status = std::filesystem::status(path_, error);
    if (status.type() == std::filesystem::file_type::none) {
        Fail(error.default_error_condition().value());  // such as links in a circle
    }
    if (std::filesystem::is_directory(status)) {
        Fail(EISDIR);
    }
    // Another file would take the place of one that is closed to us.
    if (std::filesystem::is_regular_file(status)) {
        Check(host::system::AccessError(path_, host::system::Right::Write));
    }
    if (!std::filesystem::exists(status) || std::filesystem::is_regular_file(status)) {
        unfinished_.emplace(path_);
    }
    if (writer == Writer::Self || !unfinished_) {
        Check(stream_.Open(unfinished_ ? unfinished_->path() : path_));
    }
}

void OutputFile::Write(const void* bytes, std::size_t size) {
    const int error = stream_.Write(bytes, size);
    if (error == EPIPE || error == EINTR) {  // a signal asks us to end
        throw ReaderGone();
    }
    Check(error);
}

void OutputFile::Finish() {
    Check(stream_.Close());
    if (unfinished_) {
        std::error_code error;
        unfinished_->TakePlace(error);
        Check(error.default_error_condition().value());
    }
}

void OutputFile::FinishIfFree() {
    Check(stream_.Close());
    std::error_code error;
    unfinished_->TakePlaceIfFree(error);
    Check(error.default_error_condition().value());
}

void OutputFile::TryPlace() {
    if (unfinished_) {
        Check(stream_.Open(unfinished_->path()));
    }
}

void OutputFile::Check(int error) {
    if (error != 0) {
        Fail(error);
    }
}

void OutputFile::Fail(int error) {
    const bool isOwn = IsStandardOutput(path_);
    throw Failure(kExitCaller,
                  NotWritten(isOwn ? std::filesystem::path("standard output") : path_, error));
}

void WriteWholeFile(const std::filesystem::path& path, const std::vector<unsigned char>& bytes) {
    OutputFile output(path);
    output.Write(bytes.data(), bytes.size());
    output.Finish();
}

}  // namespace cliphost
