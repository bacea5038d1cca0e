// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "reference_host/quicktime/SyncClaims.h"

#include "reference_host/quicktime/CodedAlone.h"
#include "reference_host/quicktime/OpenInput.h"
#include "reference_host/quicktime/PacketSeek.h"
#include "reference_host/quicktime/PictureDecoder.h"

namespace host {

std::unique_ptr<SyncClaims> SyncClaims::Doubted(const std::filesystem::path& path, int stream,
                                                const AVCodecParameters& form,
                                                const PictureOrder& order) {
    if (!order.IsIntraOnly() || order.PacketCount() < 2 || IsCodedAlone(form)) {
        return nullptr;
    }
    InputOwner input = OpenForPictures(path, stream);
    std::unique_ptr<SyncTeller> teller = input ? SyncTeller::Of(*input->streams[stream]) : nullptr;
    if (!teller) {
        return nullptr;
    }
    UseOneStream(*input, stream);
    return std::unique_ptr<SyncClaims>(
        new SyncClaims(std::move(input), stream, std::move(teller), order.PacketCount()));
}

SyncClaims::SyncClaims(InputOwner input, int stream, std::unique_ptr<SyncTeller> teller,
                       std::size_t packets)
    : input_(std::move(input)),
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
        isTrue_[packet] = StandsAlone(order.Packet(packet));
        packet -= isTrue_[packet] ? 0 : 1;
    }
    if (packet != claimed) {
        order.TakeBackSyncs(packet + 1, claimed + 1);
    }
}

bool SyncClaims::StandsAlone(const PacketEntry& entry) {
    const bool isThere = packet_ && ReadPacketOf(*input_, stream_, entry, 0, *packet_);
    const bool standsAlone = isThere && teller_->StandsAlone(*packet_);
    if (packet_) {
        av_packet_unref(packet_.get());
    }
    return standsAlone;
}

}  // namespace host
