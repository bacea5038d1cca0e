// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/MapOption.h"

namespace cliphost {

void AddMapOption(CLI::App& verb, PathMaps& maps, const std::string& help) {
    verb.add_option_function<std::vector<std::string>>(
            "--map",
            [&maps](const std::vector<std::string>& rules) {
                for (const std::string& rule : rules) {
                    maps.Add(rule);
                }
            },
            help)
        ->allow_extra_args(false);
}

std::vector<Failure> UnusedMaps(const PathMaps& maps, const std::string& hint) {
    std::vector<Failure> failures;
    for (const std::string& rule : maps.Unused()) {
        failures.emplace_back(kExitCaller, "--map " + rule, "nothing was mapped by it", hint);
    }
    return failures;
}

}  // namespace cliphost
