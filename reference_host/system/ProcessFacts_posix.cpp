// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include <dlfcn.h>
#include <malloc.h>

#include <algorithm>
#include <filesystem>
#include <system_error>

#include "reference_host/system/ProcessFacts.h"

namespace host::system {
namespace {

std::size_t EntriesOf(const char* folder) {
    std::error_code error;
    const std::filesystem::directory_iterator entries(folder, error);
    return error ? 0 : static_cast<std::size_t>(std::distance(begin(entries), end(entries)));
}

std::size_t AllocatedBytes() {
    // There in a process that runs under a sanitizer, which has an allocator of its own.
    using AllocatedNow = std::size_t (*)();
    if (void* const place = dlsym(RTLD_DEFAULT, "__sanitizer_get_current_allocated_bytes")) {
        return reinterpret_cast<AllocatedNow>(place)();
    }
    const struct mallinfo2 facts = mallinfo2();
    return facts.uordblks + facts.hblkhd;
}

}  // namespace

ProcessFacts OwnFacts() {
    ProcessFacts facts;
    facts.threads = EntriesOf("/proc/self/task");
    facts.handles = EntriesOf("/proc/self/fd");
    facts.memory = AllocatedBytes();
    return facts;
}

}  // namespace host::system
