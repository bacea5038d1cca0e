// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// Frames in random order, and backward, from a film with long groups of
// pictures: the reader beside a bare loop that seeks to the sync sample before
// and decodes from there each time. Neither converts much: '2vuy' is near to
// what the decoder gives.

#include <benchmark/benchmark.h>

#include <memory>
#include <random>
#include <vector>

#include "benchmarks/frames/SampleFilm.h"
#include "benchmarks/support/Brief.h"
#include "benchmarks/support/Ratios.h"
#include "reference_host/quicktime/AvOwners.h"

namespace {

const int kFrames = Sized(500, 20);
const int kAsked = Sized(40, 5);

const SampleFilm& Film() {
    static const SampleFilm film("-c:v libx264 -preset fast -g 50 -bf 2 -pix_fmt yuv420p -b:v 20M",
                                 kFrames);
    return film;
}

std::vector<int> Order(bool backward) {
    std::vector<int> order;
    std::mt19937 random(5);
    for (int i = 0; i < kAsked; ++i) {
        order.push_back(backward ? kFrames - 10 - i : static_cast<int>(random() % kFrames));
    }
    return order;
}

void Reader(benchmark::State& state) {
    const SampleFilm& film = Film();  // made before the clock starts
    const auto order = Order(state.range(0) != 0);
    std::vector<unsigned char> picture;
    for (auto _ : state) {
        const auto reader = film.Open(0x32767579);
        if (!film.Works() || !reader) {
            state.SkipWithError("the film could not be made or opened");
            break;
        }
        picture.resize(reader->GetFrameBufferSize(0xFFFFFFFF, 0, 0));
        for (const int number : order) {
            if (reader->ReadFrame(static_cast<ncfUInt64>(number), picture.data(), 0, 0, 0) !=
                NCF_OK) {
                state.SkipWithError("a frame did not decode");
                return;
            }
        }
    }
}

// The first picture shown at or behind `time`.
bool DecodeAt(AVFormatContext& input, AVCodecContext& codec, std::int64_t time) {
    const host::PacketOwner packet(av_packet_alloc());
    const host::FrameOwner frame(av_frame_alloc());
    av_seek_frame(&input, 0, time, AVSEEK_FLAG_BACKWARD);
    avcodec_flush_buffers(&codec);
    for (;;) {
        const bool isEnd = av_read_frame(&input, packet.get()) < 0;
        avcodec_send_packet(&codec, isEnd ? nullptr : packet.get());
        av_packet_unref(packet.get());
        while (avcodec_receive_frame(&codec, frame.get()) >= 0) {
            if (frame->pts >= time) {
                return true;
            }
        }
        if (isEnd) {
            return false;
        }
    }
}

// The host's own owner also takes down the byte source that the host puts in.
struct CloseBare {
    void operator()(AVFormatContext* input) const { avformat_close_input(&input); }
};

void BareLoop(benchmark::State& state) {
    const SampleFilm& film = Film();  // made before the clock starts
    const auto order = Order(state.range(0) != 0);
    for (auto _ : state) {
        AVFormatContext* opened = nullptr;
        if (!film.Works() ||
            avformat_open_input(&opened, film.Path().c_str(), nullptr, nullptr) < 0) {
            state.SkipWithError("the film could not be made or opened");
            break;
        }
        const std::unique_ptr<AVFormatContext, CloseBare> input(opened);
        const AVStream& stream = *input->streams[0];
        const AVCodec* const decoder = avcodec_find_decoder(stream.codecpar->codec_id);
        const host::CodecOwner codec(avcodec_alloc_context3(decoder));
        avcodec_parameters_to_context(codec.get(), stream.codecpar);
        codec->thread_count = 0;
        avcodec_open2(codec.get(), decoder, nullptr);
        for (const int number : order) {
            const std::int64_t time = av_rescale_q(number, AVRational{1, 25}, stream.time_base);
            if (!DecodeAt(*input, *codec, time)) {
                state.SkipWithError("a frame did not decode");
                return;
            }
        }
    }
}

BENCHMARK(Reader)
    ->ArgName("backward")
    ->Arg(0)
    ->Arg(1)
    ->Unit(benchmark::kMillisecond)
    ->UseRealTime();
BENCHMARK(BareLoop)
    ->ArgName("backward")
    ->Arg(0)
    ->Arg(1)
    ->Unit(benchmark::kMillisecond)
    ->UseRealTime();

}  // namespace

int main(int argc, char** argv) {
    return RunWithRatios(argc, argv, {{"Reader", "BareLoop", RateAtLeast(1)}});
}
