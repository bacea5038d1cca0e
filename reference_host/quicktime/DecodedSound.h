// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <filesystem>

#include "reference_host/quicktime/AvOwners.h"

namespace host {

// What comes out of a sound track's decoder. Containers tell it of linear sound;
// of compressed sound their numbers may be a template, or those of a core on
// which the decoder builds.
struct DecodedSound {
    int channels = 0;  // 0: nothing could be decoded
    int rate = 0;
    int framesPerPacket = 0;  // 0: it varies
};

// Decodes the first packets of a stream.
DecodedSound DecodeFirstSound(const std::filesystem::path& path, int stream);

}  // namespace host
