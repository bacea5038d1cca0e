// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "reference_host/quicktime/SoundPlaces.h"

#include <algorithm>
#include <cmath>

#include "reference_host/quicktime/PacketList.h"

namespace host {

ncfSInt64 GapOfStep(ncfSInt64 step, ncfSInt64 frames, AVRational timeBase, int rate) {
    const AVRational frame{1, rate};
    if (av_cmp_q(timeBase, frame) == 0) {
        return step - frames;
    }
    // Either end of the step may be rounded by half a unit, or by a whole one
    // where writers cut; what is left of a frame is none.
    const ncfSInt64 taken =
        std::clamp(av_rescale_q(step, timeBase, frame), -kFarthestTime, kFarthestTime);
    const ncfSInt64 unit = av_rescale_rnd(rate, timeBase.num, timeBase.den, AV_ROUND_UP);
    const ncfSInt64 gap = taken - frames;
    return std::abs(gap) <= 1 + 2 * unit ? 0 : gap;
}

SoundPlaces::SoundPlaces(const AVStream& stream, ncfSInt64 framesPerPacket, int rate,
                         ncfSInt64 zeroTime) {
    auto& of = const_cast<AVStream&>(stream);  // the index is asked through it, not changed
    const int count = avformat_index_get_entries_count(&of);
    packets_.reserve(static_cast<std::size_t>(std::max(count, 0)));
    for (int i = 0; i < count; ++i) {
        const ncfSInt64 time = UsableTime(avformat_index_get_entry(&of, i)->timestamp);
        if (time == AV_NOPTS_VALUE || (!packets_.empty() && time <= packets_.back().time)) {
            packets_.clear();
            return;
        }
        ncfSInt64 place = 0;
        if (packets_.empty()) {
            place = av_rescale_q(time - zeroTime, stream.time_base, AVRational{1, rate});
        } else {
            const Packet& before = packets_.back();
            place = before.place + framesPerPacket +
                    GapOfStep(time - before.time, framesPerPacket, stream.time_base, rate);
        }
        packets_.push_back({time, place});
    }
}

std::optional<SoundPlaces::Packet> SoundPlaces::LastAt(ncfSInt64 decodeTime) const {
    const auto behind = std::upper_bound(
        packets_.begin(), packets_.end(), decodeTime,
        [](ncfSInt64 wanted, const Packet& packet) { return wanted < packet.time; });
    return behind == packets_.begin() ? std::nullopt : std::optional<Packet>(*std::prev(behind));
}

ncfSInt64 SoundPlaces::TimeOf(ncfSInt64 place) const {
    const auto behind = std::upper_bound(
        packets_.begin(), packets_.end(), place,
        [](ncfSInt64 wanted, const Packet& packet) { return wanted < packet.place; });
    return behind == packets_.begin() ? packets_.front().time : std::prev(behind)->time;
}

}  // namespace host
