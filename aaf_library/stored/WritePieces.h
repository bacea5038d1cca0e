// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <filesystem>
#include <vector>

#include "aaf_library/stored/Pieces.h"

namespace aaf::stored {

// Makes or empties the file and writes the pieces, one behind the other. False with the reason in
// errno, where there is one. Others may remove the file meanwhile, as a program does that is
// interrupted.
bool WritePieces(const std::filesystem::path& file, const std::vector<Piece>& pieces);

}  // namespace aaf::stored
