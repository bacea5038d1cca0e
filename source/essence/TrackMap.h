// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <vector>

#include "source/clips/BaseClip.h"
#include "source/plugin/Tr1Memory.h"

// The movie's track id for each track number of the host: the first picture
// track, the same again for its alpha when the clip shows one, then the sound
// tracks. Further picture tracks have no entry. A failure leaves in `vect`
// what was found up to there.
NCFRESULT RemapAAFTracksToQuickTimeTracks(const std::tr1::shared_ptr<BaseClip>& media,
                                          std::vector<ncfUInt32>& vect);
