// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <filesystem>
#include <functional>
#include <string>
#include <vector>

#include "reference_host/cliphost/Problem.h"

namespace cliphost {

// A folder and all folders within it, hidden ones and those behind links too, each once and by
// the order of names. One that can't be listed is among them; what is within it is not.
std::vector<std::filesystem::path> FoldersIn(const std::filesystem::path& folder);

// Endings of names, such as "mp4", from a list with commas between them; case and a point before
// them do not count. Throws a Failure that says what is wrong.
std::vector<std::string> EndingsIn(const std::string& list);

// Whether a name ends by one of them, in any case.
bool EndsSo(const std::string& name, const std::vector<std::string>& endings);

// Calls for each file of a folder whose name ends so, in no order. Gives what is no file, such as
// links that end nowhere and pipes, in the order of names. Throws a Failure for a folder that
// can't be read.
std::vector<Problem> ForEachByEnding(const std::filesystem::path& folder,
                                     const std::vector<std::string>& endings,
                                     const std::function<void(const std::filesystem::path&)>& take);

// Files of a folder by the endings of their names, in the order of names.
struct EndingMatches {
    std::vector<std::filesystem::path> files;
    std::vector<Problem> noFiles;
};
EndingMatches FilesByEnding(const std::filesystem::path& folder,
                            const std::vector<std::string>& endings);

}  // namespace cliphost
