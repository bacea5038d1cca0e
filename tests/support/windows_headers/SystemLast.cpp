// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// The same where the AAF headers come first.

#include "host_interfaces/aaf/AAF.h"
#include "host_interfaces/aaf/AAFExports.h"
#include "host_interfaces/framework/PluginEntry.h"
#include "tests/support/windows_headers/ImplementUnknown.h"

#include <windows.h>

#include <objbase.h>

LPUNKNOWN MakeProgressBeforeSystem() {
    return MakeProgress();
}
