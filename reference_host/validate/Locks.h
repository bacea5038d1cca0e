// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <atomic>

#include "reference_host/framework/Host.h"
#include "reference_host/validate/Trial.h"

namespace validate {

// What a module did with the host's locks.
struct LockCalls {
    std::atomic<int> taken{0};
    std::atomic<int> givenBack{0};
    std::atomic<int> refused{0};  // given back by who does not hold them
};

// Puts locks that count in place of the host's; `calls` outlives the host.
void RegisterCountingLocks(host::Host& host, LockCalls& calls);

// Ends the check as failed where a lock is still held, or was given back once too often.
void ExpectGivenBack(const Trial& trial, const LockCalls& calls);

}  // namespace validate
