// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/framework/Lock.h"
#include "source/plugin/NCFSmartPtr.h"

// Holds the host's lock for a scope; without a lock it does nothing.
class ProviderLock {
public:
    explicit ProviderLock(const NCFSmartPtr<INCFLock>& lock) : lock_(lock) {
        if (lock_) {
            lock_->Lock();
        }
    }
    ~ProviderLock() {
        if (lock_) {
            lock_->Unlock();
        }
    }
    ProviderLock(const ProviderLock&) = delete;
    ProviderLock& operator=(const ProviderLock&) = delete;

private:
    const NCFSmartPtr<INCFLock> lock_;
};
