// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <filesystem>
#include <set>
#include <string>
#include <vector>

namespace cliphost {

// The ending of a path in small letters, as files are searched by it.
std::string SoughtEnding(const std::filesystem::path& path);

// All files in folders and the folders in them that have one of the endings, each once, in the
// order of the folders and in that of the names. Links to folders are not followed. What can't be
// looked into is told, and the rest is searched. Throws a Failure for a given folder that can't be
// read.
std::vector<std::filesystem::path> FilesIn(const std::vector<std::filesystem::path>& folders,
                                           const std::set<std::string>& endings);

}  // namespace cliphost
