// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <filesystem>

// Writes the movies 0.mov, 1.mov and so on into a folder that exists: each with one picture track
// of about three seconds, of 100 different lengths, and one sound track.
void WriteShortMovies(const std::filesystem::path& folder, int count);
