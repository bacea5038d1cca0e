// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include <windows.h>

#include "aaf_library/exports/LibraryPath.h"

namespace aaf {

std::wstring LibraryPath() {
    static const char anchor = 0;
    HMODULE module = nullptr;
    if (GetModuleHandleExW(
            GET_MODULE_HANDLE_EX_FLAG_FROM_ADDRESS | GET_MODULE_HANDLE_EX_FLAG_UNCHANGED_REFCOUNT,
            reinterpret_cast<LPCWSTR>(&anchor), &module) == 0) {
        return {};
    }
    std::wstring path(32768, L'\0');
    const DWORD length = GetModuleFileNameW(module, path.data(), static_cast<DWORD>(path.size()));
    path.resize(length < path.size() ? length : 0);
    return path;
}

}  // namespace aaf
