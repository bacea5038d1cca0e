// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "reference_host/quicktime/AvOwners.h"

namespace host {

// The library's parser of a codec, fed with whole packets.
class CodecParser {
public:
    // Without one where the library has none, or no memory.
    explicit CodecParser(const AVCodecParameters& form);

    // Holds what the last packet told; null: none.
    AVCodecParserContext* get() const { return parser_.get(); }
    void Look(const AVPacket& packet);

private:
    ParserOwner parser_;
    CodecOwner codec_;
};

}  // namespace host
