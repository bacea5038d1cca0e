// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <filesystem>
#include <string_view>
#include <vector>

namespace cliphost {

// How the paths of a list are parted.
enum class ListForm {
    Lines,  // ended by LF or CR LF; an empty line is no path, nor is a byte order mark
    Nulls   // ended by a byte of zero; all other bytes belong to the names
};

// The paths of a list, which may be file URLs. Throws a Failure for one that can't be read, or
// that has another form than the caller says; "-" is standard input.
std::vector<std::filesystem::path::string_type> ReadInputList(const std::filesystem::path& list,
                                                              ListForm form);

}  // namespace cliphost
