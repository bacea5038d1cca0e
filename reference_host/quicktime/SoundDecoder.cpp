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

// Compressed blocks lean on those before them; this many settle any of them,
// but where a block's loudness is told by the difference to the last.
constexpr ncfSInt64 kPrerollFrames = 16 * 1152;
constexpr ncfSInt64 kOpusPrerollFrames = 2 * 48000;
// Reading on is cheaper than a seek up to here.
constexpr ncfSInt64 kNearFrames = 96000;

// Their decoders carry something on from block to block for good.
bool LeansOnAllBefore(AVCodecID codec) {
    switch (codec) {
        case AV_CODEC_ID_ADPCM_IMA_QT:
        case AV_CODEC_ID_ADPCM_YAMAHA:
        case AV_CODEC_ID_ADPCM_G722:
        case AV_CODEC_ID_ADPCM_G726:
        case AV_CODEC_ID_MACE3:
        case AV_CODEC_ID_MACE6:
        case AV_CODEC_ID_NELLYMOSER:
        case AV_CODEC_ID_SPEEX:
        case AV_CODEC_ID_G723_1:
            return true;
        default:
            return false;
    }
}

// Damaged files have times that no sum must be made of.
ncfSInt64 Rescaled(ncfSInt64 value, AVRational from, AVRational to) {
    return std::clamp(av_rescale_q(value, from, to), -kFarthestTime, kFarthestTime);
}

// What comes out of an Opus decoder before the sound begins, in frames of 48000, as
// its configuration tells.
ncfSInt64 OpusPriming(const AVCodecParameters& form) {
    constexpr int kPlace = 10;
    return form.codec_id == AV_CODEC_ID_OPUS && form.extradata && form.extradata_size > kPlace + 1
               ? form.extradata[kPlace] | form.extradata[kPlace + 1] << 8
               : 0;
}

// Where the first stream of a file is heard or seen, in AV_TIME_BASE. Movies in
// fragments may have no edit that leaves the priming of Opus out.
ncfSInt64 StartOf(const AVFormatContext& input) {
    ncfSInt64 first = AV_NOPTS_VALUE;
    for (unsigned i = 0; i < input.nb_streams && IsMovieFamily(input); ++i) {
        const AVStream& of = *input.streams[i];
        const ncfSInt64 start = UsableTime(of.start_time);
        if (start != AV_NOPTS_VALUE) {
            const ncfSInt64 begin =
                Rescaled(start, of.time_base, AV_TIME_BASE_Q) +
                Rescaled(OpusPriming(*of.codecpar), AVRational{1, 48000}, AV_TIME_BASE_Q);
            first = first == AV_NOPTS_VALUE ? begin : std::min(first, begin);
        }
    }
    return first == AV_NOPTS_VALUE ? UsableTime(input.start_time) : first;
}

}  // namespace

std::unique_ptr<SoundDecoder> SoundDecoder::Open(const std::filesystem::path& path, int stream,
                                                 const SoundForm& form, bool hasWholeIndex,
                                                 InputView view) {
    InputOwner input = OpenForStream(path, view, stream);
    if (!input) {
        return nullptr;
    }
    if (!hasWholeIndex) {
        FindStreamDetails(*input);  // tells where the file starts
    }
    const AVStream& of = *input->streams[stream];
    auto codec = SoundCodec::Open(of, false);
    if (!codec || form.channels == 0 || of.codecpar->codec_type != AVMEDIA_TYPE_AUDIO) {
        return nullptr;
    }
    UseOneStream(*input, stream);
    return std::unique_ptr<SoundDecoder>(new SoundDecoder(
        {path, view, stream, hasWholeIndex, std::move(input), std::move(codec), form}));
}

