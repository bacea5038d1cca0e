// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <CLI/CLI.hpp>

#include "reference_host/cliphost/Workers.h"

namespace cliphost {

// Adds --jobs, --limit-seconds and --limit-memory to a verb.
void AddWorkerOptions(CLI::App& verb, WorkerCall& call);

// The options that the command line gives before any verb, to be given again.
std::vector<std::string> GivenOptions(const CLI::App& app);

}  // namespace cliphost
