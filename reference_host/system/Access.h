// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <cstdio>
#include <filesystem>
#include <string>

namespace host::system {

// What the system lets this process do with a file or folder. Errors are the
// system's numbers; 0: none.

enum class Right { Read, Write, Search };
int AccessError(const std::filesystem::path& path, Right right);

// Why a folder's entries can't be listed, though they can be reached; empty: they can.
std::string ListingProblem(const std::filesystem::path& folder);

// What comes of reading a file's first byte.
struct FirstByte {
    int openError = 0;
    int readError = 0;
    bool isThere = false;
};
FirstByte ReadFirstByte(const std::filesystem::path& file);

// A file to be read, by the C library; null, with its error number, where it can't be opened.
std::FILE* OpenToRead(const std::filesystem::path& file);

}  // namespace host::system
