// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "reference_host/quicktime/PictureDecoder.h"

#include <algorithm>

#include "reference_host/quicktime/OpenInput.h"
#include "reference_host/quicktime/RasterClaim.h"

namespace host {

InputOwner OpenForPictures(const std::filesystem::path& path, int stream) {
    InputOwner input = OpenForStream(path, InputView::AsPresented, stream);
    const bool isImpossible = input && TellsLargePictures(*input->streams[stream]->codecpar) &&
                              !FindImpossibleRaster(path, stream).empty();
    return isImpossible ? nullptr : std::move(input);
}

CodecOwner OpenPictureDecoder(const AVStream& stream, DecoderUse use, int halvings) {
    const AVCodec* const decoder = avcodec_find_decoder(stream.codecpar->codec_id);
    CodecOwner codec = MakeCodec(decoder, *stream.codecpar);
    if (!codec) {
        return nullptr;
    }
    codec->pkt_timebase = stream.time_base;
    codec->max_pixels = MostPixels(*stream.codecpar);
    // Near the end of a stream the decoder would keep good pictures back as well;
    // those that are damaged it marks.
    codec->flags |= AV_CODEC_FLAG_OUTPUT_CORRUPT;
    codec->lowres = halvings;
    if (use == DecoderUse::SyncSamples) {
        codec->thread_count = 1;  // more of them would wait for more packets
        codec->skip_frame = AVDISCARD_NONKEY;
        codec->skip_loop_filter = AVDISCARD_ALL;
    } else {
        codec->thread_count = 0;  // as many as there are processors
        codec->thread_type = FF_THREAD_FRAME | FF_THREAD_SLICE;
    }
    return avcodec_open2(codec.get(), decoder, nullptr) < 0 ? nullptr : std::move(codec);
}

// Where pictures lean on each other, halved ones drift apart.
int MostHalvings(const AVStream& stream) {
    const AVCodec* const decoder = avcodec_find_decoder(stream.codecpar->codec_id);
    const AVCodecDescriptor* const codec = avcodec_descriptor_get(stream.codecpar->codec_id);
    const bool standAlone = codec && (codec->props & AV_CODEC_PROP_INTRA_ONLY) != 0;
    return decoder && standAlone ? decoder->max_lowres : 0;
}

bool IsDamaged(const AVFrame& frame) {
    return (frame.flags & AV_FRAME_FLAG_CORRUPT) != 0 || frame.decode_error_flags != 0;
}

}  // namespace host
