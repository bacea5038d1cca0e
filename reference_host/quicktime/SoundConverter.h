// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <vector>

#include "host_interfaces/framework/Types.h"
#include "reference_host/quicktime/AvOwners.h"

namespace host {

// Sound as whole numbers of 32 bits in the channels and at the rate that were
// promised. Nearly always a decoder gives just these; where a stream changes
// on the way, channels are mixed and the rate is converted.
class SoundConverter {
public:
    SoundConverter(int channels, int rate) : channels_(channels), rate_(rate) {}

    // Whether a block is of another form than the one before, so that the rest
    // of that has to be taken first.
    bool HasRestBefore(const AVFrame& frame) const;
    // Appends a block to `words`; false for a form that is unknown.
    bool Append(const AVFrame& frame, std::vector<ncfSInt32>& words);
    // Appends what the conversion of a rate still holds, and forgets it.
    void AppendRest(std::vector<ncfSInt32>& words);
    void Forget();

    // Whether a rate was converted: what comes out then leans on all before it.
    bool HasConvertedRate() const { return hasConvertedRate_; }

private:
    bool IsAsPromised(const AVFrame& frame) const;
    bool Prepare(const AVFrame& frame);
    bool Convert(const AVFrame* frame, std::vector<ncfSInt32>& words);

    int channels_;
    int rate_;
    ResamplerOwner resampler_;  // from the form below
    int fromChannels_ = 0;
    int fromRate_ = 0;
    int fromFormat_ = AV_SAMPLE_FMT_NONE;
    bool hasConvertedRate_ = false;
};

}  // namespace host
