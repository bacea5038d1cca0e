// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/stored/WritePieces.h"

#include <windows.h>

#include <algorithm>
#include <cerrno>
#include <system_error>

namespace aaf::stored {
namespace {

constexpr std::size_t kMostAtOnce = std::size_t{1} << 24;

bool WriteAll(HANDLE file, const Piece& piece) {
    for (std::size_t at = 0; at < piece.size;) {
        DWORD done = 0;
        const auto size = static_cast<DWORD>(std::min(piece.size - at, kMostAtOnce));
        if (!WriteFile(file, piece.data + at, size, &done, nullptr) || done == 0) {
            return false;
        }
        at += done;
    }
    return true;
}

bool Failed() {
    const std::error_condition plain =
        std::system_category().default_error_condition(static_cast<int>(GetLastError()));
    errno = plain.category() == std::generic_category() ? plain.value() : EIO;
    return false;
}

}  // namespace

bool WritePieces(const std::filesystem::path& file, const std::vector<Piece>& pieces) {
    const HANDLE out = CreateFileW(file.c_str(), GENERIC_WRITE, FILE_SHARE_READ | FILE_SHARE_DELETE,
                                   nullptr, CREATE_ALWAYS, FILE_ATTRIBUTE_NORMAL, nullptr);
    if (out == INVALID_HANDLE_VALUE) {
        return Failed();
    }
    const bool isWritten = std::all_of(pieces.begin(), pieces.end(),
                                       [&](const Piece& piece) { return WriteAll(out, piece); });
    const bool isFine = isWritten || Failed();
    return CloseHandle(out) ? isFine : Failed();
}

}  // namespace aaf::stored
