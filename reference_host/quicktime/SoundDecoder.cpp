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

// Their decoders carry something on from block to block for good.
bool LeansOnAllBefore(AVCodecID codec) {
    switch (codec) {
        case AV_CODEC_ID_ADPCM_IMA_QT:
        case AV_CODEC_ID_ADPCM_G722:
        case AV_CODEC_ID_ADPCM_G726:
        case AV_CODEC_ID_MACE3:
        case AV_CODEC_ID_MACE6:
            return true;
        default:
            return false;
    }
}

// Of two decoders the one that gives the same sound from wherever it starts: the
// other carries what it rounds off from sample to sample.
const AVCodec* DecoderFor(AVCodecID codec) {
    const char* const name = codec == AV_CODEC_ID_MP2   ? "mp2float"
                             : codec == AV_CODEC_ID_MP1 ? "mp1float"
                                                        : nullptr;
    const AVCodec* const even = name ? avcodec_find_decoder_by_name(name) : nullptr;
    return even ? even : avcodec_find_decoder(codec);
}

// Damaged files have times that no sum must be made of.
ncfSInt64 Rescaled(ncfSInt64 value, AVRational from, AVRational to) {
    return std::clamp(av_rescale_q(value, from, to), -kFarthestTime, kFarthestTime);
}

bool IsLinear(const AVCodecParameters& form) {
    return av_get_exact_bits_per_sample(form.codec_id) > 0 &&
           std::string_view(avcodec_get_name(form.codec_id)).substr(0, 4) == "pcm_";
}

}  // namespace

std::unique_ptr<SoundDecoder> SoundDecoder::Open(const std::filesystem::path& path, int stream,
                                                 bool hasWholeIndex, InputView view) {
    std::string ignored;
    InputOwner input = OpenInput(path, view, ignored);
    if (!input || stream < 0 || stream >= static_cast<int>(input->nb_streams)) {
        return nullptr;
    }
    if (!hasWholeIndex) {
        FindStreamDetails(*input);  // tells where the file starts
    }
    const AVStream& of = *input->streams[stream];
    const AVCodec* const decoder = DecoderFor(of.codecpar->codec_id);
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
        new SoundDecoder(path, std::move(input), std::move(codec), stream, hasWholeIndex, view));
}

SoundDecoder::SoundDecoder(std::filesystem::path path, InputOwner input, CodecOwner codec,
                           int stream, bool hasWholeIndex, InputView view)
    : path_(std::move(path)),
      view_(view),
      input_(std::move(input)),
      codec_(std::move(codec)),
      frame_(av_frame_alloc()),
      packet_(av_packet_alloc()),
      stream_(stream),
      channels_(input_->streams[stream]->codecpar->ch_layout.nb_channels) {
    const AVStream& of = *input_->streams[stream_];
    const ncfSInt64 start = hasWholeIndex ? AV_NOPTS_VALUE : UsableTime(input_->start_time);
    // Before 0 a movie has what primes its decoders.
    if (start != AV_NOPTS_VALUE && (start > 0 || !IsMovieFamily(*input_))) {
        zeroTime_ = Rescaled(start, AVRational{1, AV_TIME_BASE}, of.time_base);
    }
    const int rate = of.codecpar->sample_rate;
    tolerance_ = 1 + 2 * av_rescale_rnd(rate, of.time_base.num, of.time_base.den, AV_ROUND_UP);
    if (of.time_base.num == 1 && of.time_base.den == rate) {
        tolerance_ = 0;
    }
    countsPlaces_ = av_cmp_q(of.time_base, AVRational{1, rate}) > 0;
    leansOnAll_ = LeansOnAllBefore(of.codecpar->codec_id) || !TellsTimesOfAll(*input_);
}

ncfSInt64 SoundDecoder::TimeOf(ncfSInt64 place) const {
    const AVStream& of = *input_->streams[stream_];
    return zeroTime_ + Rescaled(place, AVRational{1, of.codecpar->sample_rate}, of.time_base);
}

