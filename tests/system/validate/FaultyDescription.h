// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <filesystem>

#include "host_interfaces/aaf/AAFFile.h"

namespace faulty {

// A description of a movie: an AAF file in memory with a master and a file mob, which answers what
// a reader of mobs asks, and nothing else. The caller owns it.
IAAFFile* NewDescription(const std::filesystem::path& movie);
// Closes what a description has open, as no module should.
void CloseDescription(IAAFFile* file);

}  // namespace faulty
