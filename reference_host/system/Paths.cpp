// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/system/Paths.h"

#include <algorithm>

namespace host::system {

bool IsSeparator(char32_t c) {
    return c == U'/' || c == U'\\';
}

std::string GenericPathText(const std::filesystem::path& path) {
    std::string text = PathText(path);
    constexpr auto kSeparator = static_cast<char>(std::filesystem::path::preferred_separator);
    std::replace(text.begin(), text.end(), kSeparator, '/');
    return text;
}

std::u32string ToModulePath(const std::filesystem::path& path) {
    std::u32string text = FromSystemPath(path);
    for (char32_t& c : text) {
        c = c == U'/' ? U'\\' : c;
    }
    return text;
}

}  // namespace host::system
