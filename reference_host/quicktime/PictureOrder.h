// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <optional>
#include <vector>

#include "reference_host/quicktime/PacketList.h"

namespace host {

// The presented pictures of a stream in display order, and from which packet
// decoding has to start for each.
class PictureOrder {
public:
    explicit PictureOrder(std::vector<PacketEntry> packets);

    std::size_t PictureCount() const { return pictures_.size(); }
    std::size_t PacketCount() const { return packets_.size(); }
    const PacketEntry& Packet(std::size_t packet) const { return packets_[packet]; }

    std::size_t PacketOfPicture(std::size_t picture) const { return pictures_[picture].packet; }
    // Nothing for a packet whose picture is not presented.
    std::optional<std::size_t> PictureOfPacket(std::size_t packet) const;
    // The sync packet to start from: the last that is shown no later than the
    // picture, since what comes before it in display needs the one before.
    std::size_t StartFor(std::size_t picture) const { return pictures_[picture].start; }
    // Whether `picture` comes out right when decoding starts at `start`.
    bool IsWholeFrom(std::size_t picture, std::size_t start) const {
        return picture < pictures_.size() && pictures_[picture].start >= start;
    }
    // Packets that were told as sync and are none, from `first` to before `end`; the one before
    // them is one. For streams whose packets all were told as sync and are shown as they are
    // decoded.
    void TakeBackSyncs(std::size_t first, std::size_t end);
    bool IsIntraOnly() const { return isIntraOnly_; }
    // Some containers do not tell when a packet is shown.
    bool HasDisplayTimes() const { return hasDisplayTimes_; }

    // The packet that a demuxer just gave, sought near `guess`.
    struct Found {
        std::size_t packet;
        bool isSecondField;
    };
    std::optional<Found> Find(ncfSInt64 decodeTime, ncfSInt64 displayTime, ncfSInt64 position,
                              std::size_t guess) const;

private:
    struct Picture {
        std::size_t packet;
        std::size_t start;
    };
    void FindStarts();

    std::vector<PacketEntry> packets_;
    std::vector<Picture> pictures_;
    std::vector<std::size_t> pictureOf_;  // for each packet
    bool isIntraOnly_ = true;
    bool hasDisplayTimes_ = true;
    bool hasOwnDisplayTimes_ = false;  // apart from those of decoding
};

}  // namespace host
