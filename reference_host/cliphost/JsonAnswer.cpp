// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/JsonAnswer.h"

#include <fmt/format.h>

namespace cliphost {

void PrintJson(const nlohmann::ordered_json& answer) {
    fmt::print("{}\n", answer.dump(2, ' ', false, nlohmann::json::error_handler_t::replace));
}

}  // namespace cliphost
