// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "reference_host/quicktime/DecodedSound.h"

#include <algorithm>

#include "reference_host/quicktime/OpenInput.h"
#include "reference_host/quicktime/SoundCodec.h"

namespace host {
namespace {

// Some decoders begin with a packet or two that give nothing.
constexpr int kMostPackets = 64;
constexpr int kBlocksThatTell = 4;

// Decoders take memory, so only so many are open at a time.
constexpr std::size_t kStreamsAtOnce = 64;

// Decodes one stream until it is known what comes out.
class Listener {
public:
    explicit Listener(const AVStream& stream) : codec_(SoundCodec::Open(stream, true)) {
        told_.containerRate = stream.codecpar->sample_rate;
    }

    bool IsDone() const {
        return !codec_ || packets_ >= kMostPackets || blocks_ >= kBlocksThatTell;
    }
    const DecodedSound& Told() const { return told_; }
    // The end for null.
    void Take(const AVPacket* packet, AVFrame& frame) {
        ++packets_;
        codec_->Send(packet);
        while (blocks_ < kBlocksThatTell && codec_->Receive(frame) >= 0) {
            if (blocks_++ == 0) {
                told_.channels = frame.ch_layout.nb_channels;
                told_.rate = frame.sample_rate;
                told_.framesPerPacket = frame.nb_samples;
            } else if (frame.nb_samples != told_.framesPerPacket && packet) {
                told_.framesPerPacket = 0;
            }
        }
    }

private:
    std::unique_ptr<SoundCodec> codec_;
    int packets_ = 0;
    int blocks_ = 0;
    DecodedSound told_;
};

void ListenTo(const std::filesystem::path& path, const std::vector<int>& streams,
              std::map<int, DecodedSound>& told) {
    std::string ignored;
    const InputOwner input = OpenInput(path, InputView::WholeMedia, ignored);
    const PacketOwner packet(av_packet_alloc());
    const FrameOwner frame(av_frame_alloc());
    if (!input || !packet || !frame) {
        return;
    }
    UseOneStream(*input, -1);
    std::map<int, Listener> listeners;
    for (const int stream : streams) {
        if (stream >= 0 && stream < static_cast<int>(input->nb_streams)) {
            AVStream& of = *input->streams[stream];
            listeners.try_emplace(stream, of);
            of.discard = AVDISCARD_DEFAULT;
        }
    }
    const auto finish = [&](std::map<int, Listener>::iterator listener) {
        told[listener->first] = listener->second.Told();
        input->streams[listener->first]->discard = AVDISCARD_ALL;
        return listeners.erase(listener);
    };
    for (auto each = listeners.begin(); each != listeners.end();) {
        each = each->second.IsDone() ? finish(each) : std::next(each);
    }
    while (!listeners.empty() && av_read_frame(input.get(), packet.get()) >= 0) {
        const auto listener = listeners.find(packet->stream_index);
        if (listener != listeners.end()) {
            listener->second.Take(packet.get(), *frame);
            if (listener->second.IsDone()) {
                finish(listener);
            }
        }
        av_packet_unref(packet.get());
    }
    for (auto& [stream, listener] : listeners) {
        listener.Take(nullptr, *frame);
        told[stream] = listener.Told();
    }
}

}  // namespace

std::map<int, DecodedSound> DecodeFirstSounds(const std::filesystem::path& path,
                                              const std::vector<int>& streams) {
    std::map<int, DecodedSound> told;
    for (std::size_t i = 0; i < streams.size(); i += kStreamsAtOnce) {
        const auto first = streams.begin() + static_cast<std::ptrdiff_t>(i);
        const std::size_t count = std::min(kStreamsAtOnce, streams.size() - i);
        ListenTo(path, {first, first + static_cast<std::ptrdiff_t>(count)}, told);
    }
    return told;
}

}  // namespace host
