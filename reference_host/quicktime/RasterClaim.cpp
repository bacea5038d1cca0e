// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "reference_host/quicktime/RasterClaim.h"

#include <algorithm>

#include "reference_host/quicktime/HeaderLook.h"
#include "reference_host/quicktime/OpenInput.h"

namespace host {
namespace {

// Stored and told sizes differ in true movies, though not by more than this.
constexpr std::int64_t kMostTimes = 4;
// Of the codecs that leave the size to the file, a byte of the densest stands for
// fewer: 256 blocks of 4 x 4 in one colour take three.
constexpr std::int64_t kMostPixelsOfAByte = 4096;
constexpr int kPacketsToTell = 32;
constexpr int kNoSize = 64;

struct Raster {
    int width = 0;
    int height = 0;
    std::int64_t Pixels() const { return std::int64_t{width} * height; }
    std::string Words() const { return std::to_string(width) + " x " + std::to_string(height); }
};

// Stands in for the decoder's memory: notes what it would hold and gives none.
int NoteRaster(AVCodecContext* codec, AVFrame* frame, int) {
    *static_cast<Raster*>(codec->opaque) = {frame->width, frame->height};
    return AVERROR(ENOMEM);
}

CodecOwner OpenWithoutSize(const AVCodecParameters& form, Raster& noted) {
    const AVCodec* const decoder = avcodec_find_decoder(form.codec_id);
    const bool isDirect = decoder && (decoder->capabilities & AV_CODEC_CAP_DR1) != 0;
    CodecOwner codec = MakeCodec(isDirect ? decoder : nullptr, form);
    if (!codec) {
        return nullptr;
    }
    codec->width = codec->coded_width = codec->height = codec->coded_height = kNoSize;
    codec->thread_count = 1;
    codec->thread_type = FF_THREAD_SLICE;
    codec->get_buffer2 = NoteRaster;
    codec->opaque = &noted;
    return avcodec_open2(codec.get(), decoder, nullptr) < 0 ? nullptr : std::move(codec);
}

// What the first samples tell: the size of their pictures, where they hold it, and
// the bytes of the largest.
struct Samples {
    Raster own;
    std::int64_t largest = 0;
};

Samples Inspect(AVFormatContext& input, int stream) {
    Samples found;
    const CodecOwner codec = OpenWithoutSize(*input.streams[stream]->codecpar, found.own);
    const PacketOwner packet(av_packet_alloc());
    UseOneStream(input, stream);
    for (int i = 0; packet && i < kPacketsToTell && found.own.width == 0 &&
                    av_read_frame(&input, packet.get()) >= 0;
         ++i) {
        found.largest = std::max<std::int64_t>(found.largest, packet->size);
        if (codec && packet->stream_index == stream) {
            avcodec_send_packet(codec.get(), packet.get());
            const FrameOwner frame(av_frame_alloc());
            avcodec_receive_frame(codec.get(), frame.get());
        }
        av_packet_unref(packet.get());
    }
    if (found.own.width == kNoSize && found.own.height == kNoSize) {
        found.own = {};  // it took what it was told
    }
    return found;
}

}  // namespace

bool TellsLargePictures(const AVCodecParameters& form) {
    return Raster{form.width, form.height}.Pixels() > kBelievedPixels;
}

std::int64_t MostPixels(const AVCodecParameters& form) {
    return std::max(kBelievedPixels, kMostTimes * Raster{form.width, form.height}.Pixels());
}

std::string FindImpossibleRaster(const std::filesystem::path& path, int stream) {
    const InputOwner input = OpenForStream(path, InputView::AsPresented, stream);
    if (!input) {
        return {};
    }
    const AVCodecParameters& form = *input->streams[stream]->codecpar;
    const Raster told{form.width, form.height};
    const Samples samples = Inspect(*input, stream);
    const std::int64_t own = samples.own.Pixels();
    const bool isTooSmall = TellsLargePictures(form) && own > 0 && own < told.Pixels() / kMostTimes;
    if (isTooSmall || own > MostPixels(form)) {
        return "the file claims pictures of " + told.Words() +
               ", but its samples hold pictures of " + samples.own.Words();
    }
    if (TellsLargePictures(form) && own == 0 && samples.largest > 0 &&
        samples.largest < told.Pixels() / kMostPixelsOfAByte) {
        return "the file claims pictures of " + told.Words() + ", which " +
               std::to_string(samples.largest) +
               " bytes, the largest of its first samples, can't hold";
    }
    return {};
}

}  // namespace host
