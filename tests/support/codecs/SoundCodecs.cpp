// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "tests/support/codecs/SoundCodecs.h"

#include <algorithm>

#include "tests/support/codecs/Words.h"

namespace {

constexpr const char* kAllRates = "48000 44100 22050 96000";
constexpr const char* kAllLayouts = "stereo mono 5.1";
constexpr const char* kBroadcastRates = "48000 44100";
constexpr const char* kMpegRates = "48000 44100 22050";
// Noise that stands for inaudible parts is made of each block alone.
constexpr const char* kOwnNoise = "-cons_noisegen 1";
constexpr const char* kInFloats = "-c:a mp2float";

// Lists are words with a space between. The broad set has the first of each
// list together, and the second of each.
struct SoundCodec {
    const char* name;
    const char* encoder;
    const char* endings;
    const char* rates = kAllRates;
    const char* layouts = kAllLayouts;
    const char* reading = "";
    bool isExactAnywhere = true;
};

// Left out is what ffmpeg writes but does not read as such: 64-bit integers, DFPWM,
// and ADPCM at 96000, whose blocks have another size than its sample table tells.
constexpr SoundCodec kCodecs[] = {
    {"aac", "-c:a aac -aac_pns 0", "mov mp4 m4a"},
    {"aac_noise", "-c:a aac -b:a 48k", "mov", "48000", "stereo", "", false},
    {"ac3", "-c:a ac3", "mov mp4", kBroadcastRates, kAllLayouts, kOwnNoise},
    {"ac3_fixed", "-c:a ac3_fixed", "mov mp4", kBroadcastRates, kAllLayouts, kOwnNoise},
    {"adpcm_g722", "-c:a g722", "mov", "16000 48000 44100", "mono"},
    {"adpcm_g726", "-c:a g726 -strict -2", "mov", "8000 48000 44100", "mono"},
    {"adpcm_ima_qt", "-c:a adpcm_ima_qt", "mov", kAllRates, "stereo mono"},
    {"adpcm_ima_wav", "-c:a adpcm_ima_wav", "mov", kMpegRates, "stereo mono"},
    {"adpcm_ms", "-c:a adpcm_ms", "mov", kMpegRates, "stereo mono"},
    {"adpcm_swf", "-c:a adpcm_swf", "mov", "44100 22050", "mono stereo"},
    {"adpcm_yamaha", "-c:a adpcm_yamaha", "mov", kAllRates, "stereo mono"},
    {"alac", "-c:a alac", "mov mp4 m4a"},
    {"alac_24", "-c:a alac -sample_fmt s32p", "mov mp4"},
    {"dts", "-c:a dca -strict -2", "mp4 mov", kMpegRates, kAllLayouts},
    {"eac3", "-c:a eac3", "mov mp4", kBroadcastRates, kAllLayouts, kOwnNoise},
    {"flac", "-c:a flac -strict -2", "mp4"},
    {"flac_24", "-c:a flac -sample_fmt s32 -strict -2", "mp4"},
    {"g723_1", "-c:a g723_1 -b:a 6300", "mov", "8000", "mono"},
    {"gsm", "-c:a libgsm", "mov", "8000", "mono"},
    {"gsm_ms", "-c:a libgsm_ms", "mov", "8000", "mono"},
    {"mp2", "-c:a mp2", "mov mp4", kMpegRates, "stereo mono", kInFloats},
    {"mp2_fixed", "-c:a mp2fixed", "mov mp4", kMpegRates, "stereo mono", kInFloats},
    {"mp2_twolame", "-c:a libtwolame", "mov mp4", kMpegRates, "stereo mono", kInFloats},
    {"mp3", "-c:a libmp3lame", "mov mp4", kMpegRates, "stereo mono"},
    {"mp3_shine", "-c:a libshine -strict -2", "mov mp4", kMpegRates, "stereo mono"},
    {"mp3_variable", "-c:a libmp3lame -q:a 3", "mp4 mov", kMpegRates, "stereo mono"},
    {"nellymoser", "-c:a nellymoser", "mov", "8000 44100 22050", "mono"},
    {"opus", "-c:a libopus -mapping_family 1", "mp4", "48000"},
    {"opus_low", "-c:a libopus -b:a 24k", "mp4", "48000", "mono stereo"},
    {"opus_native", "-c:a opus -strict -2", "mp4", "48000", "stereo mono"},
    {"pcm_alaw", "-c:a pcm_alaw", "mov"},
    {"pcm_f32be", "-c:a pcm_f32be", "mov"},
    {"pcm_f32le", "-c:a pcm_f32le", "mov"},
    {"pcm_f64be", "-c:a pcm_f64be", "mov"},
    {"pcm_f64le", "-c:a pcm_f64le", "mov"},
    {"pcm_mulaw", "-c:a pcm_mulaw", "mov"},
    {"pcm_s16be", "-c:a pcm_s16be", "mov"},
    {"pcm_s16le", "-c:a pcm_s16le", "mov"},
    {"pcm_s24be", "-c:a pcm_s24be", "mov"},
    {"pcm_s24le", "-c:a pcm_s24le", "mov"},
    {"pcm_s32be", "-c:a pcm_s32be", "mov"},
    {"pcm_s32le", "-c:a pcm_s32le", "mov"},
    {"pcm_s8", "-c:a pcm_s8", "mov"},
    {"pcm_u8", "-c:a pcm_u8", "mov"},
    {"speex", "-c:a libspeex", "mov", "32000 16000 8000", "stereo mono"},
    {"truehd", "-c:a truehd -strict -2", "mp4", "48000 44100 96000", "stereo 5.1"},
    {"vorbis", "-c:a libvorbis", "mp4 mov"},
    {"vorbis_native", "-c:a vorbis -strict -2", "mov mp4", kAllRates, "stereo"},
};

std::vector<SoundCase> AllCases() {
    std::vector<SoundCase> cases;
    for (const SoundCodec& codec : kCodecs) {
        const auto endings = Words(codec.endings), rates = Words(codec.rates),
                   layouts = Words(codec.layouts);
        const auto brief = [&](std::size_t e, std::size_t r, std::size_t l) {
            const auto isNth = [&](std::size_t n) {
                return e == std::min(n, endings.size() - 1) && r == std::min(n, rates.size() - 1) &&
                       l == std::min(n, layouts.size() - 1);
            };
            return isNth(0) || isNth(1);
        };
        for (std::size_t e = 0; e < endings.size(); ++e) {
            for (std::size_t r = 0; r < rates.size(); ++r) {
                for (std::size_t l = 0; l < layouts.size(); ++l) {
                    cases.push_back({std::string(codec.name) + "_" + rates[r] + "_" + layouts[l] +
                                         "_" + endings[e],
                                     codec.encoder, endings[e], rates[r], layouts[l], codec.reading,
                                     codec.isExactAnywhere, brief(e, r, l)});
                }
            }
        }
    }
    return cases;
}

}  // namespace

const std::vector<SoundCase>& SoundCases() {
    static const std::vector<SoundCase> cases = AllCases();
    return cases;
}

std::string SoundSource(const std::string& rate, const std::string& layout, double seconds) {
    constexpr int kTones[] = {440, 660, 550, 60, 880, 770};
    std::string channels;
    for (int i = 0; i < ChannelsOf(layout); ++i) {
        channels += (i == 0 ? "" : "|") + std::string("0.25*sin(") + std::to_string(kTones[i]) +
                    "*2*PI*t)+0.1*(random(0)-0.5)";
    }
    return "aevalsrc='" + channels + "':c=" + layout + ":s=" + rate +
           ":d=" + std::to_string(seconds);
}

int ChannelsOf(const std::string& layout) {
    return layout == "mono" ? 1 : layout == "stereo" ? 2 : 6;
}
