// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <CLI/CLI.hpp>

#include "reference_host/cliphost/Session.h"
#include "reference_host/cliphost/Workers.h"

namespace cliphost {

// What help says of the options of a verb.
struct WorkerWords {
    const char* group;
    const char* jobs;
    const char* seconds;
    const char* memory;
};
extern const WorkerWords kManyMovies;
extern const WorkerWords kManyFrames;

// Adds --jobs, --limit-seconds and --limit-memory to a verb.
void AddWorkerOptions(CLI::App& verb, WorkerCall& call, const WorkerWords& words = kManyMovies);

// Has the work done by processes of another verb: they are given again what the command line gives
// before any verb, and what it gives this verb and the other one takes as well.
void TakeWorkerVerb(CLI::App& app, const CLI::App& verb, const std::string& worker,
                    const SessionOptions& session, WorkerCall& call);

}  // namespace cliphost
