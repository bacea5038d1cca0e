// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <filesystem>
#include <string>

namespace host {

// Why the movie wrapper can't open a file, in a few words; empty when it can.
std::string OpenProblem(const std::filesystem::path& path);

}  // namespace host
