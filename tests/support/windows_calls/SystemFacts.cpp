// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// That the real system's headers say what the tests' windows.h says.

#include <windows.h>

#include <malloc.h>

#include "tests/support/windows_calls/Facts.h"
