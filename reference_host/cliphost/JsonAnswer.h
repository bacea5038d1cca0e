// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <filesystem>
#include <nlohmann/json.hpp>

#include "reference_host/cliphost/Failure.h"
#include "reference_host/cliphost/JsonSchemas.h"

namespace cliphost {

// An object that says first which schema it has.
nlohmann::ordered_json WithSchema(const char* schema, nlohmann::ordered_json members);

// As it is printed: in lines, each with so many spaces before it.
std::string InLines(const nlohmann::ordered_json& json, std::size_t spaces = 0);

// Prints what a verb answers to --json on standard output. It says its schema, in each entry
// where it is a list.
void PrintJson(const char* schema, nlohmann::ordered_json answer);

// Prints JSON in one line, at once.
void PrintJsonLine(std::string_view json);

// Prints such a line: the movie, and what became of it.
void PrintMovieLine(const char* schema, const std::filesystem::path& movie,
                    const nlohmann::ordered_json& members);
// The same of a movie that failed.
void PrintFailureLine(const char* schema, const std::filesystem::path& movie,
                      const Problem& problem);

// Does a verb's work. With `json`, its failure is also written to standard output:
// `head`, which may name the movie or folder, and the problem. A verb that answers
// with a list passes an empty one as `head`, to which the problem is added.
template <class Work>
void AnswerFailureToo(bool json, const char* schema, nlohmann::ordered_json head,
                      const Work& work) {
    try {
        work();
    } catch (const Failure& failure) {
        if (json) {
            AddProblem(failure.problem(), head.is_array() ? head.emplace_back() : head);
            PrintJson(schema, std::move(head));
        }
        throw;
    }
}

inline constexpr char kMovieLinesHelp[] =
    "As JSON, a line for each movie as soon as it is done: its path, and what was written or why "
    "nothing was";

// The same where each answer is a line.
template <class Work>
void AnswerFailureInLine(bool lines, const char* schema, const Work& work) {
    try {
        work();
    } catch (const Failure& failure) {
        if (lines) {
            PrintFailureLine(schema, {}, failure.problem());
        }
        throw;
    }
}

}  // namespace cliphost
