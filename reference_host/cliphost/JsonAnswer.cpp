// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/JsonAnswer.h"

#include <fmt/format.h>

#include <cerrno>
#include <cstdio>
#include <system_error>

namespace cliphost {

void PrintJson(const nlohmann::ordered_json& answer) {
    fmt::print("{}\n", answer.dump(2, ' ', false, nlohmann::json::error_handler_t::replace));
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
        throw std::system_error(errno, std::generic_category(), "standard output");
    }
}

}  // namespace cliphost