SoundDecoder::SoundDecoder(Opened opened)
    : path_(std::move(opened.path)),
      view_(opened.view),
      input_(std::move(opened.input)),
      codec_(std::move(opened.codec)),
      frame_(av_frame_alloc()),
      packet_(av_packet_alloc()),
      stream_(opened.stream),
      channels_(static_cast<int>(opened.form.channels)),
      rate_(static_cast<int>(opened.form.sampleRate)),
      isLinear_(opened.form.bitsPerChannel > 0),
      converter_(channels_, rate_) {
    const AVStream& of = *input_->streams[stream_];
    const ncfSInt64 start = opened.hasWholeIndex ? AV_NOPTS_VALUE : StartOf(*input_);
    // Before 0 a movie has what primes its decoders.
    if (start != AV_NOPTS_VALUE && (start > 0 || !IsMovieFamily(*input_))) {
        zeroTime_ = Rescaled(start, AVRational{1, AV_TIME_BASE}, of.time_base);
    }
    const ncfSInt64 begin = UsableTime(of.start_time);
    if (!opened.hasWholeIndex && IsMovieFamily(*input_) && begin != AV_NOPTS_VALUE) {
        heardFrom_ = PlaceOf(begin) + Rescaled(OpusPriming(*of.codecpar), AVRational{1, 48000},
                                               AVRational{1, rate_});
    }
    tolerance_ = 1 + 2 * av_rescale_rnd(rate_, of.time_base.num, of.time_base.den, AV_ROUND_UP);
    const int coarser = av_cmp_q(of.time_base, AVRational{1, rate_});
    if (coarser == 0) {
        tolerance_ = 0;
    }
    framesPerPacket_ = opened.form.decodedPerPacket;
    const bool isRounded = coarser != 0 && IsMovieFamily(*input_) && !isLinear_;
    if (isRounded && opened.hasWholeIndex && framesPerPacket_ > 0) {
        places_.emplace(of, framesPerPacket_, rate_, zeroTime_);
        if (places_->IsEmpty()) {
            places_.reset();
        }
    }
    countsPlaces_ = !places_ && (coarser > 0 || isRounded);
    leansOnAll_ = LeansOnAllBefore(of.codecpar->codec_id) || !TellsTimesOfAll(*input_);
}

ncfSInt64 SoundDecoder::TimeOf(ncfSInt64 place) const {
    const AVStream& of = *input_->streams[stream_];
    return zeroTime_ + Rescaled(place, AVRational{1, rate_}, of.time_base);
}

ncfSInt64 SoundDecoder::PlaceOf(ncfSInt64 time) const {
    const AVStream& of = *input_->streams[stream_];
    return Rescaled(time - zeroTime_, of.time_base, AVRational{1, rate_});
}

ncfSInt64 SoundDecoder::Preroll() const {
    const AVCodecParameters& form = *input_->streams[stream_]->codecpar;
    const bool isOpus = form.codec_id == AV_CODEC_ID_OPUS;
    return isLinear_ ? 0
                     : std::max<ncfSInt64>(isOpus ? kOpusPrerollFrames : kPrerollFrames,
                                           form.seek_preroll);
}

void SoundDecoder::Rewind() {
    InputOwner again = OpenForStream(path_, view_, stream_);
    isRunning_ = again != nullptr;
    if (isRunning_) {
        input_ = std::move(again);
        UseOneStream(*input_, stream_);
    }
}

bool SoundDecoder::SeekByTime(ncfSInt64 place) {
    // What primes a decoder has times below zero.
    const ncfSInt64 early = place - Preroll();
    const ncfSInt64 from = places_ ? places_->TimeOf(early) : TimeOf(early);
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
    if (auto codec = SoundCodec::Open(*input_->streams[stream_], false)) {
        codec_ = std::move(codec);
    }
    converter_.Forget();
    isRunning_ = true;
    isFed_ = false;
    isHeld_ = false;
    mustRestart_ = false;
    isPlaced_ = false;
    lastTime_ = AV_NOPTS_VALUE;
    framesSince_ = 0;
    lastMapped_.reset();
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
    return countsPlaces_ && !known_.empty() && known_.back().place <= reached + kNearFrames;
}

// Gives the decoder the next packet, and at last the end; false behind that.
bool SoundDecoder::Feed() {
    while (!isFed_ && av_read_frame(input_.get(), packet_.get()) >= 0) {
        const bool isOurs = packet_->stream_index == stream_;
        if (isOurs) {
            codec_->Send(packet_.get());
        }
        av_packet_unref(packet_.get());
        if (isOurs) {
            return true;
        }
    }
    const bool isEnd = !isFed_;
    if (isEnd) {
        codec_->Send(nullptr);
    }
    isFed_ = true;
    return isEnd;
}

// The next frame out of the decoder; false when there is none.
bool SoundDecoder::Receive() {
    for (;;) {
        const int got = codec_->Receive(*frame_);
        if (got >= 0) {
            return true;
        }
        if (got == AVERROR_EOF || (got == AVERROR(EAGAIN) && !Feed())) {
            return false;
        }
    }
}

// From now on, since what is decoded after a jump is not what it was.
void SoundDecoder::DecodeFromStartAlways() {
    leansOnAll_ = true;
    mustRestart_ = !isFromStart_;
}

