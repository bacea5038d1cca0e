// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <string>
#include <vector>

#include "reference_host/cliphost/Essence.h"

// What is wrong with the sample map of a movie's first track beside the packets
// that ffprobe reads: place, size, whether it stands alone, and where the
// picture is shown. Sound of samples of one size is held run by run.
std::vector<std::string> SampleMapDifferences(cliphost::Essence& essence);
