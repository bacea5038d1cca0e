// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <optional>
#include <vector>

#include "host_interfaces/framework/Types.h"
#include "reference_host/quicktime/AvOwners.h"

namespace host {

// Where the packets of a stream begin when their blocks follow each other. A packet's
// time is rounded to the units of its container, and some writers round each step
// by itself, so that their times drift away from the sound. So a block directly
// follows the one before, unless their times are further apart than rounding
// explains.
class SoundPlaces {
public:
    struct Packet {
        ncfSInt64 time;
        ncfSInt64 place;
    };
    // From the index of an input whose packets all hold `framesPerPacket`.
    SoundPlaces(const AVStream& stream, ncfSInt64 framesPerPacket, int rate, ncfSInt64 zeroTime);

    // Decode time of the last packet that begins at `place` or before, of the
    // first for none.
    ncfSInt64 TimeOf(ncfSInt64 place) const;
    bool IsEmpty() const { return packets_.empty(); }
    // The last packet at this decode time or before; nothing before the first.
    std::optional<Packet> LastAt(ncfSInt64 decodeTime) const;

private:
    std::vector<Packet> packets_;
};

// Frames that a step between two times takes beside the `frames` that lie
// between them: 0 where the difference may come from rounding.
ncfSInt64 GapOfStep(ncfSInt64 step, ncfSInt64 frames, AVRational timeBase, int rate);

}  // namespace host
