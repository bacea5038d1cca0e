// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <CLI/CLI.hpp>

#include "reference_host/cliphost/ClipCheck.h"

namespace cliphost {

// Adds --map, --search and what is said of many movies to a verb; gives --search.
CLI::Option* AddCheckOptions(CLI::App& verb, CheckOptions& options);

// Has movies described by child processes, which show nothing of them.
void TakeDescribingWorkers(CLI::App& app, const SessionOptions& session, WorkerCall& call);

}  // namespace cliphost
