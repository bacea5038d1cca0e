// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <string>

#include "host_interfaces/util/NMAString.h"

// The module's own folder, with its closing separator: set at start-up, where
// the data files beside the module are looked for. Never destroyed by the
// run-time, since the host may be gone when the process ends.
void SetPluginFolder(INCFString* folder);  // takes a reference; null clears it
// Borrowed; null before start-up and after shut-down.
INCFString* GetPluginFolder();
