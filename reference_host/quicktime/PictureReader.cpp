// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "reference_host/quicktime/PictureReader.h"

#include <algorithm>

#include "reference_host/quicktime/OpenInput.h"
#include "reference_host/quicktime/PictureDecoder.h"

namespace host {
namespace {

// Fifteen pictures of 1920 x 1080 in 8 bits. Going back through a group that has more, it is
// decoded again for each fifteen.
constexpr std::size_t kMostCachedBytes = std::size_t{48} << 20;
// Going forward, memory that was just used is worth more than pictures that
// were shown already.
constexpr std::size_t kKeptForward = 4;
constexpr std::size_t kKeptBackward = 512;
// A sync sample this near is reached sooner by decoding on than by seeking.
constexpr std::size_t kNearPackets = 4;

// In place of the one that the demuxer gave, which after a seek may be another's.
void PutPalette(const Palette& palette, AVPacket& packet) {
    std::size_t size = 0;
    std::uint8_t* to = av_packet_get_side_data(&packet, AV_PKT_DATA_PALETTE, &size);
    if (!to || size != palette.size()) {
        to = av_packet_new_side_data(&packet, AV_PKT_DATA_PALETTE, palette.size());
    }
    if (to) {
        std::copy(palette.begin(), palette.end(), to);
    }
}

}  // namespace

std::unique_ptr<PictureReader> PictureReader::Open(const std::filesystem::path& path, int stream,
                                                   bool indexIsWhole) {
    InputOwner input = OpenForPictures(path, stream);
    CodecOwner codec =
        input ? OpenPictureDecoder(*input->streams[stream], DecoderUse::EveryPicture) : nullptr;
    if (!codec) {
        return nullptr;
    }
    PictureOrder order(ListPackets(*input, stream, indexIsWhole));
    UseOneStream(*input, stream);
    return std::unique_ptr<PictureReader>(
        new PictureReader(path, std::move(input), std::move(codec), stream, std::move(order)));
}

PictureReader::PictureReader(std::filesystem::path path, InputOwner input, CodecOwner codec,
                             int stream, PictureOrder order)
    : path_(std::move(path)),
      input_(std::move(input)),
      codec_(std::move(codec)),
      stream_(stream),
      order_(std::move(order)),
      syncClaims_(SyncClaims::Doubted(path_, *input_->streams[stream_], order_)),
      isSeekable_(TellsTimesOfAll(*input_)),
      marksCutPackets_(IsMovieFamily(*input_)),
      cache_(kMostCachedBytes),
      packet_(av_packet_alloc()) {}

void PictureReader::Release() {
    codec_.reset();
    cache_.Clear();
    isRunning_ = false;
    lastAsked_ = 0;
}

NCFRESULT PictureReader::Read(std::size_t picture, std::shared_ptr<const AVFrame>& frame) {
    frame = nullptr;
    if (picture >= order_.PictureCount()) {
        return NMA_E_NODATA;
    }
    // An empty sample shows the picture before it on.
    while (picture > 0 && order_.Packet(order_.PacketOfPicture(picture)).size == 0) {
        --picture;
    }
    if (!codec_) {
        codec_ = OpenPictureDecoder(*input_->streams[stream_], DecoderUse::EveryPicture);
    }
    if (!codec_) {
        return NCF_E_FAIL;
    }
    const bool goesBack = picture < lastAsked_;
    lastAsked_ = picture;
    frame = cache_.Find(picture);
    if (frame) {
        return NCF_OK;
    }
    mostKept_ = goesBack && !order_.IsIntraOnly() ? kKeptBackward : kKeptForward;
    if (!MayContinueTo(picture) && syncClaims_) {
        syncClaims_->Check(order_, picture);
    }
    if (!MayContinueTo(picture)) {
        const NCFRESULT started = StartAt(order_.StartFor(picture));
        if (started < 0) {
            return started;
        }
    }
    return DecodeUpTo(picture, frame);
}

bool PictureReader::MayContinueTo(std::size_t picture) const {
    if (!isRunning_ || (delivered_ > 0 && picture <= lastOut_) ||
        !order_.IsWholeFrom(picture, runStart_)) {
        return false;
    }
    return !isSeekable_ || order_.StartFor(picture) <= nextPacket_ + kNearPackets;
}

// Reads the first packet after a seek; keeps it when decoding may start from it.
bool PictureReader::LandsBefore(std::size_t packet) {
    while (av_read_frame(input_.get(), packet_.get()) >= 0) {
        if (packet_->stream_index == stream_) {
            const auto found = order_.Find(packet_->dts, packet_->pts, packet_->pos, packet);
            // A second field alone makes no picture.
            if (found && found->packet + found->isSecondField <= packet) {
                nextPacket_ = found->packet;
                isPending_ = true;
                return true;
            }
            av_packet_unref(packet_.get());
            return false;
        }
        av_packet_unref(packet_.get());
    }
    return false;
}

NCFRESULT PictureReader::StartAt(std::size_t packet) {
    av_packet_unref(packet_.get());
    isPending_ = false;
    isRunning_ = false;
    avcodec_flush_buffers(codec_.get());
    const PacketEntry& entry = order_.Packet(packet);
    runStart_ = packet;
    delivered_ = 0;
    // Most demuxers seek by times of display. By the time of decoding, which is earlier, they
    // arrive at the sync sample before this one, and all from there would be read for nothing.
    for (const ncfSInt64 time : {entry.displayTime, entry.decodeTime}) {
        isRunning_ =
            isRunning_ || (isSeekable_ && time != AV_NOPTS_VALUE &&
                           av_seek_frame(input_.get(), stream_, time, AVSEEK_FLAG_BACKWARD) >= 0 &&
                           LandsBefore(packet));
    }
    if (!isRunning_) {  // some files can only be read from their start
        if (InputOwner again = OpenForStream(path_, InputView::AsPresented, stream_)) {
            input_ = std::move(again);
            UseOneStream(*input_, stream_);
            isRunning_ = LandsBefore(packet);
        }
    }
    return isRunning_ ? NCF_OK : NCF_E_FAIL;
}

// Whether a picture is shown long before the one that is asked for. On the way forward it is
// decoded only where others lean on it.
bool PictureReader::IsPassedOver(std::size_t packet) const {
    const auto picture = order_.PictureOfPacket(packet);
    return picture && order_.HasDisplayTimes() && mostKept_ == kKeptForward &&
           *picture + kKeptForward < lastAsked_;
}

// Gives the decoder one more packet, or tells it that there are no more.
bool PictureReader::Feed() {
    if (!isPending_ && av_read_frame(input_.get(), packet_.get()) < 0) {
        return avcodec_send_packet(codec_.get(), nullptr) >= 0;
    }
    isPending_ = false;
    if (packet_->stream_index == stream_) {
        const std::size_t at = order_.Find(packet_->dts, packet_->pts, packet_->pos, nextPacket_)
                                   .value_or(PictureOrder::Found{nextPacket_, false})
                                   .packet;
        nextPacket_ = at + 1;
        packetsPassed_ += at < runStart_;
        if (at >= runStart_) {
            codec_->reordered_opaque = static_cast<ncfSInt64>(at);
            ++decodedPackets_;
            // A packet that the decoder refuses leaves its picture out; the
            // next may be good. What is left of one behind a file's end some
            // decoders take for a whole.
            const bool isWhole = !marksCutPackets_ || (packet_->flags & AV_PKT_FLAG_CORRUPT) == 0;
            if (isWhole && packet_->size > 0) {
                codec_->skip_frame = IsPassedOver(at) ? AVDISCARD_NONREF : AVDISCARD_DEFAULT;
                if (at < order_.PacketCount() && order_.Packet(at).palette) {
                    PutPalette(*order_.Packet(at).palette, *packet_);
                }
                avcodec_send_packet(codec_.get(), packet_.get());
            }
        }
    }
    av_packet_unref(packet_.get());
    return true;
}

std::optional<std::size_t> PictureReader::PictureOf(const AVFrame& frame) {
    if (!order_.HasDisplayTimes()) {  // count from the start of the run
        const auto first = order_.PictureOfPacket(runStart_);
        return first ? std::optional<std::size_t>(*first + delivered_) : std::nullopt;
    }
    return order_.PictureOfPacket(static_cast<std::size_t>(frame.reordered_opaque));
}

NCFRESULT PictureReader::DecodeUpTo(std::size_t picture, std::shared_ptr<const AVFrame>& out) {
    for (;;) {
        FrameOwner frame(av_frame_alloc());
        if (!frame) {
            return NCF_E_OUTOFMEMORY;
        }
        const int got = avcodec_receive_frame(codec_.get(), frame.get());
        if (got == AVERROR(EAGAIN)) {
            if (!Feed()) {
                isRunning_ = false;
                return NCF_E_FAIL;
            }
            continue;
        }
        if (got == AVERROR_EOF) {
            isRunning_ = false;
            return NCF_E_FAIL;
        }
        if (got < 0) {
            continue;  // one packet's damage
        }
        const auto number = PictureOf(*frame);
        if (!number || !order_.IsWholeFrom(*number, runStart_)) {
            continue;
        }
        ++delivered_;
        lastOut_ = *number;
        std::shared_ptr<const AVFrame> kept;
        if (!IsDamaged(*frame)) {
            kept = std::move(frame);
            cache_.Keep(*number, kept, picture, mostKept_);
        }
        if (*number == picture) {
            out = std::move(kept);
            return out ? NCF_OK : NCF_E_FAIL;
        }
        if (*number > picture) {
            return NCF_E_FAIL;
        }
    }
}

}  // namespace host
