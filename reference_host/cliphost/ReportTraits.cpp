// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/ReportTraits.h"

#include <fmt/format.h>

#include <algorithm>
#include <cmath>
#include <nlohmann/json.hpp>
#include <string_view>
#include <utility>

#include "reference_host/quicktime/DisplayMatrix.h"

namespace cliphost {
namespace {

using header_parser::Track;
using Json = nlohmann::ordered_json;

// Values of the colour description that video standards number.
struct ColorWord {
    ncfUInt32 value;
    const char* words;
};
constexpr ColorWord kPrimaries[] = {{1, "Rec. 709"},  {5, "Rec. 601 PAL"}, {6, "Rec. 601 NTSC"},
                                    {9, "Rec. 2020"}, {11, "DCI-P3"},      {12, "Display P3"}};
constexpr ColorWord kTransfers[] = {{8, "linear"}, {13, "sRGB"}, {16, "PQ"}, {18, "HLG"}};

template <std::size_t count>
const char* WordOf(const ColorWord (&words)[count], ncfUInt32 value) {
    const auto* const found =
        std::find_if(std::begin(words), std::end(words),
                     [&](const ColorWord& one) { return one.value == value; });
    return found == std::end(words) ? nullptr : found->words;
}

// "Rec. 2020, HLG (9-18-9)"
std::string ColorText(const header_parser::VideoDescription::Colors& colors) {
    const char* const primaries = WordOf(kPrimaries, colors.primaries);
    const char* const transfer = WordOf(kTransfers, colors.transfer);
    const std::string numbers =
        fmt::format("{}-{}-{}", colors.primaries, colors.transfer, colors.matrix);
    if (!primaries) {
        return numbers;
    }
    return fmt::format("{}{}{} ({})", primaries, transfer ? ", " : "", transfer ? transfer : "",
                       numbers);
}

// "rotated by 90 degrees", "mirrored"; empty for a picture that is shown as it is stored.
std::string TurnText(const host::DisplayMatrix& matrix) {
    const bool isMirrored = matrix.a * matrix.d - matrix.b * matrix.c < 0;
    const double radians = std::atan2(matrix.b, matrix.a);
    const long degrees = (std::lround(radians * 180 / std::acos(-1.0)) + 360) % 360;
    std::string text = degrees == 0 ? "" : fmt::format("rotated by {} degrees", degrees);
    if (isMirrored) {
        text += text.empty() ? "mirrored" : " and mirrored";
    }
    return text;
}

// How long the pictures are, where not all are as long as the first; the last one may be shorter
// or longer.
std::string DurationsText(const Track& track) {
    constexpr ncfUInt32 kMostLooked = 100'000;
    const header_parser::SampleTimes& times = track.samples.Times();
    const ncfUInt32 count = track.samples.Count();
    if (times.HasOneDuration() || count < 3 || track.mediaTimeScale == 0) {
        return {};
    }
    ncfUInt32 shortest = times.DurationOf(0);
    ncfUInt32 longest = shortest;
    for (ncfUInt32 i = 1; i < std::min(count - 1, kMostLooked); ++i) {
        shortest = std::min(shortest, times.DurationOf(i));
        longest = std::max(longest, times.DurationOf(i));
    }
    // Rates such as 30000/1001 in a scale that they don't divide, rounded this way or that.
    constexpr ncfUInt64 kRoundings = 50;
    if ((longest - shortest) * kRoundings <= longest) {
        return {};
    }
    const auto milliseconds = [&](ncfUInt32 duration) {
        return 1000.0 * duration / track.mediaTimeScale;
    };
    return fmt::format("pictures last from {:.4g} to {:.4g} ms", milliseconds(shortest),
                       milliseconds(longest));
}

const char* KindOf(const Track& track) {
    return track.kind == header_parser::TrackKind::kVideo ? "picture" : "sound";
}

// How a track plays its media, where that is not from the beginning straight through.
std::string EditsText(const Track& track, ncfUInt32 movieTimeScale) {
    const header_parser::EditList::Scales scales{movieTimeScale, track.mediaTimeScale};
    if (track.edits.IsEmpty() || track.mediaTimeScale == 0 || movieTimeScale == 0) {
        return {};
    }
    if (!track.edits.IsLinear(scales)) {
        return track.edits.MediaTimeAt(0, scales) < 0
                   ? fmt::format("{}: begins with a pause", KindOf(track))
                   : fmt::format("{}: several edits, or another speed", KindOf(track));
    }
    const ncfSInt64 offset = track.edits.Offset();
    return offset == 0
               ? std::string()
               : fmt::format("{}: the first {:.4g} s of the media are left out", KindOf(track),
                             static_cast<double>(offset) / track.mediaTimeScale);
}

void AddPictureFacts(const Track& track, Json& facts) {
    if (const std::string durations = DurationsText(track); !durations.empty()) {
        AddTrait(trait::kVariableRate, durations, facts);
    }
    if (track.video.empty()) {
        return;
    }
    const header_parser::VideoDescription& first = track.video.front();
    if (first.colors) {
        facts["colors"] = ColorText(*first.colors);
    }
    if (first.pixelAspect && first.pixelAspect->numerator != first.pixelAspect->denominator) {
        AddTrait(trait::kPixelAspect,
                 fmt::format("pixels are {}:{}", first.pixelAspect->numerator,
                             first.pixelAspect->denominator),
                 facts);
    }
}

// What the module writes when it serves media, and how its reasons begin; it writes of other
// things, too.
constexpr std::string_view kServed = "Forcing sample provider mode for ";
constexpr std::string_view kReasons[] = {"The movie ", "The FOURCC ",          "The audio ",
                                         "An audio ",  "More than one video ", "Video is "};
// It has a reason for each of these that it doesn't tell.
constexpr std::string_view kVideo = "video";
constexpr char kNoRecord[] = "the data files have no whole record of its codec";
constexpr char kNotLinear[] = "it is no linear PCM";

bool BeginsWith(std::string_view text, std::string_view start) {
    return text.substr(0, start.size()) == start;
}
bool BeginsAsReason(std::string_view text) {
    return std::any_of(std::begin(kReasons), std::end(kReasons),
                       [&](std::string_view start) { return BeginsWith(text, start); });
}

}  // namespace

void AddTrait(const char* id, std::string words, Json& facts) {
    facts["traits"].push_back({{"id", id}, {"words", std::move(words)}});
}

void AddHeaderFacts(const std::filesystem::path& movie, const header_parser::HeaderReport& header,
                    Json& facts) {
    if (const std::string turn = TurnText(host::DisplayMatrixOf(movie)); !turn.empty()) {
        AddTrait(trait::kRotated, turn, facts);
    }
    if (!header.movie) {
        return;
    }
    if (const auto shown = header.ShownTrack()) {
        AddPictureFacts(header.movie->tracks[*shown], facts);
    }
    for (const header_parser::TrackKind kind :
         {header_parser::TrackKind::kVideo, header_parser::TrackKind::kSound}) {
        for (const ncfUInt32 place : header.movie->Of(kind)) {
            const std::string edits =
                EditsText(header.movie->tracks[place], header.movie->timeScale);
            if (!edits.empty()) {
                AddTrait(trait::kEdits, edits, facts);
            }
        }
    }
    facts["hasTimecode"] = !header.movie->Of(header_parser::TrackKind::kTimecode).empty();
    if (header.movie->Of(header_parser::TrackKind::kTimecode).empty()) {
        AddTrait(trait::kNoTimecode, "no timecode track", facts);
    }
}

std::vector<ServedMedia> MediaServed(const std::vector<std::string>& notices) {
    std::vector<ServedMedia> served;
    std::string reason;
    for (const std::string& notice : notices) {
        if (BeginsAsReason(notice)) {
            reason = notice;
        } else if (BeginsWith(notice, kServed)) {
            std::string what = notice.substr(kServed.size());
            what.erase(what.find_last_not_of(".\n") + 1);
            if (reason.empty()) {
                reason = what == kVideo ? kNoRecord : kNotLinear;
            }
            served.push_back({std::move(what), std::exchange(reason, {})});
        }
    }
    return served;
}

void AddServedMedia(const std::vector<ServedMedia>& served, Json& facts) {
    for (const ServedMedia& one : served) {
        AddTrait(trait::kProvider, fmt::format("{}: {}", one.what, one.reason), facts);
    }
}

}  // namespace cliphost
