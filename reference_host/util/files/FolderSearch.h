// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <filesystem>
#include <string>
#include <string_view>

namespace host::files {

// One walk over the names of a folder that match a pattern: files and links to
// files, in the order of the file system. A folder that can't be read has none.
class FolderSearch {
public:
    FolderSearch(const std::filesystem::path& folder, std::u32string_view pattern);

    // False at the end.
    bool Next(std::u32string& name);

private:
    std::filesystem::directory_iterator entry_;
    std::u32string pattern_;
};

}  // namespace host::files
