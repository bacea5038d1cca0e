// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "reference_host/quicktime/PacketList.h"

#include <algorithm>

#include "reference_host/quicktime/OpenInput.h"

namespace host {
namespace {

bool MayReorder(const AVStream& stream) {
    if (stream.codecpar->codec_type != AVMEDIA_TYPE_VIDEO) {
        return false;
    }
    const AVCodecDescriptor* const codec = avcodec_descriptor_get(stream.codecpar->codec_id);
    return !codec || (codec->props & (AV_CODEC_PROP_REORDER | AV_CODEC_PROP_INTRA_ONLY)) !=
                         AV_CODEC_PROP_INTRA_ONLY;
}

std::vector<PacketEntry> FromIndex(AVStream& stream) {
    const int count = avformat_index_get_entries_count(&stream);
    std::vector<PacketEntry> packets;
    packets.reserve(static_cast<std::size_t>(std::max(count, 0)));
    for (int i = 0; i < count; ++i) {
        const AVIndexEntry* const entry = avformat_index_get_entry(&stream, i);
        PacketEntry packet;
        packet.decodeTime = packet.displayTime = entry->timestamp;
        packet.position = entry->pos;
        packet.size = static_cast<ncfUInt32>(entry->size);
        packet.isSync = (entry->flags & AVINDEX_KEYFRAME) != 0;
        packet.isShown = (entry->flags & AVINDEX_DISCARD_FRAME) == 0;
        packets.push_back(packet);
    }
    for (std::size_t i = 0; i + 1 < packets.size(); ++i) {
        packets[i].duration = packets[i + 1].decodeTime - packets[i].decodeTime;
    }
    if (packets.size() > 1) {
        packets.back().duration = packets[packets.size() - 2].duration;
    } else if (packets.size() == 1) {
        packets.back().duration = std::max<ncfSInt64>(stream.duration, 0);
    }
    return packets;
}

PacketEntry EntryOf(const AVPacket& packet) {
    PacketEntry entry;
    entry.decodeTime = packet.dts;
    entry.displayTime = packet.pts;
    entry.position = packet.pos;
    entry.duration = packet.duration;
    entry.size = static_cast<ncfUInt32>(packet.size);
    entry.isSync = (packet.flags & AV_PKT_FLAG_KEY) != 0;
    entry.isDisposable = (packet.flags & AV_PKT_FLAG_DISPOSABLE) != 0;
    entry.isShown = (packet.flags & AV_PKT_FLAG_DISCARD) == 0;
    return entry;
}

template <class Each>
void ReadThrough(AVFormatContext& input, int stream, Each each) {
    UseOneStream(input, stream);
    const PacketOwner packet(av_packet_alloc());
    while (packet && av_read_frame(&input, packet.get()) >= 0) {
        const bool more = packet->stream_index != stream || each(EntryOf(*packet));
        av_packet_unref(packet.get());
        if (!more) {
            return;
        }
    }
}

bool IndexSaysAll(const std::vector<PacketEntry>& packets, const AVStream& stream) {
    return !MayReorder(stream) || std::all_of(packets.begin(), packets.end(),
                                              [](const PacketEntry& p) { return p.isSync; });
}

}  // namespace

std::vector<PacketEntry> ListPackets(AVFormatContext& input, int stream, bool indexIsWhole) {
    std::vector<PacketEntry> packets;
    if (indexIsWhole) {
        packets = FromIndex(*input.streams[stream]);
        if (IndexSaysAll(packets, *input.streams[stream])) {
            return packets;
        }
        packets.clear();
    }
    ReadThrough(input, stream, [&](const PacketEntry& entry) {
        packets.push_back(entry);
        return true;
    });
    return packets;
}

ncfUInt64 CountShownPackets(AVFormatContext& input, int stream, bool indexIsWhole,
                            ncfUInt64 enough) {
    ncfUInt64 count = 0;
    if (indexIsWhole) {
        AVStream& of = *input.streams[stream];
        const int entries = avformat_index_get_entries_count(&of);
        for (int i = 0; i < entries && count < enough; ++i) {
            count += (avformat_index_get_entry(&of, i)->flags & AVINDEX_DISCARD_FRAME) == 0;
        }
        return count;
    }
    ReadThrough(input, stream, [&](const PacketEntry& entry) {
        count += entry.isShown;
        return count < enough;
    });
    return count;
}

}  // namespace host
