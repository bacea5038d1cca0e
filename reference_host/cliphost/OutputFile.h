// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <filesystem>
#include <optional>
#include <stdexcept>
#include <vector>

#include "reference_host/system/OutputStream.h"
#include "reference_host/system/UnfinishedFile.h"

namespace cliphost {

// The program that read our standard output has ended, which is not our failure.
class ReaderGone : public std::runtime_error {
public:
    ReaderGone() : std::runtime_error("the reader of the output has gone") {}
};

// Throws the Failure for a name that nothing can have, though the system might take it for another.
void RefuseName(const std::filesystem::path& output);

// A file that appears complete or not at all: it is written under another name in
// the same folder and renamed when it is finished. An object that ends unfinished
// leaves nothing behind. What can't be renamed is written directly: "-", which is
// standard output, and devices and pipes.
class OutputFile {
public:
    // Who writes what cannot be renamed is always this object.
    enum class Writer { Self, Other };

    explicit OutputFile(std::filesystem::path path,
                        Writer writer = Writer::Self);  // throws a Failure
    OutputFile(const OutputFile&) = delete;
    OutputFile& operator=(const OutputFile&) = delete;

    // Throws a Failure that tells why, or ReaderGone.
    void Write(const void* bytes, std::size_t size);
    void Finish();  // throws a Failure
    // Lets a file stay that somebody else has put there in the meantime. Not for devices.
    void FinishIfFree();
    // For somebody else who makes a file of his own: the name that he is to give
    // it, at which nothing is. Not for devices.
    const std::filesystem::path& NameForOther() const { return unfinished_->path(); }
    // Where that is going to lie, behind links.
    const std::filesystem::path& PlaceOfOther() const { return unfinished_->place(); }
    // Throws the Failure if the system lets nobody write there.
    void TryPlace();
    // Throws the Failure for what the system said.
    [[noreturn]] void Fail(int error);

    // Whether a path stands for an open descriptor, or is a device or pipe.
    static bool IsDevice(const std::filesystem::path& path);

private:
    void Check(int error);

    std::filesystem::path path_;
    std::optional<host::system::UnfinishedFile> unfinished_;  // none: the place itself is written
    host::system::OutputStream stream_;  // goes before what it writes is removed
};

// Writes a file at once.
void WriteWholeFile(const std::filesystem::path& path, const std::vector<unsigned char>& bytes);

}  // namespace cliphost
