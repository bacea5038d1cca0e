// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <string>
#include <vector>

#include "host_interfaces/framework/Types.h"

// Memory at a multiple of `alignment`, which is a power of two.
void* NewAligned(std::size_t size, std::size_t alignment);
void DeleteAligned(void* memory);

// The operating system of one test: one file in memory, on a volume of any
// sector size, with failures on request. Stands in for the real one when it is
// linked first. Like a real volume it refuses reads that are not aligned.
struct FakeOs {
    static FakeOs& Get();

    std::vector<ncfUInt8> content;
    ncfUInt32 sectorSize = 2048;  // 0: the volume doesn't tell
    bool openFails = false;
    bool openThrows = false;  // something that is no result
    bool closeFails = false;
    bool sizeFails = false;
    bool positionFails = false;
    bool readFails = false;
    bool outOfMemory = false;
    ncfUInt32 error = 0;

    std::u16string openedPath;
    std::u16string askedRoot;
    int opens = 0;
    int closes = 0;
    int sizeQuestions = 0;
    ncfUInt64 position = 0;
    // Each read: where it started, how much it asked for.
    struct Access {
        ncfUInt64 position;
        ncfUInt32 size;
    };
    std::vector<Access> reads;
    int misaligned = 0;  // reads that a real volume refuses
    int allocations = 0;
    int liveBuffers = 0;
    std::size_t largestBuffer = 0;

    void* lastBuffer = nullptr;
};
