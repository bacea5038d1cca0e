// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/framework/RecursiveLock.h"

#include "reference_host/framework/Guard.h"

namespace host {

NCFRESULT RecursiveLock::Lock() {
    return Guarded([this] {
        mutex_.lock();
        owner_.store(std::this_thread::get_id(), std::memory_order_relaxed);
        ++depth_;
        return NCF_OK;
    });
}

NCFRESULT RecursiveLock::Unlock() {
    // Only this thread can have put its own id there.
    if (owner_.load(std::memory_order_relaxed) != std::this_thread::get_id()) {
        return NCF_E_FAIL;
    }
    if (--depth_ == 0) {
        owner_.store(std::thread::id(), std::memory_order_relaxed);
    }
    mutex_.unlock();
    return NCF_OK;
}

}  // namespace host
