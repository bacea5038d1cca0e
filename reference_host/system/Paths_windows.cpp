// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/system/Paths.h"
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

bool HoldsBackslash(const std::filesystem::path&) {
    return false;
}

}  // namespace host::system