ncfSInt64 SoundDecoder::PlaceOf(ncfSInt64 time) const {
    const AVStream& of = *input_->streams[stream_];
    return Rescaled(time - zeroTime_, of.time_base, AVRational{1, of.codecpar->sample_rate});
}

ncfSInt64 SoundDecoder::Preroll() const {
    const AVCodecParameters& form = *input_->streams[stream_]->codecpar;
    return IsLinear(form) ? 0 : std::max<ncfSInt64>(kPrerollFrames, form.seek_preroll);
}

void SoundDecoder::Rewind() {
    std::string ignored;
    InputOwner again = OpenInput(path_, view_, ignored);
    isRunning_ = again && stream_ < static_cast<int>(again->nb_streams);
    if (isRunning_) {
        input_ = std::move(again);
        UseOneStream(*input_, stream_);
    }
}

bool SoundDecoder::SeekByTime(ncfSInt64 place) {
    // What primes a decoder has times below zero.
    const ncfSInt64 from = TimeOf(place - Preroll());
    return av_seek_frame(input_.get(), stream_, from, AVSEEK_FLAG_BACKWARD) >= 0 ||
           av_seek_frame(input_.get(), stream_, std::max(from, zeroTime_), AVSEEK_FLAG_BACKWARD) >=
               0 ||
           av_seek_frame(input_.get(), stream_, zeroTime_, AVSEEK_FLAG_ANY) >= 0;
}

// To the last counted block that is early enough.
bool SoundDecoder::SeekToKnown(ncfSInt64 place) {
    const auto behind = std::upper_bound(
        known_.begin(), known_.end(), place - Preroll(),
        [](ncfSInt64 wanted, const KnownBlock& block) { return wanted < block.place; });
    return behind != known_.begin() &&
           av_seek_frame(input_.get(), stream_, std::prev(behind)->time, AVSEEK_FLAG_BACKWARD) >= 0;
}

void SoundDecoder::Start(ncfSInt64 place) {
    avcodec_flush_buffers(codec_.get());
    isRunning_ = true;
    isPlaced_ = false;
    blockStart_ = 0;
    blockCount_ = 0;
    if (leansOnAll_ || (countsPlaces_ && !SeekToKnown(place))) {
        Rewind();
        isFromStart_ = true;
        return;
    }
    isFromStart_ = false;
    if (!countsPlaces_) {
        SeekByTime(place);
    }
}

// Whether going on from the last block is the way to get there.
bool SoundDecoder::MayDecodeOnTo(ncfSInt64 place) const {
    if (blockCount_ == 0 || place < blockStart_) {
        return false;
    }
    const ncfSInt64 reached = blockStart_ + blockCount_;
    if (!isRunning_ || leansOnAll_ || place <= reached + kNearFrames) {
        return true;
    }
    return countsPlaces_ && known_.back().place <= reached + kNearFrames;
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
        if (PlaceBlock()) {
            return true;
        }
    }
}

// Finds the place of the block that was decoded; false for one that can't be
// placed, which is what comes before the first known one after a seek.
bool SoundDecoder::PlaceBlock() {
    const ncfSInt64 follows = blockStart_ + blockCount_;
    const ncfSInt64 time = UsableTime(frame_->best_effort_timestamp);
    ncfSInt64 start = time == AV_NOPTS_VALUE ? follows : PlaceOf(time);
    if (countsPlaces_ && !isPlaced_ && !isFromStart_) {
        const auto found = std::lower_bound(
            known_.begin(), known_.end(), time,
            [](const KnownBlock& block, ncfSInt64 wanted) { return block.time < wanted; });
        if (time == AV_NOPTS_VALUE || found == known_.end() || found->time != time) {
            return false;
        }
        start = found->place;
    } else if (isPlaced_ && std::abs(start - follows) <= tolerance_) {
        start = follows;
    }
    isPlaced_ = true;
    blockStart_ = start;
    blockCount_ = frame_->nb_samples;
    if (countsPlaces_ && time != AV_NOPTS_VALUE &&
        (known_.empty() || (time > known_.back().time && start > known_.back().place))) {
        known_.push_back({time, start});
    }
    return true;
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
    if (!MayDecodeOnTo(first)) {
        Start(first);
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
