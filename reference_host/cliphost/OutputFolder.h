// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <filesystem>
#include <vector>

namespace cliphost {

// A folder for outputs. It is made with its parents; folders that were made and are
// still empty at the end are removed, so that a failed call leaves nothing.
class OutputFolder {
public:
    explicit OutputFolder(const std::filesystem::path& folder);  // throws a Failure
    ~OutputFolder();
    OutputFolder(const OutputFolder&) = delete;
    OutputFolder& operator=(const OutputFolder&) = delete;

private:
    std::vector<std::filesystem::path> made_;  // from the innermost outwards
};

}  // namespace cliphost
