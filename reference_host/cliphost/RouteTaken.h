// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <filesystem>
#include <nlohmann/json_fwd.hpp>
#include <string>

#include "reference_host/cliphost/Problem.h"
#include "reference_host/header_parser/InspectHeaders.h"

namespace cliphost {

// By which way a movie is read, and why not by the header parser where it refuses.
struct RouteTaken {
    const char* route;
    std::string reason;  // empty on the first route
};
RouteTaken RouteOf(const std::filesystem::path& movie);
RouteTaken RouteOf(const header_parser::HeaderReport& header);

// Tells on standard error that a movie is read by the second route, and why; from
// verbosity 1 on.
void TellRoute(const std::filesystem::path& movie, int verbosity);
// Sets "route", and "routeReason" on the second one.
void AddRoute(const std::filesystem::path& movie, nlohmann::ordered_json& json);
// What a movie's answer tells of it: the problem with it, or else its route.
void AddProblemOrRoute(const Problem& problem, const std::filesystem::path& movie,
                       nlohmann::ordered_json& json);

}  // namespace cliphost
