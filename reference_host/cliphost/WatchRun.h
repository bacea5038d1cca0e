// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "reference_host/cliphost/DescribeRun.h"

namespace cliphost {

struct WatchOptions {
    bool isOn = false;
    unsigned rest = 5;  // seconds
    unsigned poll = 0;  // seconds; 0: the system tells
};

// Describes the movies of folders, first those that are there and then each that arrives, until a
// signal comes. `describe` names the folders as its paths, and the folder for outputs. Throws a
// Failure where a folder is none or outputs can't be written.
void WatchFolders(Session& session, const DescribeOptions& describe, const WatchOptions& watch);

}  // namespace cliphost
