// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <atomic>

#include "host_interfaces/framework/Types.h"

// A mutex that processes share by name, with a guard against taking it twice.
// Part of the logger's design for a sink that several processes write to one
// file; nothing makes one yet. Trouble is told on standard output.
class SharedNamedMutex {
public:
    explicit SharedNamedMutex(const char* name);
    ~SharedNamedMutex();  // unlocks and closes
    SharedNamedMutex(const SharedNamedMutex&) = delete;
    SharedNamedMutex& operator=(const SharedNamedMutex&) = delete;

    // Returns at once when this thread and module own it already.
    void Lock();
    void Unlock();

    bool IsOwned() const { return owningThread_ != 0; }

private:
    void* handle_;
    std::atomic<ncfUInt64> owningThread_{0};
    std::atomic<const void*> owningModule_{nullptr};
};
