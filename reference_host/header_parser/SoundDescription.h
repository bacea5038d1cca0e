// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "reference_host/header_parser/Atom.h"
#include "reference_host/header_parser/SampleSizes.h"
#include "reference_host/header_parser/Verdict.h"

namespace header_parser {

// One sound sample description, of any version, told in true values.
struct SoundDescription {
    ncfUInt32 codec = 0;
    ncfUInt32 channels = 0;
    ncfUInt32 bits = 0;  // true depth of a channel, 0 for compressed sound
    double rate = 0;
    bool isLinear = false;
    bool isLittleEndian = false;
    bool isConstantBitRate = false;
    ncfUInt32 bytesPerPacket = 0;  // all channels; 0 when it varies
    ncfUInt32 framesPerPacket = 1;

    // How samples lie whose table says that each has one byte.
    PacketLayout OldLayout() const { return {framesPerPacket, bytesPerPacket}; }
};

// `entry` is the description behind its size and code; `isIso` tells that the
// list is of the ISO form, where version 1 adds no fields. A description
// without a rate has that of the media. Channels and rate of compressed sound
// are those that come out of its decoder.
Verdict ReadSoundDescription(const Atom& entry, bool isIso, ncfUInt32 mediaTimeScale,
                             SoundDescription& description);

}  // namespace header_parser
