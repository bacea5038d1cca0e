// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "reference_host/quicktime/SyncClaims.h"

#include "reference_host/quicktime/CodedAlone.h"
#include "reference_host/quicktime/OpenInput.h"
#include "reference_host/quicktime/PacketSeek.h"
#include "reference_host/quicktime/PictureDecoder.h"

namespace host {

std::unique_ptr<SyncClaims> SyncClaims::Doubted(const std::filesystem::path& path,
                                                const AVStream& stream, const PictureOrder& order) {
    if (!order.IsIntraOnly() || order.PacketCount() < 2 || IsCodedAlone(*stream.codecpar)) {
        return nullptr;
    }
    std::unique_ptr<SyncTeller> teller = SyncTeller::Of(stream);
    return teller ? std::unique_ptr<SyncClaims>(
                        new SyncClaims(path, stream.index, std::move(teller), order.PacketCount()))
                  : nullptr;
}

SyncClaims::SyncClaims(std::filesystem::path path, int stream, std::unique_ptr<SyncTeller> teller,
                       std::size_t packets)
    : path_(std::move(path)),
      stream_(stream),
      teller_(std::move(teller)),
      packet_(av_packet_alloc()),
      isTrue_(packets) {
    isTrue_[0] = true;  // nothing is before it
}

void SyncClaims::Check(PictureOrder& order, std::size_t picture) {
    const std::size_t claimed = order.StartFor(picture);
    std::size_t packet = claimed;
    while (!isTrue_[packet]) {
        if (!order.Packet(packet).isSync) {
            // As was found out before.
            const auto known = order.PictureOfPacket(packet);
            packet = known ? order.StartFor(*known) : packet - 1;
        } else if (StandsAlone(order.Packet(packet))) {
            isTrue_[packet] = true;
        } else {
            --packet;
        }
    }
    if (packet != claimed) {
        order.TakeBackSyncs(packet + 1, claimed + 1);
    }
}

bool SyncClaims::StandsAlone(const PacketEntry& entry) {
    if (!input_) {
        input_ = OpenForPictures(path_, stream_);
        if (input_) {
            UseOneStream(*input_, stream_);
        }
    }
    const bool isThere = input_ && packet_ && ReadPacketOf(*input_, stream_, entry, 0, *packet_);
    const bool standsAlone = isThere && teller_->StandsAlone(*packet_);
    packetsRead_ += isThere;
    if (packet_) {
        av_packet_unref(packet_.get());
    }
    return standsAlone;
}

}  // namespace host
