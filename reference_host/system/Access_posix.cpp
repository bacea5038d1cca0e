// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include <fcntl.h>
#include <unistd.h>

#include <cerrno>

#include "reference_host/system/Access.h"

namespace host::system {

int AccessError(const std::filesystem::path& path, Right right) {
    const int mode = right == Right::Read ? R_OK : right == Right::Write ? W_OK : X_OK;
    return access(path.c_str(), mode) == 0 ? 0 : errno;
}

std::string ListingProblem(const std::filesystem::path&) {
    return {};
}

FirstByte ReadFirstByte(const std::filesystem::path& file) {
    FirstByte first;
    const int descriptor = open(file.c_str(), O_RDONLY | O_CLOEXEC);
    if (descriptor < 0) {
        first.openError = errno;
        return first;
    }
    char byte = 0;
    const ssize_t got = read(descriptor, &byte, 1);
    first.readError = got < 0 ? errno : 0;
    first.isThere = got > 0;
    close(descriptor);
    return first;
}

std::FILE* OpenToRead(const std::filesystem::path& file) {
    return std::fopen(file.c_str(), "rb");
}

}  // namespace host::system
