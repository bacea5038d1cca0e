// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "reference_host/quicktime/PictureOrder.h"

#include <algorithm>

namespace host {
namespace {

constexpr std::size_t kNone = static_cast<std::size_t>(-1);

bool HaveDisplayTimes(const std::vector<PacketEntry>& packets) {
    return std::all_of(packets.begin(), packets.end(), [](const PacketEntry& packet) {
        return packet.displayTime != AV_NOPTS_VALUE;
    });
}

// Some containers give times to some packets alone. Among pictures that are
// reordered in the plain way, one that others lean on is shown when the next
// such one is decoded, and any other at once.
void FillDisplayTimes(std::vector<PacketEntry>& packets) {
    ncfSInt64 nextReference = AV_NOPTS_VALUE;
    for (std::size_t i = packets.size(); i-- > 0;) {
        PacketEntry& packet = packets[i];
        const bool isMissing = packet.displayTime == AV_NOPTS_VALUE;
        if (isMissing && packet.decodeTime != AV_NOPTS_VALUE) {
            packet.displayTime = nextReference != AV_NOPTS_VALUE
                                     ? nextReference
                                     : packet.decodeTime + packet.duration;
        }
        if (isMissing || packet.displayTime != packet.decodeTime) {
            nextReference = packet.decodeTime;
        }
    }
}

}  // namespace

PictureOrder::PictureOrder(std::vector<PacketEntry> packets) : packets_(std::move(packets)) {
    if (!HaveDisplayTimes(packets_)) {
        FillDisplayTimes(packets_);
    }
    pictureOf_.assign(packets_.size(), kNone);
    for (std::size_t i = 0; i < packets_.size(); ++i) {
        isIntraOnly_ = isIntraOnly_ && packets_[i].isSync;
        hasOwnDisplayTimes_ =
            hasOwnDisplayTimes_ || packets_[i].displayTime != packets_[i].decodeTime;
        if (packets_[i].isShown) {
            pictures_.push_back({i, 0});
        }
    }
    hasDisplayTimes_ = HaveDisplayTimes(packets_);
    if (hasDisplayTimes_) {
        std::stable_sort(pictures_.begin(), pictures_.end(),
                         [this](const Picture& a, const Picture& b) {
                             return packets_[a.packet].displayTime < packets_[b.packet].displayTime;
                         });
    }
    for (std::size_t i = 0; i < pictures_.size(); ++i) {
        pictureOf_[pictures_[i].packet] = i;
    }
    FindStarts();
}

void PictureOrder::TakeBackSyncs(std::size_t first, std::size_t end) {
    for (std::size_t i = first; i < end; ++i) {
        packets_[i].isSync = false;
    }
    isIntraOnly_ = isIntraOnly_ && first >= end;
    // Of pictures that are shown as they are decoded no others began there.
    for (std::size_t i = first; i < end; ++i) {
        if (const auto picture = PictureOfPacket(i)) {
            pictures_[*picture].start = first - 1;
        }
    }
}

void PictureOrder::FindStarts() {
    if (!hasDisplayTimes_) {
        return;  // pictures are counted, from the first
    }
    const auto shown = [this](std::size_t packet) { return packets_[packet].displayTime; };
    // Those that are shown before all sync packets behind them: their times rise.
    std::vector<std::size_t> syncs;
    std::size_t first = kNone;
    for (std::size_t i = 0; i < packets_.size(); ++i) {
        if (packets_[i].isSync) {
            first = std::min(first, i);
            while (!syncs.empty() && shown(syncs.back()) > shown(i)) {
                syncs.pop_back();
            }
            syncs.push_back(i);
        }
        const auto picture = PictureOfPacket(i);
        if (picture && first != kNone) {
            const auto behind = std::upper_bound(
                syncs.begin(), syncs.end(), shown(i),
                [&](ncfSInt64 time, std::size_t sync) { return time < shown(sync); });
            pictures_[*picture].start = behind == syncs.begin() ? first : *std::prev(behind);
        }
    }
}

std::optional<std::size_t> PictureOrder::PictureOfPacket(std::size_t packet) const {
    if (packet >= pictureOf_.size() || pictureOf_[packet] == kNone) {
        return std::nullopt;
    }
    return pictureOf_[packet];
}

std::optional<PictureOrder::Found> PictureOrder::Find(ncfSInt64 decodeTime, ncfSInt64 displayTime,
                                                      ncfSInt64 position, std::size_t guess) const {
    const auto agree = [](ncfSInt64 a, ncfSInt64 b, ncfSInt64 unknown) {
        return a == unknown || b == unknown || a == b;
    };
    const auto isOf = [&](const auto& packet) {
        if (!agree(position, packet.position, -1)) {
            return false;
        }
        // Times of decoding are guessed by some demuxers, and guessed anew
        // after a seek.
        if (hasOwnDisplayTimes_ && displayTime != AV_NOPTS_VALUE) {
            return packet.displayTime == displayTime;
        }
        return agree(decodeTime, packet.decodeTime, AV_NOPTS_VALUE);
    };
    const auto at = [&](std::size_t i) -> std::optional<Found> {
        if (isOf(packets_[i])) {
            return Found{i, false};
        }
        return packets_[i].second.isApart && isOf(packets_[i].second)
                   ? std::optional<Found>(Found{i, true})
                   : std::nullopt;
    };
    for (std::size_t away = 0; away < packets_.size(); ++away) {
        if (guess + away < packets_.size()) {
            if (const auto found = at(guess + away)) {
                return found;
            }
        }
        if (away > 0 && away <= guess && guess - away < packets_.size()) {
            if (const auto found = at(guess - away)) {
                return found;
            }
        }
    }
    return std::nullopt;
}

}  // namespace host
