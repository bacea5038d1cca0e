// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

// Include <windows.h> and <malloc.h> first, those of the system or those of the
// tests. Numbers, layouts and types of functions that the module's Windows sources
// depend on.

#include <cstddef>
#include <type_traits>

static_assert(sizeof(WCHAR) == 2 && sizeof(DWORD) == 4 && sizeof(WORD) == 2 && sizeof(BOOL) == 4);
static_assert(sizeof(HANDLE) == 8 && sizeof(HMODULE) == 8 && sizeof(LARGE_INTEGER) == 8);
static_assert(DWORD(-1) > 0 && WORD(-1) > 0 && BOOL(-1) < 0, "which have a sign");

static_assert(FALSE == 0 && TRUE == 1);
static_assert(GENERIC_READ == 0x80000000);
static_assert(FILE_SHARE_READ == 1 && FILE_SHARE_WRITE == 2);
static_assert(OPEN_EXISTING == 3);
static_assert(FILE_FLAG_NO_BUFFERING == 0x20000000);
static_assert(FILE_BEGIN == 0);
static_assert(FILE_TYPE_DISK == 1 && FILE_TYPE_CHAR == 2 && FILE_TYPE_PIPE == 3);
static_assert(GET_MODULE_HANDLE_EX_FLAG_UNCHANGED_REFCOUNT == 2);
static_assert(GET_MODULE_HANDLE_EX_FLAG_FROM_ADDRESS == 4);
static_assert(INFINITE == 0xFFFFFFFF);
static_assert(WAIT_OBJECT_0 == 0 && WAIT_ABANDONED == 0x80 && WAIT_TIMEOUT == 0x102);
static_assert(WAIT_FAILED == 0xFFFFFFFF);
static_assert(FORMAT_MESSAGE_IGNORE_INSERTS == 0x200 && FORMAT_MESSAGE_FROM_SYSTEM == 0x1000);
static_assert(MAKELANGID(LANG_NEUTRAL, SUBLANG_DEFAULT) == 0x400);
static_assert(ERROR_FILE_NOT_FOUND == 2 && ERROR_ACCESS_DENIED == 5 && ERROR_INVALID_HANDLE == 6);
static_assert(ERROR_SHARING_VIOLATION == 32 && ERROR_INVALID_PARAMETER == 87);
static_assert(ERROR_INVALID_NAME == 123);
static_assert(ERROR_MOD_NOT_FOUND == 126 && ERROR_PROC_NOT_FOUND == 127);
static_assert(GetFileExInfoStandard == 0);

static_assert(sizeof(FILETIME) == 8 && offsetof(FILETIME, dwHighDateTime) == 4);
static_assert(sizeof(SYSTEMTIME) == 16 && offsetof(SYSTEMTIME, wDayOfWeek) == 4 &&
              offsetof(SYSTEMTIME, wDay) == 6 && offsetof(SYSTEMTIME, wSecond) == 12);
static_assert(sizeof(BY_HANDLE_FILE_INFORMATION) == 52 &&
              offsetof(BY_HANDLE_FILE_INFORMATION, nFileSizeHigh) == 32 &&
              offsetof(BY_HANDLE_FILE_INFORMATION, nFileSizeLow) == 36);
static_assert(sizeof(WIN32_FILE_ATTRIBUTE_DATA) == 36 &&
              offsetof(WIN32_FILE_ATTRIBUTE_DATA, ftLastWriteTime) == 20);

template <class Expected, class Function>
constexpr bool IsCalledAs(Function*) {
    return std::is_same_v<Expected, Function>;
}
static_assert(IsCalledAs<DWORD WINAPI()>(&GetLastError));
static_assert(IsCalledAs<void WINAPI(DWORD)>(&SetLastError));
static_assert(IsCalledAs<BOOL WINAPI(HANDLE)>(&CloseHandle));
static_assert(IsCalledAs<DWORD WINAPI(HANDLE)>(&GetFileType));
static_assert(
    IsCalledAs<BOOL WINAPI(HANDLE, BY_HANDLE_FILE_INFORMATION*)>(&GetFileInformationByHandle));
static_assert(IsCalledAs<BOOL WINAPI(LPCWSTR, DWORD*, DWORD*, DWORD*, DWORD*)>(&GetDiskFreeSpaceW));
static_assert(
    IsCalledAs<BOOL WINAPI(HANDLE, LARGE_INTEGER, LARGE_INTEGER*, DWORD)>(&SetFilePointerEx));
static_assert(
    IsCalledAs<BOOL WINAPI(LPCWSTR, GET_FILEEX_INFO_LEVELS, void*)>(&GetFileAttributesExW));
static_assert(IsCalledAs<BOOL WINAPI(const FILETIME*, SYSTEMTIME*)>(&FileTimeToSystemTime));
static_assert(IsCalledAs<BOOL WINAPI(DWORD, LPCSTR, HMODULE*)>(&GetModuleHandleExA));
static_assert(IsCalledAs<DWORD WINAPI(HMODULE, LPWSTR, DWORD)>(&GetModuleFileNameW));
static_assert(IsCalledAs<HMODULE WINAPI(LPCSTR)>(&LoadLibraryA));
static_assert(IsCalledAs<FARPROC WINAPI(HMODULE, LPCSTR)>(&GetProcAddress));
static_assert(IsCalledAs<DWORD WINAPI(HANDLE, DWORD)>(&WaitForSingleObject));
static_assert(IsCalledAs<BOOL WINAPI(HANDLE)>(&ReleaseMutex));
static_assert(IsCalledAs<DWORD WINAPI()>(&GetCurrentThreadId));
static_assert(IsCalledAs<void*(std::size_t, std::size_t)>(&_aligned_malloc));
static_assert(IsCalledAs<void(void*)>(&_aligned_free));

// These take structures and lists that have other names in some headers; nobody gives one.
static_assert(std::is_same_v<HANDLE, decltype(CreateFileW(LPCWSTR{}, DWORD{}, DWORD{}, nullptr,
                                                          DWORD{}, DWORD{}, HANDLE{}))>);
static_assert(std::is_same_v<BOOL, decltype(ReadFile(HANDLE{}, static_cast<void*>(nullptr), DWORD{},
                                                     static_cast<DWORD*>(nullptr), nullptr))>);
static_assert(std::is_same_v<HANDLE, decltype(CreateMutexA(nullptr, BOOL{}, LPCSTR{}))>);
static_assert(std::is_same_v<DWORD, decltype(FormatMessageA(DWORD{}, nullptr, DWORD{}, DWORD{},
                                                            LPSTR{}, DWORD{}, nullptr))>);
