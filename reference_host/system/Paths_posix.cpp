// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/system/Paths.h"
#include "text/Encodings.h"

namespace host::system {

bool ToSystemPath(std::u32string_view path, std::filesystem::path& out) {
    std::string bytes;
    if (!encodings::ToUtf8(path, bytes) || bytes.find('\0') != std::string::npos) {
        return false;
    }
    for (char& byte : bytes) {
        byte = byte == '\\' ? '/' : byte;
    }
    out = std::move(bytes);
    return true;
}

std::u32string FromSystemPath(const std::filesystem::path& path) {
    return encodings::FromUtf8(path.native());
}

bool HoldsBackslash(const std::filesystem::path& path) {
    return path.native().find('\\') != std::string::npos;
}

}  // namespace host::system
