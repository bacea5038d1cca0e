// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include <gtest/gtest.h>

#include <cstring>

#include "reference_host/quicktime/SoundCodec.h"

namespace {

// A stream of narrow telephone sound.
struct Telephone {
    Telephone() {
        parameters->codec_type = AVMEDIA_TYPE_AUDIO;
        parameters->codec_id = AV_CODEC_ID_AMR_NB;
        parameters->sample_rate = 8000;
        av_channel_layout_default(&parameters->ch_layout, 1);
        stream.codecpar = parameters;
        stream.time_base = {1, 8000};
    }
    ~Telephone() { avcodec_parameters_free(&parameters); }
    Telephone(const Telephone&) = delete;
    Telephone& operator=(const Telephone&) = delete;

    AVCodecParameters* parameters = avcodec_parameters_alloc();
    AVStream stream{};
};

// One packet of so many blocks, each of thirteen bytes.
host::PacketOwner Blocks(int count) {
    constexpr int kBlock = 13;
    host::PacketOwner packet(av_packet_alloc());
    EXPECT_EQ(av_new_packet(packet.get(), count * kBlock), 0);
    std::memset(packet->data, 0, static_cast<std::size_t>(packet->size));
    for (int i = 0; i < count; ++i) {
        packet->data[i * kBlock] = 0x04;  // the lowest rate, a good block
    }
    packet->pts = packet->dts = 77;
    return packet;
}

int Drain(host::SoundCodec& codec) {
    const host::FrameOwner frame(av_frame_alloc());
    int blocks = 0;
    while (codec.Receive(*frame) >= 0) {
        EXPECT_EQ(frame->nb_samples, 160);
        EXPECT_EQ(frame->pts, blocks == 0 ? 77 : AV_NOPTS_VALUE);
        ++blocks;
    }
    return blocks;
}

// What stands in a packet is cut out of it when it is decoded, not before: a
// movie of 900 KB would take half a gigabyte.
TEST(SoundCodec, DividesAPacketAsItsPartsAreDecoded) {
    const Telephone telephone;
    const auto codec = host::SoundCodec::Open(telephone.stream, true);
    ASSERT_TRUE(codec);
    const host::PacketOwner packet = Blocks(5000);
    codec->Send(packet.get());
    EXPECT_EQ(av_buffer_get_ref_count(packet->buf), 2);
    EXPECT_EQ(Drain(*codec), 5000);
    EXPECT_EQ(av_buffer_get_ref_count(packet->buf), 1);
    codec->Send(Blocks(3).get());
    EXPECT_EQ(Drain(*codec), 3);
}

}  // namespace
