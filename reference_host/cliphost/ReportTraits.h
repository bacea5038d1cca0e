// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <filesystem>
#include <nlohmann/json_fwd.hpp>
#include <string>
#include <vector>

#include "reference_host/header_parser/InspectHeaders.h"

namespace cliphost {

// What is worth a look in one movie: a name for programs, and words for people.
namespace trait {
inline constexpr char kRotated[] = "rotated";
inline constexpr char kVariableRate[] = "variableRate";
inline constexpr char kPixelAspect[] = "pixelAspect";
inline constexpr char kEdits[] = "edits";
inline constexpr char kNoTimecode[] = "noTimecode";
inline constexpr char kNoSound[] = "noSound";
inline constexpr char kSilent[] = "silent";
inline constexpr char kProvider[] = "provider";
inline constexpr char kNotInterleaved[] = "notInterleaved";
}  // namespace trait
void AddTrait(const char* id, std::string words, nlohmann::ordered_json& facts);

// Adds what the header and the display matrix tell of a movie: its colours, and traits. `header`
// need not be understood.
void AddHeaderFacts(const std::filesystem::path& movie, const header_parser::HeaderReport& header,
                    nlohmann::ordered_json& facts);

// Which media the module serves through its sample provider, and why, by what it wrote for the
// user while it described a movie.
struct ServedMedia {
    std::string what;  // "video", "audio track 1"
    std::string reason;
};
std::vector<ServedMedia> MediaServed(const std::vector<std::string>& notices);
void AddServedMedia(const std::vector<ServedMedia>& served, nlohmann::ordered_json& facts);

}  // namespace cliphost
