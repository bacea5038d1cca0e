// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <string>

#include "reference_host/cliphost/Bin.h"

namespace cliphost {

// Adds a composition mob to a bin: all clips end to end, in a picture track, as many sound tracks
// as the clip with most has, and a timecode track that begins at one hour. `rate`: frames per
// second. Throws a Failure when the library refuses, and when no clip has a length.
void AddStringout(const AafLibrary& library, Bin& bin, const std::string& name, double rate);

}  // namespace cliphost
