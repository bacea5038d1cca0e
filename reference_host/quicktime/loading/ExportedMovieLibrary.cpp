// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/quicktime/loading/MovieLibrary.h"

extern "C" __attribute__((visibility("default"))) const host::MovieLibrary* CliphostMovieLibrary() {
    static const host::MovieLibrary library = {
        host::MakeQuickTimeWrapper, host::MakeQuickTimeProperty, host::OpenProblem,
        host::DecoderProblem,       host::DecoderProblem,        host::RasterProblem,
        host::DisplayMatrixOf,
    };
    return &library;
}
