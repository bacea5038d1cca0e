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

std::string NameForLibraries(const std::filesystem::path& path) {
    return PathText(path);
}

std::filesystem::path WholePath(const std::filesystem::path& path) {
    std::error_code error;
    const std::filesystem::path whole = std::filesystem::absolute(path, error);
    return error ? path : whole;
}

std::filesystem::path AbsolutePath(const std::filesystem::path& path) {
    std::error_code error;
    std::filesystem::path way;
    for (const std::filesystem::path& name : WholePath(path)) {
        if (name == ".." && std::filesystem::is_symlink(way, error)) {
            const std::filesystem::path target = std::filesystem::canonical(way, error);
            way = error ? way / name : target.parent_path();
        } else if (name == ".." && way.filename() != "..") {
            way = way.parent_path();
        } else if (name != ".") {
            way /= name;
        }
    }
    return way;
}

std::string UrlOfPath(const std::filesystem::path& path) {
    return text::FileUrl(path.native());
}

bool PathTextOfUrl(std::string_view url, std::string& path) {
    return text::PathOfFileUrl(url, path);
}

std::filesystem::path PathOfPlace(const std::string& machine, const std::string& path) {
    return machine.empty() ? std::filesystem::path(path).lexically_normal()
                           : std::filesystem::path();
}

std::string NameProblem(const std::filesystem::path&) {
    return {};
}

std::string LengthProblem(const std::filesystem::path&) {
    return {};  // the system says so itself
}

bool HoldsBackslash(const std::filesystem::path& path) {
    return path.native().find('\\') != std::string::npos;
}

}  // namespace host::system
