// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <filesystem>
#include <nlohmann/json_fwd.hpp>

namespace cliphost {

// Tells on standard error that a movie is read by the second route, and why; from
// verbosity 1 on.
void TellRoute(const std::filesystem::path& movie, int verbosity);
// Sets "route", and "routeReason" on the second one.
void AddRoute(const std::filesystem::path& movie, nlohmann::ordered_json& json);

}  // namespace cliphost
