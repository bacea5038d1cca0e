// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "reference_host/cliphost/MovieDiagnosis.h"

#include <fmt/format.h>

#include <algorithm>
#include <iterator>
#include <optional>

#include "reference_host/cliphost/FileAccess.h"
#include "reference_host/cliphost/MissingMedia.h"
#include "reference_host/header_parser/InspectHeaders.h"
#include "reference_host/header_parser/Verdict.h"
#include "reference_host/quicktime/OpenProblem.h"

namespace cliphost {
namespace {

using header_parser::Code;
using header_parser::Counted;
using header_parser::HeaderReport;
using header_parser::Track;

// Lines that the module writes on its console when it can't describe a movie.
constexpr const char* kNoRate = "The frame rate of the movie can't be determined.";
constexpr const char* kNoLength = "The length of the movie can't be determined.";
constexpr const char* kNoTracks = "Movie doesn't contain any video/audio tracks!";

constexpr const char* kCopyAgain = "copy the file again from where it came";

constexpr ncfUInt32 kEncrypted[] = {Code("encv"), Code("enca"), Code("drmi"), Code("drms")};

bool HasSaid(const std::vector<std::string>& notices, const char* line) {
    return std::find(notices.begin(), notices.end(), line) != notices.end();
}

const std::vector<ncfUInt32>& TracksOf(const HeaderReport& header, TrackKind kind) {
    return header.movie->Of(kind == TrackKind::Sound ? header_parser::TrackKind::kSound
                                                     : header_parser::TrackKind::kVideo);
}

// Why the module takes no clip from a header that the parser understands.
std::string WhyOfNoUse(const HeaderReport& header) {
    const std::vector<ncfUInt32>& pictures = TracksOf(header, TrackKind::Picture);
    if (pictures.empty() && TracksOf(header, TrackKind::Sound).empty()) {
        return fmt::format("the movie holds no picture and no sound in its {}",
                           Counted(header.movie->tracks.size(), "track"));
    }
    if (!pictures.empty() && header.movie->tracks[pictures.front()].descriptionCount == 0) {
        return fmt::format("track {} of the file: 'stsd' describes none of its samples",
                           pictures.front() + 1);
    }
    return {};
}

// How often the pictures of the first track follow each other.
std::string RateWords(const HeaderReport& header) {
    const ncfUInt32 place = TracksOf(header, TrackKind::Picture).front();
    const Track& track = header.movie->tracks[place];
    const double seconds = track.mediaTimeScale == 0
                               ? 0
                               : static_cast<double>(track.mediaDuration) / track.mediaTimeScale;
    return fmt::format("track {} of the file: {} in {:.0f} seconds come to no rate of frames",
                       place + 1, Counted(track.samples.Count(), "picture"), seconds);
}

// How the sound of a movie without description is had.
std::string SoundHint(const HeaderReport& header) {
    const std::vector<ncfUInt32>& sounds = TracksOf(header, TrackKind::Sound);
    if (sounds.empty() || header.movie->tracks[sounds.front()].sound.empty()) {
        return {};
    }
    const Track& track = header.movie->tracks[sounds.front()];
    // Without a description packets of several samples count as one.
    if (track.samples.Count() != track.mediaDuration) {
        return "take the sound out of the movie, for instance with ffmpeg -i FILE -map 0:a -c copy "
               "SOUND.mov";
    }
    return fmt::format("the sound alone can be had: cliphost audio FILE --rate {:.0f} -o FILE.wav",
                       track.sound.front().rate);
}

Problem WithoutRate(const std::filesystem::path& movie, const HeaderReport& header) {
    if (!header.movie || TracksOf(header, TrackKind::Picture).empty()) {
        return {movie, "nothing tells its rate of frames"};
    }
    return {movie, RateWords(header), SoundHint(header)};
}

// What the first track misses that misses some.
std::string WhatAnyTrackMisses(const HeaderReport& header) {
    for (std::size_t i = 0; i < header.movie->tracks.size(); ++i) {
        const ncfUInt32 count = header.movie->tracks[i].samples.Count();
        if (const std::string missing = WhatIsMissing(header, i, count); !missing.empty()) {
            return missing;
        }
    }
    return {};
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

Problem OfFirstRoute(const std::filesystem::path& movie, const HeaderReport& header,
                     const std::vector<std::string>& notices) {
    if (HasSaid(notices, kNoRate)) {
        return WithoutRate(movie, header);
    }
    if (HasSaid(notices, kNoLength)) {
        return {movie,
                fmt::format("its length of {} in {} a second comes to no frame",
                            Counted(header.movie->duration, "unit"), header.movie->timeScale),
                SoundHint(header)};
    }
    if (const std::string empty = WhatIsEmpty(header); !empty.empty()) {
        return {movie, empty};
    }
    if (const std::string missing = WhatAnyTrackMisses(header); !missing.empty()) {
        return {movie, missing, kCopyAgain};
    }
    if (const std::string opening = host::OpenProblem(movie); !opening.empty()) {
        return {movie, "the multimedia library, which decodes it, refuses it: " + opening};
    }
    return {};
}

Problem OfSecondRoute(const std::filesystem::path& movie, const std::string& refusal,
                      const std::vector<std::string>& notices) {
    const char* const found = HasSaid(notices, kNoTracks) ? "no picture and no sound is found in it"
                              : HasSaid(notices, kNoRate) ? "nothing tells its rate of frames"
                              : HasSaid(notices, kNoLength) ? "no length is found in it"
                                                            : nullptr;
    if (!found) {
        return {};
    }
    return {movie, fmt::format("{}; read by the multimedia library, {}", refusal, found)};
}

RouteTaken RouteOf(const HeaderReport& header) {
    const std::string refused = header.movie ? WhyOfNoUse(header) : header.refusal.Sentence();
    return {refused.empty() ? route::kHeader : route::kLibrary, refused};
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
        return problem;
    }
    if (opening.empty()) {
        problem = OfSecondRoute(movie, ofNoUse, notices);
        problem.route = route::kLibrary;
        if (header.refusal.code == NMA_E_NODATA) {
            problem.hint = kCopyAgain;
        }
        return problem;
    }
    // What begins with no atom of the family may be anything.
    const bool isForeign = header.refusal.offset == 0u && header.refusal.atom.empty();
    if (isForeign) {
        problem.reason += fmt::format(
            ", and the file can't be opened as another kind of movie, sound or picture either: {}",
            opening);
        problem.hint =
            header.refusal.code == NMA_E_NODATA ? kCopyAgain : "convert it to .mov or .mp4";
    } else if (header.refusal.code == NMA_E_NODATA) {
        problem.hint = kCopyAgain;
    } else if (header.refusal.code == NCF_E_NOTSUPPORTED && opening != header.refusal.reason) {
        problem.reason += "; nor can the multimedia library read it: " + opening;
    }
    return problem;
}

Problem DiagnoseSamples(const std::filesystem::path& movie, const WhichTrack& which,
                        std::uint64_t sample) {
    const HeaderReport header = header_parser::InspectHeaders(movie);
    const RouteTaken taken = RouteOf(header);
    const auto because = [&](std::string reason, std::string hint) {
        return Problem{movie, std::move(reason), std::move(hint), NCF_OK, taken.route};
    };
    const Track* track = nullptr;
    std::size_t number = 0;
    if (header.movie && which.place < TracksOf(header, which.kind).size()) {
        number = TracksOf(header, which.kind)[which.place];
        track = &header.movie->tracks[number];
        const ncfUInt32 codec = !track->video.empty()   ? track->video.front().codec
                                : !track->sound.empty() ? track->sound.front().codec
                                                        : 0;
        if (std::find(std::begin(kEncrypted), std::end(kEncrypted), codec) !=
            std::end(kEncrypted)) {
            return because(fmt::format("track {} of the file: its samples are encrypted ({})",
                                       number + 1, header_parser::NameOf(codec)),
                           "only who holds the key can read them");
        }
    }
    const std::string decoder =
        host::DecoderProblem(movie, which.kind == TrackKind::Sound, which.place);
    if (!decoder.empty()) {
        return because(decoder, "convert it with a program that knows this codec");
    }
    if (which.kind != TrackKind::Sound) {
        if (const Problem raster = WrongRaster(movie)) {
            return because(raster.reason, raster.hint);
        }
    }
    if (track) {
        if (const std::string missing = WhatIsMissing(header, number, sample); !missing.empty()) {
            return because(missing, kCopyAgain);
        }
    }
    return {};
}

RouteTaken RouteOf(const std::filesystem::path& movie) {
    return RouteOf(header_parser::InspectHeaders(movie));
}

Problem WrongRaster(const std::filesystem::path& movie) {
    const std::string raster = host::RasterProblem(movie);
    return raster.empty()
               ? Problem{}
               : Problem{movie, raster, "its description is damaged: " + std::string(kCopyAgain)};
}

}  // namespace cliphost
