// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <CLI/CLI.hpp>

#include "reference_host/framework/Host.h"

namespace cliphost {

// The options by which the user sets what the host tells a module of itself.
void AddSettings(CLI::App& app, host::HostOptions& host);

}  // namespace cliphost
