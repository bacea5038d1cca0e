// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <string>

#include "host_interfaces/framework/ResultCodes.h"
#include "host_interfaces/util/NMAString.h"

namespace NMA::Impl {

// Root of the volume of a path with backslashes: the first three
// characters of "C:\...", "\\server\share\" of a network path with that much
// in it, else empty.
std::u16string VolumeRootOf(const std::u16string& path);

// Reads a few places of a file and brings nothing else of it into the system's
// cache. On Windows that means reads past the cache, which must start and end at
// sector borders of the volume and go to an aligned address. This class hides that
// from its callers, and reads so on every system. The file is opened by the first
// operation that needs it, which throws NCF_E_HANDLE when that fails. One object
// belongs to one thread.
class SimpleFileIO {
public:
    // Takes a copy of the path, which is borrowed; doesn't touch the file.
    explicit SimpleFileIO(INCFString* path);
    SimpleFileIO(const SimpleFileIO&) = delete;
    SimpleFileIO& operator=(const SimpleFileIO&) = delete;

    virtual ~SimpleFileIO();
    virtual NCFRESULT GetFileSize(ncfUInt64* size);
    // Bytes to which place and size of a read are best aligned; either output
    // may be null.
    virtual NCFRESULT GetAlignment(ncfUInt32* offsetAlignment, ncfUInt32* sizeAlignment);
    // Reads up to `size` bytes at `position`. NMA_E_NODATA behind the end of
    // the file. Near the end `*bytesRead` may count bytes that lie behind it;
    // those are zero.
    virtual NCFRESULT Read(ncfUInt64 position, void* buffer, ncfUInt32 size, ncfUInt32* bytesRead);

    NCFRESULT GetLength(ncfUInt64* size) { return GetFileSize(size); }

private:
    void OpenIfNeeded();
    bool IsAligned(const void* address) const;
    NCFRESULT GrowAlignedBuffer(ncfUInt32 size);
    NCFRESULT ReadAligned(ncfUInt64 start, void* buffer, ncfUInt32 size, ncfUInt32* bytesRead);

    NMAString path_;
    ncfSInt64 file_;  // handle of the open file, or none
    ncfUInt64 fileSize_ = 0;
    ncfUInt32 sectorSize_;
    ncfUInt8* alignedBuffer_ = nullptr;
    ncfUInt32 alignedBufferSize_ = 0;
};

}  // namespace NMA::Impl
