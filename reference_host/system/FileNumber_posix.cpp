// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/system/FileNumber.h"

#include <sys/stat.h>

#include <algorithm>
#include <iterator>
#include <string>

namespace host::system {

std::optional<FileNumber> NumberOf(const std::filesystem::path& file) {
    struct stat found {};
    if (stat(file.c_str(), &found) != 0) {
        return std::nullopt;
    }
    return FileNumber(found.st_dev, found.st_ino);
}

bool NamesDescriptor(const std::filesystem::path& path) {
    const std::string name = path.lexically_normal();
    const std::string folders[] = {"/dev/fd/", "/dev/std", "/proc/self/"};
    return std::any_of(std::begin(folders), std::end(folders),
                       [&](const std::string& folder) { return name.rfind(folder, 0) == 0; });
}

}  // namespace host::system
