// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/HeaderTracks.h"

#include <fmt/format.h>

#include <algorithm>

namespace cliphost {

using header_parser::HeaderReport;

const std::vector<ncfUInt32>& TracksOf(const HeaderReport& header, TrackKind kind) {
    return header.movie->Of(kind == TrackKind::Sound ? header_parser::TrackKind::kSound
                                                     : header_parser::TrackKind::kVideo);
}

FoundTrack Find(const HeaderReport& header, const WhichTrack& which) {
    if (!header.movie || which.place >= TracksOf(header, which.kind).size()) {
        return {};
    }
    const std::size_t place = TracksOf(header, which.kind)[which.place];
    return {&header.movie->tracks[place], place};
}

std::string WhatIsElsewhere(const HeaderReport& header, std::size_t place,
                            std::optional<std::size_t> description) {
    const std::vector<bool>& isHere = header.movie->tracks[place].isInFile;
    const bool isElsewhere = description
                                 ? *description < isHere.size() && !isHere[*description]
                                 : std::find(isHere.begin(), isHere.end(), false) != isHere.end();
    return isElsewhere ? fmt::format(
                             "track {} of the file: its samples are in another file, and "
                             "only this one is read",
                             place + 1)
                       : std::string();
}

Problem OfCodec(const std::filesystem::path& movie, const host::CodecProblem& codec) {
    return {movie, codec.sentence, host::IsEncrypted(codec.code) ? kNeedsKey : kConvert};
}

}  // namespace cliphost
