// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/system/WindowsCalls.h"

#include <atomic>
#include <cstdlib>

#include "text/Encodings.h"

namespace host::system {
namespace {

std::atomic<UINT> codePageBefore = 0;  // 0: it is as it was

}  // namespace

std::string ErrorWords(DWORD error) {
    wchar_t words[1024];
    DWORD length = FormatMessageW(FORMAT_MESSAGE_FROM_SYSTEM | FORMAT_MESSAGE_IGNORE_INSERTS,
                                  nullptr, error, 0, words, 1024, nullptr);
    while (length > 0 && (words[length - 1] <= L' ' || words[length - 1] == L'.')) {
        --length;
    }
    return length == 0 ? "error " + std::to_string(error)
                       : encodings::ToUtf8Lossy(encodings::FromWide({words, length}));
}

OwnedHandle OpenThere(const std::filesystem::path& path, DWORD access) {
    // The flag opens folders, too.
    return OwnedHandle(CreateFileW(path.c_str(), access,
                                   FILE_SHARE_READ | FILE_SHARE_WRITE | FILE_SHARE_DELETE, nullptr,
                                   OPEN_EXISTING, FILE_FLAG_BACKUP_SEMANTICS, nullptr));
}

void EndCall(HANDLE file, OVERLAPPED& call) {
    CancelIoEx(file, &call);
    // The event may be other calls', too, so it doesn't tell that this one has ended.
    while (!HasOverlappedIoCompleted(&call)) {
        WaitForSingleObject(call.hEvent, 1);
    }
}

void PrintUtf8() {
    const UINT before = GetConsoleOutputCP();
    if (before != 0 && before != CP_UTF8 && SetConsoleOutputCP(CP_UTF8)) {
        codePageBefore = before;
        std::atexit(PutConsoleBack);
    }
}

void PutConsoleBack() {
    if (const UINT before = codePageBefore.exchange(0)) {
        SetConsoleOutputCP(before);
    }
}

HANDLE SignalEvent() {
    static const HANDLE event = CreateEventW(nullptr, TRUE, FALSE, nullptr);
    return event;
}

}  // namespace host::system
