// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <nlohmann/json_fwd.hpp>

#include "reference_host/cliphost/Essence.h"

namespace cliphost {

// How loud a sound track is over its length: the highest and the mean level of each column of a
// chart, over all channels. A column has 255 times the square root of a level of 1 at most, so that
// quiet sound is seen, too. Of long sound each column tells what a piece at its beginning holds.
// Throws a Failure.
nlohmann::ordered_json ReadWave(Essence& essence, const ClipTrack& track);

}  // namespace cliphost
