// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <filesystem>

#include "reference_host/quicktime/AvOwners.h"

namespace host {

// A file opened for the pictures of one of its streams; null where it has none of that number
// or can't hold pictures as large as it tells.
InputOwner OpenForPictures(const std::filesystem::path& path, int stream);

// What a decoder is opened for.
enum class DecoderUse {
    EveryPicture,
    // Sync samples one at a time, each between two flushes. Their edges are not smoothed: they
    // are shown much smaller than they are.
    SyncSamples
};

// Null where there is no decoder. One that can gives pictures whose sides are halved so many
// times.
CodecOwner OpenPictureDecoder(const AVStream& stream, DecoderUse use, int halvings = 0);

// How often a decoder can halve the sides of a stream's pictures.
int MostHalvings(const AVStream& stream);

bool IsDamaged(const AVFrame& frame);

}  // namespace host
