// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <nlohmann/json.hpp>

#include "reference_host/cliphost/Essence.h"

namespace cliphost {

// What pictures say of themselves.
inline constexpr char kWebp[] = "image/webp";
inline constexpr char kPng[] = "image/png";

// So that a page of 1,000 clips stays below 60 MB.
inline constexpr std::size_t kMostBytesOfStrip = 28'000;
inline constexpr std::size_t kMostBytesOfPoster = 5'000;

// What a report shows of a movie's pictures: a poster, out of the middle, and a strip, which is
// one picture of all frames side by side.
struct ReportPictures {
    nlohmann::ordered_json poster;  // null where there is none
    nlohmann::ordered_json strip;
};

// `start`: the movie's first timecode, which may be empty. Frames that can't be read are told as
// such. Throws a Failure where none can.
ReportPictures ReadReportPictures(Essence& essence, const ClipTrack& track,
                                  const std::string& start);

}  // namespace cliphost
