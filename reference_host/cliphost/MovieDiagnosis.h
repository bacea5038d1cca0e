// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <cstdint>
#include <filesystem>
#include <string>
#include <vector>

#include "reference_host/cliphost/ClipTracks.h"
#include "reference_host/cliphost/Problem.h"

namespace cliphost {

// Looks at a file that could not be described and says in a sentence what is wrong
// with it and what would help. The module gives one code for all causes; its console
// lines, the header parser and the bytes say more. When the file is not the cause
// there is no reason, only a route.
Problem DiagnoseMovie(const std::filesystem::path& movie,
                      const std::vector<std::string>& notices = {});

// One of a movie's picture or sound tracks, counted from 0 among those of its
// kind.
struct WhichTrack {
    TrackKind kind = TrackKind::Picture;
    std::size_t place = 0;
};

// Why the samples of a track can't be delivered: they are encrypted, there is no
// decoder for their codec, or they are missing from the given sample on. No reason
// when only decoding could show it.
Problem DiagnoseSamples(const std::filesystem::path& movie, const WhichTrack& which,
                        std::uint64_t sample = 0);

// Why no sample of such a track is ever shown: there are none, or the edits leave
// all of them out.
std::string WhyNotShown(const std::filesystem::path& movie, const WhichTrack& which);
// What the file is too short for of a picture track, by its place among those;
// empty for nothing.
std::string WhatPictureLacks(const std::filesystem::path& movie, std::size_t place);

// The sound of a movie that is not described, by its place among the sounds.
struct SoundAlone {
    Problem problem;    // why it can't be had whole; nothing where it can
    unsigned rate = 0;  // samples a second as the header has it; 0 for unknown
};
SoundAlone SoundWithoutDescription(const std::filesystem::path& movie, std::size_t place);

// That none of a track lies in the file itself; empty where some does.
std::string WhatLiesElsewhere(const std::filesystem::path& movie, const WhichTrack& which);

// By which way a movie is read, and why not by the header parser where it refuses.
struct RouteTaken {
    const char* route;
    std::string reason;  // empty on the first route
};
RouteTaken RouteOf(const std::filesystem::path& movie);

// Why the pictures of a movie can't be as large as its description says; nothing
// where they can.
Problem WrongRaster(const std::filesystem::path& movie);

}  // namespace cliphost
