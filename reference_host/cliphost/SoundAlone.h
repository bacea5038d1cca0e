// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "reference_host/cliphost/HeaderTracks.h"

namespace cliphost {

// The sound of a movie that is not described, by its place among the sounds.
struct SoundAlone {
    Problem problem;    // why it can't be read whole; nothing where it can
    unsigned rate = 0;  // samples a second as the header has it; 0 for unknown
};
SoundAlone SoundWithoutDescription(const std::filesystem::path& movie, std::size_t place);

// How to read it; empty where there is none.
std::string SoundHint(const header_parser::HeaderReport& header);

}  // namespace cliphost
