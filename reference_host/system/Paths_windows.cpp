// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/system/Paths.h"
#include "reference_host/util/text/WindowsPath.h"
#include "text/Encodings.h"

namespace host::system {

bool ToSystemPath(std::u32string_view path, std::filesystem::path& out) {
    std::wstring units;
    if (!encodings::ToWide(path, units) || units.find(L'\0') != std::wstring::npos) {
        return false;
    }
    for (wchar_t& unit : units) {
        unit = unit == L'/' ? L'\\' : unit;
    }
    out = std::move(units);
    return true;
}

std::u32string FromSystemPath(const std::filesystem::path& path) {
    return encodings::FromWide(path.native());
}

std::string PathText(const std::filesystem::path& path) {
    return encodings::ToUtf8Lossy(FromSystemPath(path));
}

std::filesystem::path PathOfText(std::string_view text) {
    const std::u32string plain = encodings::FromUtf8(text::WithoutVerbatimStart(text));
    return encodings::ToWideLossy(plain);
}

std::string UrlOfPath(const std::filesystem::path& path) {
    return text::UrlOfWindowsPath(PathText(path));
}

bool PathTextOfUrl(std::string_view url, std::string& path) {
    return text::WindowsPathOfUrl(url, path);
}

std::filesystem::path PathOfPlace(const std::string& machine, const std::string& path) {
    std::string here;
    return text::WindowsPathOfPlace(machine, path, here) ? PathOfText(here)
                                                         : std::filesystem::path();
}

std::string NameProblem(const std::filesystem::path& path) {
    return text::WindowsPathProblem(PathText(path));
}

bool HoldsBackslash(const std::filesystem::path&) {
    return false;
}

}  // namespace host::system
