// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/framework/Types.h"

namespace header_parser {

// How much of a file the parser is willing to take. The defaults let through
// whatever a camera or an editor writes and stop what only a hostile file
// would ask for.
struct ParserLimits {
    // What one pass asks for while the top level is walked, and at most.
    ncfUInt32 scanReadSize = 4096;
    ncfUInt32 maxReadSize = 1u << 20;
    // Atoms of the top level in front of the header: each may cost a pass.
    ncfUInt32 maxTopLevelAtoms = 65536;
    // The header is kept whole. Ten million samples with sizes, offsets and
    // display times take less than 200 MB.
    ncfUInt64 maxHeaderBytes = ncfUInt64{1} << 30;
    // A compressed header may grow to its ratio times its own size, which
    // tables reach that count upwards, but not past the second number.
    ncfUInt32 maxInflationRatio = 100;
    ncfUInt64 maxInflatedBytes = ncfUInt64{64} << 20;
    ncfUInt32 maxTracks = 4096;
    // Of all sounds together; each is a track of its own for the user.
    ncfUInt32 maxSoundChannels = 1024;
    ncfUInt32 maxDescriptionsInTrack = 4096;
    ncfUInt32 maxEditsInTrack = 1u << 20;
    ncfUInt32 maxAttributeText = 1u << 20;
};

}  // namespace header_parser
