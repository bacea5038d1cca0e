// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/RouteTaken.h"

#include <nlohmann/json.hpp>

#include "reference_host/cliphost/Notice.h"
#include "reference_host/framework/HostPath.h"

namespace cliphost {

RouteTaken RouteOf(const header_parser::HeaderReport& header) {
    const std::string refused = header.WhyOfNoUse();
    return {refused.empty() ? route::kHeader : route::kLibrary, refused};
}

RouteTaken RouteOf(const std::filesystem::path& movie) {
    return RouteOf(header_parser::InspectHeaders(movie));
}

void TellRoute(const std::filesystem::path& movie, int verbosity) {
    const RouteTaken taken = verbosity > 0 ? RouteOf(movie) : RouteTaken{};
    if (!taken.reason.empty()) {
        Notice("{}: read by the multimedia library, since the header parser refuses it: {}\n",
               host::DisplayPath(movie), taken.reason);
    }
}

void AddRoute(const std::filesystem::path& movie, nlohmann::ordered_json& json) {
    const RouteTaken taken = RouteOf(movie);
    json["route"] = taken.route;
    if (!taken.reason.empty()) {
        json["routeReason"] = taken.reason;
    }
}

void AddProblemOrRoute(const Problem& problem, const std::filesystem::path& movie,
                       nlohmann::ordered_json& json) {
    if (problem) {
        AddProblem(problem, json);
    } else {
        AddRoute(movie, json);
    }
}

}  // namespace cliphost
