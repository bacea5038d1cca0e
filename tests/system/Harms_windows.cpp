// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "tests/system/Harms.h"

#include <windows.h>

#include <iterator>

namespace {

HMODULE RealModule() {
    static const HMODULE module = [] {
        HMODULE own = nullptr;
        wchar_t file[MAX_PATH] = {};
        GetModuleHandleExW(
            GET_MODULE_HANDLE_EX_FLAG_FROM_ADDRESS | GET_MODULE_HANDLE_EX_FLAG_UNCHANGED_REFCOUNT,
            reinterpret_cast<const wchar_t*>(&RealFunction), &own);
        GetModuleFileNameW(own, file, static_cast<DWORD>(std::size(file)));
        const auto folder = std::filesystem::path(file).parent_path();
        return LoadLibraryW((folder / CLIPHOST_REAL_MODULE).make_preferred().c_str());
    }();
    return module;
}

}  // namespace

void* RealFunction(const char* name) {
    return reinterpret_cast<void*>(GetProcAddress(RealModule(), name));
}

std::filesystem::path OwnFolder() {
    return {};  // nothing that is done here needs it
}

void DoHarm(const std::string& harm, const std::filesystem::path&) {
    if (harm == "crash") {
        *static_cast<volatile int*>(nullptr) = 1;
    } else if (harm == "leave") {
        ExitProcess(4);  // 3 is what abort() leaves
    } else if (harm == "hang") {
        Sleep(INFINITE);
    }
}
