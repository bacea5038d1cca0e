// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/system/Paths.h"
#include "reference_host/system/ScratchFolder.h"

#include <fmt/format.h>

#include <random>

#include "reference_host/system/WindowsCalls.h"

namespace host::system {

std::filesystem::path TemporaryFolder() {
    const wchar_t* const named = _wgetenv(L"TMPDIR");
    if (named != nullptr && *named != L'\0') {
        return named;
    }
    return TextOf([](wchar_t* text, DWORD size) { return GetTempPathW(size, text); });
}

ScratchFolder::ScratchFolder(std::error_code& error) : ScratchFolder(TemporaryFolder(), error) {}

ScratchFolder::ScratchFolder(const std::filesystem::path& parent, std::error_code& error) {
    constexpr int kMostTries = 100;
    std::random_device random;
    for (int i = 0; i < kMostTries; ++i) {
        const std::filesystem::path path =
            AbsolutePath(parent / fmt::format("cliphost-{:08x}", random()));
        if (CreateDirectoryW(path.c_str(), nullptr)) {
            path_ = path;
            return;
        }
        const DWORD reason = GetLastError();
        if (reason != ERROR_ALREADY_EXISTS || i + 1 == kMostTries) {
            error.assign(ErrorNumber(reason), std::generic_category());
            return;
        }
    }
}

ScratchFolder::~ScratchFolder() {
    std::error_code ignored;
    if (!path_.empty()) {
        std::filesystem::remove_all(path_, ignored);
    }
}

}  // namespace host::system
