// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <filesystem>
#include <string>
#include <vector>

#include "tests/system/media/Probe.h"

// Why a file may be refused: the kinds of files that no description can be made
// of, told from their own bytes and from what ffprobe says. Names of all that a
// file shows; none for one that has to be described.
std::vector<std::string> DefectsOf(const std::filesystem::path& file, const ProbedFile& probed,
                                   double editorRate);