bool SoundDecoder::Advance() {
    for (;;) {
        block_.clear();
        if (!isHeld_) {
            const bool hasFrame = Receive();
            isRunning_ = hasFrame;
            isHeld_ = hasFrame && converter_.HasRestBefore(*frame_);
            if (!hasFrame || isHeld_) {
                converter_.AppendRest(block_);
                if (!block_.empty()) {
                    PlaceRest();
                    return true;
                }
            }
            if (!hasFrame) {
                return false;
            }
        }
        isHeld_ = false;
        if (!converter_.Append(*frame_, block_)) {
            continue;
        }
        if (IsConverting() && !leansOnAll_) {
            DecodeFromStartAlways();
        }
        if (IsConverting() && places_) {
            places_.reset();
            countsPlaces_ = true;
        }
        if (mustRestart_) {
            return false;
        }
        if (PlaceBlock()) {
            return true;
        }
        if (mustRestart_) {
            return false;
        }
    }
}

bool SoundDecoder::IsConverting() const {
    return frame_->sample_rate != rate_;
}

// What the conversion of a rate held back follows what it gave.
void SoundDecoder::PlaceRest() {
    blockStart_ += blockCount_;
    blockCount_ = static_cast<ncfSInt64>(block_.size()) / channels_;
    framesSince_ += blockCount_;
}

// The place that the index gives the block; nothing where it does not know it,
// or turns out to be wrong about how much packets hold.
std::optional<ncfSInt64> SoundDecoder::PlaceByMap() {
    const ncfSInt64 time = UsableTime(frame_->pkt_dts);
    const auto packet = time == AV_NOPTS_VALUE ? std::nullopt : places_->LastAt(time);
    if (!packet) {
        return std::nullopt;
    }
    // Where the library cuts a packet's start, as priming or by an edit, it moves
    // all its times on by what is cut. What is left of the packet tells it to the
    // frame.
    const AVStream& of = *input_->streams[stream_];
    const ncfSInt64 moved = Rescaled(time - packet->time, of.time_base, AVRational{1, rate_});
    const ncfSInt64 missing = framesPerPacket_ - static_cast<ncfSInt64>(block_.size()) / channels_;
    const bool isCut = time != packet->time;
    if (isCut && (moved >= framesPerPacket_ || std::abs(missing - moved) > tolerance_)) {
        return std::nullopt;
    }
    const bool follows = lastMapped_ && packet->place == *lastMapped_ + framesPerPacket_;
    if (follows && !isCut && packet->place != blockStart_ + blockCount_) {
        places_.reset();
        countsPlaces_ = true;
        DecodeFromStartAlways();
        return std::nullopt;
    }
    lastMapped_ = packet->place;
    return packet->place + (isCut ? missing : 0);
}

// Finds the place of the block that was decoded; false for one that can't be
// placed, which is what comes before the first known one after a seek.
bool SoundDecoder::PlaceBlock() {
    const ncfSInt64 follows = blockStart_ + blockCount_;
    const ncfSInt64 time = UsableTime(frame_->best_effort_timestamp);
    ncfSInt64 start = time == AV_NOPTS_VALUE ? follows : PlaceOf(time);
    const std::optional<ncfSInt64> mapped = places_ ? PlaceByMap() : std::nullopt;
    if (mustRestart_) {
        return false;
    }
    if (mapped) {
        start = *mapped;
    } else if (countsPlaces_ && !isPlaced_ && !isFromStart_) {
        const auto found = std::lower_bound(
            known_.begin(), known_.end(), time,
            [](const KnownBlock& block, ncfSInt64 wanted) { return block.time < wanted; });
        if (time == AV_NOPTS_VALUE || found == known_.end() || found->time != time) {
            return false;
        }
        start = found->place;
    } else if (isPlaced_ && time == AV_NOPTS_VALUE) {
        start = follows;
    } else if (isPlaced_ && countsPlaces_ && lastTime_ != AV_NOPTS_VALUE) {
        const AVStream& of = *input_->streams[stream_];
        const ncfSInt64 gap = GapOfStep(time - lastTime_, framesSince_, of.time_base, rate_);
        start = std::abs(gap) > converter_.MostHeldBack() ? follows + gap : follows;
    } else if (isPlaced_) {
        const ncfSInt64 most = std::max<ncfSInt64>(tolerance_, converter_.MostHeldBack());
        start = std::abs(start - follows) <= most ? follows : start;
    }
    isPlaced_ = true;
    blockStart_ = start;
    blockCount_ = static_cast<ncfSInt64>(block_.size()) / channels_;
    if (time != AV_NOPTS_VALUE) {
        lastTime_ = time;
        framesSince_ = 0;
    }
    framesSince_ += blockCount_;
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
        const ncfSInt64 from = std::max({first, blockStart_, heardFrom_});
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
        if (reached < end && isRunning_ && Advance()) {
            continue;
        }
        if (!mustRestart_) {
            return static_cast<ncfUInt64>(reached - first);
        }
        Start(first);
        words.assign(words.size(), 0);
        reached = first;
    }
}

}  // namespace host
