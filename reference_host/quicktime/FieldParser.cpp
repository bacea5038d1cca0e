// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "reference_host/quicktime/FieldParser.h"

#include <cstdint>

namespace host {

FieldParser::FieldParser(const AVStream& stream) {
    if (stream.codecpar->codec_id != AV_CODEC_ID_H264) {
        return;
    }
    parser_.reset(av_parser_init(AV_CODEC_ID_H264));
    codec_.reset(avcodec_alloc_context3(nullptr));
    if (!parser_ || !codec_ || avcodec_parameters_to_context(codec_.get(), stream.codecpar) < 0) {
        parser_.reset();
        return;
    }
    parser_->flags |= PARSER_FLAG_COMPLETE_FRAMES;
}

FieldKind FieldParser::KindOf(const AVPacket& packet) {
    if (!parser_) {
        return FieldKind::Whole;
    }
    std::uint8_t* ignored = nullptr;
    int ignoredSize = 0;
    parser_->picture_structure = AV_PICTURE_STRUCTURE_UNKNOWN;
    av_parser_parse2(parser_.get(), codec_.get(), &ignored, &ignoredSize, packet.data, packet.size,
                     packet.pts, packet.dts, packet.pos);
    switch (parser_->picture_structure) {
        case AV_PICTURE_STRUCTURE_TOP_FIELD:
            return FieldKind::Top;
        case AV_PICTURE_STRUCTURE_BOTTOM_FIELD:
            return FieldKind::Bottom;
        default:
            return FieldKind::Whole;
    }
}

}  // namespace host
