// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <filesystem>

#include "reference_host/cliphost/Problem.h"

namespace cliphost {

// Looks at a file that could not be described and says in a sentence what is
// the matter with it and what would help. The module gives one code for all of
// this; the bytes tell more.
Problem DiagnoseMovie(const std::filesystem::path& movie);

}  // namespace cliphost
