// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/system/OutputStream.h"

#include <fcntl.h>
#include <io.h>

#include <algorithm>
#include <cerrno>
#include <utility>

#include "reference_host/system/WindowsCalls.h"

namespace host::system {
namespace {

constexpr int kStandardOutput = 1;
// A pipe takes no more at once than it has room for.
constexpr std::size_t kMostAtOnce = std::size_t{1} << 20;

}  // namespace

std::optional<int> DescriptorOf(const std::filesystem::path& path) {
    return path == L"-" ? std::optional(kStandardOutput) : std::nullopt;
}

bool IsStandardOutput(const std::filesystem::path& path) {
    return DescriptorOf(path) == kStandardOutput;
}

int StandardOutputError(int error) {
    // The library knows no number for a pipe that nobody reads.
    return error == EINVAL && _doserrno == ERROR_NO_DATA ? EPIPE : error;
}

int OutputStream::Open(const std::filesystem::path& path) {
    // Others may remove it, so that a signal can.
    OwnedHandle file(CreateFileW(path.c_str(), GENERIC_WRITE,
                                 FILE_SHARE_READ | FILE_SHARE_WRITE | FILE_SHARE_DELETE, nullptr,
                                 CREATE_ALWAYS, FILE_ATTRIBUTE_NORMAL, nullptr));
    if (!file.IsOpen()) {
        return LastErrorNumber();
    }
    descriptor_ = _open_osfhandle(reinterpret_cast<std::intptr_t>(file.get()), _O_BINARY);
    if (descriptor_ < 0) {
        return errno;
    }
    file.Release();
    return 0;
}

int OutputStream::OpenCopyOf(int descriptor) {
    descriptor_ = _dup(descriptor);
    return descriptor_ < 0 ? errno : 0;
}

int OutputStream::Write(const void* bytes, std::size_t size) {
    const auto file = reinterpret_cast<HANDLE>(_get_osfhandle(descriptor_));
    const char* from = static_cast<const char*>(bytes);
    while (size > 0) {
        DWORD done = 0;
        const auto now = static_cast<DWORD>(std::min(size, kMostAtOnce));
        if (!WriteFile(file, from, now, &done, nullptr)) {
            return LastErrorNumber();
        }
        if (done == 0) {
            return EIO;
        }
        from += done;
        size -= done;
    }
    return 0;
}

int OutputStream::Close() {
    const int open = std::exchange(descriptor_, -1);
    return open >= 0 && _close(open) != 0 ? errno : 0;
}

}  // namespace host::system
