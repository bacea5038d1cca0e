// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/validate/Locks.h"

#include "reference_host/framework/RecursiveLock.h"

namespace validate {
namespace {

class CountingLock final : public host::Component<INCFLock> {
public:
    explicit CountingLock(LockCalls& calls) : calls_(calls) {}
    NCFRESULT Lock() override {
        const NCFRESULT result = lock_->Lock();
        calls_.taken += result >= 0 ? 1 : 0;
        return result;
    }
    NCFRESULT Unlock() override {
        const NCFRESULT result = lock_->Unlock();
        ++(result >= 0 ? calls_.givenBack : calls_.refused);
        return result;
    }

private:
    LockCalls& calls_;
    host::Ref<host::RecursiveLock> lock_ = host::MakeRef<host::RecursiveLock>();
};

}  // namespace

void RegisterCountingLocks(host::Host& host, LockCalls& calls) {
    host.RegisterComponent(CompID_LockComponent, host::MakerOf([&calls](INCFUnknown*) {
                               return host::MakeRef<CountingLock>(calls);
                           }));
}

void ExpectGivenBack(const Trial& trial, const LockCalls& calls) {
    trial.Expect(calls.refused == 0, "only locks that are held are given back",
                 std::to_string(calls.refused) + " times one was not held");
    trial.Expect(calls.taken == calls.givenBack, "each lock is given back as often as it was taken",
                 std::to_string(calls.taken) + " times taken, " + std::to_string(calls.givenBack) +
                     " times given back");
}

}  // namespace validate
