// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <filesystem>
#include <string>
#include <string_view>
#include <vector>

namespace cliphost {

struct FileSetting {
    std::string section;  // empty: before the first
    std::string name;     // empty: the section begins
    std::vector<std::string> values;
    int line = 0;
};

// What a text in TOML says, in the order of its lines: sections, and in them settings of one value
// or a list. Throws a Failure that names file and line.
std::vector<FileSetting> SettingsIn(const std::filesystem::path& file, std::string_view text);

}  // namespace cliphost
