// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <filesystem>
#include <optional>

namespace host::system {

// The open descriptor that a path stands for: "-", "/dev/stdout", "/dev/fd/5".
std::optional<int> DescriptorOf(const std::filesystem::path& path);
bool IsStandardOutput(const std::filesystem::path& path);

// Of the error that the C library just gave for standard output: the same, or EPIPE where that is
// what it means.
int StandardOutputError(int error);

// Takes bytes to a file, a device or an open descriptor. Failures are the
// system's error numbers; 0: none.
class OutputStream {
public:
    OutputStream() = default;
    ~OutputStream() { Close(); }
    OutputStream(const OutputStream&) = delete;
    OutputStream& operator=(const OutputStream&) = delete;

    // Makes the file, or empties one that is there.
    int Open(const std::filesystem::path& path);
    // Another descriptor for what is open already.
    int OpenCopyOf(int descriptor);
    int Write(const void* bytes, std::size_t size);  // EPIPE: the reader has gone
    int Close();                                     // some tell of a full disk only here

private:
    int descriptor_ = -1;
};

}  // namespace host::system
