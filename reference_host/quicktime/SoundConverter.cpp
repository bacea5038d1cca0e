// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "reference_host/quicktime/SoundConverter.h"

extern "C" {
#include <libavutil/opt.h>
}

#include <algorithm>
#include <limits>

#include "reference_host/quicktime/SoundWords.h"

namespace host {
namespace {

// Between rates of sound lie 24 times at most, from 8000 to 192000.
constexpr int kMostRatio = 32;
// Streams have two or three.
constexpr std::size_t kMostForms = 8;
// Half of what a filter spans, with room to spare, in frames of the lower rate.
constexpr int kFilterFrames = 32;

}  // namespace

bool SoundConverter::IsAsPromised(const AVFrame& frame) const {
    return frame.ch_layout.nb_channels == channels_ && frame.sample_rate == rate_;
}

SoundConverter::Form SoundConverter::FormOf(const AVFrame& frame) {
    return {frame.ch_layout.nb_channels, frame.sample_rate, frame.format};
}

bool SoundConverter::HasRestBefore(const AVFrame& frame) const {
    return current_ && current_->from.rate != rate_ && !(current_->from == FormOf(frame));
}

void SoundConverter::Forget() {
    current_ = nullptr;
    kept_.clear();
}

ResamplerOwner SoundConverter::MakeResampler(const AVFrame& frame) const {
    AVChannelLayout from{};
    AVChannelLayout to{};
    // Channels without a named place are mixed by their number.
    av_channel_layout_default(&to, channels_);
    if (frame.ch_layout.order == AV_CHANNEL_ORDER_UNSPEC ||
        av_channel_layout_copy(&from, &frame.ch_layout) < 0) {
        av_channel_layout_default(&from, frame.ch_layout.nb_channels);
    }
    SwrContext* made = nullptr;
    const int error = swr_alloc_set_opts2(&made, &to, AV_SAMPLE_FMT_DBL, rate_, &from,
                                          static_cast<AVSampleFormat>(frame.format),
                                          frame.sample_rate, 0, nullptr);
    av_channel_layout_uninit(&from);
    av_channel_layout_uninit(&to);
    ResamplerOwner resampler(made);
    const bool isUsable =
        error >= 0 && av_opt_set_int(made, "internal_sample_fmt", AV_SAMPLE_FMT_DBLP, 0) >= 0;
    return isUsable ? std::move(resampler) : nullptr;
}

bool SoundConverter::Prepare(const AVFrame& frame) {
    const Form form = FormOf(frame);
    if (current_ && current_->from == form) {
        return true;
    }
    current_ = nullptr;
    if (form.channels < 1 || form.rate < 1 || form.rate / kMostRatio > rate_ ||
        rate_ / kMostRatio > form.rate) {
        return false;
    }
    auto kept = std::find_if(kept_.begin(), kept_.end(),
                             [&](const Kept& each) { return each.from == form; });
    if (kept == kept_.end()) {
        ResamplerOwner made = kept_.size() < kMostForms ? MakeResampler(frame) : nullptr;
        if (!made) {
            return false;
        }
        kept = kept_.insert(kept_.end(), {form, std::move(made)});
    }
    // Begun anew it has nothing of before, but its filters.
    if (swr_init(kept->resampler.get()) < 0) {
        return false;
    }
    current_ = &*kept;
    if (form.rate != rate_) {
        mostHeldBack_ = std::max(mostHeldBack_, kFilterFrames * (1 + rate_ / form.rate));
    }
    return true;
}

// Null: what is left.
bool SoundConverter::Convert(const AVFrame* frame, std::vector<ncfSInt32>& words) {
    const FrameOwner out(av_frame_alloc());
    const int given = frame ? frame->nb_samples : 0;
    const int room = swr_get_out_samples(current_->resampler.get(), given);
    if (!out || room < 0 || room == std::numeric_limits<int>::max()) {
        return false;
    }
    out->format = AV_SAMPLE_FMT_DBL;
    out->sample_rate = rate_;
    out->nb_samples = room + 1;
    av_channel_layout_default(&out->ch_layout, channels_);
    if (av_frame_get_buffer(out.get(), 0) < 0) {
        return false;
    }
    const auto** const from = frame ? const_cast<const ncfUInt8**>(frame->extended_data) : nullptr;
    const int made =
        swr_convert(current_->resampler.get(), out->extended_data, out->nb_samples, from, given);
    if (made < 0) {
        return false;
    }
    out->nb_samples = made;
    return AppendSoundWords(*out, channels_, words);
}

bool SoundConverter::Append(const AVFrame& frame, std::vector<ncfSInt32>& words) {
    if (frame.nb_samples < 0) {
        return false;
    }
    if (IsAsPromised(frame)) {
        current_ = nullptr;
        return AppendSoundWords(frame, channels_, words);
    }
    return Prepare(frame) && Convert(&frame, words);
}

void SoundConverter::AppendRest(std::vector<ncfSInt32>& words) {
    if (current_ && current_->from.rate != rate_) {
        Convert(nullptr, words);
    }
    current_ = nullptr;
}

}  // namespace host
