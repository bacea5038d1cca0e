// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <nlohmann/json_fwd.hpp>

namespace cliphost {

// What is odd about clips that lie together: a list of findings, each with groups of clips by their
// numbers. `clips`: what a report's table shows of each.
nlohmann::ordered_json OddThings(const nlohmann::ordered_json& clips);

}  // namespace cliphost
