// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/system/ProcessFacts.h"
#include "reference_host/system/WindowsCalls.h"

// It needs what stands above.
#include <tlhelp32.h>

#include <vector>

namespace host::system {
namespace {

std::size_t OwnThreads() {
    const OwnedHandle all(CreateToolhelp32Snapshot(TH32CS_SNAPTHREAD, 0));
    const DWORD process = GetCurrentProcessId();
    THREADENTRY32 thread{};
    thread.dwSize = sizeof thread;
    std::size_t own = 0;
    for (BOOL isThere = all.IsOpen() && Thread32First(all.get(), &thread); isThere;
         isThere = Thread32Next(all.get(), &thread)) {
        own += thread.th32OwnerProcessID == process ? 1 : 0;
    }
    return own;
}

std::size_t AllocatedIn(HANDLE heap) {
    if (!HeapLock(heap)) {
        return 0;
    }
    std::size_t bytes = 0;
    PROCESS_HEAP_ENTRY block{};
    while (HeapWalk(heap, &block)) {
        bytes += (block.wFlags & PROCESS_HEAP_ENTRY_BUSY) != 0 ? block.cbData : 0;
    }
    HeapUnlock(heap);
    return bytes;
}

std::size_t AllocatedBytes() {
    std::vector<HANDLE> heaps(64);
    const DWORD count = GetProcessHeaps(static_cast<DWORD>(heaps.size()), heaps.data());
    std::size_t bytes = 0;
    for (DWORD i = 0; i < count && i < heaps.size(); ++i) {
        bytes += AllocatedIn(heaps[i]);
    }
    return bytes;
}

}  // namespace

ProcessFacts OwnFacts() {
    ProcessFacts facts;
    facts.threads = OwnThreads();
    DWORD handles = 0;
    facts.handles = GetProcessHandleCount(GetCurrentProcess(), &handles) ? handles : 0;
    facts.memory = AllocatedBytes();
    return facts;
}

}  // namespace host::system
