// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <filesystem>
#include <system_error>

namespace host::system {

// Where temporary files go. There may be no such folder.
std::filesystem::path TemporaryFolder();

// A folder of our own among the temporary files or in another folder, gone with what is
// in it.
class ScratchFolder {
public:
    explicit ScratchFolder(std::error_code& error);
    ScratchFolder(const std::filesystem::path& parent, std::error_code& error);
    ~ScratchFolder();
    ScratchFolder(const ScratchFolder&) = delete;
    ScratchFolder& operator=(const ScratchFolder&) = delete;

    const std::filesystem::path& path() const { return path_; }

private:
    std::filesystem::path path_;  // empty where none could be made
};

}  // namespace host::system
