// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// The input as a movie file whose essence passes through the built module: the
// formats of each picture track, three of its frames, and a second of each
// sound.

#include <algorithm>
#include <cstdio>
#include <cstdlib>
#include <numeric>

#include "fuzz/support/InputFile.h"
#include "fuzz/support/ModuleSession.h"
#include "fuzz/support/RunLimits.h"
#include "reference_host/cliphost/Failure.h"
#include "reference_host/cliphost/FrameReader.h"
#include "reference_host/cliphost/SoundReader.h"

namespace {

using cliphost::ClipTrack;
using cliphost::Essence;
using cliphost::TrackKind;

constexpr std::size_t kMostTracks = 4;
constexpr std::uint64_t kLongestSecond = 192000;  // samples

void Require(bool holds, const char* what) {
    if (!holds) {
        std::fprintf(stderr, "%s\n", what);
        std::abort();
    }
}

// A failure is as good as an answer, but it needs an explanation.
template <class Action>
void Try(Action action) {
    try {
        action();
    } catch (const cliphost::Failure& failure) {
        Require(*failure.what() != 0, "a failure without a word");
    }
}

// Looks at each byte, so that one that isn't there is found.
void Touch(const unsigned char* bytes, std::size_t size) {
    static volatile unsigned sum;
    sum = std::accumulate(bytes, bytes + size, 0u);
}

void ReadFrames(Essence& essence, const ClipTrack& track) {
    cliphost::FrameReader reader(essence, track, "");
    for (const std::uint64_t frame : {track.length / 2, std::uint64_t{0}, track.length}) {
        if (reader.Read(frame) == NCF_OK) {
            Touch(reader.bytes(), static_cast<std::size_t>(reader.frameBytes()));
        }
    }
}

void ReadSound(Essence& essence, const ClipTrack& track) {
    cliphost::SoundReader reader(essence, track);
    const std::uint64_t second = reader.form().rate == 0 ? 48000 : reader.form().rate;
    const std::uint64_t count = std::min({second, kLongestSecond, reader.Count()});
    if (count > 0) {
        const auto block = reader.Read(0, count);
        Require(block.size == count * reader.form().channels * (reader.form().bits / 8),
                "sound of another size than was asked for");
        Touch(block.bytes, block.size);
    }
}

void ReadTrack(Essence& essence, const ClipTrack& track) {
    if (track.kind == TrackKind::Sound) {
        ReadSound(essence, track);
    } else {
        ReadFrames(essence, track);
    }
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    static const fuzz::InputFile file(".mov");
    cliphost::Session& session = fuzz::TheSession();
    const fuzz::TimeLimit limit;
    Try([&] {
        Essence essence(session, file.Hold(data, size));
        const std::size_t tracks = std::min(essence.tracks().size(), kMostTracks);
        for (std::size_t i = 0; i < tracks; ++i) {
            Try([&] { ReadTrack(essence, essence.tracks()[i]); });
        }
    });
    session.TakeNotices();
    fuzz::RequireNothingLeft(session);
    return 0;
}
