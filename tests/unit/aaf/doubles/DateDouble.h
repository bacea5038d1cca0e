// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "source/plugin/os/Os.h"

// The answers to the two questions for a file's date. A program that links the
// double gets them in place of the system's.
struct DateDouble {
    bool isQueried = true;
    bool isConverted = true;
    os::DateTime date{2001, 9, 9, 1, 1, 2, 3};
};

extern DateDouble dateDouble;
