// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <filesystem>
#include <string>

namespace cliphost {

// Looks at a file that could not be described and says in a sentence what is
// the matter with it and what would help. The module gives one code for all of
// this; the bytes tell more.
std::string DiagnoseMovie(const std::filesystem::path& movie);

}  // namespace cliphost
