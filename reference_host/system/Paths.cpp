// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/system/Paths.h"

namespace host::system {

bool IsSeparator(char32_t c) {
    return c == U'/' || c == U'\\';
}

std::u32string ToModulePath(const std::filesystem::path& path) {
    std::u32string text = FromSystemPath(path);
    for (char32_t& c : text) {
        c = c == U'/' ? U'\\' : c;
    }
    return text;
}

}  // namespace host::system
