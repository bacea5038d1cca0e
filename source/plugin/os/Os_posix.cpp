// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// The operating system, by POSIX calls.

#include <dlfcn.h>
#include <fcntl.h>
#include <pthread.h>
#include <sys/file.h>
#include <sys/mman.h>
#include <sys/stat.h>
#include <sys/statvfs.h>
#include <unistd.h>

#include <cerrno>
#include <climits>
#include <cstdlib>
#include <cstring>
#include <ctime>
#include <memory>

#include "source/plugin/os/Os.h"

namespace os {
namespace {

thread_local ncfUInt32 lastError = 0;

bool Fail(int error) {
    lastError = static_cast<ncfUInt32>(error);
    return false;
}

void AppendUtf8(std::string& out, char32_t c) {
    if (c < 0x80) {
        out += static_cast<char>(c);
    } else if (c < 0x800) {
        out += static_cast<char>(0xC0 | c >> 6);
        out += static_cast<char>(0x80 | (c & 0x3F));
    } else if (c < 0x10000) {
        out += static_cast<char>(0xE0 | c >> 12);
        out += static_cast<char>(0x80 | (c >> 6 & 0x3F));
        out += static_cast<char>(0x80 | (c & 0x3F));
    } else {
        out += static_cast<char>(0xF0 | c >> 18);
        out += static_cast<char>(0x80 | (c >> 12 & 0x3F));
        out += static_cast<char>(0x80 | (c >> 6 & 0x3F));
        out += static_cast<char>(0x80 | (c & 0x3F));
    }
}

// The name that the system knows: slashes turned back, carried bytes restored.
std::string SystemPath(const std::u16string& path) {
    std::string out;
    for (std::size_t i = 0; i < path.size(); ++i) {
        const char16_t unit = path[i];
        const bool high = unit >= 0xD800 && unit < 0xDC00;
        if (high && i + 1 < path.size() && path[i + 1] >= 0xDC00 && path[i + 1] < 0xE000) {
            AppendUtf8(out, 0x10000 + ((unit - 0xD800u) << 10) + (path[i + 1] - 0xDC00u));
            ++i;
        } else if (unit >= 0xDC80 && unit <= 0xDCFF) {
            out += static_cast<char>(unit - 0xDC00);
        } else if (unit == u'\\') {
            out += '/';
        } else {
            AppendUtf8(out, unit);
        }
    }
    return out;
}

}  // namespace

ncfUInt32 LastError() {
    return lastError;
}

FileHandle OpenForReading(const std::u16string& path) {
    // Non-blocking, so that a pipe without a writer is refused, not awaited.
    const int descriptor = open(SystemPath(path).c_str(), O_RDONLY | O_CLOEXEC | O_NONBLOCK);
    if (descriptor < 0) {
        Fail(errno);
        return kNoFile;
    }
    struct stat status {};
    const bool known = fstat(descriptor, &status) == 0;
    if (!known || !S_ISREG(status.st_mode)) {
        Fail(!known ? errno : S_ISDIR(status.st_mode) ? EISDIR : EINVAL);
        close(descriptor);
        return kNoFile;
    }
    // A few places of a large file are read, so what lies behind them is not wanted.
    // Only a hint.
    posix_fadvise(descriptor, 0, 0, POSIX_FADV_RANDOM);
    return descriptor;
}

bool Close(FileHandle file) {
    return close(static_cast<int>(file)) == 0 || Fail(errno);
}

bool GetFileSize(FileHandle file, ncfUInt64* size) {
    struct stat status {};
    if (fstat(static_cast<int>(file), &status) != 0) {
        return Fail(errno);
    }
    *size = static_cast<ncfUInt64>(status.st_size);
    return true;
}

bool GetSectorSize(FileHandle file, const std::u16string&, ncfUInt32* bytes) {
    struct statvfs volume {};
    if (fstatvfs(static_cast<int>(file), &volume) != 0) {
        return Fail(errno);
    }
    // Network file systems name a megabyte: that is no sector.
    const ncfUInt64 size = volume.f_bsize;
    if (size < 512 || size > 65536 || (size & (size - 1)) != 0) {
        return Fail(ERANGE);
    }
    *bytes = static_cast<ncfUInt32>(size);
    return true;
}

bool SetPosition(FileHandle file, ncfUInt64 position) {
    if (position > static_cast<ncfUInt64>(INT64_MAX)) {
        return Fail(EINVAL);
    }
    return lseek(static_cast<int>(file), static_cast<off_t>(position), SEEK_SET) >= 0 ||
           Fail(errno);
}

bool Read(FileHandle file, void* buffer, ncfUInt32 size, ncfUInt32* bytesRead) {
    const int descriptor = static_cast<int>(file);
    ncfUInt32 done = 0;
    while (done < size) {
        const ssize_t n = read(descriptor, static_cast<char*>(buffer) + done, size - done);
        if (n < 0 && errno == EINTR) {
            continue;
        }
        if (n < 0) {
            return Fail(errno);
        }
        if (n == 0) {
            break;
        }
        done += static_cast<ncfUInt32>(n);
    }
    *bytesRead = done;
    return true;
}

void* AllocateAligned(std::size_t size, std::size_t alignment) {
    void* memory = nullptr;
    if (posix_memalign(&memory, alignment, size) != 0) {
        return nullptr;
    }
    ExpectLargeBlock(memory, size);
    return memory;
}

void FreeAligned(void* memory) {
    std::free(memory);
}

void ExpectLargeBlock(void* memory, std::size_t bytes) {
#ifdef MADV_HUGEPAGE
    constexpr std::uintptr_t kLargePage = std::uintptr_t{2} << 20;
    const std::uintptr_t begin = reinterpret_cast<std::uintptr_t>(memory);
    const std::uintptr_t first = (begin + kLargePage - 1) / kLargePage * kLargePage;
    const std::uintptr_t end = (begin + bytes) / kLargePage * kLargePage;
    if (first < end) {
        madvise(reinterpret_cast<void*>(first), end - first, MADV_HUGEPAGE);
    }
#else
    static_cast<void>(memory);
    static_cast<void>(bytes);
#endif
}

bool GetLastWriteTime(const std::u16string& path, FileTime* time) {
    struct stat status {};
    if (stat(SystemPath(path).c_str(), &status) != 0) {
        return Fail(errno);
    }
    *time = status.st_mtime;
    return true;
}

bool ToDateTime(FileTime time, DateTime* date) {
    const auto seconds = static_cast<time_t>(time);
    struct tm utc {};
    if (!gmtime_r(&seconds, &utc) || utc.tm_year < 1601 - 1900 || utc.tm_year > 30827 - 1900) {
        return Fail(EOVERFLOW);
    }
    *date = {utc.tm_year + 1900, utc.tm_mon + 1, utc.tm_mday, utc.tm_wday,
             utc.tm_hour,        utc.tm_min,     utc.tm_sec};
    return true;
}

bool GetModulePath(const void* address, std::wstring* path) {
    Dl_info info{};
    if (dladdr(address, &info) == 0 || !info.dli_fname || !*info.dli_fname) {
        return Fail(ENOENT);
    }
    std::string name = info.dli_fname;
    if (name[0] != '/') {
        const std::unique_ptr<char, void (*)(void*)> folder(getcwd(nullptr, 0), std::free);
        if (!folder) {
            return Fail(errno);
        }
        name = std::string(folder.get()) + "/" + name;
    }
    // Never given back: once started, the module stays mapped. The main
    // program has no such handle and needs none.
    (void)dlopen(info.dli_fname, RTLD_NOW | RTLD_NOLOAD | RTLD_NODELETE);

    path->clear();
    for (std::size_t i = 0; i < name.size();) {
        const auto byte = static_cast<unsigned char>(name[i]);
        const int length = byte < 0x80       ? 1
                           : byte >> 5 == 6  ? 2
                           : byte >> 4 == 14 ? 3
                           : byte >> 3 == 30 ? 4
                                             : 0;
        char32_t c = length == 1 ? byte : byte & (0x7Fu >> length);
        bool valid = length > 0 && i + static_cast<std::size_t>(length) <= name.size();
        for (int k = 1; valid && k < length; ++k) {
            const auto next = static_cast<unsigned char>(name[i + static_cast<std::size_t>(k)]);
            valid = next >> 6 == 2;
            c = c << 6 | (next & 0x3Fu);
        }
        static constexpr char32_t kLeast[] = {0, 0, 0x80, 0x800, 0x10000};
        valid = valid && c >= kLeast[length] && c < 0x110000 && (c < 0xD800 || c > 0xDFFF);
        *path += static_cast<wchar_t>(valid ? c : 0xDC00u + byte);
        i += valid ? static_cast<std::size_t>(length) : 1;
    }
    return true;
}

void* LoadLibraryByName(const char* name) {
    return dlopen(name, RTLD_NOW);
}

void* FindSymbol(void* library, const char* name) {
    return dlsym(library, name);
}

namespace {

// A robust mutex in named shared memory, so that the death of its owner does
// not leave the others waiting for ever.
struct SharedMutex {
    pthread_mutex_t mutex;
    std::uint32_t ready;
};

}  // namespace

void* CreateNamedMutex(const char* name) {
    const std::string path = std::string("/") + (name ? name : "");
    const int descriptor = shm_open(path.c_str(), O_RDWR | O_CREAT | O_CLOEXEC, 0600);
    if (descriptor < 0) {
        Fail(errno);
        return nullptr;
    }
    void* memory = MAP_FAILED;
    // Whoever locks the file first makes the mutex; the others find it made.
    // This lock keeps threads of one process apart too.
    if (flock(descriptor, LOCK_EX) == 0 && ftruncate(descriptor, sizeof(SharedMutex)) == 0) {
        memory =
            mmap(nullptr, sizeof(SharedMutex), PROT_READ | PROT_WRITE, MAP_SHARED, descriptor, 0);
    }
    if (memory == MAP_FAILED) {
        Fail(errno);
        close(descriptor);
        return nullptr;
    }
    auto* const shared = static_cast<SharedMutex*>(memory);
    if (shared->ready != 1) {
        pthread_mutexattr_t attributes;
        pthread_mutexattr_init(&attributes);
        pthread_mutexattr_setpshared(&attributes, PTHREAD_PROCESS_SHARED);
        pthread_mutexattr_setrobust(&attributes, PTHREAD_MUTEX_ROBUST);
        pthread_mutexattr_settype(&attributes, PTHREAD_MUTEX_RECURSIVE);
        pthread_mutex_init(&shared->mutex, &attributes);
        pthread_mutexattr_destroy(&attributes);
        shared->ready = 1;
    }
    // By hand, since the mapping would keep the lock beyond the close.
    flock(descriptor, LOCK_UN);
    close(descriptor);
    return shared;
}

Wait WaitForMutex(void* mutex) {
    if (!mutex) {
        Fail(EINVAL);
        return Wait::kFailed;
    }
    auto* const shared = static_cast<SharedMutex*>(mutex);
    const int error = pthread_mutex_lock(&shared->mutex);
    if (error == EOWNERDEAD) {
        pthread_mutex_consistent(&shared->mutex);
        Fail(error);
        return Wait::kAbandoned;
    }
    if (error != 0) {
        Fail(error);
        return Wait::kFailed;
    }
    return Wait::kAcquired;
}

bool ReleaseMutex(void* mutex) {
    if (!mutex) {
        return Fail(EINVAL);
    }
    const int error = pthread_mutex_unlock(&static_cast<SharedMutex*>(mutex)->mutex);
    return error == 0 || Fail(error);
}

void CloseMutex(void* mutex) {
    if (mutex) {
        munmap(mutex, sizeof(SharedMutex));
    }
}

ncfUInt64 CurrentThreadId() {
    return static_cast<ncfUInt64>(gettid());
}

const void* OwnModule() {
    Dl_info info{};
    dladdr(reinterpret_cast<const void*>(&OwnModule), &info);
    return info.dli_fbase;
}

std::string ErrorText(ncfUInt32 error) {
    return std::strerror(static_cast<int>(error));
}

}  // namespace os
