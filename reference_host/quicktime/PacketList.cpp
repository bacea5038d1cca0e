// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "reference_host/quicktime/PacketList.h"

#include <algorithm>
#include <cstring>
#include <fstream>
#include <optional>
#include <utility>

#include "reference_host/quicktime/CodedAlone.h"
#include "reference_host/quicktime/FieldParser.h"
#include "reference_host/quicktime/OpenInput.h"
#include "reference_host/quicktime/SyncTeller.h"

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

std::shared_ptr<const Palette> PaletteOf(const AVPacket& packet) {
    std::size_t size = 0;
    const std::uint8_t* const colours =
        av_packet_get_side_data(&packet, AV_PKT_DATA_PALETTE, &size);
    if (!colours || size != std::tuple_size_v<Palette>) {
        return nullptr;
    }
    const auto palette = std::make_shared<Palette>();
    std::copy_n(colours, size, palette->begin());
    return palette;
}

PacketEntry EntryOf(const AVPacket& packet) {
    PacketEntry entry;
    entry.decodeTime = UsableTime(packet.dts);
    entry.displayTime = UsableTime(packet.pts);
    entry.position = packet.pos;
    entry.duration = UsableDuration(packet.duration);
    entry.size = static_cast<ncfUInt32>(packet.size);
    entry.isSync = (packet.flags & AV_PKT_FLAG_KEY) != 0;
    entry.isDisposable = (packet.flags & AV_PKT_FLAG_DISPOSABLE) != 0;
    entry.isShown = (packet.flags & AV_PKT_FLAG_DISCARD) == 0;
    entry.palette = PaletteOf(packet);
    return entry;
}

void AddSecondField(PacketEntry& picture, const PacketEntry& field) {
    picture.second = {field.decodeTime, field.displayTime, field.position, field.size, true};
    picture.size += field.size;
    picture.duration += field.duration;
    picture.isDisposable = picture.isDisposable && field.isDisposable;
}

// Gives each picture of the stream until `each` has had enough. `syncs`: where the container is not
// believed; null: it is.
template <class Each>
void ReadThrough(AVFormatContext& input, int stream, SyncTeller* syncs, Each each) {
    UseOneStream(input, stream);
    FieldParser parser(*input.streams[stream]);
    const PacketOwner packet(av_packet_alloc());
    std::optional<PacketEntry> waiting;  // a first field, until the next packet is seen
    FieldKind waitingKind = FieldKind::Whole;
    while (packet && av_read_frame(&input, packet.get()) >= 0) {
        if (packet->stream_index != stream) {
            av_packet_unref(packet.get());
            continue;
        }
        const FieldKind kind = parser.KindOf(*packet);
        PacketEntry entry = EntryOf(*packet);
        entry.isSync = syncs ? syncs->StandsAlone(*packet) : entry.isSync;
        av_packet_unref(packet.get());
        if (waiting) {
            const bool isPair = kind != FieldKind::Whole && kind != waitingKind;
            if (isPair) {
                AddSecondField(*waiting, entry);
            }
            const PacketEntry whole = *std::exchange(waiting, std::nullopt);
            if (!each(whole)) {
                return;
            }
            if (isPair) {
                continue;
            }
        }
        if (kind != FieldKind::Whole) {
            waiting = entry;
            waitingKind = kind;
        } else if (!each(entry)) {
            return;
        }
    }
    if (waiting) {
        each(*waiting);
    }
}

// Movies without a list of sync samples claim that every one is, reordered or
// not: the first packets tell.
constexpr std::size_t kPacketsThatTell = 32;

bool AreAllSync(const std::vector<PacketEntry>& packets) {
    return std::all_of(packets.begin(), packets.end(),
                       [](const PacketEntry& packet) { return packet.isSync; });
}

// Nothing tells which of them stand alone.
void BelieveFirstSync(std::vector<PacketEntry>& packets) {
    for (std::size_t i = 1; i < packets.size(); ++i) {
        packets[i].isSync = false;
    }
}

// Pictures of more bits are no numbers of a palette.
bool MayHavePalette(const AVStream& stream) {
    const AVCodecParameters& form = *stream.codecpar;
    return form.codec_type == AVMEDIA_TYPE_VIDEO && form.bits_per_coded_sample > 0 &&
           form.bits_per_coded_sample <= 8;
}

// A palette holds until the next one.
void SpreadPalettes(std::vector<PacketEntry>& packets) {
    std::shared_ptr<const Palette> last;
    for (PacketEntry& packet : packets) {
        if (!packet.palette) {
            packet.palette = last;
        }
        last = packet.palette;
    }
}

