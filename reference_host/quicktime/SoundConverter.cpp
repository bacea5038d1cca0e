// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "reference_host/quicktime/SoundConverter.h"

extern "C" {
#include <libavutil/opt.h>
}

#include "reference_host/quicktime/SoundWords.h"

namespace host {

bool SoundConverter::IsAsPromised(const AVFrame& frame) const {
    return frame.ch_layout.nb_channels == channels_ && frame.sample_rate == rate_;
}

bool SoundConverter::HasRestBefore(const AVFrame& frame) const {
    return resampler_ && fromRate_ != rate_ &&
           (frame.ch_layout.nb_channels != fromChannels_ || frame.sample_rate != fromRate_ ||
            frame.format != fromFormat_);
}

void SoundConverter::Forget() {
    resampler_.reset();
    fromChannels_ = fromRate_ = 0;
    fromFormat_ = AV_SAMPLE_FMT_NONE;
}

bool SoundConverter::Prepare(const AVFrame& frame) {
    const int channels = frame.ch_layout.nb_channels;
    if (resampler_ && channels == fromChannels_ && frame.sample_rate == fromRate_ &&
        frame.format == fromFormat_) {
        return true;
    }
    Forget();
    if (channels < 1 || frame.sample_rate < 1) {
        return false;
    }
    AVChannelLayout from{};
    AVChannelLayout to{};
    // Channels without a named place are mixed by their number.
    av_channel_layout_default(&to, channels_);
    if (frame.ch_layout.order == AV_CHANNEL_ORDER_UNSPEC ||
        av_channel_layout_copy(&from, &frame.ch_layout) < 0) {
        av_channel_layout_default(&from, channels);
    }
    SwrContext* made = nullptr;
    const int error = swr_alloc_set_opts2(&made, &to, AV_SAMPLE_FMT_DBL, rate_, &from,
                                          static_cast<AVSampleFormat>(frame.format),
                                          frame.sample_rate, 0, nullptr);
    av_channel_layout_uninit(&from);
    av_channel_layout_uninit(&to);
    resampler_.reset(made);
    if (error < 0 || av_opt_set_int(made, "internal_sample_fmt", AV_SAMPLE_FMT_DBLP, 0) < 0 ||
        swr_init(made) < 0) {
        Forget();
        return false;
    }
    fromChannels_ = channels;
    fromRate_ = frame.sample_rate;
    fromFormat_ = frame.format;
    return true;
}

// Null: what is left.
bool SoundConverter::Convert(const AVFrame* frame, std::vector<ncfSInt32>& words) {
    const FrameOwner out(av_frame_alloc());
    const int given = frame ? frame->nb_samples : 0;
    const int room = swr_get_out_samples(resampler_.get(), given);
    if (!out || room < 0) {
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
        swr_convert(resampler_.get(), out->extended_data, out->nb_samples, from, given);
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
        Forget();
        return AppendSoundWords(frame, channels_, words);
    }
    hasConvertedRate_ = hasConvertedRate_ || frame.sample_rate != rate_;
    return Prepare(frame) && Convert(&frame, words);
}

void SoundConverter::AppendRest(std::vector<ncfSInt32>& words) {
    if (resampler_ && fromRate_ != rate_) {
        Convert(nullptr, words);
    }
    Forget();
}

}  // namespace host
