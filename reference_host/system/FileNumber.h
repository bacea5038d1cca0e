// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <cstdint>
#include <filesystem>
#include <optional>
#include <utility>

namespace host::system {

// What tells a file from every other, whatever it is called: its device and its number there.
using FileNumber = std::pair<std::uint64_t, std::uint64_t>;

// None where there is no such file.
std::optional<FileNumber> NumberOf(const std::filesystem::path& file);

// Whether the path stands for a descriptor of the process that opens it, such as /dev/stdin.
bool NamesDescriptor(const std::filesystem::path& path);

}  // namespace host::system
