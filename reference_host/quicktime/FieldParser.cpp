// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "reference_host/quicktime/FieldParser.h"

namespace host {

FieldParser::FieldParser(const AVStream& stream) {
    if (stream.codecpar->codec_id == AV_CODEC_ID_H264) {
        parser_.emplace(*stream.codecpar);
    }
}

FieldKind FieldParser::KindOf(const AVPacket& packet) {
    AVCodecParserContext* const parser = parser_ ? parser_->get() : nullptr;
    if (!parser) {
        return FieldKind::Whole;
    }
    parser->picture_structure = AV_PICTURE_STRUCTURE_UNKNOWN;
    parser_->Look(packet);
    switch (parser->picture_structure) {
        case AV_PICTURE_STRUCTURE_TOP_FIELD:
            return FieldKind::Top;
        case AV_PICTURE_STRUCTURE_BOTTOM_FIELD:
            return FieldKind::Bottom;
        default:
            return FieldKind::Whole;
    }
}

}  // namespace host
