// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "reference_host/cliphost/MovieDiagnosis.h"

#include <fmt/format.h>

#include <algorithm>
#include <cmath>
#include <functional>
#include <optional>

#include "reference_host/cliphost/FileAccess.h"
#include "reference_host/cliphost/MissingSamples.h"
#include "reference_host/header_parser/InspectHeaders.h"
#include "reference_host/header_parser/StoredAtom.h"
#include "reference_host/header_parser/Verdict.h"
#include "reference_host/quicktime/OpenProblem.h"

namespace cliphost {
namespace {

using header_parser::Counted;
using header_parser::HeaderReport;
using header_parser::Track;

// Lines that the module writes on its console when it can't describe a movie.
constexpr const char* kNoRate = "The frame rate of the movie can't be determined.";
constexpr const char* kNoLength = "The length of the movie can't be determined.";
constexpr const char* kNoTracks = "Movie doesn't contain any video/audio tracks!";

constexpr const char* kCopyAgain = "copy the file again from where it came";

constexpr const char* kTakeSoundOut =
    "take the sound out of the movie, for instance with ffmpeg -i FILE -map 0:a -c copy SOUND.mov";
constexpr const char* kNeedsKey = "only who holds the key can read them";
constexpr const char* kConvert = "convert it with a program that knows this codec";
constexpr const char* kSaveInOne =
    "save the movie with its media in one file, such as with ffmpeg -i FILE -c copy WHOLE.mov";

bool HasSaid(const std::vector<std::string>& notices, const char* line) {
    return std::find(notices.begin(), notices.end(), line) != notices.end();
}

const std::vector<ncfUInt32>& TracksOf(const HeaderReport& header, TrackKind kind) {
    return header.movie->Of(kind == TrackKind::Sound ? header_parser::TrackKind::kSound
                                                     : header_parser::TrackKind::kVideo);
}

std::string SecondsWords(ncfUInt64 units, const Track& track) {
    const ncfUInt64 seconds = (units + track.mediaTimeScale / 2) / track.mediaTimeScale;
    return Counted(seconds, "second");
}

// How often the pictures of the first track follow each other, and what makes
// that no rate where it is a single one.
std::string RateWords(const HeaderReport& header) {
    const ncfUInt32 place = TracksOf(header, TrackKind::Picture).front();
    const Track& track = header.movie->tracks[place];
    const header_parser::SampleTimes& times = track.samples.Times();
    const std::string words = fmt::format(
        "track {} of the file: {} in {} come to no rate of frames", place + 1,
        Counted(track.samples.Count(), "picture"), SecondsWords(track.mediaDuration, track));
    if (track.samples.Count() < 2) {
        return words;
    }
    const ncfUInt32 sample = times.LongestSample();
    const ncfUInt32 longest = times.DurationOf(sample);
    if (longest <= times.TotalDuration() - longest || track.toldMediaDuration >= longest) {
        return words;
    }
    return fmt::format("{}: sample {} of its table alone lasts {}, 'mdhd' tells {} of all", words,
                       sample, SecondsWords(longest, track),
                       SecondsWords(track.toldMediaDuration, track));
}

// Without a description packets of several samples count as one.
bool CountsPackets(const Track& track) {
    return track.samples.Count() != track.mediaDuration;
}

// How the sound of a movie without description is had.
std::string SoundHint(const HeaderReport& header) {
    const std::vector<ncfUInt32>& sounds = TracksOf(header, TrackKind::Sound);
    if (sounds.empty() || header.movie->tracks[sounds.front()].sound.empty()) {
        return {};
    }
    const Track& track = header.movie->tracks[sounds.front()];
    if (CountsPackets(track)) {
        return kTakeSoundOut;
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

// That samples of a track lie in another file: those of one description, or all
// for none given.
std::string WhatIsElsewhere(const HeaderReport& header, std::size_t place,
                            std::optional<std::size_t> description = {}) {
    const std::vector<bool>& isHere = header.movie->tracks[place].isInFile;
    const bool isElsewhere = description
                                 ? *description < isHere.size() && !isHere[*description]
                                 : std::find(isHere.begin(), isHere.end(), false) != isHere.end();
    return isElsewhere ? fmt::format(
                             "track {} of the file: its samples lie in another file, and "
                             "none but this one is read",
                             place + 1)
                       : std::string();
}

std::vector<ncfUInt32> CodecsOf(const Track& track) {
    std::vector<ncfUInt32> codecs;
    for (const auto& one : track.video) {
        codecs.push_back(one.codec);
    }
    for (const auto& one : track.sound) {
        codecs.push_back(one.codec);
    }
    return codecs;
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
                "track {} of the file: its edits last {} of the movie, and the "
                "movie lasts {}",
                i + 1, Counted(edits, "unit"), header.movie->duration);
        }
    }
    return {};
}

Problem OfCodec(const std::filesystem::path& movie, const host::CodecProblem& codec) {
    return {movie, codec.sentence, host::IsEncrypted(codec.code) ? kNeedsKey : kConvert};
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
                fmt::format("its length of {} in {} a second comes to no frame",
                            Counted(header.movie->duration, "unit"), header.movie->timeScale),
                SoundHint(header)};
    }
    if (const std::string missing = WhatIsMissing(header); !missing.empty()) {
        return {movie, missing, kCopyAgain};
    }
    if (const std::string opening = host::OpenProblem(movie); !opening.empty()) {
        return {movie, "the multimedia library, which decodes it, refuses it: " + opening};
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
                              : HasSaid(notices, kNoRate) ? "nothing tells its rate of frames"
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

// Why a sample is not delivered, as far as the header tells.
Problem OfSample(const HeaderReport& header, std::size_t place, TrackKind kind,
                 std::uint64_t sample) {
    const Track& track = header.movie->tracks[place];
    const std::vector<ncfUInt32> codecs = CodecsOf(track);
    // Sound is counted in what its packets hold.
    const auto description =
        DescriptionOf(track, kind == TrackKind::Sound && codecs.size() == 1 ? 0 : sample);
    const ncfUInt32 codec = description && *description < codecs.size() ? codecs[*description] : 0;
    if (host::IsEncrypted(codec)) {
        return {{},
                fmt::format("track {} of the file: its samples are encrypted ({})", place + 1,
                            header_parser::NameOf(codec)),
                kNeedsKey};
    }
    if (std::string elsewhere = WhatIsElsewhere(header, place, description); !elsewhere.empty()) {
        return {{}, elsewhere, kSaveInOne};
    }
    const MissingSamples missing(header, place);
    if (kind == TrackKind::Sound ? missing.ConcernSound(sample) : missing.ConcernPicture(sample)) {
        return {{}, missing.Sentence(), kCopyAgain};
    }
    if (std::adjacent_find(codecs.begin(), codecs.end(), std::not_equal_to<>()) != codecs.end()) {
        std::string names;
        for (const ncfUInt32 one : codecs) {
            names += (names.empty() ? "" : " and ") + header_parser::NameOf(one) +
                     (host::IsEncrypted(one) ? " (encrypted)" : "");
        }
        return {{},
                fmt::format("track {} of the file: its sample descriptions are of the codecs {}, "
                            "and the multimedia library reads a track by one alone",
                            place + 1, names)};
    }
    return {};
}

// A track of a header that is understood, with its place in the file.
struct Found {
    const Track* track = nullptr;
    std::size_t place = 0;
};

Found Find(const HeaderReport& header, const WhichTrack& which) {
    if (!header.movie || which.place >= TracksOf(header, which.kind).size()) {
        return {};
    }
    const std::size_t place = TracksOf(header, which.kind)[which.place];
    return {&header.movie->tracks[place], place};
}

RouteTaken RouteOf(const HeaderReport& header) {
    const std::string refused = header.WhyOfNoUse();
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

Problem DiagnoseSamples(const std::filesystem::path& movie, const WhichTrack& which,
                        std::uint64_t sample) {
    const HeaderReport header = header_parser::InspectHeaders(movie);
    const RouteTaken taken = RouteOf(header);
    const auto because = [&](std::string reason, std::string hint) {
        return Problem{movie, std::move(reason), std::move(hint), NCF_OK, taken.route};
    };
    const auto [track, number] = Find(header, which);
    if (track && track->samples.Count() == 0) {
        return because(fmt::format("track {} of the file: it holds no samples", number + 1), {});
    }
    if (track) {
        if (const Problem found = OfSample(header, number, which.kind, sample)) {
            return because(found.reason, found.hint);
        }
    }
    const bool ofSound = which.kind == TrackKind::Sound;
    // A decoder refuses such a size too, and does not say why.
    if (!ofSound) {
        if (const Problem raster = WrongRaster(movie)) {
            return because(raster.reason, raster.hint);
        }
    }
    // Tracks of a header that is read are those of the library, place by place.
    if (const host::CodecProblem codec = track && taken.reason.empty()
                                             ? host::DecoderProblem(movie, number)
                                             : host::DecoderProblem(movie, ofSound, which.place)) {
        const Problem problem = OfCodec(movie, codec);
        return because(problem.reason, problem.hint);
    }
    // What is only left to the library is nothing wrong.
    if (header.refusal && header.refusal.code != NCF_E_NOTSUPPORTED) {
        return because(
            fmt::format(
                "{}; the multimedia library, which reads it all the same, delivers no such {}",
                header.refusal.Sentence(), ofSound ? "sound" : "picture"),
            header.refusal.code == NMA_E_NODATA ? kCopyAgain : "");
    }
    return {};
}

std::string WhyNotShown(const std::filesystem::path& movie, const WhichTrack& which) {
    const HeaderReport header = header_parser::InspectHeaders(movie);
    const Found found = Find(header, which);
    const ncfUInt32 count = found.track ? found.track->samples.Count() : 0;
    if (count == 0) {
        const std::string refused = header.WhyOfNoUse();
        return refused.empty() ? "it has no frames"
                               : refused + "; the multimedia library finds nothing to show in it";
    }
    return fmt::format("track {} of the file: {} none of its {}", found.place + 1,
                       found.track->edits.IsEmpty() ? "its times show" : "its edits show",
                       Counted(count, "sample"));
}

std::string WhatPictureLacks(const std::filesystem::path& movie, std::size_t place) {
    const HeaderReport header = header_parser::InspectHeaders(movie);
    if (!header.movie || place >= TracksOf(header, TrackKind::Picture).size()) {
        return {};
    }
    return MissingSamples(header, TracksOf(header, TrackKind::Picture)[place]).Sentence();
}

SoundAlone SoundWithoutDescription(const std::filesystem::path& movie, std::size_t place) {
    const HeaderReport header = header_parser::InspectHeaders(movie);
    SoundAlone sound;
    if (!header.movie || place >= TracksOf(header, TrackKind::Sound).size()) {
        return sound;
    }
    const ncfUInt32 number = TracksOf(header, TrackKind::Sound)[place];
    const Track& track = header.movie->tracks[number];
    sound.rate = track.sound.empty() ? 0 : static_cast<unsigned>(std::lround(track.sound[0].rate));
    if (CountsPackets(track)) {
        sound.problem = {movie,
                         fmt::format("track {} of the file: its packets hold several samples each, "
                                     "and only a description tells how many they are",
                                     number + 1),
                         kTakeSoundOut, NCF_OK, route::kHeader};
    }
    return sound;
}

std::string WhatLiesElsewhere(const std::filesystem::path& movie, const WhichTrack& which) {
    const HeaderReport header = header_parser::InspectHeaders(movie);
    const auto [track, place] = Find(header, which);
    if (!track ||
        std::find(track->isInFile.begin(), track->isInFile.end(), true) != track->isInFile.end()) {
        return {};
    }
    return WhatIsElsewhere(header, place);
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
