// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "host_interfaces/framework/Compiler.h"
#include "reference_host/quicktime/loading/MovieLibrary.h"

extern "C" {
#include <libavutil/log.h>
}

extern "C" NCF_EXPORT const host::MovieLibrary* CliphostMovieLibrary() {
    av_log_set_level(AV_LOG_QUIET);  // results tell what goes wrong
    static const host::MovieLibrary library = {
        host::MakeQuickTimeWrapper, host::MakeQuickTimeProperty, host::OpenProblem,
        host::DecoderProblem,       host::DecoderProblem,        host::RasterProblem,
        host::DisplayMatrixOf,      host::OpenThumbnails,        host::AreCodedAlone,
    };
    return &library;
}
