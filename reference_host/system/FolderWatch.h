// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <chrono>
#include <filesystem>
#include <memory>
#include <vector>

namespace host::system {

// What happened in a watched folder.
struct FolderChange {
    enum class What {
        File,    // one was made, written to its end, moved in or out, or removed
        Folder,  // one was made or moved in
        Gone,    // the watched folder itself
        Missed,  // more than the system keeps: anything, anywhere
    };
    What what;
    std::filesystem::path path;
};

// Lets the system tell of changes in folders, each without those within it. Network file systems
// tell of what this machine does alone.
class FolderWatch {
public:
    FolderWatch();
    ~FolderWatch();
    FolderWatch(const FolderWatch&) = delete;
    FolderWatch& operator=(const FolderWatch&) = delete;

    // 0, or the system's error. A folder that is watched already is known by the path given last.
    int Add(const std::filesystem::path& folder);
    // Waits for changes, the end of the time, or a signal. Without folders, for the last two.
    std::vector<FolderChange> Wait(std::chrono::milliseconds time);

private:
    struct Watched;  // the folders, as the system knows them

    std::unique_ptr<Watched> watched_;
};

}  // namespace host::system
