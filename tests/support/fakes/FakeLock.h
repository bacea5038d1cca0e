// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <functional>

#include "host_interfaces/framework/Lock.h"
#include "tests/support/fakes/FakeObject.h"
#include "tests/support/fakes/Journal.h"

// Lock that writes "lock" and "unlock" into the journal. `whenLocked`, when set,
// is called before the lock is taken and may throw.
class FakeLock : public FakeObject<INCFLock> {
public:
    explicit FakeLock(Journal* journal = nullptr) : journal_(journal) {}

    std::function<void()> whenLocked;

    NCFRESULT Lock() override {
        if (whenLocked) {
            whenLocked();
        }
        ++depth_;
        if (journal_) {
            journal_->add("lock");
        }
        return NCF_OK;
    }
    NCFRESULT Unlock() override {
        --depth_;
        if (journal_) {
            journal_->add("unlock");
        }
        return NCF_OK;
    }
    int depth() const { return depth_; }

private:
    Journal* journal_;
    int depth_ = 0;
};
