// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/system/ScratchFolder.h"

#include <cerrno>
#include <cstdlib>

namespace host::system {

std::filesystem::path TemporaryFolder() {
    const char* const named = std::getenv("TMPDIR");
    return named != nullptr && *named != '\0' ? named : "/tmp";
}

ScratchFolder::ScratchFolder(std::error_code& error) : ScratchFolder(TemporaryFolder(), error) {}

ScratchFolder::ScratchFolder(const std::filesystem::path& parent, std::error_code& error) {
    std::string name = parent / "cliphost-XXXXXX";
    if (mkdtemp(name.data()) == nullptr) {
        error.assign(errno, std::generic_category());
        return;
    }
    path_ = name;
}

ScratchFolder::~ScratchFolder() {
    std::error_code ignored;
    if (!path_.empty()) {
        std::filesystem::remove_all(path_, ignored);
    }
}

}  // namespace host::system
