// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "reference_host/quicktime/CodecParser.h"

#include <cstdint>

namespace host {

CodecParser::CodecParser(const AVCodecParameters& form)
    : parser_(av_parser_init(form.codec_id)), codec_(avcodec_alloc_context3(nullptr)) {
    if (!parser_ || !codec_ || avcodec_parameters_to_context(codec_.get(), &form) < 0) {
        parser_.reset();
        return;
    }
    parser_->flags |= PARSER_FLAG_COMPLETE_FRAMES;
}

void CodecParser::Look(const AVPacket& packet) {
    std::uint8_t* ignored = nullptr;
    int ignoredSize = 0;
    av_parser_parse2(parser_.get(), codec_.get(), &ignored, &ignoredSize, packet.data, packet.size,
                     packet.pts, packet.dts, packet.pos);
}

}  // namespace host
