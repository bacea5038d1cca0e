// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <filesystem>
#include <string>

#include "host_interfaces/framework/Types.h"

namespace host {

// The multimedia library allocates memory for what a movie's tables count before it
// checks whether the file is long enough. A few bytes can count billions of entries.

// What any movie may claim of a kind: enough for hours of film in another file.
constexpr ncfUInt64 kClaimsAlwaysFine = 1u << 20;

// A sentence that names a table which counts more than the file's bytes can hold;
// empty when there is none, and for files of other families.
std::string FindImpossibleTable(const std::filesystem::path& path);

}  // namespace host
