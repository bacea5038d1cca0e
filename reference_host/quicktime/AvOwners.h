// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <memory>

extern "C" {
#include <libavcodec/avcodec.h>
#include <libavformat/avformat.h>
#include <libswresample/swresample.h>
#include <libswscale/swscale.h>
}

namespace host {

// Owners of the multimedia library's handles. None of its types leaves this
// folder.
struct CloseInput {
    void operator()(AVFormatContext* context) const;  // and the file that it reads
};
using InputOwner = std::unique_ptr<AVFormatContext, CloseInput>;

struct FreeCodec {
    void operator()(AVCodecContext* context) const { avcodec_free_context(&context); }
};
using CodecOwner = std::unique_ptr<AVCodecContext, FreeCodec>;

struct FreeFrame {
    void operator()(AVFrame* frame) const { av_frame_free(&frame); }
};
using FrameOwner = std::unique_ptr<AVFrame, FreeFrame>;

struct FreePacket {
    void operator()(AVPacket* packet) const { av_packet_free(&packet); }
};
using PacketOwner = std::unique_ptr<AVPacket, FreePacket>;

struct FreeParser {
    void operator()(AVCodecParserContext* parser) const { av_parser_close(parser); }
};
using ParserOwner = std::unique_ptr<AVCodecParserContext, FreeParser>;

struct FreeResampler {
    void operator()(SwrContext* resampler) const { swr_free(&resampler); }
};
using ResamplerOwner = std::unique_ptr<SwrContext, FreeResampler>;

struct FreeScaler {
    void operator()(SwsContext* scaler) const { sws_freeContext(scaler); }
};
using ScalerOwner = std::unique_ptr<SwsContext, FreeScaler>;

}  // namespace host
