// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <cstdint>
#include <filesystem>
#include <string>

namespace fuzz {

// A file for the inputs of code that opens files by name: one for the process,
// deleted at its end.
class InputFile {
public:
    explicit InputFile(const std::string& extension);
    ~InputFile();
    InputFile(const InputFile&) = delete;
    InputFile& operator=(const InputFile&) = delete;

    const std::filesystem::path& Hold(const std::uint8_t* data, std::size_t size) const;

private:
    std::filesystem::path path_;
};

}  // namespace fuzz
