// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/SoundReader.h"

#include <fmt/format.h>

#include <cmath>

#include "reference_host/cliphost/Failure.h"
#include "reference_host/framework/HostPath.h"

namespace cliphost {
namespace {

constexpr ncfUInt32 kLittleEndian = 0x4132434C;  // 'A2CL'
constexpr const char* kSilenceNotice = "filling the buffers with silence";

}  // namespace

SoundReader::SoundReader(Essence& essence, const ClipTrack& track)
    : essence_(essence), track_(track), request_(host::MakeRef<host::SampleRequest>()) {
    essence_.NeedDelivery(track_);
    SetFormat();
    form_.rate = static_cast<unsigned>(std::lround(track_.RateAsNumber()));
    // How many channels are interleaved is known by what comes.
    if (track_.length > 0) {
        const Block block = Read(0, 1);
        form_.channels = static_cast<unsigned>(block.size / (form_.bits / 8));
    } else {
        form_.channels = track_.channels;
    }
}

void SoundReader::SetFormat() {
    NMA::IUncompressedAudioProvider& sounds = essence_.sounds();
    ncfUInt32 count = 0;
    NCFRESULT result = sounds.GetNumberOfAudioFormats(track_.number, &count);
    for (ncfUInt32 i = 0; i < count && result >= 0; ++i) {
        ncfUInt32 order = 0;
        ncfUInt16 bytes = 0, bits = 0;
        result = sounds.GetAudioFormat(track_.number, i, &order, &bytes, &bits);
        if (result >= 0 && order == kLittleEndian) {
            form_.bits = bytes * 8u;
            result = sounds.SetWorkingAudioFormat(track_.number, i);
            if (result >= 0) {
                return;
            }
        }
    }
    essence_.FailSamples(track_, fmt::format("track {}: no sound format can be set", track_.number),
                         result < 0 ? result : NCF_E_NOTSUPPORTED);
}

SoundReader::Block SoundReader::Read(std::uint64_t first, std::uint64_t count) {
    essence_.session().TakeNotices();
    request_->Ask(track_.number, first, count);
    const NCFRESULT result = essence_.provider().ProvideSampleRange(request_.get(), 0);
    if (result != NCF_OK || !request_->buffer().isComplete()) {
        essence_.FailSamples(track_,
                             fmt::format("track {}: no sound from sample {}", track_.number, first),
                             result < 0 ? result : NCF_E_FAIL);
    }
    Block block{request_->buffer().bytes(),
                static_cast<std::size_t>(request_->buffer().validBytes()), false};
    for (const std::string& notice : essence_.session().TakeNotices()) {
        block.isSilence = block.isSilence || notice.find(kSilenceNotice) != std::string::npos;
    }
    return block;
}

}  // namespace cliphost
