// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <csignal>
#include <vector>

namespace host::system {

// While it lives, a signal that asks the program to end, such as an interrupt from the
// keyboard, is only noted, so that processes and folders can be put away. It takes its
// effect when the object ends. Signals that the caller ignores stay ignored.
class DelayedSignals {
public:
    DelayedSignals();
    ~DelayedSignals();
    DelayedSignals(const DelayedSignals&) = delete;
    DelayedSignals& operator=(const DelayedSignals&) = delete;

    static bool HaveCome();

private:
    struct Before {
        int signal;
        struct sigaction action;
    };
    std::vector<Before> before_;
};

}  // namespace host::system
