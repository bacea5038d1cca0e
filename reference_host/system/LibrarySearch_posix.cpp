// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/system/LibrarySearch.h"

#include <unistd.h>

#include <cstdlib>
#include <fstream>
#include <iterator>
#include <string>
#include <system_error>
#include <vector>

#include "reference_host/system/Process.h"
#include "reference_host/system/ScratchFolder.h"
#include "reference_host/system/SharedLibrary.h"

namespace host::system {
namespace {

// The system reads it once, when a program starts.
constexpr char kSearchPath[] = "LD_LIBRARY_PATH";
// The folder that the program put in front of it before it started anew.
constexpr char kAddedFolder[] = "CLIPHOST_LIBRARY_FOLDER";

std::string Environment(const char* name) {
    const char* const value = std::getenv(name);
    return value == nullptr ? "" : value;
}

// The environment as it was before, for the processes that this one starts.
void TakeBack(const std::string& folder, const std::filesystem::path& file, const char* name) {
    unsetenv(kAddedFolder);
    const std::string path = Environment(kSearchPath);
    if (path == folder) {
        unsetenv(kSearchPath);
    } else if (path.compare(0, folder.size() + 1, folder + ':') == 0) {
        setenv(kSearchPath, path.c_str() + folder.size() + 1, 1);
    }
    std::error_code error;
    const std::filesystem::path link = std::filesystem::path(folder) / name;
    if (std::filesystem::read_symlink(link, error) == file) {
        std::filesystem::remove(link, error);
        std::filesystem::remove(folder, error);
    }
}

std::vector<std::string> Arguments() {
    std::ifstream in("/proc/self/cmdline", std::ios::binary);
    const std::string all{std::istreambuf_iterator<char>(in), {}};
    std::vector<std::string> arguments;
    for (std::size_t at = 0; at < all.size();) {
        arguments.emplace_back(all.c_str() + at);
        at += arguments.back().size() + 1;
    }
    return arguments;
}

// Returns only where the program can't be started anew.
void StartAnew(const std::string& folder) {
    std::vector<std::string> arguments = Arguments();
    std::vector<char*> line;
    for (std::string& argument : arguments) {
        line.push_back(&argument[0]);
    }
    line.push_back(nullptr);
    const std::string before = Environment(kSearchPath);
    setenv(kSearchPath, (before.empty() ? folder : folder + ':' + before).c_str(), 1);
    setenv(kAddedFolder, folder.c_str(), 1);
    execv(ProgramFile("").c_str(), line.data());
}

}  // namespace

void MakeFoundAs(const std::filesystem::path& file, const char* name) {
    std::error_code error;
    const std::filesystem::path whole = std::filesystem::absolute(file, error);
    const std::string added = Environment(kAddedFolder);
    SharedLibrary library;
    std::string ignored;
    const bool isOpen = library.Open(whole, ignored);
    const bool isFound = isOpen && library.IsFoundAs(name);
    if (!added.empty()) {
        TakeBack(added, whole, name);
    }
    if (isFound) {
        // While it stays, the system knows the name.
        library.Abandon();
        return;
    }
    if (!isOpen || !added.empty()) {
        return;
    }
    const ScratchFolder scratch(error);
    if (!error) {
        std::filesystem::create_symlink(whole, scratch.path() / name, error);
    }
    if (!error) {
        StartAnew(scratch.path().native());
        TakeBack(scratch.path().native(), whole, name);
    }
}

}  // namespace host::system
