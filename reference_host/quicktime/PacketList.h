// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <vector>

#include "host_interfaces/framework/Types.h"
#include "reference_host/quicktime/AvOwners.h"

namespace host {

// One stored packet of a stream.
struct PacketEntry {
    ncfSInt64 decodeTime = AV_NOPTS_VALUE;
    ncfSInt64 displayTime = AV_NOPTS_VALUE;
    ncfSInt64 position = -1;
    ncfSInt64 duration = 0;
    ncfUInt32 size = 0;
    bool isSync = false;
    bool isDisposable = false;
    bool isShown = true;  // not only there for others to decode
};

// The packets of a stream in decode order. Where the container has an index and
// the codec keeps its pictures in order, the index says all; else the packets
// are read through once. `indexIsWhole`: the container's index names all of
// them. Leaves the input at an unknown place.
std::vector<PacketEntry> ListPackets(AVFormatContext& input, int stream, bool indexIsWhole);

// The number of pictures, at most `enough`.
ncfUInt64 CountShownPackets(AVFormatContext& input, int stream, bool indexIsWhole,
                            ncfUInt64 enough);

}  // namespace host
