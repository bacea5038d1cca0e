// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <filesystem>
#include <map>
#include <vector>

namespace host {

// What comes out of a sound track's decoder. Containers tell it of linear sound;
// of compressed sound their numbers may be a template, or those of a core on
// which the decoder builds.
struct DecodedSound {
    int channels = 0;  // 0: nothing could be decoded
    int rate = 0;
    int framesPerPacket = 0;  // 0: it varies
    int containerRate = 0;    // by the container's header alone
};

// Decodes the first packets of streams, by their numbers. The file is read once
// for many of them.
std::map<int, DecodedSound> DecodeFirstSounds(const std::filesystem::path& path,
                                              const std::vector<int>& streams);

}  // namespace host
