// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <CLI/CLI.hpp>
#include <string>
#include <vector>

#include "reference_host/cliphost/Failure.h"
#include "reference_host/cliphost/PathMaps.h"

namespace cliphost {

// Adds --map to a verb.
void AddMapOption(CLI::App& verb, PathMaps& maps, const std::string& help);

// What to tell of the rules that nothing was mapped by.
std::vector<Failure> UnusedMaps(const PathMaps& maps, const std::string& hint);

}  // namespace cliphost
