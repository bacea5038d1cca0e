// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/SoundAlone.h"

#include <fmt/format.h>

#include <cmath>

namespace cliphost {
namespace {

// Without a description packets of several samples count as one.
bool CountsPackets(const header_parser::Track& track) {
    return track.samples.Count() != track.mediaDuration;
}

}  // namespace

std::string SoundHint(const header_parser::HeaderReport& header) {
    const std::vector<ncfUInt32>& sounds = TracksOf(header, TrackKind::Sound);
    if (sounds.empty() || header.movie->tracks[sounds.front()].sound.empty()) {
        return {};
    }
    const header_parser::Track& track = header.movie->tracks[sounds.front()];
    if (CountsPackets(track)) {
        return kTakeSoundOut;
    }
    return fmt::format("extract the sound alone: cliphost audio FILE --rate {:.0f} -o FILE.wav",
                       track.sound.front().rate);
}

SoundAlone SoundWithoutDescription(const std::filesystem::path& movie, std::size_t place) {
    const header_parser::HeaderReport header = header_parser::InspectHeaders(movie);
    SoundAlone sound;
    const FoundTrack found = Find(header, {TrackKind::Sound, place});
    if (!found.track) {
        return sound;
    }
    const header_parser::Track& track = *found.track;
    sound.rate = track.sound.empty() ? 0 : static_cast<unsigned>(std::lround(track.sound[0].rate));
    if (CountsPackets(track)) {
        sound.problem = {movie,
                         fmt::format("track {} of the file: its packets hold several samples each, "
                                     "and only a description tells how many they are",
                                     found.place + 1),
                         kTakeSoundOut, NCF_OK, route::kHeader};
    }
    return sound;
}

}  // namespace cliphost
