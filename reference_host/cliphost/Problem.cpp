// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/Problem.h"

#include <nlohmann/json.hpp>

#include "reference_host/cliphost/Notice.h"
#include "reference_host/cliphost/ResultText.h"
#include "reference_host/framework/HostPath.h"

namespace cliphost {
namespace {

nlohmann::ordered_json TextOrNull(const std::string& text) {
    return text.empty() ? nlohmann::ordered_json() : nlohmann::ordered_json(text);
}

}  // namespace

std::string LineOf(const Problem& problem) {
    std::string line = problem.reason;
    if (!problem.subject.empty()) {
        line = host::DisplayPath(problem.subject) + ": " + line;
    }
    return problem.hint.empty() ? line : line + "; " + problem.hint;
}

std::string DetailsOf(const Problem& problem) {
    std::string lines;
    if (problem.code != NCF_OK) {
        lines += "  the module's answer: " + ResultText(problem.code) + "\n";
    }
    if (!problem.route.empty()) {
        lines += "  the route: " + problem.route + "\n";
    }
    return lines;
}

void AddProblem(const Problem& problem, nlohmann::ordered_json& json) {
    json["reason"] = TextOrNull(problem.reason);
    json["hint"] = TextOrNull(problem.hint);
    json["code"] = TextOrNull(problem.code == NCF_OK ? "" : ResultName(problem.code));
    json["route"] = TextOrNull(problem.route);
}

void TellProblem(const Problem& problem, int verbosity) {
    Notice("cliphost: {}\n{}", LineOf(problem), verbosity > 0 ? DetailsOf(problem) : "");
}

}  // namespace cliphost
