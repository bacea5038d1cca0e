// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/util/files/FolderSearch.h"

#include <system_error>

#include "reference_host/system/Paths.h"
#include "reference_host/util/files/NamePattern.h"

namespace host::files {

FolderSearch::FolderSearch(const std::filesystem::path& folder, std::u32string_view pattern)
    : pattern_(pattern) {
    std::error_code failure;
    entry_ = std::filesystem::directory_iterator(folder, failure);
    if (failure) {
        entry_ = {};
    }
}

bool FolderSearch::Next(std::u32string& name) {
    const std::filesystem::directory_iterator end;
    while (entry_ != end) {
        std::error_code failure;
        // Pipes and devices are left out as folders are: opening one could wait
        // for ever.
        const bool isFile = entry_->is_regular_file(failure) && !failure;
        std::u32string candidate = host::system::FromSystemPath(entry_->path().filename());
        entry_.increment(failure);
        if (failure) {
            entry_ = {};
        }
        if (isFile && MatchesPattern(candidate, pattern_)) {
            name = std::move(candidate);
            return true;
        }
    }
    return false;
}

}  // namespace host::files
