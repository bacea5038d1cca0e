// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "reference_host/quicktime/MovieSampleTable.h"

#include <algorithm>

#include "reference_host/framework/Guard.h"
#include "reference_host/quicktime/OpenInput.h"
#include "reference_host/quicktime/SoundForm.h"

namespace host {
namespace {

// Packets without a decode time count on from the one before. The last lasts to
// the end of the media, or as long as the one before it.
void FillDecodeTimes(std::vector<PacketEntry>& packets, ncfSInt64 mediaDuration) {
    ncfSInt64 next = 0;
    for (PacketEntry& packet : packets) {
        if (packet.decodeTime == AV_NOPTS_VALUE) {
            packet.decodeTime = next;
        }
        if (packet.displayTime == AV_NOPTS_VALUE) {
            packet.displayTime = packet.decodeTime;
        }
        next = std::min(packet.decodeTime + packet.duration, kFarthestTime);
    }
    for (std::size_t i = 0; i + 1 < packets.size(); ++i) {
        packets[i].duration =
            std::max<ncfSInt64>(packets[i + 1].decodeTime - packets[i].decodeTime, 0);
    }
    if (packets.empty() || packets.back().duration > 0) {
        return;
    }
    PacketEntry& last = packets.back();
    last.duration = packets.front().decodeTime + mediaDuration - last.decodeTime;
    if (mediaDuration <= 0 || last.duration <= 0) {
        last.duration = packets.size() > 1 ? packets[packets.size() - 2].duration : 0;
    }
}

// Some of them tell whether the container keeps its samples whole.
constexpr int kPacketsToCompare = 8;

// Whether the second of two fields that came apart stands right behind the first.
bool FieldsAreTogether(const std::vector<PacketEntry>& packets) {
    return std::all_of(packets.begin(), packets.end(), [](const PacketEntry& packet) {
        return !packet.second.isApart ||
               packet.second.position + static_cast<ncfSInt64>(packet.second.size) ==
                   packet.position + static_cast<ncfSInt64>(packet.size);
    });
}

std::vector<std::size_t> RunEnds(const std::vector<PacketEntry>& packets) {
    std::vector<std::size_t> ends(packets.size(), packets.size());
    for (std::size_t i = packets.size(); i-- > 1;) {
        const PacketEntry& before = packets[i - 1];
        const bool follows =
            packets[i].position == before.position + static_cast<ncfSInt64>(before.size);
        ends[i - 1] = follows ? ends[i] : i;
    }
    return ends;
}

}  // namespace

MovieSampleTable::Track MovieSampleTable::Load(int stream) const {
    Track track;
    const InputOwner input = OpenForStream(source_.path, InputView::WholeMedia, stream);
    if (!input) {
        return track;
    }
    if (IsMovieFamily(*input)) {  // its own times, untouched
        input->flags |= AVFMT_FLAG_NOFILLIN | AVFMT_FLAG_NOPARSE;
    }
    track.packets = ListPackets(*input, stream, source_.indexIsWhole);
    track.isPlain =
        source_.indexIsWhole || (FieldsAreTogether(track.packets) &&
                                 AreStoredPlain(source_.path, stream, kPacketsToCompare));
    FillDecodeTimes(track.packets, UsableDuration(input->streams[stream]->duration));
    track.samples = track.packets.size();
    track.runEnds = RunEnds(track.packets);
    if (const auto found = source_.descriptionChanges.find(stream);
        found != source_.descriptionChanges.end()) {
        track.descriptionChanges = found->second;
    }
    SoundForm form;
    if (ReadSoundForm(*input->streams[stream], form) && form.isStoredPlain) {
        track.frameBytes = form.bytesPerPacket;
        track.frameDuration =
            std::max<ncfSInt64>(av_rescale_q(1, AVRational{1, static_cast<int>(form.sampleRate)},
                                             input->streams[stream]->time_base),
                                1);
        track.samples = 0;
        for (const PacketEntry& packet : track.packets) {
            track.firstSamples.push_back(track.samples);
            track.samples += packet.size / track.frameBytes;
        }
        return track;
    }
    if (!track.packets.empty()) {
        ncfSInt64 least = track.packets.front().displayTime;
        for (const PacketEntry& packet : track.packets) {
            least = std::min(least, packet.displayTime);
        }
        track.shift = least - track.packets.front().decodeTime;
    }
    return track;
}

const MovieSampleTable::Track* MovieSampleTable::Find(ncfUInt32 track) {
    const auto stream = source_.streams.find(track);
    if (stream == source_.streams.end()) {
        return nullptr;
    }
    const auto found = tracks_.find(stream->second);
    return found != tracks_.end()
               ? &found->second
               : &tracks_.emplace(stream->second, Load(stream->second)).first->second;
}

MovieSampleTable::Place MovieSampleTable::PlaceOf(const Track& track, ncfUInt64 sample) {
    const ncfUInt64 index = sample - 1;
    if (track.frameBytes == 0) {
        return {static_cast<std::size_t>(index), 0};
    }
    const auto above =
        std::upper_bound(track.firstSamples.begin(), track.firstSamples.end(), index);
    const auto packet = static_cast<std::size_t>(above - track.firstSamples.begin()) - 1;
    return {packet, index - track.firstSamples[packet]};
}

ncfSInt64 MovieSampleTable::OffsetOf(const Track& track, const PacketEntry& packet) {
    return packet.displayTime - packet.decodeTime - track.shift;
}

template <class Out, class Value>
NCFRESULT MovieSampleTable::ForSample(ncfUInt32 track, ncfUInt64 sample, Out* out, Value value) {
    if (!out) {
        return NCF_E_POINTER;
    }
    const std::lock_guard<std::mutex> lock(mutex_);
    return Guarded([&] {
        const Track* const found = Find(track);
        Need(found, NCF_E_NOTFOUND);
        Need(sample != 0 && sample <= found->samples, NCF_E_INVALIDARG);
        const Place place = PlaceOf(*found, sample);
        *out = static_cast<Out>(value(*found, found->packets[place.packet], place));
        return NCF_OK;
    });
}

// For questions about the sample's place in the file.
template <class Out, class Value>
NCFRESULT MovieSampleTable::ForPlainSample(ncfUInt32 track, ncfUInt64 sample, Out* out,
                                           Value value) {
    bool isPlain = true;
    Out place = {};
    const NCFRESULT result =
        ForSample(track, sample, out ? &place : nullptr,
                  [&](const Track& of, const PacketEntry& packet, const Place& at) {
                      isPlain = of.isPlain && packet.position >= 0;
                      return value(of, packet, at);
                  });
    if (result < 0 || !isPlain) {
        return result < 0 ? result : NCF_E_NOTSUPPORTED;
    }
    *out = place;
    return NCF_OK;
}

NCFRESULT MovieSampleTable::GetNumSamples(ncfUInt32 track, ncfUInt64* n) {
    if (!n) {
        return NCF_E_POINTER;
    }
    const std::lock_guard<std::mutex> lock(mutex_);
    return Guarded([&] {
        const Track* const found = Find(track);
        Need(found, NCF_E_NOTFOUND);
        *n = found->samples;
        return NCF_OK;
    });
}

NCFRESULT MovieSampleTable::GetDataOffset(ncfUInt32 track, ncfUInt64 sample, ncfUInt64* position) {
    return ForPlainSample(track, sample, position,
                          [](const Track& of, const PacketEntry& packet, const Place& place) {
                              return static_cast<ncfUInt64>(packet.position) +
                                     place.within * of.frameBytes;
                          });
}

NCFRESULT MovieSampleTable::GetSampleFlags(ncfUInt32 track, ncfUInt64 sample,
                                           QTWrapper::QTWSamplePropertyFlags_t* flags) {
    return ForSample(track, sample, flags, [](const Track&, const PacketEntry& packet, Place) {
        return packet.isSync         ? QTWrapper::kQTWSampleSync
               : packet.isDisposable ? QTWrapper::kQTWSampleDisposable
                                     : QTWrapper::kQTWSampleDependent;
    });
}

NCFRESULT MovieSampleTable::GetNextDiscontiguousDataAttributeChange(ncfUInt32 track,
                                                                    ncfUInt64 sample,
                                                                    ncfUInt64* next) {
    return ForPlainSample(
        track, sample, next, [sample](const Track& of, const PacketEntry&, const Place& place) {
            const std::size_t packet = of.runEnds[place.packet];
            const ncfUInt64 end = packet == of.packets.size() ? of.samples
                                  : of.frameBytes == 0        ? ncfUInt64{packet}
                                                              : of.firstSamples[packet];
            const auto change = std::lower_bound(of.descriptionChanges.begin(),
                                                 of.descriptionChanges.end(), sample);
            return (change == of.descriptionChanges.end() ? end : std::min(end, *change)) + 1;
        });
}

NCFRESULT MovieSampleTable::GetDataSizePerSample(ncfUInt32 track, ncfUInt64 sample,
                                                 ncfUInt32* bytes) {
    return ForSample(track, sample, bytes, [](const Track& of, const PacketEntry& packet, Place) {
        return of.frameBytes == 0 ? packet.size : of.frameBytes;
    });
}

NCFRESULT MovieSampleTable::GetDisplayOffset(ncfUInt32 track, ncfUInt64 sample, ncfSInt64* offset) {
    return ForSample(track, sample, offset, [](const Track& of, const PacketEntry& packet, Place) {
        return of.frameBytes == 0 ? OffsetOf(of, packet) : 0;
    });
}

NCFRESULT MovieSampleTable::GetDecodeDuration(ncfUInt32 track, ncfUInt64 sample,
                                              ncfSInt64* duration) {
    return ForSample(track, sample, duration,
                     [](const Track& of, const PacketEntry& packet, Place) {
                         return of.frameBytes == 0 ? packet.duration : of.frameDuration;
                     });
}

ncfUInt32 MovieSampleTable::GetMaxDataSize(ncfUInt32 track) {
    const std::lock_guard<std::mutex> lock(mutex_);
    ncfUInt32 most = 0;
    Guarded([&] {
        if (const Track* const found = Find(track)) {
            for (const PacketEntry& packet : found->packets) {
                most = std::max(most, found->frameBytes == 0 ? packet.size : found->frameBytes);
            }
        }
        return NCF_OK;
    });
    return most;
}

ncfBool MovieSampleTable::HasOutOfOrderFrameDependencies(ncfUInt32 track) {
    const std::lock_guard<std::mutex> lock(mutex_);
    bool found = false;
    Guarded([&] {
        if (const Track* const of = Find(track); of && of->frameBytes == 0) {
            found =
                std::any_of(of->packets.begin(), of->packets.end(),
                            [&](const PacketEntry& packet) { return OffsetOf(*of, packet) != 0; });
        }
        return NCF_OK;
    });
    return found;
}

}  // namespace host
