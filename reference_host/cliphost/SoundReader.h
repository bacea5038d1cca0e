// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <cstdint>

#include "reference_host/cliphost/Essence.h"
#include "reference_host/cliphost/WavFile.h"
#include "reference_host/framework/SampleRequest.h"

namespace cliphost {

// Delivers the sound of one track as interleaved little-endian PCM of 24 bits.
// The essence must outlive it.
class SoundReader {
public:
    SoundReader(Essence& essence, const ClipTrack& track);  // throws a Failure

    const WavForm& form() const { return form_; }
    std::uint64_t Count() const { return track_.length; }  // frames of sound

    struct Block {
        const unsigned char* bytes = nullptr;
        std::size_t size = 0;
        bool isSilence = false;  // the module could not read it and filled in
    };
    // Throws a Failure when the module delivers nothing at all.
    Block Read(std::uint64_t first, std::uint64_t count);

private:
    void SetFormat();

    Essence& essence_;
    const ClipTrack track_;
    WavForm form_;
    host::Ref<host::SampleRequest> request_;
};

}  // namespace cliphost
