// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <filesystem>

#include "host_interfaces/framework/Types.h"
#include "reference_host/quicktime/AvOwners.h"

namespace host {

// The form of a sound track in the terms of the sound system.
struct SoundForm {
    ncfUInt32 channels = 0;
    double sampleRate = 0.0;        // frames per second
    ncfUInt32 formatId = 0;         // 'lpcm' for every linear kind
    ncfUInt32 formatFlags = 0;      // 1 float, 2 big endian, 4 signed, 8 packed, 32 planar
    ncfUInt32 bytesPerPacket = 0;   // linear: a frame of all channels; 0: it varies
    ncfUInt32 framesPerPacket = 0;  // 0: it varies
    ncfUInt32 bitsPerChannel = 0;   // 0 for compressed sound
    int decodedPerPacket = 0;       // frames that come out of each; 0: it varies
    bool isBigEndian = false;
    bool isConstantBitRate = false;
    bool isStoredPlain = false;  // linear, and the file holds frame after frame
};

// As the container tells it; false when the stream is no sound, or its numbers
// make no sense.
bool ReadSoundForm(const AVStream& stream, SoundForm& out);

// As it is delivered: channels and rate of compressed sound are those that come
// out of its decoder. But where a movie's header can be read by itself,
// `hasWholeIndex`, an extension of AAC that it does not announce does not count:
// nobody could tell of it who does not decode.
bool ReadSoundForm(const std::filesystem::path& path, const AVStream& stream, bool hasWholeIndex,
                   SoundForm& out);

}  // namespace host
