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

// Prints a comparison as one JSON object, each difference as it is found: there may be more of them
// than memory. What ends before Finish is no JSON.
class ComparisonJson {
public:
    // `head` has the members before the differences. Either one line, or lines that stand inside
    // other JSON behind so many spaces.
    enum class Form { Lines, OneLine };
    ComparisonJson(const nlohmann::ordered_json& head, Form form, std::size_t spaces = 0);

    void Take(const ComparedObject& object, const TreeDifference& difference);
    // Ends with a line end where the object is not inside another one.
    void Finish(const ComparisonCounts& counts);

private:
    std::string Text(const nlohmann::ordered_json& json, std::size_t level) const;
    std::string LineEnd(std::size_t level) const;

    Form form_;
    std::size_t spaces_;
    bool isFirst_ = true;
};

nlohmann::ordered_json ToJson(const ComparedObject& object, const TreeDifference& difference);
nlohmann::ordered_json ToJson(const ComparisonCounts& counts);

// 0 or 1.
int StatusOf(const ComparisonCounts& counts);

}  // namespace cliphost
