// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/util/files/NamePattern.h"

#include "reference_host/system/FileSystem.h"

namespace host::files {

// Goes through both texts once; after a mismatch it lets the last star take
// one character more, so the work is bounded by the product of the lengths.
bool MatchesPattern(std::u32string_view name, std::u32string_view pattern) {
    std::size_t n = 0;
    std::size_t p = 0;
    std::size_t star = std::u32string_view::npos;
    std::size_t takenByStar = 0;
    while (n < name.size()) {
        if (p < pattern.size() && pattern[p] == U'*') {
            star = p++;
            takenByStar = n;
        } else if (p < pattern.size() &&
                   (pattern[p] == U'?' || host::system::NameCharacter(pattern[p]) ==
                                              host::system::NameCharacter(name[n]))) {
            ++n;
            ++p;
        } else if (star != std::u32string_view::npos) {
            p = star + 1;
            n = ++takenByStar;
        } else {
            return false;
        }
    }
    while (p < pattern.size() && pattern[p] == U'*') {
        ++p;
    }
    return p == pattern.size();
}

}  // namespace host::files
