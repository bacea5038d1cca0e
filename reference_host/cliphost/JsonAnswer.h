// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <nlohmann/json.hpp>

#include "reference_host/cliphost/Failure.h"
#include "reference_host/cliphost/JsonSchemas.h"

namespace cliphost {

// An object that says first which schema it has.
nlohmann::ordered_json WithSchema(const char* schema, nlohmann::ordered_json members);

// Prints what a verb answers to --json on standard output. It says its schema, in each entry
// where it is a list.
void PrintJson(const char* schema, nlohmann::ordered_json answer);

// Prints JSON in one line, at once.
void PrintJsonLine(std::string_view json);

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

// The same where each answer is a line.
template <class Work>
void AnswerFailureInLine(const char* schema, const Work& work) {
    try {
        work();
    } catch (const Failure& failure) {
        nlohmann::ordered_json line = WithSchema(schema, nlohmann::ordered_json::object());
        AddProblem(failure.problem(), line);
        PrintJsonLine(line.dump(-1, ' ', false, nlohmann::json::error_handler_t::replace));
        throw;
    }
}

}  // namespace cliphost
