// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <filesystem>
#include <string>
#include <vector>

namespace host::system {

// A shared library mapped into the process: one body for each system.
class SharedLibrary {
public:
    SharedLibrary() = default;
    ~SharedLibrary();
    SharedLibrary(const SharedLibrary&) = delete;
    SharedLibrary& operator=(const SharedLibrary&) = delete;

    // False with the system's own words in `reason`.
    bool Open(const std::filesystem::path& file, std::string& reason);
    void Close();
    // Leaves the library mapped to the end of the process.
    void Abandon() { handle_ = nullptr; }

    // Null when the library exports no such function.
    void* Find(const char* name) const;
    // What it gives to others by name: functions and data, in no order.
    std::vector<std::string> Exports() const;
    // Whether this library is what the process gets from now on when it asks the
    // system for `name` without a folder.
    bool IsFoundAs(const char* name) const;

private:
    void* handle_ = nullptr;
};

// The shared library or program that holds this code; empty when the system can't tell.
std::filesystem::path FileOfCode(const void* code);

}  // namespace host::system
