// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "public_include/SimpleFileIO.h"

#include <algorithm>
#include <cstring>

#include "source/plugin/PluginLogger.h"
#include "source/plugin/ResultChecks.h"
#include "source/plugin/os/Os.h"

namespace NMA::Impl {
namespace {

constexpr char kSourceName[] = "public_include/SimpleFileIO";

// Where the volume doesn't tell.
constexpr ncfUInt32 kDefaultSectorSize = 2048;

constexpr ncfUInt64 kLargestPosition = 0x7FFFFFFFFFFFFFFFull;

std::u16string PathText(const NMAString& path) {
    const ncfUTF16* const text = path.GetUTF16String();
    return text ? std::u16string(text) : std::u16string();
}

// A failed system call, with the system's error number and the line of the call.
void TellSystemError(const char* what, int line = __builtin_LINE()) {
    const ncfUInt32 error = os::LastError();
    PluginLogger().Write(1, "SimpleFileIO error. %s HRESULT = 0x%x, %s(%d)", what, error,
                         kSourceName, line);
}

}  // namespace

std::u16string VolumeRootOf(const std::u16string& path) {
    if (path.size() >= 3 && path[1] == u':' && path[2] == u'\\') {
        return path.substr(0, 3);
    }
    if (path.compare(0, 2, u"\\\\") != 0) {
        return {};
    }
    const std::size_t third = path.find(u'\\', 3);
    const std::size_t fourth = third == std::u16string::npos ? third : path.find(u'\\', third + 1);
    return fourth == std::u16string::npos ? std::u16string() : path.substr(0, fourth + 1);
}

SimpleFileIO::SimpleFileIO(INCFString* path)
    : path_(path, kNCFUTF16), file_(os::kNoFile), sectorSize_(kDefaultSectorSize) {}

SimpleFileIO::~SimpleFileIO() {
    if (file_ != os::kNoFile && !os::Close(file_)) {
        TellSystemError("CloseHandle failed.");
    }
    os::FreeAligned(alignedBuffer_);
}

void SimpleFileIO::OpenIfNeeded() {
    if (file_ != os::kNoFile) {
        return;
    }
    const std::u16string path = PathText(path_);
    file_ = os::OpenForReading(path);
    if (file_ == os::kNoFile) {
        TellSystemError("CreateFileW failed.");
        ThrowIfFailed(NCF_E_HANDLE);
    }
    ncfUInt32 bytesPerSector = 0;
    if (os::GetSectorSize(file_, VolumeRootOf(path), &bytesPerSector) && bytesPerSector != 0) {
        sectorSize_ = bytesPerSector;
    }
}

NCFRESULT SimpleFileIO::GetFileSize(ncfUInt64* size) {
    if (!size) {
        return NCF_E_POINTER;
    }
    if (fileSize_ == 0) {
        OpenIfNeeded();
        ncfUInt64 length = 0;
        if (!os::GetFileSize(file_, &length)) {
            TellSystemError("GetFileInformationByHandle failed.");
            length = 0;
        }
        fileSize_ = length;
    }
    *size = fileSize_;
    return NCF_OK;
}

NCFRESULT SimpleFileIO::GetAlignment(ncfUInt32* offsetAlignment, ncfUInt32* sizeAlignment) {
    OpenIfNeeded();
    if (offsetAlignment) {
        *offsetAlignment = sectorSize_;
    }
    if (sizeAlignment) {
        *sizeAlignment = sectorSize_;
    }
    return NCF_OK;
}

bool SimpleFileIO::IsAligned(const void* address) const {
    return reinterpret_cast<std::uintptr_t>(address) % sectorSize_ == 0;
}

// Never shrinks; the content is dropped.
NCFRESULT SimpleFileIO::GrowAlignedBuffer(ncfUInt32 size) {
    if (size <= alignedBufferSize_) {
        return NCF_OK;
    }
    os::FreeAligned(alignedBuffer_);
    alignedBufferSize_ = 0;
    alignedBuffer_ = static_cast<ncfUInt8*>(os::AllocateAligned(size, sectorSize_));
    if (!alignedBuffer_) {
        return NCF_E_OUTOFMEMORY;
    }
    alignedBufferSize_ = size;
    return NCF_OK;
}

NCFRESULT SimpleFileIO::ReadAligned(ncfUInt64 start, void* buffer, ncfUInt32 size,
                                    ncfUInt32* bytesRead) {
    if (!os::SetPosition(file_, start)) {
        TellSystemError("SetFilePointerEx failed.");
        return NCF_E_HANDLE;
    }
    if (!os::Read(file_, buffer, size, bytesRead)) {
        TellSystemError("ReadFile failed.");
        return NCF_E_HANDLE;
    }
    if (*bytesRead == 0) {
        TellSystemError("ReadFile read 0 bytes.");
        return NMA_E_NODATA;
    }
    return NCF_OK;
}

// The range asked for, widened to whole sectors:
//
//     | sector        | sector        | sector        |
//     start    position                position + size
//     |--head--|-------------size-----|----|
//     |---------------alignedSize----------|
NCFRESULT SimpleFileIO::Read(ncfUInt64 position, void* buffer, ncfUInt32 size,
                             ncfUInt32* bytesRead) {
    if (!buffer) {
        return NCF_E_POINTER;
    }
    if (!bytesRead) {
        return NCF_E_INVALIDARG;
    }
    *bytesRead = 0;
    OpenIfNeeded();
    if (size == 0) {
        return NCF_OK;
    }
    if (position > kLargestPosition) {
        return NCF_E_HANDLE;
    }
    const auto head = static_cast<ncfUInt32>(position % sectorSize_);
    const auto tail = static_cast<ncfUInt32>((position + size) % sectorSize_);
    const ncfUInt64 start = position - head;
    const ncfUInt64 alignedSize = ncfUInt64{size} + head + (tail != 0 ? sectorSize_ - tail : 0);
    if (alignedSize > 0xFFFFFFFFull) {
        return NCF_E_HANDLE;
    }
    const auto wanted = static_cast<ncfUInt32>(alignedSize);
    ncfUInt32 done = 0;

    if (head == 0 && tail == 0 && IsAligned(buffer)) {
        const NCFRESULT result = ReadAligned(start, buffer, wanted, &done);
        if (result < 0) {
            return result;
        }
        *bytesRead = std::min(done, size);
        return NCF_OK;
    }

    NCFRESULT result = GrowAlignedBuffer(wanted);
    if (result < 0) {
        return result;
    }
    result = ReadAligned(start, alignedBuffer_, wanted, &done);
    if (result < 0) {
        return result;
    }
    // Bytes behind the end of the file come out as zeros, never as what an
    // earlier read left: content must not depend on the sector size.
    std::memset(alignedBuffer_ + done, 0, wanted - done);
    *bytesRead = std::min(done, size);
    std::memcpy(buffer, alignedBuffer_ + head, *bytesRead);
    return NCF_OK;
}

}  // namespace NMA::Impl
