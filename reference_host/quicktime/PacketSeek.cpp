// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "reference_host/quicktime/PacketSeek.h"

namespace host {
namespace {

// Packets read after a seek until the one sought is there.
constexpr int kMostPackets = 64;

bool Reach(AVFormatContext& input, int stream, ncfSInt64 position, AVPacket& packet) {
    for (int i = 0; i < kMostPackets && av_read_frame(&input, &packet) >= 0; ++i) {
        if (packet.stream_index == stream && packet.pos == position) {
            return true;
        }
        av_packet_unref(&packet);
    }
    return false;
}

}  // namespace

bool ReadPacketOf(AVFormatContext& input, int stream, const PacketEntry& entry, ncfSInt64 lead,
                  AVPacket& packet) {
    for (const ncfSInt64 time : {entry.displayTime + lead, entry.decodeTime}) {
        if (time != AV_NOPTS_VALUE &&
            av_seek_frame(&input, stream, time, AVSEEK_FLAG_BACKWARD) >= 0 &&
            Reach(input, stream, entry.position, packet)) {
            return true;
        }
    }
    return false;
}

}  // namespace host
