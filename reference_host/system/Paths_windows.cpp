// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/system/Paths.h"

#include <algorithm>

#include "reference_host/system/WindowsCalls.h"
#include "reference_host/util/text/WindowsPath.h"
#include "text/Encodings.h"

namespace host::system {
namespace {

// The form of an absolute path that has no limit of length.
std::wstring Unlimited(const std::wstring& path) {
    const bool isOfServer = path.compare(0, 2, L"\\\\") == 0;
    return isOfServer ? L"\\\\?\\UNC" + path.substr(1) : L"\\\\?\\" + path;
}

DWORD WhyNotThere(const std::wstring& path) {
    return GetFileAttributesW(path.c_str()) == INVALID_FILE_ATTRIBUTES ? GetLastError()
                                                                       : ERROR_SUCCESS;
}

}  // namespace

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

// Most disks have a second, short name for each file, out of ASCII.
std::string NameForLibraries(const std::filesystem::path& path) {
    const auto isPlain = [](const std::wstring& name) {
        return std::all_of(name.begin(), name.end(), [](wchar_t c) { return c < 0x80; });
    };
    if (isPlain(path.native())) {
        return PathText(path);
    }
    const std::wstring brief = TextOf(
        [&](wchar_t* text, DWORD size) { return GetShortPathNameW(path.c_str(), text, size); });
    return PathText(brief.empty() || !isPlain(brief) ? path : std::filesystem::path(brief));
}

// The standard library's own takes a share for a folder of the drive. Here ".." goes back by
// name, whatever lies there.
std::filesystem::path AbsolutePath(const std::filesystem::path& path) {
    if (path.empty()) {
        return path;
    }
    const std::wstring whole = TextOf([&](wchar_t* text, DWORD size) {
        return GetFullPathNameW(path.c_str(), size, text, nullptr);
    });
    return whole.empty() ? path : std::filesystem::path(whole);
}

std::filesystem::path WholePath(const std::filesystem::path& path) {
    return AbsolutePath(path);
}

std::string UrlOfPath(const std::filesystem::path& path) {
    return text::UrlOfWindowsPath(PathText(path));
}

bool PathTextOfUrl(std::string_view url, std::string& path) {
    return text::WindowsPathOfUrl(url, path);
}

std::filesystem::path PathOfPlace(const std::string& machine, const std::string& path) {
    std::string here;
    return text::WindowsPathOfPlace(machine, path, here) ? AbsolutePath(PathOfText(here))
                                                         : std::filesystem::path();
}

std::string NameProblem(const std::filesystem::path& path) {
    return text::WindowsPathProblem(PathText(path));
}

std::string LengthProblem(const std::filesystem::path& path) {
    constexpr std::size_t kLongest = MAX_PATH - 1;
    const std::wstring whole = AbsolutePath(path).native();
    // A system that takes long paths says the same of both forms.
    if (whole.size() <= kLongest || WhyNotThere(whole) == WhyNotThere(Unlimited(whole))) {
        return {};
    }
    return "its path has " + std::to_string(whole.size()) +
           " characters, and this system is set up for " + std::to_string(kLongest);
}

bool HoldsBackslash(const std::filesystem::path&) {
    return false;
}

}  // namespace host::system
