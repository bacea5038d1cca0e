// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <filesystem>
#include <optional>
#include <stdexcept>

#include "reference_host/cliphost/UnfinishedFile.h"

namespace cliphost {

// The program that read our standard output has ended, which is not our failure.
class ReaderGone : public std::runtime_error {
public:
    ReaderGone() : std::runtime_error("the reader of the output has gone") {}
};

// A file that appears complete or not at all: it is written under another name in
// the same folder and renamed when it is finished. An object that ends unfinished
// leaves nothing behind. What can't be renamed is written directly: "-", which is
// standard output, and devices and pipes.
class OutputFile {
public:
    explicit OutputFile(std::filesystem::path path);  // throws a Failure
    ~OutputFile();
    OutputFile(const OutputFile&) = delete;
    OutputFile& operator=(const OutputFile&) = delete;

    // Throws a Failure that tells why, or ReaderGone.
    void Write(const void* bytes, std::size_t size);
    void Finish();  // throws a Failure
    // Leaves the writing to somebody who makes a file of his own: the name that
    // he is to give it, at which nothing is. Not for devices.
    const std::filesystem::path& LeaveToOther();
    // Throws the Failure for what the system said.
    [[noreturn]] void Fail(int error);

    // The open descriptor that a path stands for: "-", "/dev/stdout", "/dev/fd/5".
    static std::optional<int> DescriptorOf(const std::filesystem::path& path);
    static bool IsStandardOutput(const std::filesystem::path& path) {
        return DescriptorOf(path) == 1;
    }
    // Whether a path is such a descriptor, or a device or pipe that is there.
    static bool IsDevice(const std::filesystem::path& path);

private:
    std::filesystem::path path_;
    std::optional<UnfinishedFile> unfinished_;  // none: the place itself is written
    int descriptor_ = -1;
};

}  // namespace cliphost
