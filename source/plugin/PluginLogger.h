// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/util/NMALogger.h"

// The line logger of the process, named when the module starts. Works at any
// time, also while the process ends.
NMALogger& PluginLogger();
