// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// The program's own read, lseek and open come before those of the system's
// library, for the module and all libraries too.

#include "tests/system/ReadFaults.h"

#include <dlfcn.h>
#include <sys/types.h>
#include <unistd.h>

#include <atomic>
#include <cerrno>
#include <climits>
#include <cstdarg>
#include <cstdio>
#include <cstdlib>
#include <cstring>

namespace read_faults {
namespace {

char file[4096];
std::atomic<Fault> armed{Fault::kNone};
std::atomic<int> calls{0};
std::atomic<int> failing{0};

bool IsTheFile(int descriptor) {
    char link[64];
    char target[4096];
    std::snprintf(link, sizeof link, "/proc/self/fd/%d", descriptor);
    const ssize_t length = readlink(link, target, sizeof target - 1);
    if (length <= 0) {
        return false;
    }
    target[length] = 0;
    return std::strcmp(target, file) == 0;
}

// Whether this call is the one that goes wrong.
bool Fails() {
    return ++calls == failing;
}

bool IsReadFault(Fault fault) {
    return fault == Fault::kReadFails || fault == Fault::kReadEnds || fault == Fault::kReadShort;
}

template <class Function>
Function Next(const char* name) {
    return reinterpret_cast<Function>(dlsym(RTLD_NEXT, name));
}

}  // namespace

void Arm(const std::filesystem::path& path, Fault fault, int number) {
    std::snprintf(file, sizeof file, "%s", std::filesystem::canonical(path).c_str());
    calls = 0;
    failing = number;
    armed = fault;
}

void Disarm() {
    armed = Fault::kNone;
}

int Calls() {
    return calls;
}

}  // namespace read_faults

using read_faults::armed;
using read_faults::Fault;

extern "C" {

__attribute__((visibility("default"))) ssize_t read(int descriptor, void* buffer,
                                                    std::size_t size) {
    static const auto next = read_faults::Next<ssize_t (*)(int, void*, std::size_t)>("read");
    const Fault fault = armed;
    if (read_faults::IsReadFault(fault) && read_faults::IsTheFile(descriptor) &&
        read_faults::Fails()) {
        if (fault == Fault::kReadFails) {
            errno = EIO;
            return -1;
        }
        return fault == Fault::kReadEnds ? 0 : next(descriptor, buffer, size / 2);
    }
    return next(descriptor, buffer, size);
}

static off64_t SeekOr(int descriptor, off64_t offset, int origin) {
    static const auto next = read_faults::Next<off64_t (*)(int, off64_t, int)>("lseek64");
    if (armed == Fault::kSeekFails && read_faults::IsTheFile(descriptor) && read_faults::Fails()) {
        errno = EIO;
        return -1;
    }
    return next(descriptor, offset, origin);
}

__attribute__((visibility("default"))) off_t lseek(int descriptor, off_t offset,
                                                   int origin) noexcept {
    return SeekOr(descriptor, offset, origin);
}

__attribute__((visibility("default"))) off64_t lseek64(int descriptor, off64_t offset,
                                                       int origin) noexcept {
    return SeekOr(descriptor, offset, origin);
}

// The path may lead to the file by links.
static bool RefusesOpening(const char* path) {
    char whole[PATH_MAX];
    return armed == Fault::kOpenFails && realpath(path, whole) &&
           std::strcmp(whole, read_faults::file) == 0 && read_faults::Fails();
}

__attribute__((visibility("default"))) int open(const char* path, int flags, ...) {
    static const auto next = read_faults::Next<int (*)(const char*, int, ...)>("open");
    va_list arguments;
    va_start(arguments, flags);
    const unsigned mode = va_arg(arguments, unsigned);
    va_end(arguments);
    if (RefusesOpening(path)) {
        errno = EMFILE;
        return -1;
    }
    return next(path, flags, mode);
}

__attribute__((visibility("default"))) int open64(const char* path, int flags, ...) {
    static const auto next = read_faults::Next<int (*)(const char*, int, ...)>("open64");
    va_list arguments;
    va_start(arguments, flags);
    const unsigned mode = va_arg(arguments, unsigned);
    va_end(arguments);
    if (RefusesOpening(path)) {
        errno = EMFILE;
        return -1;
    }
    return next(path, flags, mode);
}

}  // extern "C"
