// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "reference_host/cliphost/MovieDiagnosis.h"

#include <fmt/format.h>

#include <algorithm>

#include "reference_host/cliphost/FileAccess.h"
#include "reference_host/cliphost/MissingSamples.h"
#include "reference_host/cliphost/RouteTaken.h"
#include "reference_host/cliphost/SoundAlone.h"
#include "reference_host/header_parser/StoredAtom.h"
#include "reference_host/header_parser/Verdict.h"

namespace cliphost {
namespace {

using header_parser::Counted;
using header_parser::HeaderReport;
using header_parser::Track;

// Lines that the module writes on its console when it can't describe a movie.
constexpr const char* kNoRate = "The frame rate of the movie can't be determined.";
constexpr const char* kNoLength = "The length of the movie can't be determined.";
constexpr const char* kNoTracks = "Movie doesn't contain any video/audio tracks!";

bool HasSaid(const std::vector<std::string>& notices, const char* line) {
    return std::find(notices.begin(), notices.end(), line) != notices.end();
}

std::string SecondsWords(ncfUInt64 units, const Track& track) {
    const ncfUInt64 seconds = (units + track.mediaTimeScale / 2) / track.mediaTimeScale;
    return Counted(seconds, "second");
}

// Why the pictures of the first track give no frame rate, and which sample is the
// reason when it is a single one.
std::string RateWords(const HeaderReport& header) {
    const ncfUInt32 place = TracksOf(header, TrackKind::Picture).front();
    const Track& track = header.movie->tracks[place];
    const header_parser::SampleTimes& times = track.samples.Times();
    const std::string words = fmt::format("track {} of the file: {} in {} give no frame rate",
                                          place + 1, Counted(track.samples.Count(), "picture"),
                                          SecondsWords(track.mediaDuration, track));
    if (track.samples.Count() < 2) {
        return words;
    }
    const ncfUInt32 sample = times.LongestSample();
    const ncfUInt32 longest = times.DurationOf(sample);
    if (longest <= times.TotalDuration() - longest || track.toldMediaDuration >= longest) {
        return words;
    }
    return fmt::format("{}: by its table, sample {} alone lasts {}, but 'mdhd' gives {} for all",
                       words, sample, SecondsWords(longest, track),
                       SecondsWords(track.toldMediaDuration, track));
}

Problem WithoutRate(const std::filesystem::path& movie, const HeaderReport& header) {
    if (!header.movie || TracksOf(header, TrackKind::Picture).empty()) {
        return {movie, "nothing in it tells its frame rate"};
    }
    return {movie, RateWords(header), SoundHint(header)};
}

// What the first track lacks that lacks something.
std::string WhatIsMissing(const HeaderReport& header) {
    for (std::size_t i = 0; i < header.movie->tracks.size(); ++i) {
        const MissingSamples missing(header, i);
        if (!missing.IsEmpty()) {
            return missing.Sentence();
        }
    }
    return {};
}

// Tracks that can't be told from each other.
std::string WhatIsNumberedTwice(const HeaderReport& header) {
    const std::vector<Track>& tracks = header.movie->tracks;
    for (std::size_t i = 0; i < tracks.size(); ++i) {
        for (std::size_t k = 0; k < i; ++k) {
            if (tracks[k].id == tracks[i].id) {
                return fmt::format("tracks {} and {} of the file have one number, {}", k + 1, i + 1,
                                   tracks[i].id);
            }
        }
    }
    return {};
}

// Edits of one track that last longer than the movie says of itself.
std::string WhatIsTooLong(const HeaderReport& header) {
    for (std::size_t i = 0; i < header.movie->tracks.size(); ++i) {
        const ncfUInt64 edits = header.movie->tracks[i].edits.Duration();
        if (edits > header.movie->duration) {
            return fmt::format(
                "track {} of the file: its edits last {} of the movie, but the "
                "movie lasts {}",
                i + 1, Counted(edits, "unit"), header.movie->duration);
        }
    }
    return {};
}

// What keeps the samples of the first tracks from being decoded, where the library
// alone reads the movie: a code of zeros may be one that it did not come to.
Problem OfCodecs(const std::filesystem::path& movie) {
    for (const bool ofSound : {false, true}) {
        const host::CodecProblem codec = host::DecoderProblem(movie, ofSound, 0);
        if (codec && codec.code != 0) {
            return OfCodec(movie, codec);
        }
    }
    return {};
}

// What is wrong with a movie whose every part can be read.
Problem OfTracks(const std::filesystem::path& movie, const HeaderReport& header) {
    for (std::size_t i = 0; i < header.movie->tracks.size(); ++i) {
        if (std::string elsewhere = WhatIsElsewhere(header, i); !elsewhere.empty()) {
            return {movie, elsewhere, kSaveInOne};
        }
    }
    if (std::string twice = WhatIsNumberedTwice(header); !twice.empty()) {
        return {movie, twice};
    }
    // Sound without a decoder is described all the same.
    if (const host::CodecProblem codec = host::DecoderProblem(movie, false, 0)) {
        return OfCodec(movie, codec);
    }
    return {movie, WhatIsTooLong(header)};
}

// Which track of those that a clip is made of holds nothing.
std::string WhatIsEmpty(const HeaderReport& header) {
    for (const TrackKind kind : {TrackKind::Picture, TrackKind::Sound}) {
        if (!TracksOf(header, kind).empty()) {
            const ncfUInt32 place = TracksOf(header, kind).front();
            return header.movie->tracks[place].samples.Count() == 0
                       ? fmt::format("track {} of the file: it holds no samples", place + 1)
                       : std::string();
        }
    }
    return {};
}

// Whether nothing tells how long the picture that a clip shows lasts.
std::string WhatIsUntimed(const HeaderReport& header) {
    const auto place = header.ShownTrack();
    return place && header.movie->tracks[*place].duration == 0
               ? fmt::format(
                     "track {} of the file: neither its samples nor its headers tell how "
                     "long it lasts",
                     *place + 1)
               : std::string();
}

Problem OfFirstRoute(const std::filesystem::path& movie, const HeaderReport& header,
                     const std::vector<std::string>& notices) {
    if (const std::string empty = WhatIsEmpty(header); !empty.empty()) {
        return {movie, empty, SoundHint(header)};
    }
    if (HasSaid(notices, kNoRate)) {
        return WithoutRate(movie, header);
    }
    if (HasSaid(notices, kNoLength)) {
        return {movie,
                fmt::format("its length of {} at {} a second is less than a frame",
                            Counted(header.movie->duration, "unit"), header.movie->timeScale),
                SoundHint(header)};
    }
    if (const std::string missing = WhatIsMissing(header); !missing.empty()) {
        return {movie, missing, kCopyAgain};
    }
    if (const std::string opening = host::OpenProblem(movie); !opening.empty()) {
        return {movie, "the multimedia library, which has to decode it, refuses it: " + opening};
    }
    if (const std::string untimed = WhatIsUntimed(header); !untimed.empty()) {
        return {movie, untimed};
    }
    for (const ncfUInt32 sound : TracksOf(header, TrackKind::Sound)) {
        const Track& track = header.movie->tracks[sound];
        if (!track.sound.empty() && track.sound.front().channels == 0) {
            return {movie,
                    fmt::format("track {} of the file: its sound, {}, has no channels", sound + 1,
                                header_parser::NameOf(track.sound.front().codec))};
        }
    }
    return OfTracks(movie, header);
}

bool HoldsWholeFragment(const std::filesystem::path& movie) {
    header_parser::FileBytes file(movie);
    header_parser::StoredAtoms atoms(file);
    header_parser::StoredAtom atom;
    while (atoms.Next(atom)) {
        if (atom.type == header_parser::Code("moof")) {
            return !atom.isOpen && !atom.isCutShort;
        }
    }
    return false;
}

// Why a movie that the header parser refuses is not described by the library.
Problem OfSecondRoute(const std::filesystem::path& movie, const HeaderReport& header,
                      const std::vector<std::string>& notices) {
    const header_parser::Refusal& refusal = header.refusal;
    const char* const found = HasSaid(notices, kNoTracks) ? "no picture and no sound is found in it"
                              : HasSaid(notices, kNoRate) ? "nothing in it tells its frame rate"
                              : HasSaid(notices, kNoLength) ? "no length is found in it"
                                                            : nullptr;
    Problem problem{movie, refusal.Sentence(), refusal.code == NMA_E_NODATA ? kCopyAgain : ""};
    const bool isFragmented = refusal.reason.find("fragmented") != std::string::npos;
    if (isFragmented && !HoldsWholeFragment(movie)) {
        problem.reason +=
            fmt::format("; the file ends at byte {} without a whole fragment", header.fileSize);
        problem.hint = kCopyAgain;
    } else if (found) {
        problem.reason += fmt::format("; read by the multimedia library, {}", found);
    } else if (const Problem codec = OfCodecs(movie)) {
        problem.reason += fmt::format("; read by the multimedia library, {}", codec.reason);
        problem.hint = codec.hint;
    }
    return problem;
}

}  // namespace

Problem DiagnoseMovie(const std::filesystem::path& movie, const std::vector<std::string>& notices) {
    if (Problem problem = WhyUnreadable(movie)) {
        return problem;
    }
    const HeaderReport header = header_parser::InspectHeaders(movie);
    const std::string ofNoUse = RouteOf(header).reason;
    if (ofNoUse.empty()) {
        Problem problem = OfFirstRoute(movie, header, notices);
        problem.route = route::kHeader;
        return problem;
    }
    const std::string opening = host::OpenProblem(movie);
    Problem problem{movie, ofNoUse};
    problem.route = route::kNone;
    if (header.movie) {
        problem.route = opening.empty() ? route::kLibrary : route::kNone;
        return problem;
    }
    if (opening.empty()) {
        problem = OfSecondRoute(movie, header, notices);
        problem.route = route::kLibrary;
        return problem;
    }
    // What begins with no atom of the family may be anything.
    const bool isForeign = header.refusal.offset == 0u && header.refusal.code == NCF_E_NOTSUPPORTED;
    if (isForeign) {
        problem.reason += fmt::format(
            ", and the file can't be opened as another kind of movie, sound or picture either: {}",
            opening);
    } else if (header.refusal.code == NMA_E_NODATA) {
        problem.hint = kCopyAgain;
    } else if (header.refusal.code == NCF_E_NOTSUPPORTED && opening != header.refusal.reason) {
        problem.reason += "; nor can the multimedia library read it: " + opening;
    }
    return problem;
}

}  // namespace cliphost
