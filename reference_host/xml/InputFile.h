// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <filesystem>
#include <functional>
#include <string>

#include "host_interfaces/framework/ResultCodes.h"

namespace host {

// Takes one piece of a file; `last` comes with the final one, which may be
// empty. A negative result ends the reading and is its result.
using PieceTaker = std::function<NCFRESULT(const char* bytes, std::size_t size, bool last)>;

// Reads a file from start to end. Folders, pipes and devices are refused before
// they are opened, and so is a file beyond the limits for documents. `problem`
// says what was wrong with the file itself.
NCFRESULT ReadInputFile(const std::filesystem::path& file, const PieceTaker& take,
                        std::string& problem);

}  // namespace host
