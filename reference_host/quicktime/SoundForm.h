// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <filesystem>
#include <map>

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
    int decodedPerPacket =
        0;  // frames out of each, by the first ones; 0: it varies, or is not known
    bool isBigEndian = false;
    bool isConstantBitRate = false;
    bool isStoredPlain = false;  // linear, and the file holds frame after frame
};

// As the container tells it; false when the stream is no sound, or its numbers
// make no sense.
bool ReadSoundForm(const AVStream& stream, SoundForm& out);

// All sound of a movie as it is delivered, by stream: channels and rate of compressed
// sound are those of its decoder. But when the header of the movie can be read by
// itself, as `hasWholeIndex` says, the rate is the header's: from the configuration
// of AAC, and from the fields of MPEG audio. A reader that does not decode can't know
// any other.
std::map<int, SoundForm> ReadSoundForms(const std::filesystem::path& path,
                                        const AVFormatContext& input, bool hasWholeIndex);

}  // namespace host
