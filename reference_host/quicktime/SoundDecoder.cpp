// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "reference_host/quicktime/SoundDecoder.h"

#include <algorithm>

#include "reference_host/quicktime/OpenInput.h"
#include "reference_host/quicktime/PacketList.h"
#include "reference_host/quicktime/SoundForm.h"
#include "reference_host/quicktime/SoundWords.h"

namespace host {
namespace {

// Compressed blocks lean on those before them; this many settle any of them.
constexpr ncfSInt64 kPrerollFrames = 16 * 1152;
// Reading on is cheaper than a seek up to here.
constexpr ncfSInt64 kNearFrames = 96000;

bool IsLinear(const AVCodecParameters& form) {
    return av_get_exact_bits_per_sample(form.codec_id) > 0 &&
           std::string_view(avcodec_get_name(form.codec_id)).substr(0, 4) == "pcm_";
}

}  // namespace

std::unique_ptr<SoundDecoder> SoundDecoder::Open(const std::filesystem::path& path, int stream) {
    std::string ignored;
    InputOwner input = OpenInput(path, InputView::AsPresented, ignored);
    if (!input || stream < 0 || stream >= static_cast<int>(input->nb_streams)) {
        return nullptr;
    }
    const AVStream& of = *input->streams[stream];
    const AVCodec* const decoder = avcodec_find_decoder(of.codecpar->codec_id);
    CodecOwner codec(decoder ? avcodec_alloc_context3(decoder) : nullptr);
    if (!codec || avcodec_parameters_to_context(codec.get(), of.codecpar) < 0) {
        return nullptr;
    }
    codec->pkt_timebase = of.time_base;
    SoundForm form;
    if (!ReadSoundForm(of, form) || avcodec_open2(codec.get(), decoder, nullptr) < 0) {
        return nullptr;
    }
    UseOneStream(*input, stream);
    return std::unique_ptr<SoundDecoder>(
        new SoundDecoder(std::move(input), std::move(codec), stream));
}

SoundDecoder::SoundDecoder(InputOwner input, CodecOwner codec, int stream)
    : input_(std::move(input)),
      codec_(std::move(codec)),
      frame_(av_frame_alloc()),
      packet_(av_packet_alloc()),
      stream_(stream),
      channels_(input_->streams[stream]->codecpar->ch_layout.nb_channels) {
    const AVStream& of = *input_->streams[stream_];
    // Movies begin at 0 of their own time; other files where their first
    // stream does.
    if (!IsMovieFamily(*input_) && UsableTime(input_->start_time) != AV_NOPTS_VALUE) {
        zeroTime_ = av_rescale_q(input_->start_time, AVRational{1, AV_TIME_BASE}, of.time_base);
    }
    tolerance_ = 1 + 2 * av_rescale_rnd(of.codecpar->sample_rate, of.time_base.num,
                                        of.time_base.den, AV_ROUND_UP);
    if (of.time_base.num == 1 && of.time_base.den == of.codecpar->sample_rate) {
        tolerance_ = 0;
    }
}

ncfSInt64 SoundDecoder::TimeOf(ncfSInt64 place) const {
    const AVStream& of = *input_->streams[stream_];
    return zeroTime_ + av_rescale_q(place, AVRational{1, of.codecpar->sample_rate}, of.time_base);
}

ncfSInt64 SoundDecoder::PlaceOf(ncfSInt64 time) const {
    const AVStream& of = *input_->streams[stream_];
    return av_rescale_q(time - zeroTime_, of.time_base, AVRational{1, of.codecpar->sample_rate});
}

void SoundDecoder::Seek(ncfSInt64 place) {
    const AVCodecParameters& form = *input_->streams[stream_]->codecpar;
    const ncfSInt64 preroll =
        IsLinear(form) ? 0 : std::max<ncfSInt64>(kPrerollFrames, form.seek_preroll);
    // What primes a decoder has times below zero.
    const ncfSInt64 from = TimeOf(place - preroll);
    if (av_seek_frame(input_.get(), stream_, from, AVSEEK_FLAG_BACKWARD) < 0 &&
        av_seek_frame(input_.get(), stream_, std::max(from, zeroTime_), AVSEEK_FLAG_BACKWARD) < 0) {
        av_seek_frame(input_.get(), stream_, zeroTime_, AVSEEK_FLAG_ANY);
    }
    avcodec_flush_buffers(codec_.get());
    isRunning_ = true;
    isPlaced_ = false;
    blockCount_ = 0;
}

bool SoundDecoder::Feed() {
    while (av_read_frame(input_.get(), packet_.get()) >= 0) {
        const bool isOurs = packet_->stream_index == stream_;
        if (isOurs) {
            avcodec_send_packet(codec_.get(), packet_.get());  // a refused one leaves a gap
        }
        av_packet_unref(packet_.get());
        if (isOurs) {
            return true;
        }
    }
    return avcodec_send_packet(codec_.get(), nullptr) >= 0;
}

bool SoundDecoder::Advance() {
    for (;;) {
        const int got = avcodec_receive_frame(codec_.get(), frame_.get());
        if (got == AVERROR(EAGAIN)) {
            if (Feed()) {
                continue;
            }
            isRunning_ = false;
            return false;
        }
        if (got == AVERROR_EOF) {
            isRunning_ = false;
            return false;
        }
        if (got < 0) {
            continue;
        }
        block_.clear();
        if (!AppendSoundWords(*frame_, channels_, block_)) {
            continue;
        }
        const ncfSInt64 follows = blockStart_ + blockCount_;
        const ncfSInt64 time = UsableTime(frame_->best_effort_timestamp);
        ncfSInt64 start = time == AV_NOPTS_VALUE ? follows : PlaceOf(time);
        if (isPlaced_ && std::abs(start - follows) <= tolerance_) {
            start = follows;
        }
        isPlaced_ = true;
        blockStart_ = start;
        blockCount_ = frame_->nb_samples;
        return true;
    }
}

ncfUInt64 SoundDecoder::Read(ncfUInt64 place, ncfUInt64 count, std::vector<ncfSInt32>& words) {
    constexpr ncfUInt64 kFarthest = ncfUInt64{1} << 48;
    const auto wide = static_cast<std::size_t>(channels_);
    words.assign(static_cast<std::size_t>(count) * wide, 0);
    if (place >= kFarthest || count >= kFarthest || count == 0) {
        return 0;
    }
    const auto first = static_cast<ncfSInt64>(place);
    const auto end = first + static_cast<ncfSInt64>(count);
    const bool isBehind = blockCount_ > 0 && first >= blockStart_;
    if (!isBehind || (isRunning_ && first > blockStart_ + blockCount_ + kNearFrames)) {
        Seek(first);
    }
    ncfSInt64 reached = first;
    while (true) {
        const ncfSInt64 from = std::max(first, blockStart_);
        const ncfSInt64 to = std::min(end, blockStart_ + blockCount_);
        if (blockCount_ > 0 && from < to) {
            std::copy_n(block_.begin() + static_cast<std::ptrdiff_t>(from - blockStart_) *
                                             static_cast<std::ptrdiff_t>(wide),
                        static_cast<std::size_t>(to - from) * wide,
                        words.begin() + static_cast<std::ptrdiff_t>(from - first) *
                                            static_cast<std::ptrdiff_t>(wide));
            reached = std::max(reached, to);
        } else if (blockCount_ > 0 && blockStart_ >= end) {
            reached = end;  // silence before sound that is still to come
        }
        if (reached >= end || !isRunning_ || !Advance()) {
            return static_cast<ncfUInt64>(reached - first);
        }
    }
}

}  // namespace host
