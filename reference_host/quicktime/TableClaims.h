// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <filesystem>
#include <string>

#include "host_interfaces/framework/Types.h"

namespace host {

// The multimedia library makes room for what a movie's tables count before it
// looks whether the file holds it. A few bytes can count thousands of millions.

// As many of a kind as any movie may claim: hours of film in another file.
constexpr ncfUInt64 kClaimsAlwaysFine = 1u << 20;

// Which table of a movie counts more than the file's bytes can stand for, in a
// sentence; empty when none does, and for files of other families.
std::string FindImpossibleTable(const std::filesystem::path& path);

}  // namespace host
