// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/system/Paths.h"
#include "reference_host/util/text/FileUrl.h"
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

std::string PathText(const std::filesystem::path& path) {
    return path.native();
}

std::filesystem::path PathOfText(std::string_view text) {
    return text;
}

std::string UrlOfPath(const std::filesystem::path& path) {
    return text::FileUrl(path.native());
}

bool PathTextOfUrl(std::string_view url, std::string& path) {
    return text::PathOfFileUrl(url, path);
}

std::filesystem::path PathOfPlace(const std::string& machine, const std::string& path) {
    return machine.empty() ? std::filesystem::path(path) : std::filesystem::path();
}

std::string NameProblem(const std::filesystem::path&) {
    return {};
}

bool HoldsBackslash(const std::filesystem::path& path) {
    return path.native().find('\\') != std::string::npos;
}

}  // namespace host::system
