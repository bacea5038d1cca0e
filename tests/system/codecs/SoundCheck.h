// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <string>
#include <vector>

#include "reference_host/cliphost/Essence.h"

// What is wrong with the sound of a movie beside the samples of 24 bits that
// ffmpeg makes of it: how many, and every one of them. `reading` holds options
// of ffmpeg's decoder.
std::vector<std::string> SoundDifferences(cliphost::Essence& essence, const std::string& reading);
// Ranges read alone whose samples are not those of a whole read.
std::vector<std::string> SoundRangeDifferences(cliphost::Essence& essence);
