// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "reference_host/header_parser/SoundDescription.h"

namespace header_parser {

// The fields of a sound description say little about compressed sound: in files of
// the ISO form the channels are a template, and the rate may be that of a core that
// the decoder extends. What the decoder delivers is in its configuration, which
// follows the fields in [begin, end), in the atom `wave` or beside it. Corrects
// channels and rate from it; a configuration that is missing, cut short or
// impossible changes nothing.
void ReadSoundConfig(ncfUInt32 codec, const ncfUInt8* begin, const ncfUInt8* end,
                     SoundDescription& description);

// What the configuration of AAC says by itself; 0 for what it does not say.
// Extensions count when it announces them.
struct AacSound {
    ncfUInt32 channels = 0;
    ncfUInt32 rate = 0;
};
AacSound ReadAacSound(const ncfUInt8* begin, const ncfUInt8* end);

}  // namespace header_parser
