// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "reference_host/quicktime/CodecPixels.h"

#include <cstring>

#include "reference_host/quicktime/OpenInput.h"
#include "reference_host/quicktime/RasterClaim.h"
#include "reference_host/quicktime/pixels/PixelLayout.h"

extern "C" {
#include <libavutil/pixdesc.h>
}

namespace host {
namespace {

constexpr auto kUyvy = static_cast<ncfUInt32>(PixelLayout::Uyvy8);
constexpr auto kYuv10 = static_cast<ncfUInt32>(PixelLayout::Yuv10);
constexpr auto kBgra = static_cast<ncfUInt32>(PixelLayout::Bgra8);
constexpr auto kArgb16 = static_cast<ncfUInt32>(PixelLayout::Argb16);
constexpr auto kFloat = static_cast<ncfUInt32>(PixelLayout::AyuvFloat);

// Packets looked through before giving a stream up.
constexpr int kPacketsThatTellPixels = 512;

}  // namespace

CodecPixels PixelsOf(AVPixelFormat format) {
    const AVPixFmtDescriptor* const found = av_pix_fmt_desc_get(format);
    if (!found) {
        return {};
    }
    const bool isPalette = (found->flags & AV_PIX_FMT_FLAG_PAL) != 0;
    const bool isRgb =
        (found->flags & AV_PIX_FMT_FLAG_RGB) != 0 || isPalette || found->nb_components <= 2;
    const bool isDeep = !isPalette && found->comp[0].depth > 8;
    if (isRgb) {
        return isDeep ? CodecPixels{{kArgb16, kBgra}, 1} : CodecPixels{{kBgra}, 1};
    }
    return isDeep || HasAlphaComponent(format)
               ? CodecPixels{{kUyvy, kFloat, kYuv10, kArgb16, kBgra}, 0}
               : CodecPixels{{kUyvy, kBgra}, 0};
}

bool HasAlphaComponent(AVPixelFormat format) {
    const AVPixFmtDescriptor* const found = av_pix_fmt_desc_get(format);
    return found && (found->flags & AV_PIX_FMT_FLAG_ALPHA) != 0 &&
           (found->flags & AV_PIX_FMT_FLAG_PAL) == 0;
}

bool ShowsAlpha(const AVFrame& frame) {
    if (frame.format != AV_PIX_FMT_PAL8) {
        return HasAlphaComponent(static_cast<AVPixelFormat>(frame.format));
    }
    // Only entries that the picture uses count; unused ones are often zero.
    for (int y = 0; y < frame.height; ++y) {
        const std::uint8_t* const row =
            frame.data[0] + static_cast<std::ptrdiff_t>(y) * frame.linesize[0];
        for (int x = 0; x < frame.width; ++x) {
            ncfUInt32 entry = 0;
            std::memcpy(&entry, frame.data[1] + std::size_t{4} * row[x], sizeof entry);
            if (entry >> 24 != 0xFF) {
                return true;
            }
        }
    }
    return false;
}

FrameOwner DecodeFirstPicture(AVFormatContext& input, int stream) {
    const AVCodecParameters& form = *input.streams[stream]->codecpar;
    const AVCodec* const decoder = avcodec_find_decoder(form.codec_id);
    const CodecOwner codec(decoder ? avcodec_alloc_context3(decoder) : nullptr);
    FrameOwner frame(av_frame_alloc());
    const PacketOwner packet(av_packet_alloc());
    if (!codec || !frame || !packet || avcodec_parameters_to_context(codec.get(), &form) < 0) {
        return nullptr;
    }
    codec->max_pixels = MostPixels(form);
    if (avcodec_open2(codec.get(), decoder, nullptr) < 0) {
        return nullptr;
    }
    UseOneStream(input, stream);
    for (int i = 0; i < kPacketsThatTellPixels; ++i) {
        const bool isEnd = av_read_frame(&input, packet.get()) < 0;
        if (isEnd || packet->stream_index == stream) {
            avcodec_send_packet(codec.get(), isEnd ? nullptr : packet.get());
        }
        av_packet_unref(packet.get());
        if (avcodec_receive_frame(codec.get(), frame.get()) >= 0) {
            return frame;
        }
        if (isEnd) {
            return nullptr;
        }
    }
    return nullptr;
}

}  // namespace host
