// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/plugin/SharedNamedMutex.h"

#include <iostream>

#include "source/plugin/os/Os.h"

namespace {

const char* TextOf(os::Wait outcome) {
    switch (outcome) {
        case os::Wait::kAbandoned:
            return "WAIT_ABANDONED - ";
        case os::Wait::kTimeout:
            return "WAIT_TIMEOUT - ";
        case os::Wait::kFailed:
            return "WAIT_FAILED - ";
        default:
            return "UNDEFINED_BEHAVIOUR - ";
    }
}

}  // namespace

SharedNamedMutex::SharedNamedMutex(const char* name) : handle_(os::CreateNamedMutex(name)) {
    if (!handle_) {
        const ncfUInt32 error = os::LastError();
        std::cout << "Error create shared mutex" << (name ? name : "")
                  << "err: " << os::ErrorText(error) << std::endl;
    }
}

SharedNamedMutex::~SharedNamedMutex() {
    Unlock();
    os::CloseMutex(handle_);
}

void SharedNamedMutex::Lock() {
    const ncfUInt64 thread = os::CurrentThreadId();
    const void* const module = os::OwnModule();
    if (owningThread_ == thread && owningModule_ == module) {
        return;
    }
    const os::Wait outcome = os::WaitForMutex(handle_);
    const ncfUInt32 error = os::LastError();
    if (outcome == os::Wait::kAcquired) {
        owningThread_ = thread;
        owningModule_ = module;
        return;
    }
    std::cout << TextOf(outcome) << "Lock shared mutex: " << handle_
              << "; code: " << os::ErrorText(error) << std::endl;
}

void SharedNamedMutex::Unlock() {
    if (os::ReleaseMutex(handle_)) {
        owningThread_ = 0;
        owningModule_ = nullptr;
    }
}
