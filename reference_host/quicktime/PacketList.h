// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <array>
#include <cstdint>
#include <filesystem>
#include <memory>
#include <vector>

#include "host_interfaces/framework/Types.h"
#include "reference_host/quicktime/AvOwners.h"

namespace host {

// Colours of 256 numbers, as the library hands them beside a packet.
using Palette = std::array<std::uint8_t, AVPALETTE_SIZE>;

// One stored picture of a stream, or another packet of it. Some containers keep
// the two fields of a picture in a packet each; both are one entry.
struct PacketEntry {
    ncfSInt64 decodeTime = AV_NOPTS_VALUE;
    ncfSInt64 displayTime = AV_NOPTS_VALUE;
    ncfSInt64 position = -1;
    ncfSInt64 duration = 0;
    ncfUInt32 size = 0;
    bool isSync = false;
    bool isDisposable = false;
    bool isShown = true;  // not only there for others to decode
    struct SecondField {
        ncfSInt64 decodeTime = AV_NOPTS_VALUE;
        ncfSInt64 displayTime = AV_NOPTS_VALUE;
        ncfSInt64 position = -1;
        ncfUInt32 size = 0;
        bool isApart = false;  // in a packet of its own
    } second;
    // The one that holds for this packet; null where the container tells none.
    // Demuxers give it once: with the first packet that is read, or where it changes.
    std::shared_ptr<const Palette> palette;
};

// Times beyond this come from damaged files alone. Sums of a few stay in range.
constexpr ncfSInt64 kFarthestTime = ncfSInt64{1} << 60;
// A time that can be reckoned with, else unknown; a duration likewise, else 0.
ncfSInt64 UsableTime(ncfSInt64 time);
ncfSInt64 UsableDuration(ncfSInt64 duration);

// The packets of a stream in decode order. Where the container has an index and
// the stream keeps its pictures in order, the index says all; else the packets
// are read through once. `indexIsWhole`: the container's index names all of
// them. Leaves the input at an unknown place.
std::vector<PacketEntry> ListPackets(AVFormatContext& input, int stream, bool indexIsWhole);

// What the index alone tells, of which times of display are no part: those of decoding stand for
// them.
std::vector<PacketEntry> ListByIndex(AVStream& stream);

// Whether the first packets of a stream, at most `count`, stand in the file at
// their positions as they are.
bool AreStoredPlain(const std::filesystem::path& path, int stream, int count);

// The number of pictures, at most `enough`.
ncfUInt64 CountShownPackets(AVFormatContext& input, int stream, bool indexIsWhole,
                            ncfUInt64 enough);

}  // namespace host
