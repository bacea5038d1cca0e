// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "reference_host/movie_writer/Movie.h"

namespace movies {

// One chunk of a track as the layout places it.
struct Chunk {
    std::uint64_t firstSample = 0;  // from zero
    std::uint64_t samples = 0;
    unsigned description = 1;
    std::uint64_t size = 0;
    std::uint64_t position = 0;
};

std::vector<Chunk> ChunksOf(const Track& track);
std::uint64_t MediaDurationOf(const Track& track);
// In movie time units: of the edits where there are some, else of the media.
std::uint64_t TrackDurationOf(const Track& track, std::uint32_t movieTimeScale);
Box TrackBox(const Track& track, std::uint32_t id, std::uint32_t movieTimeScale,
             std::uint64_t creationTime, const std::vector<Chunk>& chunks);

// Adds `child` to `parent` unless its type is omitted, or what replaces it.
void Put(Box& parent, const Box& child, const std::vector<Box>& replaced,
         const std::vector<std::string>& omitted);

}  // namespace movies
