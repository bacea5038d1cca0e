// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <memory>
#include <type_traits>

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

template <auto Free>
struct FreeBy {
    template <class Handle>
    void operator()(Handle* handle) const {
        if constexpr (std::is_invocable_v<decltype(Free), Handle**>) {
            Free(&handle);
        } else {
            Free(handle);
        }
    }
};
using CodecOwner = std::unique_ptr<AVCodecContext, FreeBy<avcodec_free_context>>;
// A context for a stream of that form; null without decoder or memory.
inline CodecOwner MakeCodec(const AVCodec* decoder, const AVCodecParameters& form) {
    CodecOwner codec(decoder ? avcodec_alloc_context3(decoder) : nullptr);
    return codec && avcodec_parameters_to_context(codec.get(), &form) >= 0 ? std::move(codec)
                                                                           : nullptr;
}
using FrameOwner = std::unique_ptr<AVFrame, FreeBy<av_frame_free>>;
using PacketOwner = std::unique_ptr<AVPacket, FreeBy<av_packet_free>>;
using ParserOwner = std::unique_ptr<AVCodecParserContext, FreeBy<av_parser_close>>;
using ResamplerOwner = std::unique_ptr<SwrContext, FreeBy<swr_free>>;
using ScalerOwner = std::unique_ptr<SwsContext, FreeBy<sws_freeContext>>;

}  // namespace host
