// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "tests/unit/clips/os_fake/FakeOs.h"

#include <algorithm>
#include <cstdlib>
#include <cstring>
#include <new>

#include "source/plugin/os/Os.h"

namespace {

constexpr os::FileHandle kTheFile = 0;  // a handle like any other

}  // namespace

void* NewAligned(std::size_t size, std::size_t alignment) {
#ifdef _WIN32
    return _aligned_malloc(size, alignment);
#else
    return std::aligned_alloc(alignment, (size + alignment - 1) / alignment * alignment);
#endif
}

void DeleteAligned(void* memory) {
#ifdef _WIN32
    _aligned_free(memory);
#else
    std::free(memory);
#endif
}

FakeOs& FakeOs::Get() {
    static FakeOs system;
    return system;
}

namespace os {

ncfUInt32 LastError() {
    return FakeOs::Get().error;
}

FileHandle OpenForReading(const std::u16string& path) {
    FakeOs& system = FakeOs::Get();
    ++system.opens;
    system.openedPath = path;
    if (system.openThrows) {
        throw std::bad_alloc();
    }
    return system.openFails ? kNoFile : kTheFile;
}

bool Close(FileHandle) {
    ++FakeOs::Get().closes;
    return !FakeOs::Get().closeFails;
}

bool GetFileSize(FileHandle, ncfUInt64* size) {
    FakeOs& system = FakeOs::Get();
    ++system.sizeQuestions;
    *size = system.sizeFails ? 4711 : system.content.size();
    return !system.sizeFails;
}

bool GetSectorSize(FileHandle, const std::u16string& volumeRoot, ncfUInt32* bytes) {
    FakeOs& system = FakeOs::Get();
    system.askedRoot = volumeRoot;
    *bytes = system.sectorSize;
    return system.sectorSize != 0;
}

bool SetPosition(FileHandle, ncfUInt64 position) {
    FakeOs::Get().position = position;
    return !FakeOs::Get().positionFails;
}

bool Read(FileHandle, void* buffer, ncfUInt32 size, ncfUInt32* bytesRead) {
    FakeOs& system = FakeOs::Get();
    system.reads.push_back({system.position, size});
    system.lastBuffer = buffer;
    const ncfUInt32 sector = system.sectorSize ? system.sectorSize : 2048;
    if (system.position % sector != 0 || size % sector != 0 ||
        reinterpret_cast<std::uintptr_t>(buffer) % sector != 0) {
        ++system.misaligned;
    }
    if (system.readFails) {
        return false;
    }
    const ncfUInt64 length = system.content.size();
    const ncfUInt64 left = system.position < length ? length - system.position : 0;
    *bytesRead = static_cast<ncfUInt32>(std::min<ncfUInt64>(left, size));
    if (*bytesRead != 0) {
        std::memcpy(buffer, system.content.data() + system.position, *bytesRead);
    }
    return true;
}

void* AllocateAligned(std::size_t size, std::size_t alignment) {
    FakeOs& system = FakeOs::Get();
    ++system.allocations;
    system.largestBuffer = std::max(system.largestBuffer, size);
    if (system.outOfMemory) {
        return nullptr;
    }
    ++system.liveBuffers;
    void* const memory = NewAligned(size, alignment);
    std::memset(memory, 0xEE, size);  // stale bytes show
    return memory;
}

void FreeAligned(void* memory) {
    if (memory) {
        --FakeOs::Get().liveBuffers;
    }
    DeleteAligned(memory);
}

void ExpectLargeBlock(void*, std::size_t) {}

}  // namespace os
