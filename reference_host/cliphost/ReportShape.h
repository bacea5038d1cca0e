// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <nlohmann/json_fwd.hpp>
#include <string>

namespace cliphost {

// What a report keeps of a clip, out of JSON that may come from a process that a movie has broken:
// members that docs/json_schema/report.schema.json names, with values of their kind. Whatever else
// is there is left out, and so is what lacks something that the page needs.
nlohmann::ordered_json ClipFrom(const std::string& json);

}  // namespace cliphost
