// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/util/text/Encodings.h"
#include "reference_host/util/text/Paths.h"

namespace host::text {

bool IsSeparator(char32_t c) {
    return c == U'/' || c == U'\\';
}

bool ToSystemPath(std::u32string_view text, std::filesystem::path& out) {
    std::wstring units;
    if (!ToWide(text, units) || units.find(L'\0') != std::wstring::npos) {
        return false;
    }
    for (wchar_t& unit : units) {
        unit = unit == L'/' ? L'\\' : unit;
    }
    out = std::move(units);
    return true;
}

std::u32string FromSystemPath(const std::filesystem::path& path) {
    return FromWide(path.native());
}

std::u32string ToModulePath(const std::filesystem::path& path) {
    std::u32string text = FromSystemPath(path);
    for (char32_t& c : text) {
        c = c == U'/' ? U'\\' : c;
    }
    return text;
}

bool HoldsBackslash(const std::filesystem::path&) {
    return false;
}

}  // namespace host::text
