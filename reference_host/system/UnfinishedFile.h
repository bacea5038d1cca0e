// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <filesystem>
#include <system_error>

namespace host::system {

// The temporary name in the same folder under which a file is written. A link stays
// a link: the file that it points to is replaced.
// A file that was not finished is removed: when the object ends, and when a signal
// ends the program, such as an interrupt from the keyboard; then also the one that a
// library writes first, which has kWriterEnding behind this name.
class UnfinishedFile {
public:
    static constexpr char kWriterEnding[] = ".part";

    explicit UnfinishedFile(const std::filesystem::path& place);
    ~UnfinishedFile();
    UnfinishedFile(const UnfinishedFile&) = delete;
    UnfinishedFile& operator=(const UnfinishedFile&) = delete;

    const std::filesystem::path& path() const { return path_; }
    // Where it is to lie, behind links.
    const std::filesystem::path& place() const { return place_; }
    // Puts the whole file into its place; what was there before is gone.
    void TakePlace(std::error_code& error);
    // The same where nothing is; what is there stays. Of two who try, one succeeds.
    void TakePlaceIfFree(std::error_code& error);

private:
    std::filesystem::path place_;
    std::filesystem::path path_;
    int slot_ = -1;  // where the signal handler finds the name
};

// For a signal handler: removes such files and ends the program by the signal.
extern "C" void EndBySignal(int signal);

}  // namespace host::system
