// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <filesystem>
#include <string>

// A path, or any text, as one word of a shell's command.
inline std::string Quoted(const std::filesystem::path& text) {
    std::string quoted = "'";
    for (const char c : text.u8string()) {
        quoted += c == '\'' ? std::string("'\\''") : std::string(1, c);
    }
    return quoted + "'";
}
