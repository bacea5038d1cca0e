// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "reference_host/quicktime/DecodedSound.h"

#include "reference_host/quicktime/OpenInput.h"
#include "reference_host/quicktime/SoundCodec.h"

namespace host {
namespace {

// Some decoders begin with a packet or two that give nothing.
constexpr int kMostPackets = 64;
constexpr int kBlocksThatTell = 4;

}  // namespace

DecodedSound DecodeFirstSound(const std::filesystem::path& path, int stream) {
    std::string ignored;
    const InputOwner input = OpenInput(path, InputView::WholeMedia, ignored);
    if (!input || stream < 0 || stream >= static_cast<int>(input->nb_streams)) {
        return {};
    }
    const auto codec = SoundCodec::Open(*input->streams[stream], true);
    const PacketOwner packet(av_packet_alloc());
    const FrameOwner frame(av_frame_alloc());
    if (!codec || !packet || !frame) {
        return {};
    }
    UseOneStream(*input, stream);
    DecodedSound told;
    int blocks = 0;
    for (int packets = 0; packets < kMostPackets && blocks < kBlocksThatTell;) {
        const bool isEnd = av_read_frame(input.get(), packet.get()) < 0;
        if (!isEnd && packet->stream_index != stream) {
            av_packet_unref(packet.get());
            continue;
        }
        codec->Send(isEnd ? nullptr : packet.get());
        av_packet_unref(packet.get());
        ++packets;
        while (codec->Receive(*frame) >= 0) {
            if (blocks++ == 0) {
                told = {frame->ch_layout.nb_channels, frame->sample_rate, frame->nb_samples};
            } else if (frame->nb_samples != told.framesPerPacket && !isEnd) {
                told.framesPerPacket = 0;
            }
        }
        if (isEnd) {
            break;
        }
    }
    return told;
}

}  // namespace host
