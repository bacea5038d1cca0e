// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/system/Access.h"
#include "reference_host/system/Paths.h"
#include "reference_host/system/WindowsCalls.h"

namespace host::system {

// Only an attempt tells: rights come from lists, shares and attributes.
int AccessError(const std::filesystem::path& path, Right right) {
    const DWORD access = right == Right::Read    ? GENERIC_READ
                         : right == Right::Write ? GENERIC_WRITE
                                                 : FILE_TRAVERSE;
    return OpenThere(path, access).IsOpen() ? 0 : LastErrorNumber();
}

// The C++ library lists folders through a C library of the compiler, which has room for no more.
std::string ListingProblem(const std::filesystem::path& folder) {
    constexpr std::size_t kLongest = MAX_PATH - 1;
    const std::size_t size = AbsolutePath(folder).native().size();
    return size <= kLongest ? std::string()
                            : "its path has " + std::to_string(size) + " characters, of which " +
                                  std::to_string(kLongest) + " are the most for that";
}

FirstByte ReadFirstByte(const std::filesystem::path& file) {
    FirstByte first;
    const OwnedHandle opened = OpenThere(file, GENERIC_READ);
    if (!opened.IsOpen()) {
        first.openError = LastErrorNumber();
        return first;
    }
    char byte = 0;
    DWORD got = 0;
    first.readError = ReadFile(opened.get(), &byte, 1, &got, nullptr) ? 0 : LastErrorNumber();
    first.isThere = got > 0;
    return first;
}

std::FILE* OpenToRead(const std::filesystem::path& file) {
    return _wfopen(file.c_str(), L"rb");
}

}  // namespace host::system
