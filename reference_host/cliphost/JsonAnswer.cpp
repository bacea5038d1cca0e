// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/JsonAnswer.h"

#include <fmt/format.h>

#include <cerrno>
#include <cstdio>
#include <system_error>

#include "reference_host/cliphost/MachinePath.h"
#include "reference_host/system/OutputStream.h"

namespace cliphost {

using nlohmann::ordered_json;

ordered_json WithSchema(const char* schema, ordered_json members) {
    ordered_json whole = {{schema::kMember, schema}};
    for (auto& [name, value] : members.items()) {
        whole[name] = std::move(value);
    }
    return whole;
}

std::string InLines(const ordered_json& json, std::size_t spaces) {
    const std::string indentation(spaces, ' ');
    std::string lines = indentation;
    for (const char c : json.dump(2, ' ', false, ordered_json::error_handler_t::replace)) {
        lines += c;
        if (c == '\n') {
            lines += indentation;
        }
    }
    return lines;
}

void PrintJson(const char* schema, ordered_json answer) {
    if (answer.is_array()) {
        for (ordered_json& entry : answer) {
            entry = WithSchema(schema, std::move(entry));
        }
    } else {
        answer = WithSchema(schema, std::move(answer));
    }
    fmt::print("{}\n", InLines(answer));
}

void PrintJsonLine(std::string_view json) {
    std::string line;
    bool isIndentation = true;
    for (const char c : json) {  // in texts a line end is escaped
        isIndentation = c == '\n' || (isIndentation && c == ' ');
        if (!isIndentation) {
            line += c;
        }
    }
    fmt::print("{}\n", line);
    if (std::fflush(stdout) != 0) {
        throw std::system_error(host::system::StandardOutputError(errno), std::generic_category(),
                                "standard output");
    }
}

void PrintMovieLine(const char* schema, const std::filesystem::path& movie,
                    const ordered_json& members) {
    ordered_json line = {{schema::kMember, schema}};
    if (!movie.empty()) {
        line["movie"] = MachinePath(movie);
    }
    line.update(members);
    PrintJsonLine(line.dump(-1, ' ', false, nlohmann::json::error_handler_t::replace));
}

void PrintFailureLine(const char* schema, const std::filesystem::path& movie,
                      const Problem& problem) {
    ordered_json members;
    AddProblem(problem, members);
    PrintMovieLine(schema, movie, members);
}

}  // namespace cliphost
