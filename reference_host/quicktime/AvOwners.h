// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <memory>

extern "C" {
#include <libavcodec/avcodec.h>
#include <libavformat/avformat.h>
}

namespace host {

// Owners of the multimedia library's handles. None of its types leaves this
// folder.
struct CloseInput {
    void operator()(AVFormatContext* context) const { avformat_close_input(&context); }
};
using InputOwner = std::unique_ptr<AVFormatContext, CloseInput>;

}  // namespace host
