// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "reference_host/quicktime/PacketList.h"

namespace host {

// Reads the packet of one entry, which has a position, into `packet`. `lead`: by how much times of
// display, where the entry tells none of its own, are behind those of decoding. False where it
// isn't found.
bool ReadPacketOf(AVFormatContext& input, int stream, const PacketEntry& entry, ncfSInt64 lead,
                  AVPacket& packet);

}  // namespace host
