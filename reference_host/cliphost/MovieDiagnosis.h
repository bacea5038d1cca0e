// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <filesystem>
#include <string>
#include <vector>

#include "reference_host/cliphost/Problem.h"

namespace cliphost {

// Looks at a file that could not be described and says in a sentence what is wrong
// with it and what would help. The module gives one code for all causes; its console
// lines, the header parser and the bytes say more. When the file is not the cause
// there is no reason, only a route.
Problem DiagnoseMovie(const std::filesystem::path& movie,
                      const std::vector<std::string>& notices = {});

}  // namespace cliphost
