// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/util/text/Encodings.h"
#include "reference_host/util/text/Paths.h"

namespace host::text {

bool IsSeparator(char32_t c) {
    return c == U'/' || c == U'\\';
}

bool ToSystemPath(std::u32string_view text, std::filesystem::path& out) {
    std::string bytes;
    if (!ToUtf8(text, bytes) || bytes.find('\0') != std::string::npos) {
        return false;
    }
    for (char& byte : bytes) {
        byte = byte == '\\' ? '/' : byte;
    }
    out = std::move(bytes);
    return true;
}

std::u32string FromSystemPath(const std::filesystem::path& path) {
    return FromUtf8(path.native());
}

std::u32string ToModulePath(const std::filesystem::path& path) {
    std::u32string text = FromSystemPath(path);
    for (char32_t& c : text) {
        c = c == U'/' ? U'\\' : c;
    }
    return text;
}

bool HoldsBackslash(const std::filesystem::path& path) {
    return path.native().find('\\') != std::string::npos;
}

}  // namespace host::text
