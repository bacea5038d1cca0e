// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <vector>

#include "host_interfaces/framework/Types.h"
#include "reference_host/quicktime/AvOwners.h"

namespace host {

// Sound as 32-bit integers, with the channels and at the rate that were promised.
// A decoder nearly always delivers just these; when a stream changes on the way,
// channels are mixed and the rate is converted. Changes between rates that no real
// stream has are refused, and so are more than a few forms: each one costs memory
// and time.
class SoundConverter {
public:
    SoundConverter(int channels, int rate) : channels_(channels), rate_(rate) {}

    // Whether a block is of another form than the one before, so that the rest
    // of that has to be taken first.
    bool HasRestBefore(const AVFrame& frame) const;
    // Appends a block to `words`; false for a form that is unknown or refused.
    bool Append(const AVFrame& frame, std::vector<ncfSInt32>& words);
    // Appends what the conversion of a rate still holds.
    void AppendRest(std::vector<ncfSInt32>& words);
    void Forget();  // all forms, for a jump

    // Frames by which what came out may be behind; 0 when no rate was converted.
    int MostHeldBack() const { return mostHeldBack_; }

private:
    bool IsAsPromised(const AVFrame& frame) const;
    bool Prepare(const AVFrame& frame);
    ResamplerOwner MakeResampler(const AVFrame& frame) const;
    bool Convert(const AVFrame* frame, std::vector<ncfSInt32>& words);

    int channels_;
    int rate_;
    struct Form {
        int channels;
        int rate;
        int format;
        bool operator==(const Form& other) const {
            return channels == other.channels && rate == other.rate && format == other.format;
        }
    };
    static Form FormOf(const AVFrame& frame);
    struct Kept {
        Form from;
        ResamplerOwner resampler;
    };
    std::vector<Kept> kept_;   // of all forms since decoding began
    Kept* current_ = nullptr;  // the one that works, none while all is as promised
    int mostHeldBack_ = 0;
};

}  // namespace host
