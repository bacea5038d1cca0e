// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "tests/support/windows_calls/WindowsCalls.h"

#include <windows.h>

#include <malloc.h>

#include <algorithm>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <type_traits>
#include <utility>

#include "tests/support/windows_calls/Facts.h"

namespace {

struct OpenFile {
    WindowsCalls::File* file;
    bool pastTheCache;
    std::uint64_t position;
};

WindowsCalls windows;
DWORD lastError = 0;
std::map<HANDLE, OpenFile> openFiles;
std::uintptr_t nextHandle = 0x100;

HANDLE NewHandle() {
    ++windows.openHandles;
    nextHandle += 4;
    return reinterpret_cast<HANDLE>(nextHandle);
}

// --- arguments as text -------------------------------------------------------

// Numbers with a meaning by their bits are passed as Bits.
struct Bits {
    std::uint64_t value;
};
// What a call writes into, whose address says nothing.
struct Place {
    const void* address;
};

std::string Text(Bits bits) {
    char text[32];
    std::snprintf(text, sizeof text, "0x%llx", static_cast<unsigned long long>(bits.value));
    return text;
}
std::string Text(const void* handle) {
    return handle ? Text(Bits{reinterpret_cast<std::uintptr_t>(handle)}) : "null";
}
std::string Text(Place place) {
    return place.address ? "place" : "null";
}
template <class Number, class = std::enable_if_t<std::is_integral_v<Number>>>
std::string Text(Number number) {
    return std::to_string(number);
}
std::string Text(const char* text) {
    return text ? '"' + std::string(text) + '"' : "null";
}
std::string Text(const char16_t* text) {
    if (!text) {
        return "null";
    }
    std::string out = "\"";
    for (; *text; ++text) {
        const bool isPlain = *text >= 0x20 && *text < 0x7F;
        out += isPlain ? std::string(1, static_cast<char>(*text)) : '<' + Text(Bits{*text}) + '>';
    }
    return out + '"';
}

template <class... Arguments>
std::string Listed(const Arguments&... arguments) {
    std::string list;
    ((list += (list.empty() ? "" : ", ") + Text(arguments)), ...);
    return list;
}

// Notes a call; false when it is to fail.
template <class... Arguments>
bool Called(const char* function, const Arguments&... arguments) {
    windows.calls.push_back(function + ('(' + Listed(arguments...)) + ')');
    const auto failure = windows.failures.find(function);
    if (failure == windows.failures.end()) {
        return true;
    }
    lastError = failure->second;
    return false;
}

BOOL Refuse(DWORD error) {
    lastError = error;
    return FALSE;
}

// --- files ---------------------------------------------------------------------

WindowsCalls::File* Find(LPCWSTR name) {
    const auto file = windows.files.find(name);
    return file == windows.files.end() ? nullptr : &file->second;
}

OpenFile* Find(HANDLE handle) {
    const auto file = openFiles.find(handle);
    return file == openFiles.end() ? nullptr : &file->second;
}

std::uint64_t LengthOf(const WindowsCalls::File& file) {
    return std::max<std::uint64_t>(file.length, file.bytes.size());
}

FILETIME AsFileTime(std::uint64_t time) {
    return {static_cast<DWORD>(time), static_cast<DWORD>(time >> 32)};
}

// What is read past the cache begins and ends with sectors, in file and memory.
bool IsAllowed(const OpenFile& open, std::uint64_t number) {
    const bool allowed = !open.pastTheCache || number % open.file->sectorSize == 0;
    windows.misaligned += !allowed;
    return allowed;
}

}  // namespace

WindowsCalls& WindowsCalls::Get() {
    return windows;
}

WindowsCalls& WindowsCalls::Anew() {
    windows = WindowsCalls();
    lastError = 0;
    openFiles.clear();
    nextHandle = 0x100;
    return windows;
}

std::vector<std::string> WindowsCalls::TakeCalls() {
    return std::exchange(calls, {});
}

