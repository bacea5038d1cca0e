// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/SampleDiagnosis.h"

#include <fmt/format.h>

#include <algorithm>
#include <functional>

#include "reference_host/cliphost/MissingSamples.h"
#include "reference_host/cliphost/RouteTaken.h"
#include "reference_host/header_parser/Verdict.h"

namespace cliphost {
namespace {

using header_parser::Counted;
using header_parser::HeaderReport;
using header_parser::Track;

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
                fmt::format("track {} of the file: its sample descriptions name the codecs {}, "
                            "but the multimedia library reads one codec per track",
                            place + 1, names)};
    }
    return {};
}

}  // namespace

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
            fmt::format("{}; the multimedia library can open it, but delivers no such {}",
                        header.refusal.Sentence(), ofSound ? "sound" : "picture"),
            header.refusal.code == NMA_E_NODATA ? kCopyAgain : "");
    }
    return {};
}

std::string WhyNotShown(const std::filesystem::path& movie, const WhichTrack& which) {
    const HeaderReport header = header_parser::InspectHeaders(movie);
    const FoundTrack found = Find(header, which);
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
    const FoundTrack found = Find(header, {TrackKind::Picture, place});
    return found.track ? MissingSamples(header, found.place).Sentence() : std::string();
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

Problem WrongRaster(const std::filesystem::path& movie) {
    const std::string raster = host::RasterProblem(movie);
    return raster.empty()
               ? Problem{}
               : Problem{movie, raster, "its description is damaged: " + std::string(kCopyAgain)};
}

}  // namespace cliphost
