// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <atomic>
#include <mutex>
#include <thread>

#include "host_interfaces/framework/Lock.h"
#include "reference_host/framework/Component.h"

namespace host {

// The lock component. One thread may take it several times; giving back what
// the calling thread doesn't hold is NCF_E_FAIL.
class RecursiveLock final : public Component<INCFLock> {
public:
    NCFRESULT Lock() override;
    NCFRESULT Unlock() override;

private:
    std::recursive_mutex mutex_;
    std::atomic<std::thread::id> owner_{};
    ncfUInt32 depth_ = 0;  // the owner's alone
};

}  // namespace host
