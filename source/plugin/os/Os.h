// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <string>
#include <vector>

#include "host_interfaces/framework/Types.h"

// Everything that the module asks of the operating system. One body for each
// system is chosen by the build; nothing outside this folder names a system
// call. A third body must keep what is said here. Paths are UTF-16 with
// backslashes; a lone surrogate U+DC00 + b stands for the byte b of a name that
// is no UTF-8. Functions that fail say so in their result; those of files,
// dates and mutexes leave the system's error number in LastError() of the
// calling thread.
namespace os {

// The error number that the last of those calls that failed left on this thread.
ncfUInt32 LastError();

// --- files -----------------------------------------------------------------

using FileHandle = ncfSInt64;
inline constexpr FileHandle kNoFile = -1;

// Opens a regular file for reads that bring nothing into the system's cache beyond
// what they ask for: Windows reads past the cache, POSIX systems through it, with
// nothing read ahead. kNoFile for folders, pipes, devices and what is absent.
FileHandle OpenForReading(const std::u16string& path);
bool Close(FileHandle file);
// Length in bytes.
bool GetFileSize(FileHandle file, ncfUInt64* size);
// Bytes in a sector of the volume, which reads are aligned to in position, size
// and address; on Windows they must be. `volumeRoot` is what SimpleFileIO took from
// the path, empty when there is none; only Windows asks by it. false when unknown.
bool GetSectorSize(FileHandle file, const std::u16string& volumeRoot, ncfUInt32* bytes);
bool SetPosition(FileHandle file, ncfUInt64 position);
// Reads at the position set; `*bytesRead` below `size` at the end of the file.
bool Read(FileHandle file, void* buffer, ncfUInt32 size, ncfUInt32* bytesRead);

// Memory at a multiple of `alignment`, a power of two; null when there is none.
void* AllocateAligned(std::size_t size, std::size_t alignment);
void FreeAligned(void* memory);
// Tells the system that `bytes` at `memory`, not yet touched, are one large
// block, so that it may back them with large pages. Only a hint.
void ExpectLargeBlock(void* memory, std::size_t bytes);

// --- dates -----------------------------------------------------------------

// A point in time as the system counts it.
using FileTime = ncfSInt64;

// A point in time in UTC.
struct DateTime {
    int year;       // 1601 to 30827
    int month;      // 1 to 12
    int day;        // 1 to 31
    int dayOfWeek;  // 0 Sunday
    int hour;
    int minute;
    int second;
};

// Time of the last write to a file.
bool GetLastWriteTime(const std::u16string& path, FileTime* time);
// false for a time before or behind the years of a DateTime, as file systems
// may bear it.
bool ToDateTime(FileTime time, DateTime* date);

// --- the module ------------------------------------------------------------

// Absolute path of the module that holds `address`, links kept; the module then
// stays mapped until the process ends. false when it can't be told.
bool GetModulePath(const void* address, std::wstring* path);

// --- run-time libraries ------------------------------------------------------

// Loads a shared library by its bare name, as the system searches for it; it
// stays mapped. Null when there is none. FindSymbol gives null for what the
// library lacks.
void* LoadLibraryByName(const char* name);
void* FindSymbol(void* library, const char* name);

// --- named mutexes -----------------------------------------------------------

// A mutex that processes share by name; null when it can't be made.
void* CreateNamedMutex(const char* name);
// Outcomes of waiting for one; an abandoned one was left by a dead owner.
enum class Wait { kAcquired, kAbandoned, kTimeout, kFailed, kUndefined };
Wait WaitForMutex(void* mutex);
bool ReleaseMutex(void* mutex);
void CloseMutex(void* mutex);
// Identity of the calling thread, and of the module that holds this code.
ncfUInt64 CurrentThreadId();
const void* OwnModule();
// The system's text for an error number, in its own 8-bit encoding, without line
// end.
std::string ErrorText(ncfUInt32 error);

}  // namespace os
