// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <filesystem>
#include <optional>
#include <string>
#include <vector>

#include "reference_host/cliphost/ClipTracks.h"
#include "reference_host/cliphost/Problem.h"
#include "reference_host/header_parser/InspectHeaders.h"
#include "reference_host/quicktime/HeaderLook.h"
#include "reference_host/quicktime/OpenProblem.h"

// What the questions about a file that fails have in common: its tracks as its
// header tells them, and what helps.
namespace cliphost {

inline constexpr const char* kCopyAgain = "copy the file again from where it came";
inline constexpr const char* kTakeSoundOut =
    "take the sound out of the movie, for instance with ffmpeg -i FILE -map 0:a -c copy SOUND.mov";
inline constexpr const char* kNeedsKey = "only someone with the key can read them";
inline constexpr const char* kConvert = "convert it with a program that knows this codec";
inline constexpr const char* kSaveInOne =
    "save the movie with its media in one file, such as with ffmpeg -i FILE -c copy WHOLE.mov";

// One of a movie's picture or sound tracks, counted from 0 among those of its
// kind.
struct WhichTrack {
    TrackKind kind = TrackKind::Picture;
    std::size_t place = 0;
};

// The places in the file of the tracks of a kind. The header is understood.
const std::vector<ncfUInt32>& TracksOf(const header_parser::HeaderReport& header, TrackKind kind);

// A track with its place in the file; null for one that the header does not tell.
struct FoundTrack {
    const header_parser::Track* track = nullptr;
    std::size_t place = 0;
};
FoundTrack Find(const header_parser::HeaderReport& header, const WhichTrack& which);

// That samples of a track lie in another file: those of one description, or all
// for none given.
std::string WhatIsElsewhere(const header_parser::HeaderReport& header, std::size_t place,
                            std::optional<std::size_t> description = {});

Problem OfCodec(const std::filesystem::path& movie, const host::CodecProblem& codec);

}  // namespace cliphost
