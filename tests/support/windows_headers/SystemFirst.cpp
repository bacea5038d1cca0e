// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// A program that knows the system's component model before it meets the AAF headers.

#include <windows.h>

#include <objbase.h>

#include "host_interfaces/aaf/AAF.h"
#include "host_interfaces/aaf/AAFExports.h"
#include "host_interfaces/framework/PluginEntry.h"
#include "tests/support/windows_headers/ImplementUnknown.h"

LPUNKNOWN MakeProgressAfterSystem() {
    return MakeProgress();
}
