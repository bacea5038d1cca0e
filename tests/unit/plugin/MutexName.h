// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <unistd.h>

#include <string>

#ifndef _WIN32
#include <sys/mman.h>
#endif

// A mutex name of this process alone, gone at the end.
class MutexName {
public:
    MutexName() = default;
    MutexName(const MutexName&) = delete;
    MutexName& operator=(const MutexName&) = delete;
    ~MutexName() {
#ifndef _WIN32  // where a mutex goes with the last who has it
        shm_unlink(("/" + name_).c_str());
#endif
    }

    const char* c_str() const {
        return name_.c_str();
    }

private:
    const std::string name_ = "cliphost-test-" + std::to_string(getpid());
};
