// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// A library of one function, for tests of where a module lies.
extern "C" __attribute__((visibility("default"))) int OsTestLibrary() {
    return 1;
}
