// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "reference_host/header_parser/SoundDescription.h"

namespace header_parser {

// The fields of a sound description tell little of compressed sound: in files
// of the ISO form its channels are a template, and its rate may be that of a
// core on which the decoder builds. What comes out is told by the decoder's
// configuration, which stands in [begin, end) behind the fields, in the atom
// `wave` or beside it. Puts channels and rate right where it tells them; what
// is missing, cut short or impossible leaves them as they are.
void ReadSoundConfig(ncfUInt32 codec, const ncfUInt8* begin, const ncfUInt8* end,
                     SoundDescription& description);

// What the configuration of AAC tells by itself; 0 for what it does not tell.
// Extensions count where it announces them.
struct AacSound {
    ncfUInt32 channels = 0;
    ncfUInt32 rate = 0;
};
AacSound ReadAacSound(const ncfUInt8* begin, const ncfUInt8* end);

}  // namespace header_parser