// Whether both are shown equally long after they are decoded.
bool IsShownAsLate(const PacketEntry& a, const PacketEntry& b) {
    const auto isKnown = [](const PacketEntry& packet) {
        return packet.decodeTime != AV_NOPTS_VALUE && packet.displayTime != AV_NOPTS_VALUE;
    };
    return !isKnown(a) || !isKnown(b) ||
           a.displayTime - a.decodeTime == b.displayTime - b.decodeTime;
}

}  // namespace

ncfSInt64 UsableTime(ncfSInt64 time) {
    return time > -kFarthestTime && time < kFarthestTime ? time : AV_NOPTS_VALUE;
}

ncfSInt64 UsableDuration(ncfSInt64 duration) {
    return duration > 0 && duration < kFarthestTime ? duration : 0;
}

std::vector<PacketEntry> ListByIndex(AVStream& stream) {
    const int count = avformat_index_get_entries_count(&stream);
    std::vector<PacketEntry> packets;
    packets.reserve(static_cast<std::size_t>(std::max(count, 0)));
    for (int i = 0; i < count; ++i) {
        const AVIndexEntry* const entry = avformat_index_get_entry(&stream, i);
        PacketEntry packet;
        packet.decodeTime = packet.displayTime = UsableTime(entry->timestamp);
        packet.position = entry->pos;
        packet.size = static_cast<ncfUInt32>(entry->size);
        packet.isSync = (entry->flags & AVINDEX_KEYFRAME) != 0;
        packet.isShown = (entry->flags & AVINDEX_DISCARD_FRAME) == 0;
        packets.push_back(packet);
    }
    for (std::size_t i = 0; i + 1 < packets.size(); ++i) {
        const ncfSInt64 time = packets[i].decodeTime;
        const ncfSInt64 next = packets[i + 1].decodeTime;
        const bool areKnown = time != AV_NOPTS_VALUE && next != AV_NOPTS_VALUE;
        packets[i].duration = areKnown ? next - time : 0;
    }
    if (packets.size() > 1) {
        packets.back().duration = packets[packets.size() - 2].duration;
    } else if (packets.size() == 1) {
        packets.back().duration = UsableDuration(stream.duration);
    }
    return packets;
}

std::vector<PacketEntry> ListPackets(AVFormatContext& input, int stream, bool indexIsWhole) {
    AVStream& of = *input.streams[stream];
    std::vector<PacketEntry> indexed;
    bool isInOrder = false;
    std::size_t enough = kPacketsThatTell;
    if (indexIsWhole) {
        indexed = ListByIndex(of);
        isInOrder = !MayReorder(of);
        if (isInOrder && !MayHavePalette(of)) {
            return indexed;
        }
        enough = isInOrder ? 1 : enough;
        // The first packets tell, and of the rest what the library has seen in the index.
        isInOrder =
            isInOrder || (!indexed.empty() && AreAllSync(indexed) && of.codecpar->video_delay == 0);
    }
    const bool isDoubted = indexIsWhole && AreAllSync(indexed) && !IsCodedAlone(*of.codecpar);
    const auto syncs = isDoubted ? SyncTeller::Of(of) : nullptr;
    std::vector<PacketEntry> packets;
    ReadThrough(input, stream, syncs.get(), [&](const PacketEntry& entry) {
        packets.push_back(entry);
        isInOrder = isInOrder && IsShownAsLate(packets.front(), entry);
        return !isInOrder || packets.size() < enough;
    });
    if (isInOrder && !indexed.empty() && !packets.empty()) {
        indexed.front().palette = packets.front().palette;
    }
    std::vector<PacketEntry>& whole = isInOrder ? indexed : packets;
    SpreadPalettes(whole);
    if (isDoubted && !syncs) {
        BelieveFirstSync(whole);
    }
    return std::move(whole);
}

bool AreStoredPlain(const std::filesystem::path& path, int stream, int count) {
    const InputOwner input = OpenForStream(path, InputView::WholeMedia, stream);
    std::ifstream file(path, std::ios::binary);
    const PacketOwner packet(av_packet_alloc());
    if (!input || !file || !packet) {
        return false;
    }
    UseOneStream(*input, stream);
    std::vector<char> bytes;
    while (count > 0 && av_read_frame(input.get(), packet.get()) >= 0) {
        bool isSame = true;
        if (packet->stream_index == stream && packet->size > 0) {
            bytes.resize(static_cast<std::size_t>(packet->size));
            file.seekg(packet->pos < 0 ? 0 : packet->pos);
            file.read(bytes.data(), packet->size);
            isSame = file && packet->pos >= 0 &&
                     std::memcmp(bytes.data(), packet->data, bytes.size()) == 0;
            --count;
        }
        av_packet_unref(packet.get());
        if (!isSame) {
            return false;
        }
    }
    return true;
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
    ReadThrough(input, stream, nullptr, [&](const PacketEntry& entry) {
        count += entry.isShown;
        return count < enough;
    });
    return count;
}

}  // namespace host
