// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <filesystem>
#include <system_error>

namespace host::system {

// The name beside a file's place under which it is written until it is whole. A
// link stays; what it leads to is the place.
// What has not taken its place is removed: when the object ends, and when the
// program is ended by a signal, such as an interrupt at the keyboard.
class UnfinishedFile {
public:
    explicit UnfinishedFile(const std::filesystem::path& place);
    ~UnfinishedFile();
    UnfinishedFile(const UnfinishedFile&) = delete;
    UnfinishedFile& operator=(const UnfinishedFile&) = delete;

    const std::filesystem::path& path() const { return path_; }
    // Puts the whole file into its place; what was there before is gone.
    void TakePlace(std::error_code& error);

private:
    std::filesystem::path place_;
    std::filesystem::path path_;
    int slot_ = -1;  // where the signal handler finds the name
};

}  // namespace host::system
