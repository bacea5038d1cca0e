// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <windows.h>

#include <filesystem>
#include <string>
#include <utility>

#include "reference_host/system/ErrorNumber.h"

// What the Windows halves share.
namespace host::system {

// Closes a handle of the system.
class OwnedHandle {
public:
    explicit OwnedHandle(HANDLE handle = nullptr) : handle_(handle) {}
    ~OwnedHandle() { Close(); }
    OwnedHandle(OwnedHandle&& other) noexcept : handle_(std::exchange(other.handle_, nullptr)) {}
    OwnedHandle& operator=(OwnedHandle&& other) noexcept {
        std::swap(handle_, other.handle_);
        return *this;
    }

    bool IsOpen() const { return handle_ != nullptr && handle_ != INVALID_HANDLE_VALUE; }
    HANDLE get() const { return handle_; }
    HANDLE Release() { return std::exchange(handle_, nullptr); }
    void Close() {
        if (IsOpen()) {
            CloseHandle(handle_);
        }
        handle_ = nullptr;
    }

private:
    HANDLE handle_;
};

inline int LastErrorNumber() {
    return ErrorNumber(GetLastError());
}

// What the system says of an error, in UTF-8.
std::string ErrorWords(DWORD error);

// A file or folder that is there, opened beside others who read, write or remove it.
OwnedHandle OpenThere(const std::filesystem::path& path, DWORD access);

// Ends a call that goes on by itself, if it still does: its memory is the caller's again. The call
// has an event.
void EndCall(HANDLE file, OVERLAPPED& call);

// Lets Ctrl+C and the like end the program as a signal does, unless somebody takes them who asks
// for them later. To be called by the program, not by a library that has a copy of all this.
void EndByEvents();

// Has the console take UTF-8. It is the caller's, who may go on with another program, so it is put
// back at the end.
void PrintUtf8();
void PutConsoleBack();

// Set from when a signal has come until it is waited for anew.
HANDLE SignalEvent();

// Calls that fill a buffer with a text and want a larger one where it does not fit: `fill` is given
// buffer and size, and gives the length.
template <class Fill>
std::wstring TextOf(const Fill& fill) {
    std::wstring text(MAX_PATH, L'\0');
    for (;;) {
        const DWORD length = fill(text.data(), static_cast<DWORD>(text.size()));
        if (length < text.size()) {
            text.resize(length);
            return text;
        }
        text.resize(text.size() * 2);
    }
}

}  // namespace host::system
