// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <cstdint>
#include <filesystem>
#include <string>

// What the utility library asks of the file system: one body for each. A
// third one has to say how names compare, what a volume is called, and when
// a file was written last; a question that the system can't answer gives 0 or
// an empty text, never a failure.
namespace host::system {

struct VolumeFacts {
    std::uint32_t serialNumber = 0;
    std::u32string label;
    std::uint32_t type = 0;  // 0 unknown, 2 removable, 3 fixed, 4 network
};

// Of the volume on which `folder` lies.
VolumeFacts ReadVolumeFacts(const std::filesystem::path& folder);

// Last write, seconds from 1970-01-01 UTC; 0 when it can't be read.
std::uint64_t LastWrite(const std::filesystem::path& file);

// The character by which names are told apart: itself, or its capital where
// names that differ in case only are one name.
char32_t NameCharacter(char32_t c);
// A path in these characters: of two that are equal, each names the other's file.
std::filesystem::path NameKey(const std::filesystem::path& path);

}  // namespace host::system
