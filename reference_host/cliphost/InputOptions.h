// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <CLI/CLI.hpp>

#include "reference_host/cliphost/MoviePlan.h"

namespace cliphost {

// Adds the options by which a verb is told which movies to read: paths, lists, what is taken out
// of folders, and shares. `file` is the verb's option for what is made of the only movie; the verb
// has --out-dir.
void AddInputOptions(CLI::App& verb, MoviesOptions& movies, CLI::Option& file);

// The same for a verb that makes one thing of all movies. Gives the option for a list.
CLI::Option* AddInputOptions(CLI::App& verb, MoviesOptions& movies);

// Refuses a call that names no movie. Throws a problem of the command line.
void NeedInputs(const MoviesOptions& movies);

}  // namespace cliphost
