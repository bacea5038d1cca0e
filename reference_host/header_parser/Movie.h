// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <array>
#include <memory>
#include <optional>
#include <vector>

#include "reference_host/header_parser/EditList.h"
#include "reference_host/header_parser/HeaderBytes.h"
#include "reference_host/header_parser/SampleTable.h"
#include "reference_host/header_parser/SoundDescription.h"
#include "reference_host/header_parser/Timecode.h"
#include "reference_host/header_parser/VideoDescription.h"

namespace header_parser {

enum class TrackKind { kVideo, kSound, kTimecode, kOther };
inline constexpr std::size_t kTrackKinds = 4;

// A parsed track. Tables and texts point into the bytes of its movie.
struct Track {
    TrackKind kind = TrackKind::kOther;
    ncfUInt32 id = 0;
    ncfUInt32 duration = 0;          // movie time units
    bool isShorterThanTold = false;  // its headers and edits tell more than it can fill
    std::array<float, 9> matrix{};
    ncfUInt32 mediaTimeScale = 0;
    ncfUInt32 mediaDuration = 0;
    ncfUInt32 toldMediaDuration = 0;  // by its header; 0 for nothing
    EditList edits;
    SampleTable samples;

    ncfUInt32 descriptionCount = 0;
    std::vector<bool> isInFile;  // for each description
    std::vector<VideoDescription> video;
    std::vector<SoundDescription> sound;
    TimecodeDescription timecode;  // the first description

    // Only when the sound of all samples has one size and one duration.
    bool HasConstantSamples() const {
        return samples.Sizes().AreEqual() && samples.Times().HasOneDuration();
    }
};

// A whole parsed header. Objects that are handed out share it, and it does not
// change any more.
struct Movie {
    HeaderBytes bytes;
    bool isUnpacked = false;  // the bytes are not those of the file
    ncfUInt64 creationTime = 0;
    ncfUInt32 timeScale = 0;
    ncfUInt32 duration = 0;
    ncfUInt64 atomPosition = 0;
    ncfUInt64 atomSize = 0;
    std::vector<Track> tracks;  // in the order of the file
    // Places of the tracks of each kind, in the same order.
    std::array<std::vector<ncfUInt32>, kTrackKinds> ofKind;
    std::optional<TimecodeAddress> startAddress;  // of the first timecode track
    bool isSelfContained = true;  // no description of any track refers to another file

    const std::vector<ncfUInt32>& Of(TrackKind kind) const {
        return ofKind[static_cast<std::size_t>(kind)];
    }
};

// Reads what stands within the movie atom. The bytes are taken over.
Verdict ReadMovie(HeaderBytes&& bytes, const ParserLimits& limits, Movie& movie);

// Unpacks a compressed header: `bytes` become those of the plain one. Fine and
// without effect when the header is plain.
Verdict Inflate(HeaderBytes& bytes, const ParserLimits& limits, bool* isUnpacked = nullptr);

// The parts of ReadMovie: a trak atom, and its media.
Verdict ReadTrack(const Atom& trak, ncfUInt32 movieTimeScale, const ParserLimits& limits,
                  Track& track);

}  // namespace header_parser
