// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <filesystem>
#include <string>
#include <vector>

#include "host_interfaces/framework/Types.h"
#include "reference_host/quicktime/AvOwners.h"

namespace host {

// A movie opened through the multimedia library. Tracks have the movie's own
// ids where it numbers them well, else 1 to n in the order of the streams.
class MovieFile {
public:
    // Null with a sentence in `reason` that says what was wrong.
    static std::unique_ptr<MovieFile> Open(const std::filesystem::path& path, std::string& reason);

    // The stream of a track; null for a track that there is not.
    const AVStream* FindTrack(ncfUInt32 track) const;
    ncfUInt32 HighestTrack() const;
    ncfUInt32 TrackCount() const { return static_cast<ncfUInt32>(numbers_.size()); }

    bool IsVideo(ncfUInt32 track) const;  // pictures attached to sound are none
    bool IsAudio(ncfUInt32 track) const;
    bool IsTimecode(ncfUInt32 track) const;

    // Seconds from 1904-01-01 UTC, 0 when the movie does not say.
    ncfUInt64 CreationTime() const;

private:
    explicit MovieFile(InputOwner input);
    void NumberTracks();

    InputOwner input_;
    std::vector<ncfUInt32> numbers_;  // of the stream at the same place
};

}  // namespace host
