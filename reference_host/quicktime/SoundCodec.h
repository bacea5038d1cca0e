// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <memory>

#include "host_interfaces/framework/Types.h"
#include "reference_host/quicktime/AvOwners.h"

namespace host {

// A decoder of one sound stream. When packets hold several blocks, of which the
// decoder would see only the first, a parser splits them. It takes packets in order:
// a jump needs a new object, because some decoders keep state that a flush does not
// clear.
class SoundCodec {
public:
    // Null where there is no decoder. `keepsPriming`: what the container says is
    // to be left out of the first and last packets comes out too.
    static std::unique_ptr<SoundCodec> Open(const AVStream& stream, bool keepsPriming);

    // Takes a packet, or the end for null; what can't be decoded leaves a gap.
    void Send(const AVPacket* packet);
    // As avcodec_receive_frame; the rate is that of the sound, whatever the
    // container says.
    int Receive(AVFrame& frame);

private:
    explicit SoundCodec(CodecOwner codec) : codec_(std::move(codec)) {}
    PacketOwner NextPart();

    CodecOwner codec_;
    bool dividesPackets_ = false;
    // The packet that is being divided, how far, and by what; null for none.
    PacketOwner whole_;
    int divided_ = 0;
    bool isFirstPart_ = false;
    ParserOwner parser_;
    bool isEnding_ = false;
};

}  // namespace host
