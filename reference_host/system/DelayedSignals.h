// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <vector>

namespace host::system {

// While it lives, a signal that asks the program to end, such as an interrupt from the
// keyboard, is only noted, so that processes and folders can be put away. It takes its
// effect when the object ends. Signals that the caller ignores stay ignored. Of several
// objects the first is the one that counts.
class DelayedSignals {
public:
    // Where the work at hand may take long: the line is written on standard error when a
    // signal comes, and one that comes a second later or more ends the program at once.
    explicit DelayedSignals(const char* line = nullptr);
    ~DelayedSignals();
    DelayedSignals(const DelayedSignals&) = delete;
    DelayedSignals& operator=(const DelayedSignals&) = delete;

    static bool HaveCome() { return Which() != 0; }
    static int Which();  // 0: none has come
    // Whether it told that nobody reads what we write any more.
    static bool ReaderHasGone();

private:
    struct Before;  // what was settled for a signal
    std::vector<Before> before_;
};

}  // namespace host::system
