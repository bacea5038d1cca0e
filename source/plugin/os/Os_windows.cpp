// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// The operating system, by its calls on 64-bit Windows.

#include "source/plugin/os/Os.h"

#include <windows.h>

#include <malloc.h>

namespace os {
namespace {

HANDLE AsHandle(FileHandle file) {
    return reinterpret_cast<HANDLE>(file);
}

LPCWSTR Wide(const std::u16string& text) {
    return reinterpret_cast<LPCWSTR>(text.c_str());
}

}  // namespace

ncfUInt32 LastError() {
    return ::GetLastError();
}

FileHandle OpenForReading(const std::u16string& path) {
    const HANDLE file = ::CreateFileW(Wide(path), GENERIC_READ, FILE_SHARE_READ, nullptr,
                                      OPEN_EXISTING, FILE_FLAG_NO_BUFFERING, nullptr);
    if (file == INVALID_HANDLE_VALUE) {
        return kNoFile;
    }
    // "CON" and pipes are opened as files are; reading them would wait for somebody.
    if (::GetFileType(file) != FILE_TYPE_DISK) {
        ::CloseHandle(file);
        ::SetLastError(ERROR_INVALID_PARAMETER);
        return kNoFile;
    }
    return reinterpret_cast<FileHandle>(file);
}

bool Close(FileHandle file) {
    return ::CloseHandle(AsHandle(file)) != 0;
}

bool GetFileSize(FileHandle file, ncfUInt64* size) {
    BY_HANDLE_FILE_INFORMATION information{};
    if (!::GetFileInformationByHandle(AsHandle(file), &information)) {
        return false;
    }
    *size = static_cast<ncfUInt64>(information.nFileSizeHigh) << 32 | information.nFileSizeLow;
    return true;
}

bool GetSectorSize(FileHandle, const std::u16string& volumeRoot, ncfUInt32* bytes) {
    DWORD size = 0;
    if (volumeRoot.empty() ||
        !::GetDiskFreeSpaceW(Wide(volumeRoot), nullptr, &size, nullptr, nullptr) || size == 0) {
        return false;
    }
    *bytes = size;
    return true;
}

bool SetPosition(FileHandle file, ncfUInt64 position) {
    LARGE_INTEGER target{};
    target.QuadPart = static_cast<LONGLONG>(position);
    return ::SetFilePointerEx(AsHandle(file), target, nullptr, FILE_BEGIN) != 0;
}

bool Read(FileHandle file, void* buffer, ncfUInt32 size, ncfUInt32* bytesRead) {
    DWORD done = 0;
    if (!::ReadFile(AsHandle(file), buffer, size, &done, nullptr)) {
        return false;
    }
    *bytesRead = done;
    return true;
}

void* AllocateAligned(std::size_t size, std::size_t alignment) {
    // The C library may end the process over another number.
    const bool isPowerOfTwo = alignment != 0 && (alignment & (alignment - 1)) == 0;
    return isPowerOfTwo ? _aligned_malloc(size, alignment) : nullptr;
}

void FreeAligned(void* memory) {
    _aligned_free(memory);
}

// Large pages are a privilege that a module does not ask for.
void ExpectLargeBlock(void*, std::size_t) {}

bool GetLastWriteTime(const std::u16string& path, FileTime* time) {
    WIN32_FILE_ATTRIBUTE_DATA attributes{};
    if (!::GetFileAttributesExW(Wide(path), GetFileExInfoStandard, &attributes)) {
        return false;
    }
    const FILETIME& written = attributes.ftLastWriteTime;
    *time = static_cast<FileTime>(static_cast<ncfUInt64>(written.dwHighDateTime) << 32 |
                                  written.dwLowDateTime);
    return true;
}

bool ToDateTime(FileTime time, DateTime* date) {
    const FILETIME written = {static_cast<DWORD>(time),
                              static_cast<DWORD>(static_cast<ncfUInt64>(time) >> 32)};
    SYSTEMTIME utc{};
    if (!::FileTimeToSystemTime(&written, &utc)) {
        return false;
    }
    *date = {utc.wYear, utc.wMonth, utc.wDay, utc.wDayOfWeek, utc.wHour, utc.wMinute, utc.wSecond};
    return true;
}

bool GetModulePath(const void* address, std::wstring* path) {
    HMODULE module = nullptr;
    // The reference that this look-up adds is never given back: once started,
    // the module stays mapped.
    if (!::GetModuleHandleExA(GET_MODULE_HANDLE_EX_FLAG_FROM_ADDRESS, static_cast<LPCSTR>(address),
                              &module)) {
        return false;
    }
    constexpr DWORD kSize = 260;
    WCHAR buffer[kSize] = {};
    const DWORD length = ::GetModuleFileNameW(module, buffer, kSize);
    if (length == 0) {
        return false;
    }
    // A longer path is cut, and counted with the zero that may be missing.
    path->assign(buffer, buffer + (length < kSize ? length : kSize - 1));
    return true;
}

void* LoadLibraryByName(const char* name) {
    return reinterpret_cast<void*>(::LoadLibraryA(name));
}

void* FindSymbol(void* library, const char* name) {
    return reinterpret_cast<void*>(::GetProcAddress(static_cast<HMODULE>(library), name));
}

void* CreateNamedMutex(const char* name) {
    return ::CreateMutexA(nullptr, FALSE, name);
}

Wait WaitForMutex(void* mutex) {
    switch (::WaitForSingleObject(mutex, INFINITE)) {
        case WAIT_OBJECT_0:
            return Wait::kAcquired;
        case WAIT_ABANDONED:
            return Wait::kAbandoned;
        case WAIT_TIMEOUT:
            return Wait::kTimeout;
        case WAIT_FAILED:
            return Wait::kFailed;
        default:
            return Wait::kUndefined;
    }
}

bool ReleaseMutex(void* mutex) {
    return ::ReleaseMutex(mutex) != 0;
}

void CloseMutex(void* mutex) {
    if (mutex) {
        ::CloseHandle(mutex);
    }
}

ncfUInt64 CurrentThreadId() {
    return ::GetCurrentThreadId();
}

const void* OwnModule() {
    HMODULE module = nullptr;
    ::GetModuleHandleExA(
        GET_MODULE_HANDLE_EX_FLAG_FROM_ADDRESS | GET_MODULE_HANDLE_EX_FLAG_UNCHANGED_REFCOUNT,
        reinterpret_cast<LPCSTR>(&OwnModule), &module);
    return module;
}

std::string ErrorText(ncfUInt32 error) {
    char buffer[512] = {};
    DWORD length = ::FormatMessageA(FORMAT_MESSAGE_FROM_SYSTEM | FORMAT_MESSAGE_IGNORE_INSERTS,
                                    nullptr, error, MAKELANGID(LANG_NEUTRAL, SUBLANG_DEFAULT),
                                    buffer, sizeof buffer - 1, nullptr);
    while (length > 0 && (buffer[length - 1] == '\n' || buffer[length - 1] == '\r')) {
        buffer[--length] = '\0';
    }
    return buffer;
}

}  // namespace os
