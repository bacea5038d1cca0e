// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <CLI/CLI.hpp>

#include "reference_host/cliphost/MovieColumns.h"

namespace cliphost {

// Adds --columns to a verb; the table is read later.
void AddColumnsOption(CLI::App& verb, GivenColumns& columns);

}  // namespace cliphost