extern "C" {

DWORD GetLastError() {
    return lastError;
}

void SetLastError(DWORD error) {
    lastError = error;
}

HANDLE CreateFileW(LPCWSTR name, DWORD access, DWORD share, SECURITY_ATTRIBUTES* security,
                   DWORD disposition, DWORD flags, HANDLE pattern) {
    if (!Called("CreateFileW", name, Bits{access}, Bits{share}, Place{security}, disposition,
                Bits{flags}, pattern)) {
        return INVALID_HANDLE_VALUE;
    }
    WindowsCalls::File* const file = Find(name);
    const DWORD error = !file                                            ? ERROR_FILE_NOT_FOUND
                        : file->isFolder                                 ? ERROR_ACCESS_DENIED
                        : file->isWritten && !(share & FILE_SHARE_WRITE) ? ERROR_SHARING_VIOLATION
                                                                         : 0;
    if (error) {
        lastError = error;
        return INVALID_HANDLE_VALUE;
    }
    const HANDLE handle = NewHandle();
    openFiles[handle] = {file, (flags & FILE_FLAG_NO_BUFFERING) != 0, 0};
    return handle;
}

BOOL CloseHandle(HANDLE handle) {
    if (!Called("CloseHandle", handle)) {
        return FALSE;
    }
    openFiles.erase(handle);
    --windows.openHandles;
    return TRUE;
}

DWORD GetFileType(HANDLE handle) {
    const OpenFile* const open = Find(handle);
    return Called("GetFileType", handle) && open ? open->file->type : 0;
}

BOOL GetFileInformationByHandle(HANDLE handle, BY_HANDLE_FILE_INFORMATION* information) {
    if (!Called("GetFileInformationByHandle", handle, Place{information})) {
        return FALSE;
    }
    const OpenFile* const open = Find(handle);
    if (!open) {
        return Refuse(ERROR_INVALID_HANDLE);
    }
    *information = {};
    information->nFileSizeHigh = static_cast<DWORD>(LengthOf(*open->file) >> 32);
    information->nFileSizeLow = static_cast<DWORD>(LengthOf(*open->file));
    return TRUE;
}

BOOL GetDiskFreeSpaceW(LPCWSTR root, DWORD* sectorsPerCluster, DWORD* bytesPerSector,
                       DWORD* freeClusters, DWORD* clusters) {
    if (!Called("GetDiskFreeSpaceW", root, Place{sectorsPerCluster}, Place{bytesPerSector},
                Place{freeClusters}, Place{clusters})) {
        return FALSE;
    }
    const auto volume = windows.roots.find(root);
    if (volume == windows.roots.end()) {
        return Refuse(ERROR_INVALID_NAME);
    }
    *bytesPerSector = volume->second;
    return TRUE;
}

BOOL SetFilePointerEx(HANDLE handle, LARGE_INTEGER distance, LARGE_INTEGER* position,
                      DWORD method) {
    if (!Called("SetFilePointerEx", handle, distance.QuadPart, Place{position}, method)) {
        return FALSE;
    }
    OpenFile* const open = Find(handle);
    if (!open) {
        return Refuse(ERROR_INVALID_HANDLE);
    }
    const auto target = static_cast<std::uint64_t>(distance.QuadPart);
    if (!IsAllowed(*open, target)) {
        return Refuse(ERROR_INVALID_PARAMETER);
    }
    open->position = target;
    return TRUE;
}

BOOL ReadFile(HANDLE handle, void* buffer, DWORD size, DWORD* bytesRead, OVERLAPPED* overlapped) {
    if (!Called("ReadFile", handle, Place{buffer}, size, Place{bytesRead}, Place{overlapped})) {
        return FALSE;
    }
    OpenFile* const open = Find(handle);
    if (!open) {
        return Refuse(ERROR_INVALID_HANDLE);
    }
    if (!IsAllowed(*open, open->position) || !IsAllowed(*open, size) ||
        !IsAllowed(*open, reinterpret_cast<std::uintptr_t>(buffer))) {
        return Refuse(ERROR_INVALID_PARAMETER);
    }
    const std::uint64_t length = LengthOf(*open->file);
    const std::uint64_t left = open->position < length ? length - open->position : 0;
    *bytesRead = static_cast<DWORD>(std::min<std::uint64_t>(left, size));
    const std::vector<std::uint8_t>& bytes = open->file->bytes;
    const std::uint64_t held = open->position < bytes.size() ? bytes.size() - open->position : 0;
    const auto copied = static_cast<std::size_t>(std::min<std::uint64_t>(held, *bytesRead));
    std::copy_n(bytes.data() + (copied ? open->position : 0), copied,
                static_cast<std::uint8_t*>(buffer));
    std::memset(static_cast<std::uint8_t*>(buffer) + copied, 0, *bytesRead - copied);
    open->position += *bytesRead;
    return TRUE;
}

BOOL GetFileAttributesExW(LPCWSTR name, GET_FILEEX_INFO_LEVELS level, void* attributes) {
    if (!Called("GetFileAttributesExW", name, static_cast<int>(level), Place{attributes})) {
        return FALSE;
    }
    const WindowsCalls::File* const file = Find(name);
    if (!file) {
        return Refuse(ERROR_FILE_NOT_FOUND);
    }
    WIN32_FILE_ATTRIBUTE_DATA data{};
    // Other times than the one that is asked for.
    data.ftCreationTime = data.ftLastAccessTime = AsFileTime(file->written + 1);
    data.ftLastWriteTime = AsFileTime(file->written);
    std::memcpy(attributes, &data, sizeof data);
    return TRUE;
}

// A date like any other: the tests need no calendar.
BOOL FileTimeToSystemTime(const FILETIME* time, SYSTEMTIME* utc) {
    if (!Called("FileTimeToSystemTime", Bits{time->dwHighDateTime}, Bits{time->dwLowDateTime},
                Place{utc})) {
        return FALSE;
    }
    *utc = {2026, 11, 0, 22, 21, 43, 57, 999};
    return TRUE;
}

BOOL GetModuleHandleExA(DWORD flags, LPCSTR name, HMODULE* module) {
    if (!Called("GetModuleHandleExA", Bits{flags}, Place{name}, Place{module})) {
        return FALSE;
    }
    const auto found = windows.modules.find(name);
    if (found == windows.modules.end()) {
        return Refuse(ERROR_MOD_NOT_FOUND);
    }
    *module = reinterpret_cast<HMODULE>(const_cast<std::u16string*>(&found->second));
    return TRUE;
}

DWORD GetModuleFileNameW(HMODULE module, LPWSTR name, DWORD size) {
    if (!Called("GetModuleFileNameW", Place{module}, Place{name}, size)) {
        return 0;
    }
    // A path that is too long is cut; systems before Vista don't end it with a zero.
    const auto& path = *reinterpret_cast<const std::u16string*>(module);
    const std::size_t length = std::min<std::size_t>(path.size(), size);
    std::copy_n(path.data(), length, name);
    if (length < size) {
        name[length] = 0;
    }
    return static_cast<DWORD>(length);
}

HMODULE LoadLibraryA(LPCSTR name) {
    if (!Called("LoadLibraryA", name)) {
        return nullptr;
    }
    const auto library = windows.libraries.find(name);
    if (library == windows.libraries.end()) {
        Refuse(ERROR_MOD_NOT_FOUND);
        return nullptr;
    }
    return reinterpret_cast<HMODULE>(&library->second);
}

FARPROC GetProcAddress(HMODULE module, LPCSTR name) {
    if (!Called("GetProcAddress", Place{module}, name)) {
        return nullptr;
    }
    if (*reinterpret_cast<const std::string*>(module) != name) {
        Refuse(ERROR_PROC_NOT_FOUND);
        return nullptr;
    }
    return [] { return 4711ll; };
}

HANDLE CreateMutexA(SECURITY_ATTRIBUTES* security, BOOL owned, LPCSTR name) {
    return Called("CreateMutexA", Place{security}, owned, name) ? NewHandle() : nullptr;
}

DWORD WaitForSingleObject(HANDLE handle, DWORD milliseconds) {
    return Called("WaitForSingleObject", handle, Bits{milliseconds}) ? windows.wait : WAIT_FAILED;
}

BOOL ReleaseMutex(HANDLE mutex) {
    return Called("ReleaseMutex", mutex);
}

DWORD GetCurrentThreadId() {
    return windows.thread;
}

DWORD FormatMessageA(DWORD flags, const void* source, DWORD message, DWORD language, LPSTR buffer,
                     DWORD size, va_list_of_windows* arguments) {
    if (!Called("FormatMessageA", Bits{flags}, Place{source}, message, Bits{language},
                Place{buffer}, size, Place{arguments})) {
        return 0;
    }
    const std::string& text = windows.errorTexts[message];
    if (text.size() >= size) {
        return 0;
    }
    std::copy_n(text.c_str(), text.size() + 1, buffer);
    return static_cast<DWORD>(text.size());
}

void* _aligned_malloc(std::size_t size, std::size_t alignment) {
    if (!Called("_aligned_malloc", size, alignment)) {
        return nullptr;
    }
    ++windows.liveBlocks;
    void* memory = nullptr;
    if (posix_memalign(&memory, std::max(alignment, sizeof(void*)), size) != 0) {
        std::abort();
    }
    std::memset(memory, 0xEE, size);  // stale bytes show
    return memory;
}

void _aligned_free(void* memory) {
    windows.liveBlocks -= memory != nullptr;
    std::free(memory);
}

}  // extern "C"
