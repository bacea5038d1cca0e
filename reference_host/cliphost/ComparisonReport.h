// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <filesystem>
#include <nlohmann/json_fwd.hpp>
#include <string>

#include "reference_host/cliphost/AafComparison.h"

namespace cliphost {

// What is left out of a comparison, for the help of verbs.
inline constexpr char kLeftOutOfComparison[] =
    "What always differs is left out: who wrote a file and when (CreationTime, LastModified, "
    "Generation, the\nidentifications). Definitions count where they are used.";

// Prints differences for people as they come, each object's under its name.
class ComparisonLines {
public:
    void Take(const ComparedObject& object, const TreeDifference& difference);
    // The last line.
    void Finish(const ComparisonCounts& counts);

private:
    std::string told_;  // what the last lines are of
};

nlohmann::ordered_json ToJson(const ComparedObject& object, const TreeDifference& difference);
nlohmann::ordered_json ToJson(const ComparisonCounts& counts);

// 0 or 1.
int StatusOf(const ComparisonCounts& counts);

}  // namespace cliphost
