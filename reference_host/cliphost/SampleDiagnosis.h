// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <cstdint>

#include "reference_host/cliphost/HeaderTracks.h"

namespace cliphost {

// Why the samples of a track don't become frames or sound: encrypted, of a codec
// without decoder, or not in the file from the given sample on. There is no
// reason where the decoder alone could tell.
Problem DiagnoseSamples(const std::filesystem::path& movie, const WhichTrack& which,
                        std::uint64_t sample = 0);

// Why no sample of such a track is ever shown: there are none, or the edits leave
// all of them out.
std::string WhyNotShown(const std::filesystem::path& movie, const WhichTrack& which);
// What the file is too short for of a picture track, by its place among those;
// empty for nothing.
std::string WhatPictureLacks(const std::filesystem::path& movie, std::size_t place);

// That none of a track lies in the file itself; empty where some does.
std::string WhatLiesElsewhere(const std::filesystem::path& movie, const WhichTrack& which);

// Why the pictures of a movie can't be as large as its description says; nothing
// where they can.
Problem WrongRaster(const std::filesystem::path& movie);

}  // namespace cliphost
