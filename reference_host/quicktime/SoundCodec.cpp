// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "reference_host/quicktime/SoundCodec.h"

extern "C" {
#include <libavutil/opt.h>
}

#include <cstring>

namespace host {
namespace {

// Of two decoders, the one that gives the same sound wherever it starts: the other
// carries its rounding errors from sample to sample.
const AVCodec* DecoderFor(AVCodecID codec) {
    const char* const name = codec == AV_CODEC_ID_MP2   ? "mp2float"
                             : codec == AV_CODEC_ID_MP1 ? "mp1float"
                                                        : nullptr;
    const AVCodec* const even = name ? avcodec_find_decoder_by_name(name) : nullptr;
    return even ? even : avcodec_find_decoder(codec);
}

// Movies put several blocks of these into a sample; the demuxer leaves them so.
bool NeedsDivision(AVCodecID codec) {
    return codec == AV_CODEC_ID_AMR_NB || codec == AV_CODEC_ID_AMR_WB;
}

}  // namespace

std::unique_ptr<SoundCodec> SoundCodec::Open(const AVStream& stream, bool keepsPriming) {
    const AVCodec* const decoder = DecoderFor(stream.codecpar->codec_id);
    CodecOwner codec = MakeCodec(decoder, *stream.codecpar);
    if (!codec) {
        return nullptr;
    }
    codec->pkt_timebase = stream.time_base;
    if (keepsPriming) {
        codec->flags2 |= AV_CODEC_FLAG2_SKIP_MANUAL;
    }
    // What stands in for inaudible parts is made up: here out of each block, so
    // that it does not hang on where decoding began. Few decoders have this.
    if (decoder->priv_class) {
        av_opt_set_int(codec->priv_data, "cons_noisegen", 1, 0);
    }
    if (avcodec_open2(codec.get(), decoder, nullptr) < 0) {
        return nullptr;
    }
    std::unique_ptr<SoundCodec> opened(new SoundCodec(std::move(codec)));
    opened->dividesPackets_ = NeedsDivision(stream.codecpar->codec_id);
    return opened;
}

// The first part keeps the packet's time; the others follow it. The parser gives
// a part when it sees what is behind it, so the last comes with the end, and a
// parser does not go on behind that. Null when there are no more.
PacketOwner SoundCodec::NextPart() {
    while (parser_) {
        const int left = whole_->size - divided_;
        const bool isEnd = left <= 0;
        ncfUInt8* part = nullptr;
        int size = 0;
        const int used = av_parser_parse2(parser_.get(), codec_.get(), &part, &size,
                                          isEnd ? nullptr : whole_->data + divided_,
                                          isEnd ? 0 : left, whole_->pts, whole_->dts, -1);
        const bool isStuck = used < 0 || used > left || (used == 0 && size == 0);
        PacketOwner owned(!isStuck && size > 0 ? av_packet_alloc() : nullptr);
        if (owned && av_new_packet(owned.get(), size) >= 0) {
            std::memcpy(owned->data, part, static_cast<std::size_t>(size));
            if (isFirstPart_) {
                av_packet_copy_props(owned.get(), whole_.get());
            }
            isFirstPart_ = false;
        } else {
            owned.reset();
        }
        divided_ += isStuck ? 0 : used;
        if (isStuck || isEnd) {
            parser_.reset();
            whole_.reset();
        }
        if (owned) {
            return owned;
        }
    }
    return nullptr;
}

void SoundCodec::Send(const AVPacket* packet) {
    if (!dividesPackets_) {
        avcodec_send_packet(codec_.get(), packet);
    } else if (packet) {
        whole_.reset(av_packet_clone(packet));
        parser_.reset(whole_ ? av_parser_init(codec_->codec_id) : nullptr);
        divided_ = 0;
        isFirstPart_ = true;
    } else {
        isEnding_ = true;
    }
}

int SoundCodec::Receive(AVFrame& frame) {
    for (;;) {
        const int got = avcodec_receive_frame(codec_.get(), &frame);
        // Some decoders give the first block the container's rate.
        if (got >= 0 && codec_->sample_rate > 0) {
            frame.sample_rate = codec_->sample_rate;
        }
        if (got != AVERROR(EAGAIN)) {
            return got;
        }
        if (const PacketOwner part = NextPart()) {
            avcodec_send_packet(codec_.get(), part.get());
        } else if (isEnding_) {
            isEnding_ = false;
            avcodec_send_packet(codec_.get(), nullptr);
        } else {
            return got;
        }
    }
}

}  // namespace host
