// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "fuzz/support/InputFile.h"

#include <unistd.h>

#include <fstream>

namespace fuzz {
namespace {

// Where files cost no disk.
std::filesystem::path Folder() {
    const std::filesystem::path memory = "/dev/shm";
    return std::filesystem::is_directory(memory) ? memory : std::filesystem::temp_directory_path();
}

}  // namespace

InputFile::InputFile(const std::string& extension)
    : path_(Folder() / ("cliphost_fuzz_" + std::to_string(getpid()) + extension)) {}

InputFile::~InputFile() {
    std::error_code ignored;
    std::filesystem::remove(path_, ignored);
}

const std::filesystem::path& InputFile::Hold(const std::uint8_t* data, std::size_t size) const {
    std::ofstream(path_, std::ios::binary | std::ios::trunc)
        .write(reinterpret_cast<const char*>(data), static_cast<std::streamsize>(size));
    return path_;
}

}  // namespace fuzz
