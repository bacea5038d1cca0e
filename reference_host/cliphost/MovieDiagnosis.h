// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <filesystem>
#include <string>
#include <vector>

#include "reference_host/cliphost/Problem.h"

namespace cliphost {

// Looks at a file that could not be described and says in a sentence what is
// the matter with it and what would help. The module gives one code for all of
// this; what it told the user meanwhile, the header parser and the bytes tell
// more. There is no reason, only a route, where the file is not the cause.
Problem DiagnoseMovie(const std::filesystem::path& movie,
                      const std::vector<std::string>& notices = {});

}  // namespace cliphost
